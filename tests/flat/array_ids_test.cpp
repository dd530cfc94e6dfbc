// The array IDs that drives and logical drives get from the arrays of their adapter.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "published.h"
#include "support/fresh_library.h"
#include "support/row.h"

namespace {

using namespace raid::test;

using Numbers = std::vector<int>;

std::string drive(int channel, int device) {
    return element("ac:hardDrive",
                   element("as:channelID", channel) + element("as:deviceID", device));
}

std::string channel(int id, const std::string& drives) {
    return element("ac:channel", element("as:channelID", id) + drives);
}

std::string logical(int id) { return element("ac:logicalDrive", element("as:logicalDriveID", id)); }

std::string array(int id, const std::string& content) {
    return element("ac:basicArray", element("as:arrayID", id) + content);
}

std::string physical(const std::string& channels) { return element("ac:physicalDrives", channels); }

std::string logicals(const std::string& drives) { return element("ac:logicalDrives", drives); }

// An adapter by what it holds, and the array IDs that are published for it.
struct Numbering : Row {
    std::string arrays;
    std::string channels;
    std::string logicalDrives;
    Numbers ofDrives;
    Numbers ofLogicalDrives;
};

const std::vector<Numbering> numberings{
    {"WithoutArrays", "", channel(1, drive(1, 1)), logical(1), {0}, {-1}},
    {"WithAnArrayOfNothing", array(5, ""), channel(1, drive(1, 1)), logical(1), {0}, {-1}},
    {"WithAnArrayOfSome",
     array(5, physical(channel(1, drive(0, 2))) + logicals(logical(8))),
     channel(1, drive(1, 1) + drive(1, 2)) + channel(2, drive(2, 2)),
     logical(7) + logical(8),
     {0, 5, 0},
     {-1, 5}},
    {"WhereTheLastOfTwoArraysHolds",
     array(5, physical(channel(1, drive(1, 2))) + logicals(logical(8))) +
         array(6, physical(channel(1, drive(1, 2))) + logicals(logical(8))) +
         array(7, physical(channel(1, drive(1, 3))) + logicals(logical(9))),
     channel(1, drive(1, 2)),
     logical(8),
     {6},
     {6}},
    {"WithADriveInTwoChannelsOfAnArray",
     array(5, physical(channel(1, drive(1, 2)) + channel(1, drive(1, 2) + drive(1, 3)))),
     channel(1, drive(1, 2) + drive(1, 3)),
     "",
     {5, 5},
     {}},
    // A drive counts by the channel that it names, an array's by the channel that it stands in.
    {"WhereADriveNamesAnotherChannel",
     array(5, physical(channel(1, drive(9, 2)))),
     channel(4, drive(1, 2) + drive(9, 2)),
     "",
     {5, 0},
     {}},
    {"WithDrivesDirectlyInTheArray", array(5, drive(1, 2)), channel(1, drive(1, 2)), "", {0}, {}},
    {"WithASpannedArray",
     element("ac:spannedArray",
             element("as:arrayID", 4) + logicals(logical(8)) +
                 element("ac:arrays",
                         array(5, physical(channel(1, drive(1, 2))) + logicals(logical(9))))),
     channel(1, drive(1, 2)),
     logical(8) + logical(9),
     {0},
     {-1, -1}},
    {"WithTheArrayIDZero",
     array(0, physical(channel(0, drive(0, 0))) + logicals(logical(0))),
     channel(0, drive(0, 0)),
     logical(0),
     {0},
     {0}},
    {"WithNegativeNumbers",
     array(5, physical(channel(-1, drive(-1, -2))) + logicals(logical(-3))),
     channel(-1, drive(-1, -2) + drive(-2, -1)),
     logical(-3) + logical(3),
     {5, 0},
     {5, -1}},
};

std::string adapter(const Numbering& numbering, std::string_view type) {
    return element("ac:adapter",
                   physical(numbering.channels) + logicals(numbering.logicalDrives) +
                       element("ac:arrays", numbering.arrays),
                   type);
}

class ArrayIDs : public FreshLibrary, public testing::WithParamInterface<Numbering> {};

TEST_P(ArrayIDs, AreLookedUpForPellionAndUnknownAdapters) {
    for (const char* const type : {"o:PellionAdapter", "o:MirrelAdapter", "o:Unknown"}) {
        publish(adapter(GetParam(), type));
        EXPECT_EQ(all(getRAIDDiskDriveCount, getRAIDDiskDriveArrayID), GetParam().ofDrives) << type;
        EXPECT_EQ(all(getRAIDLogicalDriveCount, getRAIDLogicalDriveArrayID),
                  GetParam().ofLogicalDrives)
            << type;
    }
}

TEST_P(ArrayIDs, StayAsTheyWereReadForVantryAndLsiAdapters) {
    for (const char* const type : {"o:DorvelAdapter", "o:LSIAdapter"}) {
        publish(adapter(GetParam(), type));
        EXPECT_EQ(all(getRAIDDiskDriveCount, getRAIDDiskDriveArrayID),
                  Numbers(GetParam().ofDrives.size(), 0))
            << type;
        EXPECT_EQ(all(getRAIDLogicalDriveCount, getRAIDLogicalDriveArrayID),
                  Numbers(GetParam().ofLogicalDrives.size(), -1))
            << type;
    }
}

INSTANTIATE_TEST_SUITE_P(Adapters, ArrayIDs, testing::ValuesIn(numberings), nameOfRow);

class ArrayIDsOfAdapters : public FreshLibrary {};

TEST_F(ArrayIDsOfAdapters, ComeFromTheAdaptersOwnArrays) {
    const auto with = [](int id) {
        return Numbering{"",
                         array(id, physical(channel(1, drive(1, 1))) + logicals(logical(1))),
                         channel(1, drive(1, 1)),
                         logical(1),
                         {},
                         {}};
    };
    publish(adapter(with(5), "o:PellionAdapter") + adapter(with(6), "o:LSIAdapter") +
            adapter(with(7), "o:MirrelAdapter"));
    EXPECT_EQ(all(getRAIDDiskDriveCount, getRAIDDiskDriveArrayID), (Numbers{5, 0, 7}));
    EXPECT_EQ(all(getRAIDLogicalDriveCount, getRAIDLogicalDriveArrayID), (Numbers{5, -1, 7}));
}

TEST_F(ArrayIDsOfAdapters, ShowInTheDisplayNames) {
    publish(adapter({"", array(5, logicals(logical(1))), "", logical(1) + logical(2), {}, {}},
                    "o:PellionAdapter"));
    EXPECT_EQ(written(getRAIDLogicalDriveArrayIDString, 0), "Logical Drive 5");
    EXPECT_EQ(written(getRAIDLogicalDriveArrayIDString, 1), "Logical Drive -1");
}

}  // namespace
