#pragma once

// The numbers that the examples use; docs/raidsim.md explains them all.
namespace raidsim::generate {

enum class Interface { parallelScsi = 0, sata = 1, sas = 2 };

enum class DriveState { ready = 0, online = 1, hotSpare = 2, rebuilding = 3, failed = 4 };

enum class BatteryStatus { none = 0, good = 1 };

enum class AlarmStatus { off = 0, on = 1 };

enum class HotSpareType { none = 0, global = 1 };

}  // namespace raidsim::generate
