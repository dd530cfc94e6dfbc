#include "fault/instructions.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "bounds.h"
#include "files.h"
#include "text.h"

namespace raidsim {

namespace {

using Words = std::vector<std::string>;
using StepKind = FaultStep::Kind;

[[noreturn]] void refuse(const std::string& word, const std::string& wanted) {
    throw FaultError("\"" + word + "\" is not " + wanted);
}

std::size_t sizeOf(const std::string& word) {
    const auto number = parseInt(word);
    if (!number || *number < 0 || static_cast<std::size_t>(*number) > bounds::fileBytes)
        refuse(word, "a number of bytes");
    return static_cast<std::size_t>(*number);
}

int numberOf(const std::string& word) {
    const auto number = parseInt(word);
    if (!number)
        refuse(word, "a number");
    return *number;
}

template <typename Value, std::size_t count>
Value chosenFrom(const std::array<std::pair<std::string_view, Value>, count>& choices,
                 const std::string& word) {
    const auto found = std::ranges::find(choices, word, &std::pair<std::string_view, Value>::first);
    if (found != choices.end())
        return found->second;
    std::string names;
    for (const auto& choice : choices)
        names.append(names.empty() ? "" : ", ").append(choice.first);
    refuse(word, "one of " + names);
}

constexpr std::array<std::pair<std::string_view, RequestKind>, 5> requests{{
    {"config", RequestKind::config},
    {"events", RequestKind::events},
    {"wait", RequestKind::wait},
    {"newest", RequestKind::newest},
    {"any", RequestKind::any},
}};
constexpr std::array<std::pair<std::string_view, StepKind>, 3> endings{{
    {"close", StepKind::close},
    {"reset", StepKind::reset},
    {"stall", StepKind::stall},
}};
constexpr std::array<std::pair<std::string_view, HostCall>, 3> calls{{
    {"refresh", HostCall::refresh},
    {"getEvent", HostCall::getEvent},
    {"enableRAIDEvent", HostCall::enableRAIDEvent},
}};
constexpr std::array<std::pair<std::string_view, Fate>, 3> fates{{
    {"kept", Fate::kept},
    {"lost", Fate::lost},
    {"replaced", Fate::replaced},
}};
constexpr std::array<std::pair<std::string_view, LogExpectation::Kind>, 3> matches{{
    {"is", LogExpectation::Kind::exact},
    {"has", LogExpectation::Kind::has},
    {"ends", LogExpectation::Kind::ends},
}};

// Changes of a text. The words are those behind the change's name.

using Change = std::function<void(std::string& text)>;

Change becomeText(const CaseBuilder&, const Words& words) {
    return [next = words[0]](std::string& text) { text = next; };
}

Change appendText(const CaseBuilder&, const Words& words) {
    const std::string times = words.size() > 1 ? words[1] : "x1";
    if (!times.starts_with('x'))
        refuse(times, "a count such as x100");
    return [piece = words[0], count = sizeOf(times.substr(1))](std::string& text) {
        if (count > 0 &&
            piece.size() > (bounds::fileBytes - std::min(bounds::fileBytes, text.size())) / count)
            throw FaultError("the answer becomes too long");
        for (std::size_t done = 0; done < count; ++done)
            text.append(piece);
    };
}

Change keepFront(const CaseBuilder&, const Words& words) {
    return
        [size = sizeOf(words[0])](std::string& text) { text.resize(std::min(size, text.size())); };
}

Change replaceFirst(const CaseBuilder&, const Words& words) {
    return [old = words[0], next = words[1]](std::string& text) {
        const auto found = text.find(old);
        if (found == std::string::npos)
            throw FaultError("the answer does not hold \"" + old + "\"");
        text.replace(found, old.size(), next);
    };
}

Change becomeFile(const CaseBuilder& builder, const Words& words) {
    return
        [path = pathFrom(builder.folder, words[0])](std::string& text) { text = readFile(path); };
}

// What an instruction of several forms does, by its second word.
template <typename Result>
struct Form {
    std::string_view name;
    std::string_view arguments;
    std::size_t least = 0;  // words behind the name
    std::size_t most = 0;
    Result (*make)(const CaseBuilder& builder, const Words& words);
};

constexpr std::array<Form<Change>, 5> changes{{
    {"text", "T", 1, 1, becomeText},
    {"append", "T [xCOUNT]", 1, 2, appendText},
    {"keep", "N", 1, 1, keepFront},
    {"replace", "OLD NEW", 2, 2, replaceFirst},
    {"file", "PATH", 1, 1, becomeFile},
}};

// What a host is expected to see.

using Expect = std::function<void(FaultOutcome& outcome)>;

template <Fate FaultOutcome::*member>
Expect expectFate(const CaseBuilder&, const Words& words) {
    return [fate = chosenFrom(fates, words[0])](FaultOutcome& outcome) { outcome.*member = fate; };
}

Expect expectResult(const CaseBuilder&, const Words& words) {
    return [number = numberOf(words[0])](FaultOutcome& outcome) { outcome.result = number; };
}

Expect expectNext(const CaseBuilder&, const Words& words) {
    return [number = numberOf(words[0])](FaultOutcome& outcome) { outcome.next = number; };
}

Expect expectCount(const CaseBuilder&, const Words& words) {
    return [family = words[0], number = numberOf(words[1])](FaultOutcome& outcome) {
        outcome.counts.emplace_back(family, number);
    };
}

Expect expectLog(const CaseBuilder&, const Words& words) {
    const LogExpectation expected{numberOf(words[0]), chosenFrom(matches, words[1]), words[2]};
    return [expected](FaultOutcome& outcome) { outcome.log.push_back(expected); };
}

Expect expectOpen(const CaseBuilder&, const Words& words) {
    return [number = numberOf(words[0])](FaultOutcome& outcome) { outcome.leftOpen = number; };
}

Expect expectWithin(const CaseBuilder&, const Words& words) {
    return [number = numberOf(words[0])](FaultOutcome& outcome) {
        outcome.within = std::chrono::seconds(number);
    };
}

constexpr std::array<Form<Expect>, 8> expectations{{
    {"configuration", "kept|lost|replaced", 1, 1, expectFate<&FaultOutcome::configuration>},
    {"events", "kept|lost|replaced", 1, 1, expectFate<&FaultOutcome::events>},
    {"result", "N", 1, 1, expectResult},
    {"next", "N", 1, 1, expectNext},
    {"count", "FAMILY N", 2, 2, expectCount},
    {"log", "LEVEL is|has|ends T", 3, 3, expectLog},
    {"open", "N", 1, 1, expectOpen},
    {"within", "SECONDS", 1, 1, expectWithin},
}};

template <typename Result, std::size_t count>
Result formOf(const std::array<Form<Result>, count>& forms, const CaseBuilder& builder,
              const Words& words) {
    std::string usage;
    for (const Form<Result>& form : forms) {
        if (form.name == words[1] && words.size() >= form.least + 2 &&
            words.size() <= form.most + 2)
            return form.make(builder, {words.begin() + 2, words.end()});
        usage.append(usage.empty() ? "" : ", ")
            .append(form.name)
            .append(" ")
            .append(form.arguments);
    }
    throw FaultError("usage: " + words[0] + " " + usage);
}

// The instructions, each with the number of its words.

void addStep(CaseBuilder& builder, FaultStep step) {
    if (builder.ends)
        throw FaultError("the connection has ended");
    builder.built.steps.push_back(step);
}

void meets(CaseBuilder& builder, const Words& words) {
    builder.built.meets = chosenFrom(requests, words[1]);
}

void change(CaseBuilder& builder, const Words& words) {
    builder.built.edits.push_back({words[0] == "header", formOf(changes, builder, words)});
}

void read(CaseBuilder& builder, const Words& words) {
    builder.reads = true;
    if (words[1] == "request") {
        addStep(builder, {StepKind::readRequest});
    } else if (words[1] != "nothing") {
        addStep(builder, {StepKind::read, sizeOf(words[1])});
    }
}

void send(CaseBuilder& builder, const Words& words) {
    builder.sends = true;
    if (words[1] == "nothing")
        return;
    const std::size_t bytes = words[1] == "header"                       ? FaultStep::header
                              : words[1] == "rest" || words[1] == "body" ? FaultStep::rest
                                                                         : sizeOf(words[1]);
    addStep(builder, {StepKind::send, bytes});
}

void pieces(CaseBuilder& builder, const Words& words) {
    addStep(builder, {StepKind::pieces, sizeOf(words[1])});
}

void taken(CaseBuilder& builder, const Words&) { addStep(builder, {StepKind::taken}); }

void pause(CaseBuilder& builder, const Words& words) {
    const auto time = parseSeconds(words[1]);
    if (!time)
        refuse(words[1], std::string(secondsForm));
    addStep(builder, {StepKind::pause, 0, *time});
}

void end(CaseBuilder& builder, const Words& words) {
    addStep(builder, {chosenFrom(endings, words[1])});
    builder.ends = true;
}

void refuseConnections(CaseBuilder& builder, const Words&) { builder.built.refuses = true; }

void call(CaseBuilder& builder, const Words& words) {
    builder.built.outcome.call = chosenFrom(calls, words[1]);
}

void cancel(CaseBuilder& builder, const Words&) { builder.built.outcome.cancels = true; }

void expect(CaseBuilder& builder, const Words& words) {
    formOf(expectations, builder, words)(builder.built.outcome);
}

struct Instruction {
    std::string_view name;
    std::string_view arguments;
    std::size_t least;  // words, the name included
    std::size_t most;
    void (*obey)(CaseBuilder& builder, const Words& words);
};

constexpr std::array<Instruction, 13> instructions{{
    {"meets", "config|events|wait|newest|any", 2, 2, meets},
    {"body", "CHANGE ...", 2, 4, change},
    {"header", "CHANGE ...", 2, 4, change},
    {"read", "request|nothing|N", 2, 2, read},
    {"send", "header|body|rest|nothing|N", 2, 2, send},
    {"pieces", "N", 2, 2, pieces},
    {"taken", "", 1, 1, taken},
    {"pause", "SECONDS", 2, 2, pause},
    {"end", "close|reset|stall", 2, 2, end},
    {"refuse", "", 1, 1, refuseConnections},
    {"call", "refresh|getEvent|enableRAIDEvent", 2, 2, call},
    {"cancel", "", 1, 1, cancel},
    {"expect", "WHAT ...", 2, 5, expect},
}};

}  // namespace

FaultCase CaseBuilder::finish() {
    auto& steps = built.steps;
    if (!reads)
        steps.insert(steps.begin(), {StepKind::readRequest});
    if (!sends)
        steps.insert(ends ? steps.end() - 1 : steps.end(), {StepKind::send, FaultStep::rest});
    if (!ends)
        steps.push_back({StepKind::close});
    return std::move(built);
}

void obey(CaseBuilder& builder, const Words& words) {
    const auto found = std::ranges::find(instructions, words[0], &Instruction::name);
    if (found == instructions.end())
        throw FaultError("unknown instruction \"" + words[0] + "\"");
    if (words.size() < found->least || words.size() > found->most) {
        throw FaultError("usage: " + std::string(found->name) + " " +
                         std::string(found->arguments));
    }
    found->obey(builder, words);
}

}  // namespace raidsim
