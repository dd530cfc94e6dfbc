#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <poll.h>

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <nlohmann/json.hpp>
#include <regex>
#include <set>
#include <sstream>

#include "documents.h"
#include "program.h"
#include "scripted.h"
#include "simulator.h"
#include "support/files.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using testing::HasSubstr;

json dataOf(const Result& result) {
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.status, 0);
    return json::parse(result.output)["data"];
}

class Recording : public testing::Test {
protected:
    ~Recording() override { std::filesystem::remove(file); }

    std::vector<std::string> from(std::vector<std::string> arguments) const {
        arguments.insert(arguments.end(), {"--from", file});
        return arguments;
    }

    // Until the recorder has written it.
    void waitForFile(const std::string& text) const {
        while (saved().find(text) == std::string::npos) {
            static_cast<void>(poll(nullptr, 0, milliseconds));
        }
    }

    std::string saved() const {
        std::ostringstream content;
        content << std::ifstream{file}.rdbuf();
        return content.str();
    }

    // How often it is written.
    std::size_t occurrences(const std::string& text) const {
        const std::string content = saved();
        std::size_t count = 0;
        for (std::size_t place = content.find(text); place != std::string::npos;
             place = content.find(text, place + 1)) {
            ++count;
        }
        return count;
    }

    int interrupted(Program& recorder) const {
        recorder.signal(SIGINT);
        return recorder.finish().status;
    }

    const std::string file = "saved.rec";

private:
    static constexpr int milliseconds = 5;
};

TEST_F(Recording, ShowsWhatTheServiceShowedWithoutIt) {
    json list;
    json tree;
    {
        Simulator simulator{"mixed.xml"};
        simulator.command("event type=Critical eventCode=101 string=\"Drive & failed\"");
        list = dataOf(run({"list", "--json"}));
        tree = dataOf(run({"tree", "--json"}));
        EXPECT_EQ(run({"record", "--for", "0", file}).status, 0);
    }
    EXPECT_EQ(dataOf(run(from({"list", "--json"}))), list);
    EXPECT_EQ(dataOf(run(from({"tree", "--json"}))), tree);
    EXPECT_EQ(dataOf(run(from({"events", "--json"})))["message_string"], "Drive & failed");
}

// The question for the events is cancelled, and the one behind it answered.
TEST_F(Recording, FailsWhenOneOfItsFirstAnswersDoesNotComeInTime) {
    const ScriptedService service{{answering(newestEventDocument("1")),
                                   Connection{.end = End::hold},
                                   answering(configuration(sampleAdapter()))}};
    const Result result = run({"record", "--timeout", "1", file});
    EXPECT_EQ(result.status, 69);
    EXPECT_THAT(result.errors, HasSubstr("--timeout"));
}

TEST_F(Recording, SaysThatNothingCameInTheTimeToRecord) {
    const ScriptedService service{{Connection{.end = End::hold}, Connection{}, Connection{}}};
    const Result result = run({"record", "--for", "1", file});
    EXPECT_EQ(result.status, 69);
    EXPECT_THAT(result.errors, HasSubstr("within the --for"));
}

TEST_F(Recording, IsPrintedWhereItsFileIsTheStandardOutput) {
    const Simulator simulator{"small-server.xml"};
    const Result result = run({"record", "--for", "0", "-", "--json"});
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.output, testing::StartsWith("raid-recording 1 "));
    EXPECT_FALSE(std::filesystem::exists("-"));
    std::ofstream{file} << result.output;
    EXPECT_EQ(dataOf(run(from({"list", "--json"})))["disk_drives"].size(), 6U);
}

TEST_F(Recording, IsShownAlsoWhileAServiceHasOtherThingsToTell) {
    {
        const Simulator simulator{"small-server.xml"};
        EXPECT_EQ(run({"record", "--for", "0", file}).status, 0);
    }
    const Simulator simulator{"large-rack.xml"};
    EXPECT_EQ(dataOf(run(from({"list", "--json"})))["disk_drives"].size(), 6U);
    EXPECT_EQ(json::parse(run(from({"list", "--json"})).output)["source"]["type"], "recording");
}

