#include "generate/examples.h"

#include <array>
#include <utility>

#include "generate/sized_rack.h"

namespace raidsim::generate {

namespace {

const DriveModel quillon70{"QUILLON", "QS15K073", "B41A", "32P0729", Interface::parallelScsi,
                           70006};
const DriveModel quillon140{"QUILLON", "QS15K147", "B41A", "32P0731", Interface::parallelScsi,
                            140014};
const DriveModel tessmark250{"TESSMARK", "TM7200-250", "3.AE", "39M4507", Interface::sata, 238418};
const DriveModel ostrel300{"OSTREL", "OX10-300", "S60G", "42D0520", Interface::sas, 286102};

// Drives with consecutive device numbers from 0, all of one model.
std::vector<DrivePlan> drives(int count, const DriveModel& model) {
    std::vector<DrivePlan> made;
    for (int device = 0; device < count; ++device)
        made.push_back({device, model});
    return made;
}

std::vector<Place> places(int channel, int first, int count) {
    std::vector<Place> made;
    for (int device = first; device < first + count; ++device)
        made.push_back({channel, device});
    return made;
}

std::vector<int> slots(int count) {
    std::vector<int> made;
    for (int slot = 1; slot <= count; ++slot)
        made.push_back(slot);
    return made;
}

std::vector<LogicalPlan> raid5(int id, const std::string& name, int memberSize, int members) {
    return {{id, name, 5, memberSize * (members - 1), memberSize}};
}

std::vector<LogicalPlan> mirror(int id, const std::string& name, int size) {
    return {{id, name, 1, size, size}};
}

SystemPlan smallServer() {
    AdapterPlan adapter{
        .xsiType = "o:PellionAdapter", .id = 1, .typeName = "Pellion 4220", .physicalSlot = 2};
    adapter.memoryMegabytes = 128;

    ChannelPlan first{1, Interface::parallelScsi, wideScsi, drives(4, quillon70), {}};
    first.drives[0].holdsOs = true;
    first.enclosures = {{8, 0, "HALVOR", "HV-6 Backplane", 2, 2, 2, slots(6)}};
    ChannelPlan second{2, Interface::parallelScsi, wideScsi, drives(2, quillon70), {}};
    second.drives[1].state = DriveState::hotSpare;
    adapter.channels = {first, second};

    ArrayPlan array{.id = 0, .name = "A", .members = places(1, 0, 4)};
    array.members.push_back({2, 0});
    array.logicals = {{0, "System", 5, 32000, 8000}, {1, "Data", 5, 200000, 50000}};
    adapter.arrays = {array};

    return {"birch", "Linux", "2.6.9-42.ELsmp", {adapter}};
}

// Two arrays share their drives, so that a drive belongs to the later one; two more lie below a
// spanned array.
AdapterPlan sharedAndSpanned() {
    AdapterPlan adapter{
        .xsiType = "o:PellionAdapter", .id = 1, .typeName = "Pellion 4240", .physicalSlot = 1};
    adapter.memoryMegabytes = 256;
    ChannelPlan first{1, Interface::parallelScsi, wideScsi, drives(6, quillon140), {}};
    first.drives[0].holdsOs = true;
    first.drives[5].state = DriveState::hotSpare;
    first.enclosures = {{8, 0, "HALVOR", "HV-14 \"Tall\"", 4, 2, 3, slots(14)}};
    ChannelPlan second{2, Interface::parallelScsi, wideScsi, drives(4, quillon70), {}};
    adapter.channels = {first, second};

    adapter.arrays = {
        {.id = 0, .name = "R&D <fast>", .owner = "Müller & Söhne", .members = places(1, 0, 5)},
        {.id = 1, .name = "Größe 2", .members = places(1, 2, 3)},
    };
    adapter.arrays[0].logicals = {{0, "Système", 1, 40000, 40000}};
    adapter.arrays[1].logicals = raid5(1, "R&D", 60000, 3);

    SpannedPlan spanned{.id = 4, .name = "Span"};
    spanned.arrays = {{.id = 2, .name = "Span, left", .members = places(2, 0, 2)},
                      {.id = 3, .name = "Span, right", .members = places(2, 2, 2)}};
    spanned.logicals = {{2, "Åsa's mirror", 10, 140000, 140000}};
    adapter.spanned = {spanned};
    return adapter;
}

AdapterPlan mirrorOnly() {
    AdapterPlan adapter{
        .xsiType = "o:MirrelAdapter", .id = 2, .typeName = "Mirrel 2S", .physicalSlot = 0};
    adapter.interface = Interface::sata;
    adapter.battery = false;
    adapter.channels = {{1, Interface::sata, serialAta, drives(1, tessmark250), {}},
                        {2, Interface::sata, serialAta, drives(1, tessmark250), {}}};
    ArrayPlan array{.id = 0, .name = "Mirror", .members = {{1, 0}, {2, 0}}};
    array.logicals = mirror(0, "Boot", 238000);
    adapter.arrays = {array};
    return adapter;
}

AdapterPlan external() {
    AdapterPlan adapter{
        .xsiType = "o:DorvelAdapter", .id = 3, .typeName = "Dorvel 800", .physicalSlot = 3};
    adapter.interface = Interface::sas;
    adapter.memoryMegabytes = 512;
    ChannelPlan channel{0, Interface::sas, serialScsi, drives(7, ostrel300), {}};
    channel.drives[6].state = DriveState::hotSpare;
    channel.enclosures = {{32, 1, "HALVOR", "HV-12E", 3, 2, 2, slots(12)}};
    adapter.channels = {channel};
    ArrayPlan array{.id = 0, .name = "Archive", .owner = "A", .members = places(0, 0, 6)};
    array.logicals = raid5(0, "Archive", 286000, 6);
    adapter.arrays = {array};
    return adapter;
}

AdapterPlan striped() {
    AdapterPlan adapter{
        .xsiType = "o:LSIAdapter", .id = 4, .typeName = "Serial 4E", .physicalSlot = 4};
    adapter.interface = Interface::sas;
    adapter.battery = false;
    adapter.channels = {{0, Interface::sas, serialScsi, drives(4, ostrel300), {}}};
    ArrayPlan array{.id = 0, .name = "Scratch", .members = places(0, 0, 4)};
    array.listsMembersDirectly = true;
    array.logicals = {{0, "Scratch", 0, 1144000, 0}};
    adapter.arrays = {array};
    return adapter;
}

AdapterPlan unknownType() {
    AdapterPlan adapter{
        .xsiType = "o:TalvikAdapter", .id = 5, .typeName = "Talvik 1", .physicalSlot = 5};
    adapter.interface = Interface::sata;
    adapter.memoryMegabytes = 64;
    adapter.channels = {{1, Interface::sata, serialAta, drives(3, tessmark250), {}}};
    ArrayPlan array{.id = 0, .name = "Büro", .members = places(1, 0, 2)};
    array.logicals = mirror(0, "Büro", 230000);
    adapter.arrays = {array};
    adapter.channels[0].drives[2].state = DriveState::ready;
    return adapter;
}

SystemPlan mixed() {
    return {"köln-3",
            "Linux",
            "2.6.18 (SMP & PAE)",
            {sharedAndSpanned(), mirrorOnly(), external(), striped(), unknownType()}};
}

SystemPlan largeRack() { return sizedRack({.adapters = 4, .channels = 4, .drives = 24}); }

constexpr std::array<Example, 3> all{{
    {"small-server.xml", smallServer},
    {"mixed.xml", mixed},
    {"large-rack.xml", largeRack},
}};

}  // namespace

std::span<const Example> examples() noexcept { return all; }

}  // namespace raidsim::generate
