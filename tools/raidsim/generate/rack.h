#pragma once

#include <string>
#include <vector>

#include "generate/codes.h"
#include "xml/tree.h"

// Makes configuration documents from plans. A plan says what stands where; sizes of arrays,
// serial numbers and the listings of members follow from it.
namespace raidsim::generate {

struct DriveModel {
    std::string vendor{};
    std::string model{};
    std::string firmware{};
    std::string fru{};
    Interface interface = Interface::parallelScsi;
    int megabytes = 0;
};

struct DrivePlan {
    int device = 0;
    DriveModel model{};
    DriveState state = DriveState::online;
    bool holdsOs = false;
};

struct EnclosurePlan {
    int device = 0;
    int logicalId = 0;
    std::string vendor{};
    std::string model{};
    int fans = 0;
    int supplies = 0;
    int sensors = 0;
    std::vector<int> slots{};
};

// What the links of the time carry, in megabytes per second.
constexpr int wideScsi = 320;
constexpr int serialAta = 150;
constexpr int serialScsi = 300;

struct ChannelPlan {
    int id = 0;
    Interface interface = Interface::parallelScsi;
    int megabytesPerSecond = 0;
    std::vector<DrivePlan> drives{};
    std::vector<EnclosurePlan> enclosures{};
};

struct LogicalPlan {
    int id = 0;
    std::string name{};
    int raidLevel = 0;
    int dataMegabytes = 0;
    int parityMegabytes = 0;
};

// A drive by its place.
struct Place {
    int channel;
    int device;
};

struct ArrayPlan {
    int id = 0;
    std::string name{};
    std::string owner{};
    std::vector<Place> members{};
    std::vector<LogicalPlan> logicals{};
    bool listsMembersDirectly = false;  // ac:hardDrive in the array instead of by channel
};

struct SpannedPlan {
    int id = 0;
    std::string name{};
    std::vector<ArrayPlan> arrays{};
    std::vector<LogicalPlan> logicals{};
};

struct AdapterPlan {
    std::string xsiType{};
    int id = 0;
    std::string typeName{};
    Interface interface = Interface::parallelScsi;
    int memoryMegabytes = 0;
    bool battery = true;
    int physicalSlot = 0;
    std::vector<ChannelPlan> channels{};
    std::vector<ArrayPlan> arrays{};
    std::vector<SpannedPlan> spanned{};
    std::vector<LogicalPlan> logicals{};  // those of the adapter beside those of its arrays
};

struct SystemPlan {
    std::string name{};
    std::string os{};
    std::string osVersion{};
    std::vector<AdapterPlan> adapters{};
};

// The document with its envelope.
[[nodiscard]] xml::Tree document(const SystemPlan& plan);

}  // namespace raidsim::generate