TEST_F(Recording, HasTheEventsAndTheConfigurationsThatCameWhileItWasMade) {
    Simulator simulator{"small-server.xml"};
    simulator.command("event string=first");
    Program recorder{raidinfo({"record", file})};
    waitForFile("first");
    simulator.command("set adapter:1/channel:1/drive:3 overallStatus=2");
    simulator.command("event string=second");
    waitForFile("second");
    recorder.signal(SIGINT);
    EXPECT_EQ(recorder.finish().status, 130);
    const Result shown = run(from({"events"}));
    EXPECT_THAT(shown.output, testing::AllOf(HasSubstr("first"), HasSubstr("second")));
    EXPECT_EQ(std::ranges::count(shown.output, '\n'), 2);
    EXPECT_THAT(run(from({"tree"})).output, HasSubstr("Disk drive 3: Critical"));
}

TEST_F(Recording, HasAnEventWhoseNumberIsFarFromThoseBefore) {
    Simulator simulator{"small-server.xml"};
    simulator.command("event string=first");
    Program recorder{raidinfo({"record", file})};
    waitForFile("first");
    simulator.command("event sequenceNumber=500000 string=second");
    waitForFile("second");
    simulator.command("event string=third");
    waitForFile("third");
    EXPECT_EQ(interrupted(recorder), 130);
    EXPECT_EQ(occurrences(" configuration "), 1U);
    EXPECT_LE(occurrences(" events "), 3U);
}

TEST_F(Recording, HasAnAnswerOnceThatComesAgainAndAgain) {
    const std::string malformed = eventBatch({2}).substr(0, 400);
    const auto batch = [](const std::vector<int>& numbers) {
        return answering(eventBatch(numbers));
    };
    const ScriptedService service{
        {answering(newestEventDocument("1")), batch({1}), answering(configuration("")),
         answering(newestEventDocument("2")), answering(malformed), answering(configuration("")),
         answering(newestEventDocument("2")), answering(malformed), answering(configuration("")),
         Connection{.end = End::hold}}};
    Program recorder{raidinfo({"record", file})};
    service.waitFor(9, Stage::requestRead);
    EXPECT_EQ(interrupted(recorder), 130);
    EXPECT_EQ(occurrences(" configuration "), 1U);
    EXPECT_EQ(occurrences(" events "), 2U);
    EXPECT_EQ(occurrences("failure "), 0U);
}

TEST_F(Recording, HasTheEventsOfAServiceThatCountsAnewAfterARestart) {
    Simulator simulator{"small-server.xml"};
    simulator.command("event string=first\nevent string=second");
    Program recorder{raidinfo({"record", file})};
    waitForFile("second");
    simulator.command("down");
    waitForFile("failure ");
    simulator.command("forget\nup\nevent string=third");
    waitForFile("third");
    simulator.command("event string=fourth");
    waitForFile("fourth");
    EXPECT_EQ(interrupted(recorder), 130);
    EXPECT_EQ(occurrences("failure "), 1U);
    EXPECT_EQ(occurrences(" configuration "), 1U);
}

TEST_F(Recording, DoesNotTakeItsOwnEndForTheServices) {
    const Simulator simulator{"small-server.xml"};
    EXPECT_EQ(run({"record", "--for", "1", file}).status, 0);
    EXPECT_EQ(occurrences("failure "), 0U);
}

TEST_F(Recording, KeepsItsConfigurationWhenItIsInterruptedWhileItAsksForTheNext) {
    {
        const ScriptedService service{
            {answering(newestEventDocument("1")), answering(eventBatch({1})),
             answering(configuration(sampleAdapter())), answering(newestEventDocument("2")),
             answering(eventBatch({2})), Connection{.end = End::hold}}};
        Program recorder{raidinfo({"record", file})};
        service.waitFor(5, Stage::requestRead);
        EXPECT_EQ(interrupted(recorder), 130);
    }
    EXPECT_EQ(occurrences("failure "), 0U);
    EXPECT_THAT(run(from({"tree"})).output, HasSubstr("Pellion 4220"));
}

