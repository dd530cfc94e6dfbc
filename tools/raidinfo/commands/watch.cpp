#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <vector>

#include "commands/commands.h"
#include "events/event_line.h"
#include "exit_status.h"
#include "json/json.h"
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
          reader{watched.library()} {
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
        if (askNewest() == 0) {
            return lost(serviceUnavailable());
        }
        const int seen = *newest;
        try {
            const Trees trees = session.inventory();
            if (session.stop().stop_requested()) {
                return true;
            }
            lastNumber = seen;
            show(trees);
            return true;
        } catch (const Failure& failure) {
            return lost(failure);
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
        session.library().function<void(int)>("setRAIDEventSequenceNumber")(lastNumber + 1);
        const Alarm alarm{options.interval, session.library().function<void()>("cancelGetEvent")};
        session.library().function<int()>("getEvent")();
        constexpr std::size_t shownEvents = 3;
        for (const Record& event : reader.read(eventKind())) {
            if (numberOf(eventKind(), event, "sequence_number") > lastNumber) {
                std::string line = eventLine(event);
                line.pop_back();
                lastEvents.push_back({std::move(line)});
            }
        }
        if (lastEvents.size() > shownEvents) {
            lastEvents.erase(lastEvents.begin(),
                             lastEvents.end() - static_cast<std::ptrdiff_t>(shownEvents));
        }
    }

    const Session& session;
    const WatchOptions& options;
    std::optional<Screen> screen;  ///< none for JSON
    int (*askNewest)();
    const int* newest;
    RecordReader reader;
    Backoff backoff;
    std::vector<TreeLine> lines;
    std::vector<ScreenLine> lastEvents;
    std::string trouble;
    int lastNumber = 0;
    bool everShown = false;
};

}  // namespace

int runCommand(const Session& session, const WatchOptions& watch) {
    if (session.recorded()) {
        throw Failure{ExitStatus::usage, "a recording does not change; watch needs the service"};
    }
    Watch{session, watch}.run();
    return 0;
}

}  // namespace raidinfo
