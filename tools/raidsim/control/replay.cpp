#include "control/replay.h"

#include <algorithm>
#include <array>
#include <optional>
#include <string>
#include <utility>

#include "service.h"
#include "state/event_answer.h"
#include "text.h"
#include "xml/elements.h"
#include "xml/tree.h"
#include "xml/well_formed.h"

namespace raidsim {

namespace {

using recording::Question;
using recording::Recording;
using Body = std::optional<std::string>;

void replayConfiguration(Service& service, const Body& body) {
    if (body) {
        service.serve(Document::verbatim(*body));
    } else {
        service.substitute(RequestKind::config, std::nullopt);
    }
}

std::optional<int> returnedNumber(const std::string& body) {
    try {
        xml::checkWellFormed(body);
    } catch (const xml::XmlError&) {
        return std::nullopt;
    }
    const auto returned = xml::elementsOf(body, "as:return");
    if (returned.size() != 1)
        return std::nullopt;
    return parseInt(trim(xml::parse(returned.front()).front().second.data()));
}

// The number tells the log, too: a service that has lost its events counts anew.
void replayNewest(Service& service, const Body& body) {
    service.substitute(RequestKind::newest, body);
    if (const auto number = body ? returnedNumber(*body) : std::nullopt)
        service.events().rollBack(*number);
}

void replayEvents(Service& service, const Body& body) {
    if (!body) {
        for (const RequestKind kind : {RequestKind::events, RequestKind::wait})
            service.substitute(kind, std::nullopt);
        service.events().giveWaitersUp();
        return;
    }
    service.answerFromState(RequestKind::wait);
    const auto answer = cutEventAnswer(*body);
    if (!answer) {
        service.substitute(RequestKind::events, body);
        service.events().wakeWaiters();
        return;
    }
    service.answerFromState(RequestKind::events);
    if (service.events().take(*answer))
        service.answerFromState(RequestKind::newest);
}

struct Replay {
    Question question;
    void (*perform)(Service& service, const Body& body);
};

constexpr std::array<Replay, 3> replays{{
    {Question::configuration, replayConfiguration},
    {Question::newestEvent, replayNewest},
    {Question::events, replayEvents},
}};

void replay(Service& service, const recording::Entry& entry) {
    std::ranges::find(replays, entry.question, &Replay::question)->perform(service, entry.body);
}

const recording::Entry* firstOf(const Recording& recording, Question question) {
    const auto found = std::ranges::find(recording.entries, question, &recording::Entry::question);
    return found == recording.entries.end() ? nullptr : &*found;
}

void beginReplay(Service& service, const Recording& recording) {
    const recording::Entry* const configuration = firstOf(recording, Question::configuration);
    replayConfiguration(service, configuration == nullptr ? std::nullopt : configuration->body);
    if (const recording::Entry* const newest = firstOf(recording, Question::newestEvent))
        replay(service, *newest);
}

Step stepAt(std::chrono::milliseconds time, Command command) {
    return {0, Schedule{time, time},
            [command = std::move(command)](std::uint64_t) { return command; }};
}

}  // namespace

std::vector<Step> replayOf(const std::shared_ptr<const Recording>& recording) {
    std::vector<Step> steps{stepAt(std::chrono::milliseconds(0), [recording](Service& service) {
        beginReplay(service, *recording);
        return Outcome{};
    })};
    for (const recording::Entry& entry : recording->entries) {
        // The recording lives as long as its steps.
        steps.push_back(stepAt(entry.at, [recording, &entry](Service& service) {
            replay(service, entry);
            return Outcome{};
        }));
    }
    return steps;
}

}  // namespace raidsim
