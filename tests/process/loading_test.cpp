// A host that loads and unloads the library again and again.

#include <dlfcn.h>
#include <gtest/gtest.h>
#include <malloc.h>

#include <array>
#include <memory>
#include <stdexcept>
#include <string>

#include "../flat/exported.h"
#include "full_answers.h"
#include "support/files.h"

namespace {

using namespace raid::test;

// The sanitizers keep books of every library that was ever loaded, in the same heap; there, the
// leak sanitizer judges at the end of the process.
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
constexpr bool isHeapOurs = false;
#else
constexpr bool isHeapOurs = true;
#endif

std::size_t heapInUse() {
    const auto info = mallinfo2();
    return info.uordblks + info.hblkhd;
}

struct Unload {
    void operator()(void* library) const { EXPECT_EQ(dlclose(library), 0); }
};
using Library = std::unique_ptr<void, Unload>;

Library load() {
    Library library(dlopen(RAID_LIBRARY, RTLD_NOW | RTLD_LOCAL));
    if (!library) {
        throw std::runtime_error(dlerror());
    }
    return library;
}

void fillTheLists(const Library& library) {
    const auto call = [&](const char* name) { return exported<int()>(name, library.get())(); };
    call("RAIDinit");
    call("getEvent");
    call("enableRAIDEvent");
    for (const char* const count :
         {"getPellionAdapterCount", "getRAIDDiskDriveCount", "getRAIDEventCount"}) {
        ASSERT_GT(call(count), 0) << count;
    }
}

TEST(Loading, AgainAndAgainCostsNoMemory) {
    constexpr int warmUp = 10;
    constexpr int rounds = 300;
    // Less than any one list of one round holds, were it left behind.
    constexpr std::size_t tolerated = std::size_t{32} * rounds;
    const AnsweringService service(fullAnswers());
    const auto loadAndUnload = [&](int times) {
        for (int round = 0; round < times; ++round) {
            fillTheLists(load());
            ASSERT_EQ(dlopen(RAID_LIBRARY, RTLD_NOW | RTLD_NOLOAD), nullptr) << round;
            ASSERT_TRUE(service.keepsOnly(0));
        }
    };
    loadAndUnload(warmUp);
    const auto before = heapInUse();
    loadAndUnload(rounds);
    if (isHeapOurs) {
        EXPECT_LE(heapInUse(), before + tolerated);
    }
}

TEST(Loading, AfterALogWasWrittenLeavesItAsItIs) {
    writeLogLevel(8);
    const AnsweringService service(fullAnswers());
    fillTheLists(load());
    const std::string first = readLog();
    ASSERT_FALSE(first.empty());
    fillTheLists(load());
    EXPECT_TRUE(readLog().starts_with(first));
    EXPECT_EQ(readLog().size(), 2 * first.size());
}

TEST(Loading, TwiceSharesTheLists) {
    const AnsweringService service(fullAnswers());
    const Library first = load();
    {
        const Library second = load();
        fillTheLists(second);
    }
    EXPECT_GT(exported<int()>("getRAIDFanCount", first.get())(), 0);
}

}  // namespace
