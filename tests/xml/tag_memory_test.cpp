// Which tags are remembered, and when they are recalled.

#include "xml/tag_memory.h"

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <vector>

namespace {

using namespace raid::xml;

const std::string size = "<as:size xsi:type=\"xsd:int\">";
const std::string name = "<as:name xsi:type=\"xsd:string\">";
const std::string state = "<as:state xsi:type=\"xsd:int\">";
const std::string end = "</ac:hardDrive>";

constexpr std::array<std::string_view, 3> children{"as:size", "as:name", "as:state"};
constexpr std::array<std::string_view, 3> beginnings{
    "<as:size xsi:type=", "<as:name xsi:type=", "<as:state xsi:type="};

int numberOf(std::string_view asked) {
    const auto* const child = std::ranges::find(children, asked);
    return child == children.end() ? unknownName : static_cast<int>(child - children.begin());
}

// Only the end tag is known from the beginning.
constexpr std::array<KnownTag, 4> endTagOnly{
    {{}, {}, {}, {"</ac:hardDrive>", {{.isTag = true, .closing = true}, ownName}}}};
constexpr Names drive{&numberOf, endTagOnly, TagIndex(beginnings)};
constexpr Names otherDrive = drive;

class RememberedTags : public testing::Test {
protected:
    static NamedUnit numbered(int number) { return {{.isTag = true, .opening = true}, number}; }

    // The number that was kept with the tag; -2 when it is not known.
    int recall(std::string_view text) {
        const auto* const tag = memory.recall(text);
        return tag == nullptr ? unknownName : tag->found.number;
    }

    TagMemories memories;
    TagMemory& memory = memories.of(drive);
};

TEST_F(RememberedTags, AreRecalledByTheirBytesAtTheFrontOfAText) {
    EXPECT_EQ(recall(size + "5</as:size>"), unknownName);
    memory.keep(size, numbered(0));
    EXPECT_EQ(recall(size + "5</as:size>"), 0);
    EXPECT_EQ(recall(size), 0);
    EXPECT_EQ(recall(" " + size), unknownName);
    EXPECT_EQ(recall(name), unknownName);
    EXPECT_EQ(recall(""), unknownName);
}

TEST_F(RememberedTags, AreRecalledWholeOnly) {
    memory.keep(size, numbered(0));
    for (std::size_t length = 0; length < size.size(); ++length) {
        EXPECT_EQ(recall(std::string_view(size).substr(0, length)), unknownName) << length;
    }
    for (std::size_t place = 0; place < size.size(); ++place) {
        auto other = size;
        other[place] = '~';
        EXPECT_EQ(recall(other), unknownName) << other;
    }
}

TEST_F(RememberedTags, TellTheBytesThatTheyAre) {
    memory.keep(size, numbered(0));
    const auto text = size + "5";
    const auto* const tag = memory.recall(text);
    ASSERT_NE(tag, nullptr);
    EXPECT_EQ(tag->bytes, size);
}

TEST_F(RememberedTags, BelongToTheClassThatWasRead) {
    memory.keep(size, numbered(0));
    EXPECT_EQ(memories.of(otherDrive).recall(size), nullptr);
    EXPECT_EQ(&memories.of(drive), &memory);
    EXPECT_EQ(recall(size), 0);
}

TEST_F(RememberedTags, AreRecalledInWhateverOrderTheyCome) {
    const std::vector<std::string> tags{size, name, state};
    for (int number = 0; number < 3; ++number) {
        memory.keep(tags[static_cast<std::size_t>(number)], numbered(number));
    }
    for (int first = 0; first < 3; ++first) {
        for (int second = 0; second < 3; ++second) {
            EXPECT_EQ(recall(tags[static_cast<std::size_t>(first)]), first);
            EXPECT_EQ(recall(tags[static_cast<std::size_t>(second)]), second);
        }
        EXPECT_EQ(recall(end + "\n      "), ownName);
    }
}

TEST_F(RememberedTags, AreKeptAsTheyWereWrittenLast) {
    const std::string otherwise = "<as:size id=\"3\" xsi:type=\"xsd:long\">";
    memory.keep(size, numbered(0));
    memory.keep(otherwise, numbered(0));
    EXPECT_EQ(recall(otherwise), 0);
    EXPECT_EQ(recall(size), unknownName);
}

TEST_F(RememberedTags, IncludeTheEndTagOfTheElement) {
    EXPECT_EQ(recall(end + "<ac:channel>"), ownName);
    EXPECT_EQ(recall("</ac:channel>   "), unknownName);
    EXPECT_EQ(recall("</ac:hardDrives>"), unknownName);
}

TEST(TheFollower, IsFoundWithoutASearch) {
    // Too short for the index, so that only the tag that is expected is found.
    const std::string tag = "<as:size>";
    TagMemories memories;
    auto& memory = memories.of(drive);
    memory.keep(tag, {{}, 0});
    EXPECT_EQ(memory.recall(tag), nullptr);  // as:name is expected
    memory.keep(tag, {{}, 0});
    EXPECT_NE(memory.recall(tag), nullptr);  // it came after itself
}

TEST(TagMemories, HaveRoomForEveryClass) {
    TagMemories memories;
    const std::vector<Names> classes(1000, drive);
    for (const auto& each : classes) {
        memories.of(each).keep(size, {{}, 0});
    }
    for (const auto& each : classes) {
        auto& memory = memories.of(each);
        const auto* const recalled = memory.recall(size);
        ASSERT_NE(recalled, nullptr);
        EXPECT_EQ(recalled->bytes.data(), size.data());
    }
}

}  // namespace
