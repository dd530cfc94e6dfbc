#pragma once

#include <string>

#include "health/verdict.h"

namespace raidinfo::health {

/// The verdict in a few words: "3 findings in 27 records".
[[nodiscard]] std::string headline(const Verdict& verdict);

/// The verdict and a line for each finding.
[[nodiscard]] std::string summary(const Verdict& verdict);

/// The same with what every finding rests on, and every rule that was checked.
[[nodiscard]] std::string explained(const Verdict& verdict);

}  // namespace raidinfo::health
