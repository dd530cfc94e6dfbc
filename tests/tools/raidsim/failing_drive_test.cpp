#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "control/player.h"
#include "running_service.h"
#include "vocabulary.h"

namespace raidsim::test {
namespace {

using namespace std::chrono_literals;
using testing::Each;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

// The failing drive on the small server, by the scenario's own clock.
class FailingDrive : public testing::Test {
protected:
    void advanceTo(std::chrono::milliseconds elapsed) {
        player.advanceTo(elapsed, [&](const ScriptLine& line) { line.command(service); });
        EXPECT_THAT(unknownIn(service.document()), IsEmpty());
    }
    std::vector<std::string> read(std::string_view path, const std::string& field) {
        return values(service.document(), path, field);
    }
    std::vector<std::string> status(std::string_view path) { return read(path, "overallStatus"); }
    std::size_t listings(std::string_view path) { return count(service.document(), path); }

    Service service = makeService(example("small-server.xml"));
    ScenarioPlayer player{parseScenario(example("failing-drive.scenario"))};
    const std::string failing = "adapter:1/channel:1/drive:3";
    const std::string spare = "adapter:1/channel:2/drive:1";
};

TEST_F(FailingDrive, BeginsWithTheFailureAtSecondTwo) {
    const std::string before = service.document().body();
    advanceTo(1999ms);
    EXPECT_EQ(service.document().body(), before);
    EXPECT_EQ(service.events().newest(), 0);

    advanceTo(2s);
    EXPECT_THAT(read(failing, "state"), ElementsAre("4", "4"));
    EXPECT_THAT(status(failing), Each("2"));
    EXPECT_THAT(status("system"), ElementsAre("2"));
    EXPECT_THAT(status("adapter:1"), ElementsAre("2"));
    EXPECT_THAT(status("array:0"), ElementsAre("1"));
    EXPECT_THAT(read("logical:*", "state"), Each("1"));
    EXPECT_EQ(service.events().newest(), 3);
    EXPECT_THAT(service.events().body(1, 1), HasSubstr("Drive failed"));
}

TEST_F(FailingDrive, RebuildsOntoTheHotSpare) {
    advanceTo(5s);
    EXPECT_EQ(listings("array:0/" + failing), 0U);
    EXPECT_EQ(listings("array:0/channel:2/drive:1"), 1U);
    EXPECT_EQ(listings("spares/drive:*"), 0U);
    EXPECT_THAT(read(spare, "state"), Each("3"));
    EXPECT_THAT(read("logical:*", "state"), Each("2"));
    EXPECT_THAT(status("array:0"), ElementsAre("1"));
    EXPECT_THAT(status("system"), ElementsAre("2"));
    EXPECT_THAT(service.document().body(), HasSubstr(">25</as:percentComplete>"));
    EXPECT_EQ(service.events().newest(), 5);
}

TEST_F(FailingDrive, RecoversAndGetsANewHotSpare) {
    advanceTo(8s);
    EXPECT_THAT(read(spare, "state"), Each("1"));
    EXPECT_THAT(read("logical:*", "state"), Each("0"));
    EXPECT_THAT(status("array:0"), ElementsAre("0"));
    EXPECT_THAT(status("system"), ElementsAre("2"));  // the failed drive is still there

    advanceTo(10s);
    EXPECT_EQ(player.nextDue(), std::nullopt);
    EXPECT_THAT(read(failing, "state"), ElementsAre("2", "2"));
    EXPECT_EQ(listings("spares/" + failing), 1U);
    EXPECT_THAT(status("system"), ElementsAre("0"));
    EXPECT_THAT(service.document().body(), Not(HasSubstr("ac:progress")));
    EXPECT_EQ(service.events().newest(), 10);
}

}  // namespace
}  // namespace raidsim::test
