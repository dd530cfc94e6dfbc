// What docs/ says about the simulator.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

#include "control/command.h"
#include "control/player.h"
#include "program.h"
#include "running_service.h"
#include "support/files.h"
#include "text.h"
#include "vocabulary.h"

namespace raidsim::test {
namespace {

using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

std::string document(const std::string& name) {
    return raid::test::readFile(std::string(RAIDSIM_DOCS) + "/" + name);
}

// The indented blocks of a document between two texts.
std::vector<std::string> blocksBetween(const std::string& text, const std::string& first,
                                       const std::string& last) {
    const auto start = text.find(first);
    const std::string part = text.substr(start, text.find(last, start) - start);
    std::vector<std::string> blocks;
    bool inside = false;
    for (const std::string_view line : split(part, '\n')) {
        if (line.starts_with("    ")) {
            if (!inside)
                blocks.emplace_back();
            blocks.back().append(line.substr(4)).append("\n");
        }
        inside = line.starts_with("    ") || (inside && line.empty());
    }
    return blocks;
}

TEST(DocumentsOfTheSimulator, NameEveryCommand) {
    Service service = makeService(smallSystem());
    const std::string help = run("help", service).message;
    const std::string control = document("raidsim.md");
    const std::string scenarios = document("scenarios.md");
    for (const std::string_view line : split(help, '\n')) {
        const std::string name = "`" + std::string(line.substr(0, line.find(' ')));
        EXPECT_THAT(control, HasSubstr("| " + name));
        EXPECT_THAT(scenarios, HasSubstr(name));
    }
}

TEST(DocumentsOfTheSimulator, NameEveryOption) {
    const std::string page = document("raidsim.md");
    const std::string help = Program({"--help"}).readOutput();
    int options = 0;
    for (const std::string_view line : split(help, '\n')) {
        if (!line.starts_with("  --"))
            continue;
        ++options;
        const std::string_view option = line.substr(2);
        EXPECT_THAT(page, HasSubstr("`" + std::string(option.substr(0, option.find(' ')))));
    }
    EXPECT_GE(options, 10);
}

TEST(DocumentsOfTheSimulator, ShowScenariosThatCanBePlayed) {
    const auto shown = blocksBetween(document("scenarios.md"), "## Examples", "These lie in");
    EXPECT_THAT(shown, SizeIs(3));
    for (const std::string& text : shown) {
        Service service = makeService(example("small-server.xml"));
        ScenarioPlayer player(parseScenario(text, std::string(RAIDSIM_EXAMPLES) + "/scenarios"));
        player.advanceTo(std::chrono::hours(1), [&](const ScriptLine& line) {
            EXPECT_NO_THROW(line.command(service)) << text;
        });
        EXPECT_THAT(unknownIn(service.document()), IsEmpty());
    }
}

TEST(DocumentsOfTheSimulator, ShowCommandsThatCanBeCarriedOut) {
    const std::string page = document("raidsim.md");
    Service service = makeService(example("small-server.xml"));
    run("event sequenceNumber=41", service);
    for (const auto& [first, last] : std::vector<std::pair<std::string, std::string>>{
             {"until something in it changes", "`join` and `leave` likewise"},
             {"### Hot plugging", "The path of what is added"},
             {"events added last are kept", "A service that counts wrong"},
             {"they were told:", "| `place=`"}}) {
        const auto shown = blocksBetween(page, first, last);
        ASSERT_THAT(shown, SizeIs(1)) << first;
        for (const std::string_view line : split(shown.front(), '\n'))
            EXPECT_NO_THROW(run(line, service)) << line;
    }
    EXPECT_THAT(unknownIn(service.document()), IsEmpty());
}

}  // namespace
}  // namespace raidsim::test
