// Lists take room for as many elements as the list of that kind before them had.

#include <gtest/gtest.h>

#include <string>

#include "model/channels_and_drives_vocabulary.h"
#include "model/navigation.h"
#include "support/fresh_library.h"

namespace {

class ListOfElements : public raid::test::FreshLibrary {
protected:
    static RAIDChannel channelWith(int drives) {
        std::string text = "<ac:channel>";
        for (int i = 0; i < drives; ++i) {
            text += "<ac:hardDrive/>";
        }
        text += "</ac:channel>";
        return {text.data(), static_cast<int>(text.size()), nullptr};
    }

    static std::size_t roomOf(const RAIDChannel& channel) {
        return raid::Navigation::hardDrives(channel).capacity();
    }
};

TEST_F(ListOfElements, HasTheRoomThatTheOneBeforeItNeeded) {
    channelWith(23);
    const auto channel = channelWith(23);
    EXPECT_EQ(channel.getHardDrive().size(), 23U);
    EXPECT_EQ(roomOf(channel), 23U);
    channelWith(3);
    EXPECT_EQ(roomOf(channelWith(1)), 3U);
    EXPECT_EQ(roomOf(channelWith(1)), 1U);
}

TEST_F(ListOfElements, GrowsBeyondThatRoom) {
    channelWith(2);
    EXPECT_EQ(channelWith(100).getHardDrive().size(), 100U);
}

TEST_F(ListOfElements, WastesLittleAfterALongOne) {
    channelWith(10'000);
    EXPECT_EQ(roomOf(channelWith(1)), 64U);
}

TEST_F(ListOfElements, TakesNoRoomForNone) {
    channelWith(5);
    EXPECT_EQ(roomOf(channelWith(0)), 0U);
}

}  // namespace
