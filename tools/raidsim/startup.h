#pragma once

#include <chrono>
#include <string>
#include <vector>

#include "control/scenario.h"
#include "options.h"
#include "state/document.h"

namespace raidsim {

// What is to be served, and what will happen to it.
struct Startup {
    Document document;
    std::string documentPath;
    std::vector<Step> steps;
    std::chrono::sys_seconds epoch;  // the date at which a virtual clock begins
    std::string warning;             // for the operator; empty: none
};

// Reads the configuration, the scenario and the recording that the options name. Throws StartError.
[[nodiscard]] Startup startUp(const Options& options);

}  // namespace raidsim
