#pragma once

#include <string>

#include "kinds.h"
#include "records.h"
#include "tree.h"

namespace raidinfo {

/// The inventory as one document: a list of records for each kind.
[[nodiscard]] std::string inventoryJson(const Snapshot& snapshot);

/// The trees as one document.
[[nodiscard]] std::string treeJson(const Group& roots);

/// One event as one line.
[[nodiscard]] std::string eventJson(const Record& event);

}  // namespace raidinfo
