// Lets the library meet every case of every fault file, and holds it to what the file expects.

#include <gtest/gtest.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <memory>
#include <set>
#include <string>
#include <vector>

#include "fault/fault_file.h"
#include "flat/exported.h"
#include "host.h"
#include "support/fresh_library.h"
#include "support/lock.h"
#include "support/open_descriptors.h"
#include "support/row.h"

namespace {

using namespace raid::test;
using raidsim::Fate;
using raidsim::FaultCase;
using raidsim::FaultFile;
using raidsim::FaultOutcome;
using raidsim::LogExpectation;

// How many cases of one file run in one test.
constexpr std::size_t casesAtOnce = 2000;

// Some cases of a file.
struct Portion {
    std::string name;  // of its test
    std::string path;
    std::size_t first;
    std::size_t last;

    friend std::ostream& operator<<(std::ostream& out, const Portion& portion) {
        return out << portion.path;
    }
};

std::string testName(const std::string& path, std::size_t part) {
    std::string name = std::filesystem::path(path).lexically_relative(RAID_FAULTS).string();
    name = name.substr(0, name.rfind('.')) + (part == 0 ? "" : "_part" + std::to_string(part));
    std::ranges::replace_if(
        name, [](unsigned char c) { return std::isalnum(c) == 0; }, '_');
    return name;
}

std::vector<Portion> portions() {
    std::set<std::string> files;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(RAID_FAULTS)) {
        if (entry.path().extension() == ".fault") {
            files.insert(entry.path().string());
        }
    }
    std::vector<Portion> all;
    for (const auto& path : files) {
        const FaultFile file(path);
        for (std::size_t first = 0; first < file.cases(); first += casesAtOnce) {
            all.push_back({testName(path, first / casesAtOnce), path, first,
                           std::min(first + casesAtOnce, file.cases())});
        }
    }
    return all;
}

// Ends the process with a message when a call does not return in time.
class Deadline {
public:
    Deadline(const std::string& label, std::chrono::seconds time) {
        message = "Still under the fault: " + label + "\n";
        struct sigaction late {};
        late.sa_handler = [](int) {
            (void)!write(STDERR_FILENO, message.data(), message.size());
            _exit(1);
        };
        sigaction(SIGALRM, &late, nullptr);
        alarm(static_cast<unsigned>(time.count()));
    }
    Deadline(const Deadline&) = delete;
    Deadline& operator=(const Deadline&) = delete;
    ~Deadline() { alarm(0); }

private:
    inline static std::string message;
};

void expectLog(const std::string& log, const LogExpectation& expected) {
    switch (expected.kind) {
        case LogExpectation::Kind::exact:
            EXPECT_EQ(log, expected.text);
            break;
        case LogExpectation::Kind::has:
            EXPECT_NE(log.find(expected.text), std::string::npos) << "The log:\n"
                                                                  << log << "\nlacks:\n"
                                                                  << expected.text;
            break;
        case LogExpectation::Kind::ends:
            EXPECT_TRUE(log.ends_with(expected.text)) << "The log:\n"
                                                      << log << "\ndoes not end so:\n"
                                                      << expected.text;
            break;
    }
}

std::set<int> levelsOf(const FaultOutcome& outcome) {
    std::set<int> levels;
    for (const auto& expected : outcome.log) {
        levels.insert(expected.level);
    }
    return levels.empty() ? std::set{1} : levels;
}

class FaultScripts : public FreshLibrary, public testing::WithParamInterface<Portion> {
protected:
    void meet(std::size_t number, const FaultCase& chosen, int level) {
        const FaultOutcome& outcome = chosen.outcome;
        host.startGood(outcome);
        const auto descriptors = openDescriptors().size();
        simulator.arm(GetParam().path, number);
        int result = 0;
        {
            const Deadline deadline(label(number, chosen), outcome.within);
            result = host.call(outcome, level);
        }
        expectOutcome(outcome, level, result);
        const auto said = simulator.disarm();
        EXPECT_TRUE(chosen.refuses || said.find(" case ") != std::string::npos)
            << "the service met nobody: " << said;
        EXPECT_EQ(said.find("cannot be played"), std::string::npos) << said;
        expectSound(descriptors, outcome);
    }

    [[nodiscard]] static std::string label(std::size_t number, const FaultCase& chosen) {
        return GetParam().path + " case " + std::to_string(number) + " " + chosen.values;
    }

    int leftOpen = 0;

private:
    void expectOutcome(const FaultOutcome& outcome, int level, int result) const {
        if (outcome.configuration != Fate::unsaid) {
            EXPECT_EQ(static_cast<int>(host.configuration()),
                      static_cast<int>(outcome.configuration))
                << "1: kept, 2: lost, 3: replaced";
        }
        if (outcome.events != Fate::unsaid) {
            EXPECT_EQ(static_cast<int>(host.events()), static_cast<int>(outcome.events))
                << "1: kept, 2: lost, 3: replaced";
        }
        EXPECT_EQ(result, outcome.result.value_or(result)) << "the call's result";
        EXPECT_EQ(nextSequenceNumber, outcome.next.value_or(nextSequenceNumber));
        for (const auto& [family, count] : outcome.counts) {
            EXPECT_EQ(exported<int()>("get" + family + "Count")(), count) << family;
        }
        const auto log = Host::log();
        for (const auto& expected : outcome.log) {
            if (expected.level == level) {
                expectLog(log, expected);
            }
        }
    }

    // What must hold after every fault.
    void expectSound(std::size_t descriptors, const FaultOutcome& outcome) {
        EXPECT_TRUE(threads.isReachedAgain());
        EXPECT_EQ(openDescriptors().size(),
                  descriptors + static_cast<std::size_t>(outcome.leftOpen));
        leftOpen += outcome.leftOpen;
        EXPECT_TRUE(isFree(mutex_handle));
        EXPECT_TRUE(host.isGoodAgain()) << "the next good answer is not published";
    }

    const ThreadCount threads;
    Simulator simulator;
    Host host{simulator};
};

TEST_P(FaultScripts, LeaveTheHostAsTheySay) {
    const FaultFile file(GetParam().path);
    for (std::size_t number = GetParam().first; number < GetParam().last; ++number) {
        const auto chosen = file.at(number);
        for (const int level : levelsOf(chosen.outcome)) {
            SCOPED_TRACE(label(number, chosen) + ", level " + std::to_string(level));
            meet(number, chosen, level);
            if (HasFailure()) {
                return;  // what follows would only repeat it
            }
        }
    }
    expectOpenDescriptors(leftOpen);
}

INSTANTIATE_TEST_SUITE_P(In, FaultScripts, testing::ValuesIn(portions()),
                         [](const auto& instance) { return instance.param.name; });

}  // namespace
