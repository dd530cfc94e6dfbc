#pragma once

#include <array>
#include <stdexcept>
#include <string>
#include <string_view>

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

/// What programs and people are told of an exit status.
struct StatusWords {
    ExitStatus status;
    std::string_view code;
    std::string_view meaning;
};

inline constexpr auto statusWords = std::to_array<StatusWords>({
    {ExitStatus::ok, "", "done"},
    {ExitStatus::usage, "usage", "the command line is wrong"},
    {ExitStatus::badInput, "bad_input", "a file is not what it should be"},
    {ExitStatus::noInput, "no_input", "a file cannot be read"},
    {ExitStatus::serviceUnavailable, "service_unavailable", "the service does not answer"},
    {ExitStatus::internalError, "internal_error", "internal error, for example no memory"},
    {ExitStatus::unusableLibrary, "unusable_library", "the library cannot be used"},
    {ExitStatus::cannotCreate, "cannot_create", "a file cannot be written"},
    {ExitStatus::outputFailed, "output_failed", "the output cannot be written"},
    {ExitStatus::malformedAnswer, "malformed_answer", "the service's answer is malformed"},
});

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
