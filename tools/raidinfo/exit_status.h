#pragma once

#include <stdexcept>
#include <string>

namespace raidinfo {

/// What the program's exit status says; the numbers are those of sysexits.h where one fits.
/// `health` and `diff` end with 0 to 3 of their own. An interrupted program ends with 128 plus the
/// number of the signal.
enum class ExitStatus : int {
    ok = 0,
    usage = 64,
    badInput = 65,
    noInput = 66,
    serviceUnavailable = 69,
    internalError = 70,
    unusableLibrary = 72,
    cannotCreate = 73,
    outputFailed = 74,
    malformedAnswer = 76,
};

constexpr int signalExitBase = 128;

/// Ends the program: one line for standard error and the exit status.
class Failure : public std::runtime_error {
public:
    Failure(ExitStatus status, const std::string& message)
        : std::runtime_error{message}, reason{status} {}

    [[nodiscard]] ExitStatus status() const noexcept { return reason; }

private:
    ExitStatus reason;
};

}  // namespace raidinfo
