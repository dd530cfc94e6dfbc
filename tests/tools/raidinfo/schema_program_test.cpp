#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <nlohmann/json.hpp>

#include "program.h"
#include "simulator.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using testing::HasSubstr;

Result validated(const std::string& documents) {
    Program validator{
        {"/usr/bin/python3", RAIDINFO_TESTS "/validate.py", RAIDINFO_PROGRAM, "schema"}};
    validator.send(documents);
    validator.endInput();
    return validator.finish();
}

std::string line(const std::string& document) { return json::parse(document).dump() + "\n"; }

class Schema : public testing::TestWithParam<std::string> {};

TEST_P(Schema, HoldsForWhatEverySubcommandPrints) {
    std::string documents;
    int count = 0;
    const auto add = [&](const std::vector<std::string>& arguments) {
        SCOPED_TRACE(testing::PrintToString(arguments));
        const Result result = run(arguments);
        documents += line(result.output);
        const bool failed = result.status >= 64 || (result.status == 2 && arguments[0] == "diff");
        EXPECT_EQ(json::parse(result.output)["complete"], !failed);
        ++count;
    };
    add({"list", "--json"});  // Nobody serves yet.
    add({"lists", "--json"});
    {
        Simulator simulator{GetParam()};
        simulator.command("event type=Critical eventCode=101 string=\"Drive failed\"");
        add({"list", "--json"});
        add({"list", "disk_drives", "-o", "+size", "--filter", "state!=1", "--json"});
        add({"show", "logical_drives", "0", "--json"});
        add({"tree", "--json"});
        add({"tree", "--logical", "--json"});
        add({"events", "--count", "1", "--json"});
        add({"snapshot", "before.json", "--json"});
        add({"record", "--for", "0", "saved.rec", "--json"});
        add({"doctor", "--json"});
        add({"health", "--json"});
        simulator.command("set adapter:*/channel:1/drive:* overallStatus=2");
        add({"diff", "before.json", "--json"});
        add({"diff", "before.json", "saved.rec", "--json"});
        add({"diff", "nowhere", "--json"});
    }
    add({"doctor", "--json"});
    add({"list", "--from", "saved.rec", "--json"});
    std::filesystem::remove("before.json");
    std::filesystem::remove("saved.rec");
    const Result result = validated(documents);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.output, std::to_string(count) + " valid\n");
}

INSTANTIATE_TEST_SUITE_P(OfTheSimulator, Schema,
                         testing::Values("small-server.xml", "mixed.xml", "large-rack.xml"),
                         [](const auto& example) {
                             std::string name = example.param.substr(0, example.param.find('.'));
                             std::erase(name, '-');
                             return name;
                         });

TEST(DocumentOfAnotherShape, IsRefusedByTheSchema) {
    const Simulator simulator{"small-server.xml"};
    json document = json::parse(run({"list", "--json"}).output);
    document["data"]["disk_drives"][0]["size"] = "large";
    EXPECT_THAT(validated(document.dump() + "\n").errors, HasSubstr("ValidationError"));
    document["data"] = nullptr;
    document.erase("generated_at");
    EXPECT_THAT(validated(document.dump() + "\n").errors, HasSubstr("generated_at"));
}

}  // namespace
}  // namespace raidinfo::test
