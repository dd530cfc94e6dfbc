#pragma once

#include <vector>

#include "records.h"
#include "tree.h"

class RAIDAdapter;

namespace raidinfo {

/// The trees of the adapters: what belongs to what is taken from the library's model, since the
/// published records of enclosure parts and of arrays do not name their parents; the fields come
/// from the published records. The snapshot must be of the same configuration and outlive the tree.
[[nodiscard]] Group adapterTrees(const std::vector<RAIDAdapter>& adapters,
                                 const Snapshot& snapshot);

}  // namespace raidinfo
