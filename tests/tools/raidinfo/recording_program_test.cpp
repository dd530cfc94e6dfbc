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
#include "simulator.h"
#include "support/files.h"
#include "support/scripted_service.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using raid::test::answering;
using raid::test::ScriptedService;
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
    void waitForFile(const std::string& first, const std::string& behindIt = "") const {
        for (bool found = false; !found; static_cast<void>(poll(nullptr, 0, milliseconds))) {
            std::ostringstream content;
            content << std::ifstream{file}.rdbuf();
            const std::size_t place = content.str().find(first);
            found = place != std::string::npos &&
                    content.str().find(behindIt, place) != std::string::npos;
        }
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
    // The configuration is asked for behind the events.
    waitForFile("second", "</m:getConfigResponse>");
    recorder.signal(SIGINT);
    EXPECT_EQ(recorder.finish().status, 130);
    const Result shown = run(from({"events"}));
    EXPECT_THAT(shown.output, testing::AllOf(HasSubstr("first"), HasSubstr("second")));
    EXPECT_EQ(std::ranges::count(shown.output, '\n'), 2);
    EXPECT_THAT(run(from({"tree"})).output, HasSubstr("Disk drive 3: Critical"));
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
        const ScriptedService service{{answering("<?xml version='1.0'?><env:Envelope>"),
                                       answering(raid::test::newestEventDocument("0")),
                                       answering(eventBatch({}))}};
        EXPECT_EQ(run({"record", "--for", "0", file}).status, 0);
    }
    const Result result = run(from({"list"}));
    EXPECT_EQ(result.status, 76);
    EXPECT_THAT(result.errors, HasSubstr("malformed"));
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
