#pragma once

#include <chrono>
#include <cstddef>
#include <functional>
#include <limits>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

// What a fault file says: how the service misbehaves towards one client, and what a host must make
// of it. docs/faults.md describes the files.
namespace raidsim {

// A file that is not understood; the message names the line.
class FaultError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The requests that a fault can meet.
enum class RequestKind { config, events, wait, newest, any };

// A change of the header or of the body of the good answer.
struct FaultEdit {
    bool ofHeader;
    std::function<void(std::string& text)> change;  // throws FaultError
};

// One step of what the service does on the connection.
struct FaultStep {
    enum class Kind { readRequest, read, send, pieces, taken, pause, close, reset, stall };

    static constexpr std::size_t header = std::numeric_limits<std::size_t>::max();
    static constexpr std::size_t rest = header - 1;

    Kind kind;
    std::size_t bytes = 0;  // of read, send (or one of the two above) and pieces
    std::chrono::milliseconds time{0};
};

enum class HostCall { refresh, getEvent, enableRAIDEvent };

// What became of the configuration, or of the events, that the host had before.
enum class Fate { unsaid, kept, lost, replaced };

struct LogExpectation {
    enum class Kind { exact, has, ends };

    int level;
    Kind kind;
    std::string text;
};

// What a host sees. The service does not look at it: it is for those who test a host.
struct FaultOutcome {
    HostCall call = HostCall::refresh;
    bool cancels = false;
    Fate configuration = Fate::unsaid;
    Fate events = Fate::unsaid;
    std::optional<int> result;
    std::optional<int> next;  // nextSequenceNumber
    std::vector<std::pair<std::string, int>> counts;
    std::vector<LogExpectation> log;
    int leftOpen = 0;
    std::chrono::seconds within{10};
};

// The fault with a value for everything that varies.
struct FaultCase {
    std::string values;  // "cut=17", for people
    RequestKind meets = RequestKind::config;
    bool refuses = false;
    std::vector<FaultEdit> edits;
    std::vector<FaultStep> steps;
    FaultOutcome outcome;

    // The request is read whole before anything else, so the fault can choose what it meets.
    [[nodiscard]] bool beginsWithRequest() const noexcept {
        return !refuses && steps.front().kind == FaultStep::Kind::readRequest;
    }
};

// The bytes that a case sends.
struct FaultAnswer {
    std::string bytes;
    std::size_t headerSize = 0;
};

// The good body, as the case changes it. Throws FaultError.
[[nodiscard]] FaultAnswer answerOf(const FaultCase& chosen, std::string goodBody);

}  // namespace raidsim
