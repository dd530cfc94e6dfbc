#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <csignal>
#include <filesystem>
#include <fstream>
#include <functional>
#include <map>
#include <regex>
#include <set>
#include <string>

#include "documents.h"
#include "program.h"
#include "scripted.h"
#include "simulator.h"

namespace raidinfo::test {
namespace {

int statusInShell(const std::string& prefix, const std::string& command) {
    return Program{{"/bin/sh", "-c", prefix + "exec \"$0\" " + command, RAIDINFO_PROGRAM}}
        .finish()
        .status;
}

int statusWith(const std::string& change, const std::vector<std::string>& arguments) {
    Simulator simulator{"small-server.xml"};
    simulator.command(change);
    simulator.command("event string=done");
    Program events{raidinfo({"events", "--count", "1"})};
    static_cast<void>(events.finish());
    return run(arguments).status;
}

int statusAfter(int signal) {
    const ScriptedService service{{Connection{.end = End::hold}}};
    // A shell's background job inherits that some signals are ignored.
    Program program{{"/usr/bin/env", "--default-signal", RAIDINFO_PROGRAM, "tree"}};
    service.waitFor(0, Stage::answered);
    program.signal(signal);
    return program.finish().status;
}

int statusWithFile(const std::string& content, const std::vector<std::string>& arguments) {
    std::ofstream{"file"} << content;
    const int status = run(arguments).status;
    std::filesystem::remove("file");
    return status;
}

int statusOfMalformedAnswers() {
    const ScriptedService service{
        {answering("<"), answering(newestEventDocument("0")), answering("<")}};
    return run({"tree"}).status;
}

// How to come by each exit status.
const std::map<int, std::function<int()>> ways{
    {0, [] { return statusWith("", {"health"}); }},
    {1, [] { return statusWith("set adapter:1 overallStatus=1", {"health"}); }},
    {2,
     [] {
         return run({"diff", "nowhere"}).status;
     }},
    {3, [] { return run({"health"}).status; }},
    {64, [] { return run({"lists"}).status; }},
    {65,
     [] {
         return statusWithFile("no recording", {"list", "--from", "file"});
     }},
    {66,
     [] {
         return run({"list", "--from", "nowhere"}).status;
     }},
    {69, [] { return run({"list"}).status; }},
    {70,
     [] {
         // Too little address space for the buffer of texts.
         const Simulator simulator{"small-server.xml"};
         return statusInShell("ulimit -v 600000; ", "list");
     }},
    {72,
     [] {
         return run({"list", "--library", "nowhere.so"}).status;
     }},
    {73,
     [] {
         return statusWith("", {"snapshot", "nowhere/file"});
     }},
    {74,
     [] {
         const Simulator simulator{"small-server.xml"};
         return Program{{"/bin/sh", "-c", "exec \"$0\" list >/dev/full", RAIDINFO_PROGRAM}}
             .finish()
             .status;
     }},
    {76, statusOfMalformedAnswers},
    {129, [] { return statusAfter(SIGHUP); }},
    {130, [] { return statusAfter(SIGINT); }},
    {131, [] { return statusAfter(SIGQUIT); }},
    {143, [] { return statusAfter(SIGTERM); }},
};

class ExitStatus : public testing::TestWithParam<int> {};

TEST_P(ExitStatus, IsAsDocumented) { EXPECT_EQ(ways.at(GetParam())(), GetParam()); }

std::vector<int> statuses() {
    std::vector<int> numbers;
    for (const auto& [number, way] : ways) {
        numbers.push_back(number);
    }
    return numbers;
}

INSTANTIATE_TEST_SUITE_P(OfEachKind, ExitStatus, testing::ValuesIn(statuses()),
                         [](const auto& status) { return std::to_string(status.param); });

TEST(TableOfExitStatuses, NamesThoseThereAre) {
    std::ifstream document{RAIDINFO_DOCUMENT};
    std::set<int> documented;
    bool inTable = false;
    for (std::string line; std::getline(document, line);) {
        inTable = line.starts_with("#") ? line == "## Exit status" : inTable;
        std::smatch row;
        if (inTable && std::regex_search(line, row, std::regex{"^\\| ([0-9]+) \\|"})) {
            documented.insert(std::stoi(row[1]));
        }
    }
    const std::vector<int> known = statuses();
    EXPECT_EQ(documented, (std::set<int>{known.begin(), known.end()}));
}

}  // namespace
}  // namespace raidinfo::test
