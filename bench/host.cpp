// What a host sees: whole refreshes and event batches over the loopback, and the accessors, all
// through the library as hosts load it. The service must be listening.
//
//   bench_host DOCUMENT [arguments of the harness]
//
// names the document that the service answers with.

#include <malloc.h>

#include <array>
#include <climits>
#include <cstring>
#include <iostream>
#include <memory>
#include <string>
#include <vector>

#include "RAIDInstrumentation.h"
#include "agent/document.h"
#include "agent/exchange.h"
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
Benchmark accessor(const char* name, Call call) {
    return {std::string("accessor/") + name, calls,
            [call] { return timeOfCalls(static_cast<int>(RAIDDiskDriveList.size()), call); }};
}

const RAIDHardDrive& drive(int position) {
    return RAIDDiskDriveList[static_cast<std::size_t>(position)];
}

std::array<char, 256> text{};

std::vector<Benchmark> accessors() {
    const auto serialNumber = std::make_shared<std::vector<std::string>>();
    for (const auto& each : RAIDDiskDriveList) {
        serialNumber->push_back(each.getSerialNumber());
    }
    return {
        accessor("nothing", [](int position) { use(position); }),
        accessor("count/library", [](int /*position*/) { use(getRAIDDiskDriveCount()); }),
        accessor("count/list", [](int /*position*/) { use(RAIDDiskDriveList.size()); }),
        accessor("number/library", [](int position) { use(getRAIDDiskDriveSize(position)); }),
        accessor("number/list", [](int position) { use(drive(position).getSize()); }),
        accessor("text/library",
                 [](int position) {
                     getRAIDDiskDriveSerialNumber(text.data(), position);
                     use(text);
                 }),
        accessor("text/memcpy",
                 [serialNumber](int position) {
                     const auto& from = (*serialNumber)[static_cast<std::size_t>(position)];
                     std::memcpy(text.data(), from.c_str(), from.size() + 1);
                     use(text);
                 }),
        accessor("display name/library",
                 [](int position) {
                     getRAIDDiskDriveDiskDriveIDString(text.data(), position);
                     use(text);
                 }),
    };
}

}  // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        std::cerr << "usage: bench_host DOCUMENT [arguments of the harness]\n";
        return 64;
    }
    mallopt(M_MMAP_THRESHOLD, INT_MAX);
    mallopt(M_TRIM_THRESHOLD, INT_MAX);
    configRead = 1;
    RAIDinit();
    if (RAIDDiskDriveList.empty()) {
        std::cerr << "bench_host: no service answers\n";
        return 69;
    }
    auto benchmarks = accessors();
    const std::string document = argv[1];
    argv[1] = argv[0];
    benchmarks.push_back(
        {"refresh/" + document + "/library", 1, [] { return passingTime([] { RAIDinit(); }); }});
    benchmarks.push_back({"refresh/" + document + "/exchange", 1, [] {
                              return passingTime([] { use(agent::Document(getSOAPData(0))); });
                          }});
    return measure(std::move(benchmarks), argc - 1, argv + 1);
}
