// The getters are inline in the headers, and copying, moving and destroying come from the compiler.
// This file is compiled so that the library also holds each of them as a symbol of its own: hosts
// look them up by name, and which ones exist must not hang on what the optimiser inlined.

#include <type_traits>
#include <utility>

#include "model/arrays.h"
#include "model/channels_and_drives.h"
#include "model/enclosures.h"
#include "model/logical_drives.h"
#include "model/raid_events.h"
#include "model/system_and_adapter.h"

namespace raid {

template <class Model>
void useAsValue(Model& model) {
    Model copy(model);
    Model moved(std::move(copy));
    copy = model;
    model = std::move(moved);
    if constexpr (std::is_default_constructible_v<Model>) {
        model = Model();
    }
}

template void useAsValue(RAIDSystem&);
template void useAsValue(RAIDAdapter&);
template void useAsValue(RAIDPhysicalDrives&);
template void useAsValue(RAIDHotSpareDrives&);
template void useAsValue(RAIDChannel&);
template void useAsValue(RAIDHardDrive&);
template void useAsValue(RAIDEnclosureDevice&);
template void useAsValue(RAIDFan&);
template void useAsValue(RAIDPowerSupply&);
template void useAsValue(RAIDTempSensor&);
template void useAsValue(RAIDDeviceSlotID&);
template void useAsValue(RAIDArrays&);
template void useAsValue(RAIDBasicArray&);
template void useAsValue(RAIDSpannedArray&);
template void useAsValue(RAIDLogicalDrives&);
template void useAsValue(RAIDLogicalDrive&);
template void useAsValue(RAIDChunks&);
template void useAsValue(RAIDLimits&);
template void useAsValue(RAIDProgress&);
template void useAsValue(RAIDEvents&);
template void useAsValue(RAIDEvent&);

}  // namespace raid
