#include "simulator.h"

#include <stdexcept>

namespace raid::test {

Simulator::Simulator()
    : program({"--init", RAID_EXAMPLES "/small-server.init", RAID_EXAMPLES "/small-server.xml"}) {
    readThrough("raidsim: listening");
}

void Simulator::serveMarked() {
    program.type("set adapter:1/channel:1 transferSpeed=160\n");
    (void)disarm();
}

void Simulator::serveUnmarked() {
    program.type("set adapter:1/channel:1 transferSpeed=320\n");
    (void)disarm();
}

void Simulator::arm(const std::string& file, std::size_t caseNumber) {
    program.type("fault \"" + file + "\" " + std::to_string(caseNumber) + "\n");
    readThrough("fault: armed");
    said.clear();
}

void Simulator::waitForStall() { readThrough("fault: stalled"); }

std::string Simulator::disarm() {
    program.type("fault off\n");
    readThrough("fault: off");
    return said;
}

void Simulator::readThrough(const std::string& start) {
    for (;;) {
        const std::string line = program.readLine();
        if (line.empty()) {
            throw std::runtime_error("raidsim ended: " + program.readErrors());
        }
        said.append(line).append("\n");
        if (line.starts_with(start)) {
            return;
        }
    }
}

}  // namespace raid::test
