#pragma once

#include <filesystem>
#include <string>

#include "program.h"

namespace raidinfo::test {

// The simulated service with one of the shipped configurations, or another by its absolute path.
class Simulator {
public:
    explicit Simulator(const std::filesystem::path& example)
        : program{{RAIDSIM_PROGRAM, std::filesystem::path{RAID_EXAMPLES} / example}} {
        program.waitForOutput("listening");
    }

    void command(const std::string& line) { program.send(line + "\n"); }

    // Returns when the service has done what the lines say. Leaves an event behind.
    void obey(const std::string& lines) {
        constexpr int farApart = 1000;
        newestEvent += farApart;
        const std::string number = std::to_string(newestEvent);
        command(lines + "\nevent sequenceNumber=" + number + "\nstatus");
        program.waitForOutput("newest " + number);
    }

private:
    Program program;
    int newestEvent = 0;
};

}  // namespace raidinfo::test
