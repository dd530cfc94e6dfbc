#include "readers/reader.h"

#include <array>

#include "agent/agent_link.h"
#include "agent/envelope.h"
#include "readers/peer.h"

namespace raid::bench {
namespace {

const RAIDSystem* modelOfPeers() { return peerModel.get(); }
const RAIDSystem* modelOfLibrary() { return raidSystem; }

constexpr std::array all{
    Reader{"library", &readWithLibrary, &modelOfLibrary},
    Reader{"rapidxml", &readWithRapidxml, &modelOfPeers},
#ifdef RAID_BENCH_ALL_PEERS
    Reader{"pugixml", &readWithPugixml, &modelOfPeers},
    Reader{"expat", &readWithExpat, &modelOfPeers},
    Reader{"libxml2", &readWithLibxml2, &modelOfPeers},
#endif
};

}  // namespace

void readWithLibrary(agent::Document document, int length) {
    processXML(document.release(), length);
}

std::span<const Reader> readers() { return all; }

}  // namespace raid::bench
