#include <algorithm>
#include <cstdint>
#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <vector>

#include "commands/commands.h"
#include "events/event_line.h"
#include "events/follower.h"
#include "events/wait.h"
#include "exit_status.h"
#include "json/json.h"
#include "source/service.h"
#include "source/service_failures.h"
#include "system/alarm.h"
#include "system/backoff.h"
#include "system/timestamp.h"
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
        const Alarm alarm{everShown ? std::nullopt : session.options().limit,
                          session.library().function<void()>("cancelGetEvent")};
        const std::stop_token over = alarm.over();
        if (askNewest() == 0) {
            return lost(over.stop_requested() ? noAnswerInTime() : serviceUnavailable());
        }
        const int seen = *newest;
        try {
            const Trees trees = Trees{readInventory(session.library(), over)};
            if (session.stop().stop_requested()) {
                return true;
            }
            newestSeen = seen;
            show(trees);
            return true;
        } catch (const Failure& failure) {
            return lost(over.stop_requested() ? noAnswerInTime() : failure);
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
        std::vector<TreeLine> now = treeLines(trees.adapters(), session.codeBook());
        const bool changed = markChanges(now, lines);
        const bool first = !everShown;
        const bool recovered = !trouble.empty();
        trouble.clear();
        lines = std::move(now);
        everShown = true;
        if (session.options().json) {
            if (first || changed || recovered) {
                session.printLine({}, treeJson(trees.adapters()));
            }
        } else if (session.terminal().cursorMoves || first || changed || recovered) {
            draw();
        }
    }

    void draw() {
        std::vector<ScreenLine> text{{"RAID at " + presentTimestamp(), Style::heading}};
        if (!trouble.empty()) {
            text.push_back({trouble, Style::critical});
        }
        const std::vector<ScreenLine> tree = drawnLines(lines);
        text.insert(text.end(), tree.begin(), tree.end());
        text.insert(text.end(), lastEvents.begin(), lastEvents.end());
        screen->show(text);
    }

    /// Until something happens or the interval is over.
    void waitForEvents() {
        bool isNew = false;
        bool inTime = false;
        {
            const Alarm alarm{options.interval,
                              session.library().function<void()>("cancelGetEvent")};
            isNew = tellEvents(wait.from(nextNumber()).events);
            inTime = !alarm.over().stop_requested();
        }
        // A service whose newest event has a lower number than others, or that fails, ends each
        // wait at once.
        idleWaits = inTime && !isNew ? idleWaits + 1 : 0;
        if (idleWaits > 1) {
            pauseUnlessStopped(options.interval, session.stop());
        }
    }

    /// What came while the inventory was read is told, too.
    [[nodiscard]] std::int64_t nextNumber() const {
        const std::int64_t next = newestSeen + 1;
        const bool isCounting = continuity && newestSeen >= continuity->last().value_or(0);
        return isCounting ? std::min(next, std::max<std::int64_t>(continuity->next(), 1)) : next;
    }

    /// Keeps the last ones for the picture; returns whether there were any.
    bool tellEvents(const Records& batch) {
        if (!continuity) {
            continuity.emplace(newestSeen + 1);
        }
        const bool wentBack = continuity->last() && newestSeen < *continuity->last();
        static_cast<void>(beginsAnew(*continuity, batch, wentBack, silent));
        const auto fresh = continuity->accept(batch).fresh;
        for (const std::size_t place : fresh) {
            std::string line = eventLine(batch[place]);
            line.pop_back();
            lastEvents.push_back({std::move(line)});
        }
        constexpr std::size_t shownEvents = 3;
        if (lastEvents.size() > shownEvents) {
            lastEvents.erase(lastEvents.begin(),
                             lastEvents.end() - static_cast<std::ptrdiff_t>(shownEvents));
        }
        return !fresh.empty();
    }

    const Session& session;
    const WatchOptions& options;
    std::optional<Screen> screen;  ///< none for JSON
    int (*askNewest)();
    const int* newest;
    EventWait wait;
    Backoff backoff;
    std::vector<TreeLine> lines;
    std::vector<ScreenLine> lastEvents;
    std::string trouble;
    std::optional<Continuity> continuity;  ///< of the events, from the first wait on
    EventListener silent{[](const Record& /*event*/) { return true; },
                         [](const Notice& /*notice*/) {}};
    std::int64_t newestSeen = 0;  ///< before the last look
    int idleWaits = 0;            ///< that ended early and brought nothing, in a row
    bool everShown = false;
};

}  // namespace

int runCommand(const Session& session, const WatchOptions& watch) {
    Watch{session, watch}.run();
    return 0;
}

}  // namespace raidinfo
