#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "library/library.h"

namespace raidinfo {

/// The library's exchange with the service, with its own questions, for those who want the answer
/// as it came. Each returns the body of the answer; nothing if none came or cancelGetEvent was
/// called. Numbers of events are taken as far as the service counts.
class Exchange {
public:
    explicit Exchange(const Library& library);

    [[nodiscard]] std::optional<std::string> configuration() const;
    [[nodiscard]] std::optional<std::string> newestEvent() const;

    /// Every event there is.
    [[nodiscard]] std::optional<std::string> allEvents() const;

    /// Those from one number to another, both included.
    [[nodiscard]] std::optional<std::string> events(std::int64_t first, std::int64_t last) const;

    /// Answered once there is an event behind this number.
    [[nodiscard]] std::optional<std::string> nextEvent(std::int64_t number) const;

private:
    [[nodiscard]] std::optional<std::string> answerTo(const std::string& request) const;

    char* (*exchange)(const char*);
};

/// The number of the newest event by the answer's body; 0 where the library can read none.
[[nodiscard]] int newestEventIn(const Library& library, const std::string& body);

}  // namespace raidinfo
