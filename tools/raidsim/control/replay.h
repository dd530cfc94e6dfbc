#pragma once

#include <memory>
#include <vector>

#include "control/scenario.h"
#include "recording/recording.h"

namespace raidsim {

// The steps by which a service comes to answer as the recorded one did: each answer from the time
// of its recording on, the first configuration and the first newest event from the beginning on,
// and nothing where the exchange failed. A question that was not recorded at all is answered from
// the events, and for the configuration with nothing.
[[nodiscard]] std::vector<Step> replayOf(
    const std::shared_ptr<const recording::Recording>& recording);

}  // namespace raidsim
