// Hosts read the published records with offsets that their compiler took from the headers.

#include "layout.h"

#include <gtest/gtest.h>

#include "support/files.h"

namespace {

using namespace raid::test;

// What has moved on purpose is recorded by scripts/abi --update.
TEST(LayoutOfTheModelClasses, IsTheOneThatHostsWereBuiltWith) {
    const bool is64Bit = sizeof(void*) == 8;
    EXPECT_EQ(layoutOfTheModelClasses(),
              readFile(is64Bit ? RAID_ABI "/layout-amd64.txt" : RAID_ABI "/layout-i386.txt"));
}

}  // namespace
