#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

// The answers of a service in the order in which they came. A file of them is written front to back
// and is good after every entry, whatever becomes of its writer:
//
//     raid-recording 1 2026-11-21T17:48:00Z
//     answer 0 configuration 27648
//     (27648 bytes and a line feed)
//     failure 3005 events
//
// The numbers in front are milliseconds since the start.
namespace recording {

// The wait for the next event is no question of its own: it tells nothing that the events do not.
enum class Question : std::uint8_t { configuration, newestEvent, events };

struct Entry {
    std::chrono::milliseconds at;
    Question question;
    std::optional<std::string> body;  // none: the exchange brought no body
};

struct Recording {
    std::string startedAt;  // UTC, such as 2026-11-21T17:48:00Z
    std::vector<Entry> entries;
    bool cutShort = false;  // the last entry was not whole, and is not among the entries
};

// The message names the byte where the text stops being a recording.
class RecordingError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// What is to be said of a recording that is cut short.
inline constexpr std::string_view cutShortNotice = "the last entry is cut short and left out";

// Whether the text calls itself a recording, which may still be malformed.
[[nodiscard]] bool isNamedRecording(std::string_view text);

// Reads a whole file. Throws RecordingError.
[[nodiscard]] Recording parse(std::string_view text);

// The first line of a file, and what follows it for each entry.
[[nodiscard]] std::string heading(std::string_view startedAt);
[[nodiscard]] std::string written(const Entry& entry);

}  // namespace recording
