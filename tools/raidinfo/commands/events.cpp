#include <algorithm>
#include <nlohmann/json.hpp>
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
    Presentation(const Session& shownIn, const EventsOptions& chosen)
        : session{shownIn}, options{chosen} {}

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
            greatest = std::max(greatest, numberOf(eventKind(), event, "sequence_number"));
            StateFile{*options.state}.write(greatest);
        }
        return ++shown != options.count;
    }

    void notice(const Notice& notice) {
        if (notice.code == numbersWentBack) {
            greatest = 0;
        }
        complain(notice.message);
        if (session.options().json) {
            session.printLine({{notice.code, notice.message}}, nullptr);
        }
    }

private:
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
    int greatest = 0;  ///< number shown since the service began to count
};

StreamStart startOf(const EventsOptions& options) {
    StreamStart start{.first = options.since};
    if (options.state) {
        start.shownBefore = StateFile{*options.state}.read();
    }
    return start;
}

void showRecorded(const Session& session, const StreamStart& start, const EventListener& listener) {
    Continuity continuity = start.shownBefore ? Continuity::after(*start.shownBefore)
                                              : Continuity{start.first.value_or(0)};
    RecordReader reader{session.library()};
    for (const recording::Entry& entry : session.recorded()->entries) {
        if (entry.question != recording::Question::events || !entry.body) {
            continue;
        }
        if (const auto batch = eventsIn(session.library(), reader, *entry.body)) {
            if (!showBatch(continuity, *batch, listener)) {
                return;
            }
        }
    }
}

}  // namespace

int runCommand(const Session& session, const EventsOptions& events) {
    Presentation presentation{session, events};
    const EventListener listener{
        [&presentation](const Record& event) { return presentation.show(event); },
        [&presentation](const Notice& notice) { presentation.notice(notice); }};
    if (session.recorded()) {
        showRecorded(session, startOf(events), listener);
    } else {
        followEvents(session.library(), startOf(events), listener, session.stop());
    }
    return 0;
}

}  // namespace raidinfo
