#pragma once

#include <span>

#include "generate/rack.h"

namespace raidsim::generate {

struct Example {
    const char* fileName;  // in examples/
    SystemPlan (*plan)();
};

// The example documents that come with the program.
[[nodiscard]] std::span<const Example> examples() noexcept;

}  // namespace raidsim::generate
