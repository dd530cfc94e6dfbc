#pragma once

#include <string>

#include "tools/raidsim/program.h"

namespace raid::test {

// raidsim in a process of its own, serving the small example, told by lines to misbehave.
class Simulator {
public:
    Simulator();

    // Changes a value in the configuration, and changes it back.
    void serveMarked();
    void serveUnmarked();

    // The next client that the case is meant for meets it.
    void arm(const std::string& file, std::size_t caseNumber);
    // Waits until the service stalls.
    void waitForStall();
    // The service is good again; returns what it said since it was armed.
    [[nodiscard]] std::string disarm();

private:
    // Reads lines up to the one that begins so.
    void readThrough(const std::string& start);

    raidsim::test::Program program;
    std::string said;
};

}  // namespace raid::test
