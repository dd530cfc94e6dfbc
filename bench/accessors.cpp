// The accessors, through the library as hosts load it, against reading the same of the exported
// list.
//
//   bench_accessors DOCUMENT [arguments of the harness]
//
// names what the service answers with, which must be listening. The times are those of the loop
// around the calls, too, which the processor hides behind most of them.

#include <array>
#include <cstdio>
#include <cstring>
#include <stdexcept>
#include <string>
#include <vector>

#include "RAIDInstrumentation.h"
#include "flat/lists.h"
#include "harness/harness.h"

namespace {

using namespace raid;
using namespace raid::bench;

constexpr int calls = 10'000;

/// So many calls, each at another position.
template <class Call>
std::chrono::nanoseconds timeOfCalls(int positions, Call call) {
    return processorTime([&] {
        int position = 0;
        for (int i = 0; i < calls; ++i) {
            call(position);
            position = position + 1 < positions ? position + 1 : 0;
        }
    });
}

template <class Call>
Benchmark accessor(const char* name, std::size_t positions, Call call) {
    return {std::string("accessor/") + name, calls,
            [positions, call] { return timeOfCalls(static_cast<int>(positions), call); }};
}

template <class Record>
const Record& at(const std::vector<Record>& list, int position) {
    return list[static_cast<std::size_t>(position)];
}

std::array<char, 4096> text{};

void keep(const std::string& value) {
    std::memcpy(text.data(), value.c_str(), value.size() + 1);
    use(text);
}

std::vector<Benchmark> ofDrives() {
    const auto drives = RAIDDiskDriveList.size();
    std::vector<std::string> serialNumbers;
    for (const auto& drive : RAIDDiskDriveList) {
        serialNumbers.push_back(drive.getSerialNumber());
    }
    return {
        accessor("the loop", drives, [](int position) { use(position); }),
        accessor("count/library", drives,
                 [](int position) { use(position + getRAIDDiskDriveCount()); }),
        accessor("count/list", drives,
                 [](int position) { use(position + static_cast<int>(RAIDDiskDriveList.size())); }),
        accessor("number/library", drives,
                 [](int position) { use(getRAIDDiskDriveSize(position)); }),
        accessor("number/list", drives,
                 [](int position) { use(at(RAIDDiskDriveList, position).getSize()); }),
        accessor("text/library", drives,
                 [](int position) {
                     getRAIDDiskDriveSerialNumber(text.data(), position);
                     use(text);
                 }),
        accessor("text/list", drives,
                 [](int position) { keep(at(RAIDDiskDriveList, position).getSerialNumber()); }),
        accessor("text/memcpy", drives,
                 [serialNumbers](int position) { keep(at(serialNumbers, position)); }),
        accessor("display name/library", drives,
                 [](int position) {
                     getRAIDDiskDriveDiskDriveIDString(text.data(), position);
                     use(text);
                 }),
        accessor("display name/list", drives,
                 [](int position) {
                     std::snprintf(text.data(), text.size(), "Disk Drive %d",
                                   at(RAIDDiskDriveList, position).getArrayUniqueID());
                     use(text);
                 }),
    };
}

std::vector<Benchmark> ofAdapters() {
    const auto adapters = PellionAdapterList.size();
    return {
        accessor("initiator IDs/library", adapters,
                 [](int position) {
                     getPellionAdapterInitiatorIDs(text.data(), position);
                     use(text);
                 }),
        accessor("initiator IDs/list", adapters,
                 [](int position) {
                     std::string joined;
                     for (const auto& channel :
                          at(PellionAdapterList, position).getPhysicaldrives()) {
                         joined +=
                             (joined.empty() ? "" : ",") + std::to_string(channel.getInitiatorID());
                     }
                     keep(joined);
                 }),
    };
}

std::vector<Benchmark> benchmarksFor(const std::string& /*document*/) {
    configRead = 1;
    RAIDinit();
    if (RAIDDiskDriveList.empty() || PellionAdapterList.empty()) {
        throw std::runtime_error("no service answers with drives below a Pellion adapter");
    }
    auto made = ofDrives();
    for (auto& each : ofAdapters()) {
        made.push_back(std::move(each));
    }
    return made;
}

}  // namespace

int main(int argc, char** argv) { return measureAll(&benchmarksFor, argc, argv); }