TEST_F(Recording, IsShownByItsLastConfigurationThatCanBeRead) {
    const std::string good = configuration(sampleAdapter());
    const auto answer = [](const std::string& body) {
        return "answer 0 configuration " + std::to_string(body.size()) + "\n" + body + "\n";
    };
    raid::test::writeFile(file, "raid-recording 1 2026-11-21T17:48:00Z\n" + answer(good) +
                                    answer(good.substr(0, 500)) + "failure 0 configuration\n");
    const Result shown = run(from({"tree"}));
    EXPECT_EQ(shown.status, 0);
    EXPECT_THAT(shown.output, HasSubstr("Pellion 4220"));
}

// Everything between the tags of this element, wherever it stands.
std::set<std::string> textsOf(const std::string& element, const std::string& document) {
    const std::regex tags{"<" + element + "[^>]*>([^<]+)</" + element + ">"};
    std::set<std::string> texts;
    for (std::sregex_iterator match{document.begin(), document.end(), tags}, end; match != end;
         ++match) {
        texts.insert((*match)[1]);
    }
    return texts;
}

TEST_F(Recording, ThatIsRedactedHasNoSerialNumber) {
    const Simulator simulator{"mixed.xml"};
    EXPECT_EQ(run({"record", "--redact", "--for", "0", file}).status, 0);
    const std::string saved = raid::test::readFile(file);
    const auto serials =
        textsOf("as:serialNumber", raid::test::readFile(RAID_EXAMPLES "/mixed.xml"));
    EXPECT_GT(serials.size(), 10U);
    for (const std::string& serial : serials) {
        EXPECT_EQ(saved.find(serial), std::string::npos) << serial;
    }
    EXPECT_EQ(textsOf("as:serialNumber", saved).size(), serials.size());
}

TEST_F(Recording, ThatIsRedactedHasNothingOfTheServerInItsEvents) {
    Simulator simulator{"mixed.xml"};
    simulator.obey("event serverName=payroll serverAddress=198.51.100.7 string=\"on payroll\"");
    EXPECT_EQ(run({"record", "--redact", "--for", "0", file}).status, 0);
    const std::string saved = raid::test::readFile(file);
    EXPECT_THAT(saved, testing::Not(HasSubstr("payroll")));
    EXPECT_THAT(saved, testing::Not(HasSubstr("198.51.100.7")));
    const std::string shown = run(from({"events"})).output;
    const std::regex sameNameTwice{"on (NAME-[0-9]+) .*server \\1, address ADDRESS-[0-9]+"};
    EXPECT_TRUE(std::regex_search(shown, sameNameTwice)) << shown;
}

TEST_F(Recording, ThatIsRedactedHasNothingOfADriveThatIsInsertedMeanwhile) {
    Simulator simulator{"small-server.xml"};
    simulator.command("event string=first");
    Program recorder{raidinfo({"record", "--redact", file})};
    waitForFile("first");
    simulator.command(
        "add adapter:1/channel:1/drive:9 like adapter:1/channel:1/drive:3 serialNumber=SECRET0099\n"
        "event string=\"drive SECRET0099 inserted\"");
    waitForFile("inserted");
    EXPECT_EQ(interrupted(recorder), 130);
    EXPECT_EQ(occurrences("SECRET0099"), 0U);
    EXPECT_EQ(occurrences(" configuration "), 2U);
}

