#pragma once

#include <vector>

#include "inventory/records.h"
#include "inventory/tree.h"

class RAIDAdapter;

namespace raidinfo {

/// The trees of the adapters: what belongs to what is taken from the library's model, since the
/// published records of enclosure parts and of arrays do not name their parents; the fields come
/// from the published records. The snapshot must be of the same configuration and outlive the tree.
[[nodiscard]] Group adapterTrees(const std::vector<RAIDAdapter>& adapters,
                                 const Snapshot& snapshot);

/// The same trees as storage people see them: no channels; the arrays with their logical drives
/// and, in full, their member drives; then the logical drives outside arrays and the hot spares.
[[nodiscard]] Group logicalView(const Group& adapters);

}  // namespace raidinfo
