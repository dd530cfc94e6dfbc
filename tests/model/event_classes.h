#pragma once

#include "model/classes.h"

namespace raid::test {

// The classes of the events, described as those of the configuration are.
[[nodiscard]] const std::vector<ModelClass>& eventClasses();

}  // namespace raid::test
