#include "story.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <utility>

#include "control/scenario.h"
#include "files.h"
#include "vocabulary.h"

namespace raidsim::test {

namespace {

Scenario readScenario(const std::string& name, std::optional<std::uint64_t> seed) {
    const std::string folder = std::string(RAIDSIM_EXAMPLES) + "/scenarios";
    return parseScenario(readFile(folder + "/" + name + ".scenario"), folder, seed);
}

}  // namespace

Story::Story(const std::string& name, std::optional<std::uint64_t> seed)
    : Story(readScenario(name, seed)) {}

Story::Story(Scenario scenario)
    : start(scenario.start.value()),
      player(std::move(scenario.steps)),
      served(Document::read(scenario.config), scenario.config, [this] {
          return start + std::chrono::floor<std::chrono::seconds>(player.elapsed());
      }) {}

void Story::advanceTo(std::chrono::milliseconds elapsed) {
    look();
    for (auto due = player.nextDue(); due && *due <= elapsed; due = player.nextDue()) {
        player.advanceTo(*due, [this](const ScriptLine& line) {
            const Outcome outcome = line.command(served);
            if (!outcome.message.empty())
                lines.push_back(outcome.message);
        });
        look();
    }
}

void Story::look() {
    const std::string& body = served.document().body();
    if (body == lastSeen)
        return;
    lastSeen = body;
    seen += body;
    EXPECT_THAT(unknownIn(served.document()), testing::IsEmpty());
}

std::vector<std::string> Story::read(std::string_view path, const std::string& field) {
    return values(served.document(), path, field);
}

std::size_t Story::listings(std::string_view path) { return count(served.document(), path); }

std::vector<std::string> Story::events(const std::string& field) {
    const xml::Tree answer = xml::parse(served.goodBody(RequestKind::events));
    const xml::Tree& list = answer.get_child("env:Envelope.env:Body.m:getEventsResponse.ac:events");
    std::vector<std::string> found;
    for (const auto& [name, event] : list) {
        if (name == "ac:event")
            found.push_back(xml::textOf(event, "as:" + field));
    }
    return found;
}

std::string Story::transcript() { return seen + served.goodBody(RequestKind::events); }

}  // namespace raidsim::test
