#pragma once

#include "exit_status.h"

namespace raidinfo {

[[nodiscard]] inline Failure serviceUnavailable() {
    return {ExitStatus::serviceUnavailable,
            "the RAID management service on 127.0.0.1 port 34572 does not answer"};
}

[[nodiscard]] inline Failure malformedAnswer() {
    return {ExitStatus::malformedAnswer, "the answer of the RAID management service is malformed"};
}

}  // namespace raidinfo
