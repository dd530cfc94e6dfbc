#pragma once

#include <chrono>
#include <functional>
#include <optional>
#include <stop_token>

#include "library/library.h"
#include "recording/recording.h"

namespace raidinfo {

/// Where the recorder puts what it gets.
using EntrySink = std::function<void(const recording::Entry&)>;

/// How long to record: until stop is requested unless the whole time is given, of which 0 means
/// asking once; and how long to wait for the first answers.
struct RecordingTime {
    std::optional<std::chrono::seconds> whole = std::nullopt;
    std::optional<std::chrono::milliseconds> firstAnswer = std::nullopt;
};

/// Asks for the configuration and the events and then, at each new event, again, and hands over
/// every answer that says something new, as it came, for so long. A configuration comes before the
/// events that may be about it. A service that cannot be reached at first is a Failure; one that
/// goes away is waited for, recorded as gone, and asked for everything when it is back.
void recordAnswers(const Library& library, const EntrySink& sink, const RecordingTime& time,
                   const std::stop_token& stop);

}  // namespace raidinfo
