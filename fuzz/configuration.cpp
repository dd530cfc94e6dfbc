// Lets the library read a configuration and publish it, from the answer to the twelve lists.

#include <vector>

#include "../tests/support/inventory_lists.h"
#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "flat/lists.h"
#include "flat/snapshot.h"
#include "support/input.h"
#include "support/require.h"
#include "support/served_answer.h"

namespace {

using namespace raid;

std::vector<std::size_t> sizes() {
    std::vector<std::size_t> all;
    test::forEachInventoryList([&](const auto& list) { all.push_back(list.size()); });
    return all;
}

/// Reads what was published as a host does, with a buffer as large as the answer.
void readPublished(std::size_t answerSize) {
    std::vector<char> buffer(answerSize + 16);
    for (int at = 0; at < getPellionAdapterCount(); ++at) {
        getPellionAdapterSerialNumber(buffer.data(), at);
        getPellionAdapterOverallStatusString(buffer.data(), at);
    }
    for (int at = 0; at < getRAIDDiskDriveCount(); ++at) {
        getRAIDDiskDriveVendor(buffer.data(), at);
        getRAIDDiskDriveDiskDriveIDString(buffer.data(), at);
    }
    const auto adapters = raidSystem->getAdapters();
    fuzz::require(adapters.size() >=
                      PellionAdapterList.size() + LSIAdapterList.size() + VantryAdapterList.size(),
                  "every published adapter comes from the document");
}

}  // namespace

int LLVMFuzzerInitialize(int* /*argc*/, char*** /*argv*/) {
    configRead = 1;
    LOG_LEVEL = 1;
    return 0;
}

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto answer = fuzz::inEnvelope(fuzz::textOf(data, size), "getConfigResponse");
    fuzz::serve(answer);
    const auto before = sizes();
    RAIDinit();
    if (raidSystem == nullptr) {
        fuzz::require(sizes() == before, "a malformed answer leaves the lists alone");
        return 0;
    }
    const auto once = sizes();
    readPublished(answer.size());
    setRefreshFlag();
    (void)getChannelCount();
    fuzz::require(sizes() == once, "the same answer publishes the same lists");
    return 0;
}
