#pragma once

#include <chrono>
#include <functional>
#include <optional>

#include "doctor/examined.h"
#include "library/library.h"

namespace raidinfo {

/// Looks at everything between the service and the lists, in that order, and hands over each
/// finding as soon as there is one. Ends where the service is not there; of one that answers, what
/// is malformed takes nothing from the rest. The service is given up after the limit. Changes the
/// working directory while it runs.
void examine(const Library& library, std::optional<std::chrono::milliseconds> limit,
             const std::function<void(const Examined&)>& tell);

}  // namespace raidinfo
