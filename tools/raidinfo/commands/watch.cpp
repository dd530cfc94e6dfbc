#include <chrono>
#include <cstdint>
#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "commands/commands.h"
#include "events/wait.h"
#include "exit_status.h"
#include "json/json.h"
#include "presentation/tree.h"
#include "source/exchange.h"
#include "source/service.h"
#include "source/service_failures.h"
#include "system/alarm.h"
#include "system/backoff.h"
#include "system/timestamp.h"
#include "watch/idle_waits.h"
#include "watch/latest_events.h"
#include "watch/screen.h"
#include "watch/tree_lines.h"

namespace raidinfo {
namespace {

/// Looks at the service again and again, and shows what it sees.
class Watch {
public:
    Watch(const Session& watched, const WatchOptions& chosen)
        : session{watched},
          options{chosen},
          askNewest{watched.library().function<int()>("enableRAIDEvent")},
          newest{watched.library().variable<int>("nextSequenceNumber")},
          service{watched.library()},
          wait{watched.library()} {
        if (!watched.options().json) {
            screen.emplace(watched.output(), watched.options().color);
        }
    }

    void run() {
        while (!session.stop().stop_requested()) {
            if (look()) {
                backoff.reset();
                waitForEvents();
            } else {
                backoff.wait(session.stop());
            }
        }
    }

private:
    /// Reads and shows the inventory; what is shown stays where the service does not answer.
    bool look() {
        std::optional<Trees> trees;
        try {
            trees.emplace(readNow());
        } catch (const Failure& failure) {
            return lost(failure);
        }
        if (!session.stop().stop_requested()) {
            show(*trees);
        }
        return true;
    }

    /// Waits as long as the options say, but only for the first answer.
    Trees readNow() {
        const Alarm alarm{everShown ? std::nullopt : session.options().limit,
                          session.library().function<void()>("cancelGetEvent"), session.stop()};
        try {
            if (askNewest() == 0) {
                throw serviceUnavailable();
            }
            const int seen = *newest;
            Trees trees{readInventory(session.library(), alarm.over())};
            newestSeen = seen;
            return trees;
        } catch (const Failure&) {
            if (alarm.rang()) {
                throw noAnswerInTime();
            }
            throw;
        }
    }

    bool lost(const Failure& failure) {
        if (session.stop().stop_requested()) {
            return true;
        }
        if (!everShown) {
            throw failure;
        }
        if (trouble != failure.what()) {
            trouble = failure.what();
            if (session.options().json) {
                session.printLine({{troubleCode(failure.status()), trouble}}, nullptr);
            } else {
                draw();
            }
        }
        return false;
    }

    void show(const Trees& trees) {
        const bool first = !everShown;
        const bool recovered = !trouble.empty();
        trouble.clear();
        everShown = true;
        if (session.options().json) {
            Json data = treeJson(trees.adapters());
            if (first || recovered || data != printed) {
                session.printLine({}, data);
                printed = std::move(data);
            }
            return;
        }
        const bool changed = takeLines(trees, first);
        const bool isNews = first || changed || recovered || hasNewEvents;
        hasNewEvents = false;
        if (session.terminal().cursorMoves || isNews) {
            draw();
        }
    }

    /// Returns whether there are marks that are new.
    bool takeLines(const Trees& trees, bool first) {
        std::vector<TreeLine> now = treeLines(trees.adapters(), session.codeBook());
        const bool changed = !first && markChanges(now, lines);
        const auto present = Clock::now();
        // Elsewhere the picture with the marks stays where it is.
        if (session.terminal().cursorMoves && present < marked + timeOfMarks) {
            keepMarks(now, lines);
        }
        if (changed) {
            marked = present;
        }
        lines = std::move(now);
        return changed;
    }

    void draw() {
        Picture picture{.above = {{"RAID at " + presentTimestamp(), Style::heading}},
                        .tree = lines,
                        .below = {}};
        if (!trouble.empty()) {
            picture.above.push_back({trouble, Style::critical});
        }
        if (lines.empty()) {
            picture.above.push_back({std::string{noAdapters}});
        }
        for (const std::string& line : events.lines()) {
            picture.below.push_back({line});
        }
        screen->show(std::move(picture));
    }

    /// Until something happens or the interval is over.
    void waitForEvents() {
        if (session.stop().stop_requested()) {
            return;
        }
        bool isNew = false;
        bool inTime = false;
        {
            const Alarm alarm{options.interval,
                              session.library().function<void()>("cancelGetEvent")};
            const std::int64_t awaited = events.awaited(newestSeen);
            isNew = service.nextEvent(awaited - 1) &&
                    events.take(wait.from(events.readFrom(awaited)).events, newestSeen);
            inTime = !alarm.over().stop_requested();
        }
        hasNewEvents = hasNewEvents || isNew;
        idleWaits.ended(inTime, isNew);
        if (idleWaits.needPause()) {
            pauseUnlessStopped(options.interval, session.stop());
        }
    }

    using Clock = std::chrono::steady_clock;

    /// So long a change stays marked on a terminal, though the next look may follow at once.
    static constexpr std::chrono::seconds timeOfMarks{5};

    const Session& session;
    const WatchOptions& options;
    std::optional<Screen> screen;  ///< none for JSON
    int (*askNewest)();
    const int* newest;
    Exchange service;
    EventWait wait;
    Backoff backoff;
    std::vector<TreeLine> lines;
    Clock::time_point marked{};  ///< when something was last
    LatestEvents events;
    std::string trouble;
    Json printed;
    std::int64_t newestSeen = 0;  ///< before the last look
    IdleWaits idleWaits;
    bool everShown = false;
    bool hasNewEvents = false;  ///< since the last picture
};

}  // namespace

int runCommand(const Session& session, const WatchOptions& watch) {
    Watch{session, watch}.run();
    return 0;
}

}  // namespace raidinfo
