#pragma once

#include "generate/rack.h"

namespace raidsim::generate {

// How much a rack holds. Every channel has its drives in shelves of twelve with an enclosure each;
// the last drive of a shelf is a hot spare, the others make an array.
struct RackSize {
    int adapters = 1;
    int channels = 1;  // of each adapter
    int drives = 12;   // of each channel
};

[[nodiscard]] SystemPlan sizedRack(const RackSize& size);

}  // namespace raidsim::generate
