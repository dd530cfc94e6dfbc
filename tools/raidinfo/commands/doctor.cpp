#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "commands/commands.h"
#include "doctor/examination.h"
#include "exit_status.h"
#include "text/printable.h"

namespace raidinfo {
namespace {

constexpr std::size_t titleWidth = 17;
constexpr std::size_t outcomeWidth = 6;

Style styleOf(Examined::Outcome outcome) {
    switch (outcome) {
        case Examined::Outcome::fine:
            return Style::good;
        case Examined::Outcome::noteworthy:
            return Style::warning;
        case Examined::Outcome::bad:
            break;
    }
    return Style::critical;
}

std::string line(const Examined& found, const Painter& painter) {
    const std::string_view word = wordOf(found.outcome);
    return std::string{found.title} + std::string(titleWidth - found.title.size(), ' ') +
           painter(word, styleOf(found.outcome)) + std::string(outcomeWidth - word.size(), ' ') +
           printable(found.finding) + "\n";
}

Json entry(const Examined& found) {
    return Json::object({{"check", std::string{found.key}},
                         {"outcome", std::string{wordOf(found.outcome)}},
                         {"finding", found.finding}});
}

}  // namespace

int runCommand(const Session& session, const DoctorOptions& /*doctor*/) {
    auto status = ExitStatus::ok;
    std::vector<Trouble> troubles;
    auto findings = Json::array();
    const auto limit = session.options().limit;
    examine(session.library(), limit, [&](const Examined& found) {
        if (found.outcome == Examined::Outcome::bad) {
            status = status == ExitStatus::ok ? found.status : status;
            troubles.push_back({troubleCode(found.status), found.finding});
        }
        if (session.options().json) {
            findings.push_back(entry(found));
        } else {
            session.output().write(line(found, session.painter()));
        }
    });
    if (session.options().json) {
        session.print(Json::object({{"findings", std::move(findings)}}), troubles);
    }
    return static_cast<int>(status);
}

}  // namespace raidinfo