TEST_F(Recording, ThatIsRedactedHasNoEventsWithoutAConfigurationThatKnowsTheirNames) {
    const ScriptedService service{{answering(newestEventDocument("1")), answering(eventBatch({1})),
                                   answering(configuration("")),
                                   answering(newestEventDocument("2")), answering(eventBatch({2})),
                                   Connection{}, Connection{.end = End::hold}}};
    Program recorder{raidinfo({"record", "--redact", file})};
    service.waitFor(6, Stage::requestRead);
    EXPECT_EQ(interrupted(recorder), 130);
    EXPECT_EQ(occurrences("event 1"), 1U);
    EXPECT_EQ(occurrences("event 2"), 0U);
}

// The tree with one text for every serial number.
json withoutSerials(json tree) {
    for (auto& [key, value] : tree.items()) {
        if (value.is_structured()) {
            value = withoutSerials(value);
        } else if (key == "serial_number" && value != "") {
            value = "a serial number";
        }
    }
    return tree;
}

TEST_F(Recording, ThatIsRedactedShowsTheSameTreeButForTheSerialNumbers) {
    json tree;
    {
        const Simulator simulator{"mixed.xml"};
        tree = dataOf(run({"tree", "--json"}));
        EXPECT_EQ(run({"record", "--redact", "--for", "0", file}).status, 0);
    }
    const json redacted = dataOf(run(from({"tree", "--json"})));
    EXPECT_NE(redacted, tree);
    EXPECT_EQ(withoutSerials(redacted), withoutSerials(tree));
    EXPECT_THAT(run(from({"tree"})).output, HasSubstr("serial number "));
}

TEST_F(Recording, OfAMalformedAnswerIsMalformed) {
    {
        const ScriptedService service{{answering(newestEventDocument("0")),
                                       answering(eventBatch({})),
                                       answering("<?xml version='1.0'?><env:Envelope>")}};
        EXPECT_EQ(run({"record", "--for", "0", file}).status, 0);
    }
    const Result result = run(from({"list"}));
    EXPECT_EQ(result.status, 76);
    EXPECT_THAT(result.errors, HasSubstr("malformed"));
}

TEST_F(Recording, ShowsTheEventsOfAServiceThatBeganToCountAnew) {
    std::ofstream recording{file};
    recording << "raid-recording 1 2026-11-21T17:48:00Z\n";
    for (const std::string& body : {eventBatch({7, 8}), otherEventBatch({1, 2}), eventBatch({3})}) {
        recording << "answer 0 events " << body.size() << '\n' << body << '\n';
    }
    recording.close();
    const Result result = run(from({"events"}));
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.errors, testing::MatchesRegex("raidinfo: [^\n]* count anew\n"));
    EXPECT_THAT(result.output, testing::ContainsRegex("7  .*\n8  .*\n1  .*\n2  .*\n3  "));
}

TEST_F(Recording, ThatIsNoneIsRefused) {
    std::ofstream{file} << "something else\n";
    const Result result = run(from({"list"}));
    EXPECT_EQ(result.status, 65);
    EXPECT_THAT(result.errors, testing::MatchesRegex("raidinfo: saved.rec: [^\n]*\n"));
}

TEST_F(Recording, IsNotMadeWithoutAService) {
    const Result result = run({"record", "--for", "0", file});
    EXPECT_EQ(result.status, 69);
    EXPECT_THAT(result.errors, HasSubstr("does not answer"));
}

TEST_F(Recording, ThatIsThereIsKeptWhenTheServiceDoesNotAnswer) {
    raid::test::writeFile(file, "an earlier recording");
    EXPECT_EQ(run({"record", "--for", "0", file}).status, 69);
    EXPECT_EQ(raid::test::readFile(file), "an earlier recording");
}

TEST_F(Recording, IsNothingToWatchRecordOrExamine) {
    {
        const Simulator simulator{"small-server.xml"};
        EXPECT_EQ(run({"record", "--for", "0", file}).status, 0);
    }
    for (const std::vector<std::string>& command :
         std::vector<std::vector<std::string>>{{"watch"}, {"doctor"}, {"record", "other.rec"}}) {
        EXPECT_EQ(run(from(command)).status, 64) << command.front();
    }
}

}  // namespace
}  // namespace raidinfo::test
