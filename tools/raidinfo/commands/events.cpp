#include <algorithm>
#include <chrono>
#include <cstdint>
#include <nlohmann/json.hpp>
#include <optional>
#include <string>

#include "commands/commands.h"
#include "events/event_line.h"
#include "events/follower.h"
#include "events/hook.h"
#include "events/state_file.h"
#include "json/json.h"
#include "source/recorded.h"

namespace raidinfo {
namespace {

/// Shows events, hands them to the hook and keeps account of them.
class Presentation {
public:
    Presentation(const Session& shownIn, const EventsOptions& chosen,
                 const std::optional<LastShown>& shownBefore)
        : session{shownIn}, options{chosen}, last{shownBefore} {}

    bool show(const Record& event) {
        if (session.options().json) {
            session.printLine({}, eventJson(event));
        } else {
            session.output().write(eventLine(event));
        }
        if (!options.command.empty()) {
            runHookFor(event);
            if (session.stop().stop_requested()) {
                return false;  // The hook may not have done its work: the next run shows it again.
            }
        }
        if (options.state) {
            keep(event);
        }
        return ++shown != options.count;
    }

    void notice(const Notice& notice) {
        if (notice.code == numbersWentBack) {
            last.reset();
        }
        complain(notice.message);
        if (session.options().json) {
            session.printLine({{notice.code, notice.message}}, nullptr);
        }
    }

    /// A run that is ended before it has shown anything must not lose what comes until the next.
    void begin(std::int64_t first) {
        if (options.state) {
            StateFile{*options.state}.write({std::max<std::int64_t>(first - 1, 0)});
        }
    }

private:
    /// An event that comes late leaves the state alone.
    void keep(const Record& event) {
        const std::int64_t number = numberOf(eventKind(), event, "sequence_number");
        if (!last || number >= last->number) {
            last = LastShown{number, contentOf(event)};
            StateFile{*options.state}.write(*last);
        }
    }

    void runHookFor(const Record& event) {
        const std::string input =
            documentLine(enveloped(sourceOf(session.options()), {}, eventJson(event)));
        const std::string trouble = runHook(options.command, input, session.stop());
        if (!trouble.empty() && !session.stop().stop_requested()) {
            notice({"hook_failed", "the command for the event " + trouble});
        }
    }

    const Session& session;
    const EventsOptions& options;
    int shown = 0;
    std::optional<LastShown> last;  ///< with the greatest number since the service began to count
};

/// What cannot be kept is told before the first event is handed to anybody.
StreamStart startOf(const EventsOptions& options,
                    std::optional<std::chrono::milliseconds> patience) {
    StreamStart start{.first = options.since, .patience = patience, .interval = options.interval};
    if (options.state) {
        const StateFile state{*options.state};
        start.shownBefore = state.read();
        if (start.shownBefore) {
            state.write(*start.shownBefore);
        } else {
            state.tryToWrite();
        }
    }
    return start;
}

void showRecorded(const Session& session, const StreamStart& start, const EventListener& listener) {
    Continuity continuity = start.shownBefore ? Continuity::after(*start.shownBefore)
                                              : Continuity{start.first.value_or(0)};
    RecordedEvents recorded{session.library(), *session.recorded()};
    while (const auto batch = recorded.next()) {
        const bool wentBack = continuity.last() && greatestNumber(*batch) < *continuity.last();
        static_cast<void>(beginsAnew(continuity, *batch, wentBack, listener));
        if (!showBatch(continuity, *batch, listener)) {
            return;
        }
    }
    if (recorded.leftOut() > 0) {
        listener.notice({troubleCode(ExitStatus::malformedAnswer),
                         "recorded answers with events that are malformed and left out: " +
                             std::to_string(recorded.leftOut())});
    }
    for (const auto& [code, message] : session.troublesOfSource()) {
        listener.notice({code, message});
    }
}

}  // namespace

int runCommand(const Session& session, const EventsOptions& events) {
    const StreamStart start = startOf(events, session.options().limit);
    Presentation presentation{session, events, start.shownBefore};
    const EventListener listener{
        [&presentation](const Record& event) { return presentation.show(event); },
        [&presentation](const Notice& notice) { presentation.notice(notice); },
        [&presentation](std::int64_t first) { presentation.begin(first); }};
    if (session.recorded()) {
        showRecorded(session, start, listener);
    } else {
        followEvents(session.library(), start, listener, session.stop());
    }
    return 0;
}

}  // namespace raidinfo
