#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <optional>
#include <stop_token>
#include <string>
#include <string_view>

#include "events/continuity.h"
#include "inventory/records.h"
#include "library/library.h"

namespace raidinfo {

/// The code of the notice that the service has begun to count its events anew.
inline constexpr std::string_view numbersWentBack = "numbers_went_back";

/// What is told of the stream besides its events.
struct Notice {
    std::string_view code;
    std::string message;
};

/// Who is told. `show` returns false when it has seen enough.
struct EventListener {
    std::function<bool(const Record&)> show;
    std::function<void(const Notice&)> notice;
    /// Of the number with which a stream begins that follows no earlier run; 0: any.
    std::function<void(std::int64_t)> begin = [](std::int64_t /*first*/) {};
};

/// Where the stream begins: at the service's newest event, at a number, or after the last number
/// that an earlier run has shown.
struct StreamStart {
    std::optional<std::int64_t> first = std::nullopt;
    std::optional<LastShown> shownBefore = std::nullopt;
    std::optional<std::chrono::milliseconds> patience = std::nullopt;  ///< for the first answer
    /// After so long a wait the service is asked whether it has begun to count anew, or has used
    /// its last number once more: neither ends the wait.
    std::chrono::milliseconds interval{};
};

/// Shows every event once until stop is requested or the listener has seen enough. A service that
/// cannot be reached at first is a Failure; one that goes away later is waited for. Answers that
/// are malformed again and again are a Failure, too.
void followEvents(const Library& library, const StreamStart& start, const EventListener& listener,
                  const std::stop_token& stop);

/// Whether the batch is of a service that has begun to count anew, which is likely where the
/// numbers went back. Then it is told, and the continuity begins anew.
bool beginsAnew(Continuity& continuity, const Records& batch, bool wentBack,
                const EventListener& listener);

/// Shows a batch; returns false when the listener has seen enough.
bool showBatch(Continuity& continuity, const Records& batch, const EventListener& listener);

}  // namespace raidinfo
