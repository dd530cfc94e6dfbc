// The scenarios of examples/scenarios, each by its own clock.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <filesystem>
#include <map>
#include <set>
#include <string>
#include <vector>

#include "story.h"
#include "support/row.h"

namespace raidsim::test {
namespace {

using namespace std::chrono_literals;
using testing::AllOf;
using testing::Contains;
using testing::Each;
using testing::ElementsAre;
using testing::Ge;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Le;
using testing::Not;
using testing::Pair;
using testing::SizeIs;
using testing::StartsWith;
using testing::UnorderedElementsAre;

struct StoryRow : raid::test::Row {
    StoryRow(const char* test, const char* file) : Row(test), scenario(file) {}

    const char* scenario;
};

const std::vector<StoryRow> stories{
    {"DiskFailure", "disk-failure"},
    {"EnclosureOverheating", "enclosure-overheating"},
    {"PowerSupplyLoss", "power-supply-loss"},
    {"LogicalDriveOffline", "logical-drive-offline"},
    {"EventStorm", "event-storm"},
    {"FlakyService", "flaky-service"},
};

class EveryStory : public testing::TestWithParam<StoryRow> {};

TEST_P(EveryStory, HasTheSameBytesEachTime) {
    Story story(GetParam().scenario);
    story.playToTheEnd();
    EXPECT_TRUE(story.isOver());
    Story again(GetParam().scenario);
    again.playToTheEnd();
    EXPECT_EQ(again.transcript(), story.transcript());
}

INSTANTIATE_TEST_SUITE_P(Stories, EveryStory, testing::ValuesIn(stories), raid::test::nameOfRow);

TEST(Stories, AreAllTold) {
    std::set<std::string> files;
    for (const auto& entry :
         std::filesystem::directory_iterator(std::string(RAIDSIM_EXAMPLES) + "/scenarios"))
        files.insert(entry.path().filename().string());
    for (const StoryRow& story : stories)
        EXPECT_EQ(files.erase(std::string(story.scenario) + ".scenario"), 1U);
    EXPECT_THAT(files, IsEmpty());
}

TEST(DiskFailureStory, RebuildsOntoTheHotSpare) {
    Story story("disk-failure");
    const std::string failing = "adapter:1/channel:1/drive:3";
    const std::string spare = "adapter:1/channel:2/drive:1";
    story.advanceTo(5s);
    EXPECT_THAT(story.read("physicals/" + failing, "smartError"), Contains("true"));
    EXPECT_THAT(story.status("system"), ElementsAre("1"));
    story.advanceTo(30s);
    EXPECT_THAT(story.status("system"), ElementsAre("2"));
    EXPECT_THAT(story.status("array:0"), ElementsAre("1"));
    story.advanceTo(65s);
    EXPECT_THAT(story.service().document().body(), HasSubstr(">50</as:percentComplete>"));
    EXPECT_EQ(story.listings("array:0/channel:2/drive:1"), 1U);
    EXPECT_EQ(story.listings("array:0/" + failing), 0U);
    story.advanceTo(95s);
    EXPECT_THAT(story.read("logical:*", "state"), Each("0"));
    EXPECT_THAT(story.service().document().body(), Not(HasSubstr("ac:progress")));
    story.advanceTo(120s);
    EXPECT_EQ(story.listings(failing), 0U);
    EXPECT_THAT(story.status("system"), ElementsAre("0"));
    story.playToTheEnd();
    EXPECT_EQ(story.listings("spares/" + failing), 1U);
    EXPECT_THAT(story.read(failing, "serialNumber"), ElementsAre("QS0101077K", "QS0101077K"));
    EXPECT_THAT(story.read(failing, "state"), Each("2"));
    EXPECT_THAT(story.read(spare, "state"), Each("1"));
    EXPECT_THAT(story.status("system"), ElementsAre("0"));
}

TEST(DiskFailureStory, DatesItsEventsByItsOwnClock) {
    Story story("disk-failure");
    story.advanceTo(30s);
    EXPECT_THAT(story.events("date"), ElementsAre("2026-03-02T09:00:05Z", "2026-03-02T09:00:30Z",
                                                  "2026-03-02T09:00:30Z", "2026-03-02T09:00:30Z"));
}

TEST(EnclosureOverheatingStory, WarnsAlarmsAndCoolsDown) {
    Story story("enclosure-overheating");
    story.advanceTo(80s);
    EXPECT_THAT(story.read("sensor:*", "status"), ElementsAre("1", "1"));
    EXPECT_THAT(story.status("system"), ElementsAre("1"));
    story.advanceTo(100s);
    EXPECT_THAT(story.status("system"), ElementsAre("2"));
    EXPECT_THAT(story.read("adapter:1", "alarmStatus"), ElementsAre("2"));
    story.advanceTo(180s);
    EXPECT_EQ(std::ranges::count(story.events("eventCode"), "204"), 5);
    story.advanceTo(195s);
    EXPECT_EQ(story.listings("fan:*"), 1U);
    story.playToTheEnd();
    EXPECT_THAT(story.read("fan:*", "status"), ElementsAre("0", "0"));
    EXPECT_THAT(story.status("system"), ElementsAre("0"));
    EXPECT_THAT(story.read("adapter:1", "alarmStatus"), ElementsAre("1"));
}

TEST(PowerSupplyLossStory, TakesTheEnclosureAwayAndBringsItBack) {
    Story story("power-supply-loss");
    story.advanceTo(0s);
    const std::string before = story.service().document().body();
    story.advanceTo(11s);
    EXPECT_THAT(story.status("adapter:3"), ElementsAre("1"));
    EXPECT_THAT(story.read("adapter:3/logical:*", "writeCacheMode"), Each("0"));
    story.advanceTo(50s);
    EXPECT_EQ(story.listings("adapter:3/enclosure:*"), 0U);
    EXPECT_EQ(story.listings("adapter:3/drive:*"), 0U);
    EXPECT_THAT(story.read("adapter:3/logical:*", "state"), Each("3"));
    EXPECT_THAT(story.status("adapter:3"), ElementsAre("2"));
    EXPECT_THAT(story.status("adapter:1"), ElementsAre("0"));
    EXPECT_THAT(story.events("deviceID"), Contains("6"));
    story.playToTheEnd();
    EXPECT_EQ(story.service().document().body(), before);
}

TEST(LogicalDriveOfflineStory, LosesOneLogicalDriveAndMakesItAnew) {
    Story story("logical-drive-offline");
    story.advanceTo(30s);
    EXPECT_THAT(story.read("logical:*", "state"), Each("2"));
    EXPECT_THAT(story.service().document().body(), HasSubstr(">19</as:percentComplete>"));
    story.advanceTo(31s);
    EXPECT_THAT(story.read("logical:*", "state"), Each("3"));
    EXPECT_THAT(story.service().document().body(), Not(HasSubstr("ac:progress")));
    EXPECT_THAT(story.status("array:0"), ElementsAre("2"));
    story.advanceTo(60s);
    EXPECT_THAT(story.read("logical:0", "state"), Each("1"));
    EXPECT_THAT(story.read("logical:1", "state"), Each("3"));
    story.playToTheEnd();
    EXPECT_EQ(story.listings("logical:1"), 0U);
    EXPECT_THAT(story.read("logical:2", "name"), ElementsAre("Data", "Data"));
    EXPECT_THAT(story.read("array:0/logical:*", "logicalDriveID"), ElementsAre("0", "2"));
    EXPECT_THAT(story.status("array:0"), ElementsAre("1"));
    EXPECT_THAT(story.service().document().body(), Not(HasSubstr("ac:progress")));
}

TEST(EventStormStory, TellsTenThousandEventsInOrder) {
    Story story("event-storm");
    story.playToTheEnd();
    const auto numbers = story.events("sequenceNumber");
    ASSERT_EQ(numbers.size(), 10'000U);
    for (std::size_t i = 0; i < numbers.size(); ++i)
        ASSERT_EQ(numbers[i], std::to_string(i + 1));
    EXPECT_TRUE(std::ranges::is_sorted(story.events("date")));
    EXPECT_EQ(story.service().events().newest(), 10'000);
}

TEST(EventStormStory, ChoosesEvenlyAndByItsSeed) {
    Story story("event-storm");
    story.playToTheEnd();
    std::map<std::string, int> times;
    for (const std::string& device : story.events("deviceID"))
        ++times[device];
    EXPECT_THAT(times, UnorderedElementsAre(Pair("0", AllOf(Ge(2350), Le(2650))),
                                            Pair("1", AllOf(Ge(2350), Le(2650))),
                                            Pair("2", AllOf(Ge(2350), Le(2650))),
                                            Pair("3", AllOf(Ge(2350), Le(2650)))));
    Story other("event-storm", 5);
    other.playToTheEnd();
    EXPECT_NE(other.transcript(), story.transcript());
    EXPECT_EQ(other.events("sequenceNumber"), story.events("sequenceNumber"));
}

// Differs when any byte does, and is the same on every machine.
std::uint64_t fingerprint(std::string_view bytes) {
    std::uint64_t print = 14695981039346656037U;
    for (const char byte : bytes)
        print = (print ^ static_cast<unsigned char>(byte)) * 1099511628211U;
    return print;
}

TEST(EventStormStory, HasTheSameBytesOnEveryMachine) {
    Story story("event-storm");
    story.playToTheEnd();
    EXPECT_EQ(fingerprint(story.service().goodBody(RequestKind::events)), 11512338552750493152U)
        << "if the scenario was changed, this is its new figure";
}

TEST(EventStormStory, SpreadsOverHalfAMinute) {
    Story story("event-storm");
    story.advanceTo(25s);
    EXPECT_THAT(story.events("date"), SizeIs(AllOf(Ge(4980U), Le(5020U))));
}

TEST(FlakyServiceStory, ArmsItsFaultsAndEndsThem) {
    Story story("flaky-service");
    story.advanceTo(8s);
    EXPECT_TRUE(story.service().faults().meetRequest(RequestKind::config).has_value());
    story.advanceTo(20s);
    EXPECT_EQ(story.service().faults().meetRequest(RequestKind::config)->label,
              "adapter case 7: field=physicalSlot");
    story.advanceTo(29s);
    EXPECT_FALSE(story.service().faults().meetRequest(RequestKind::wait).has_value());
    EXPECT_THAT(story.said(), SizeIs(9));
    EXPECT_EQ(story.said().back(), "fault: off");
    EXPECT_THAT(story.said().front(), StartsWith("fault: armed closed-without-a-byte"));
}

TEST(FlakyServiceStory, RepeatsDropsAndDisordersNumbers) {
    Story story("flaky-service");
    story.advanceTo(40s);
    EXPECT_THAT(story.events("sequenceNumber"),
                ElementsAre("39", "40", "41", "42", "43", "44", "45", "45", "51", "50"));
    EXPECT_EQ(story.service().events().newest(), 51);
}

TEST(FlakyServiceStory, IsDownWithAndWithoutItsMemory) {
    Story story("flaky-service");
    story.advanceTo(30s);
    EXPECT_TRUE(story.service().presence().isDown());
    story.advanceTo(33s);
    EXPECT_FALSE(story.service().presence().isDown());
    EXPECT_EQ(story.service().events().newest(), 44);
    story.advanceTo(49s);
    EXPECT_TRUE(story.service().presence().isDown());
    EXPECT_EQ(story.service().events().newest(), 0);
    story.advanceTo(65s);
    EXPECT_THAT(story.events("sequenceNumber"), ElementsAre("1", "2", "3", "4", "5", "6"));
    story.playToTheEnd();
    EXPECT_FALSE(story.service().presence().isDown());
    EXPECT_EQ(story.service().events().newest(), 12);
    EXPECT_EQ(story.events("string").back(), "All is well");
}

}  // namespace
}  // namespace raidsim::test
