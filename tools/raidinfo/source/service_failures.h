#pragma once

#include <string>

#include "exit_status.h"
#include "source/service_address.h"

namespace raidinfo {

[[nodiscard]] inline Failure serviceUnavailable() {
    return {ExitStatus::serviceUnavailable,
            "the RAID management service on " + ServiceAddress::inWords() + " does not answer"};
}

[[nodiscard]] inline Failure noAnswerInTime(const std::string& option = "--timeout") {
    return {ExitStatus::serviceUnavailable,
            "the RAID management service gave no answer within the " + option};
}

[[nodiscard]] inline Failure malformedAnswer() {
    return {ExitStatus::malformedAnswer, "the answer of the RAID management service is malformed"};
}

}  // namespace raidinfo
