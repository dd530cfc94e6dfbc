#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <utility>
#include <vector>

#include "support/files.h"
#include "terminal.h"

namespace completion::test {
namespace {

using raid::test::writeFile;

// What is typed, and what stands there after the tabulator key.
using Completed = std::vector<std::pair<std::string, std::string>>;

void expectCompleted(const std::string& program, const Completed& lines) {
    Terminal terminal(program);
    for (const auto& [typed, line] : lines)
        EXPECT_EQ(terminal.completed(typed), line) << typed;
}

TEST(CompletionOfRaidsim, CompletesItsWords) {
    expectCompleted(RAIDSIM_PROGRAM, {
                                         {"raidsim gen", "raidsim generate "},
                                         {"raidsim comp", "raidsim completion "},
                                         {"raidsim --sc", "raidsim --scenario "},
                                         {"raidsim --port 0 --sc", "raidsim --port 0 --scenario "},
                                         {"raidsim generate --ada", "raidsim generate --adapters "},
                                         {"raidsim generate --sc", "raidsim generate --sc"},
                                         {"raidsim --clock v", "raidsim --clock virtual "},
                                         {"raidsim --clock=v", "raidsim --clock=virtual "},
                                         {"raidsim --port gen", "raidsim --port gen"},
                                     });
}

TEST(CompletionOfRaidsim, CompletesFiles) {
    std::filesystem::create_directory("generated");
    writeFile("small.xml", "");
    writeFile("two words.scenario", "");
    writeFile("a=b.rec", "");
    expectCompleted(RAIDSIM_PROGRAM,
                    {
                        {"raidsim sma", "raidsim small.xml "},
                        {"raidsim --scenario two", "raidsim --scenario two\\ words.scenario "},
                        {"raidsim --scenario two\\ wo", "raidsim --scenario two\\ words.scenario "},
                        {"raidsim --scenario 'two wo", "raidsim --scenario 'two words.scenario' "},
                        {"raidsim --init=sma", "raidsim --init=small.xml "},
                        {"raidsim --replay a=b", "raidsim --replay a=b.rec "},
                        {"raidsim --fault generat", "raidsim --fault generated/"},
                        {"raidsim generate > sma", "raidsim generate > small.xml "},
                        {"raidsim small.xml sma", "raidsim small.xml sma"},
                    });
}

TEST(CompletionOfRaidinfo, CompletesItsWords) {
    // Only files are completed as files.
    std::filesystem::create_directory("health");
    expectCompleted(
        RAIDINFO_PROGRAM,
        {
            {"raidinfo hea", "raidinfo health "},
            {"raidinfo health --na", "raidinfo health --nagios "},
            {"raidinfo list fa", "raidinfo list fans "},
            {"raidinfo show fans fa", "raidinfo show fans fa"},
            {"raidinfo --color al", "raidinfo --color always "},
            {"raidinfo --color=al", "raidinfo --color=always "},
            {"raidinfo list fans -o ind", "raidinfo list fans -o index "},
            {"raidinfo list fans -o +index,pos", "raidinfo list fans -o +index,position "},
        });
}

// "*" is the name of a column to nobody, but the shell takes it for these files, or for all
// columns.
TEST(CompletionOfRaidinfo, TakesAListForWhatIsTypedWhateverFilesThereAre) {
    std::filesystem::create_directory("columns");
    const std::filesystem::path before = std::filesystem::current_path();
    std::filesystem::current_path("columns");
    writeFile("index", "");
    expectCompleted(RAIDINFO_PROGRAM,
                    {
                        {"raidinfo list fans -o '*,ind", "raidinfo list fans -o '*,index' "},
                        {"raidinfo list fans -o 'i*,ind", "raidinfo list fans -o 'i*,index' "},
                        {"raidinfo list fans -o index,ind", "raidinfo list fans -o index,ind"},
                    });
    std::filesystem::current_path(before);
}

TEST(CompletionOfRaidinfo, StartsAFilterThatGoesOn) {
    expectCompleted(RAIDINFO_PROGRAM,
                    {
                        {"raidinfo list fans --filter ind", "raidinfo list fans --filter index"},
                        {"raidinfo list fans --filter=ind", "raidinfo list fans --filter=index"},
                    });
}

}  // namespace
}  // namespace completion::test
