#pragma once

#include <string>
#include <vector>

#include "fault/fault.h"

namespace raidsim {

// Where the instructions of one case go.
struct CaseBuilder {
    explicit CaseBuilder(std::string filesFrom) : folder(std::move(filesFrom)) {}

    std::string folder;  // what a file is named relative to
    FaultCase built;
    bool reads = false;
    bool sends = false;
    bool ends = false;

    // The case, completed by what an unsaid instruction means.
    [[nodiscard]] FaultCase finish();
};

// Carries out one line of a fault file. Throws FaultError.
void obey(CaseBuilder& builder, const std::vector<std::string>& words);

}  // namespace raidsim
