#include "diff/rules.h"

#include <algorithm>
#include <array>

#include "inventory/overall_status.h"
#include "inventory/value.h"

namespace raidinfo::diff {
namespace {

// Words are graded, not numbers: which number means what is for the code book to say. A name that
// stands nowhere here is neither better nor worse than another.

// "unknown" is a status that the library has no word for.
constexpr auto overallStates = [] {
    std::array<Grade, overallStatusWords.size() + 1> grades{};
    for (std::size_t index = 0; index < overallStatusWords.size(); ++index) {
        grades[index] = {overallStatusWords[index], static_cast<int>(index)};
    }
    grades.back() = {unknownWord, 1};
    return grades;
}();
constexpr std::array states{
    Grade{"normal", 0},  Grade{"ready", 0},    Grade{"online", 0},   Grade{"hot spare", 0},
    Grade{"present", 0}, Grade{"warning", 1},  Grade{"degraded", 1}, Grade{"rebuilding", 1},
    Grade{"absent", 1},  Grade{"critical", 2}, Grade{"failed", 2},   Grade{"offline", 2},
};
constexpr std::array batteryStates{Grade{"good", 0}, Grade{"charging", 1}, Grade{"none", 1},
                                   Grade{"failed", 2}};
constexpr std::array fault{Grade{"no", 0}, Grade{"yes", 1}};

constexpr auto allRules = std::to_array<Rule>({
    {.key = "serial_number", .lead = "serial"},
    {.key = "overall_status", .lead = "", .grades = overallStates},
    {.key = "state", .grades = states},
    {.key = "status", .grades = states},
    {.key = "smart_error",
     .begins = "SMART error",
     .ends = "no longer a SMART error",
     .grades = fault},
    {.key = "blocked", .begins = "became blocked", .ends = "no longer blocked", .grades = fault},
    {.key = "battery_status", .grades = batteryStates},
    {.key = "hot_spare", .begins = "became hot spare", .ends = "no longer hot spare"},
    {.key = "firmware_version", .lead = "firmware updated"},
    {.key = "firmware_level", .lead = "firmware updated"},
    {.key = "array_id", .of = SubjectId::diskDrive, .followsHolder = true},
    {.key = "array_id", .of = SubjectId::logicalDrive, .followsHolder = true},
    {},  // any other field
});

const Grade* gradeOf(const Rule& rule, const std::optional<std::string>& word) {
    const auto found =
        word ? std::ranges::find(rule.grades, *word, &Grade::word) : rule.grades.end();
    return found == rule.grades.end() ? nullptr : &*found;
}

}  // namespace

const Rule& ruleOf(const Subject& subject, std::string_view key) {
    const auto found = std::ranges::find_if(allRules, [&](const Rule& rule) {
        return rule.key == key && (!rule.of || *rule.of == subject.id);
    });
    return found == allRules.end() ? allRules.back() : *found;
}

std::size_t rankOf(const Rule& rule) noexcept {
    return static_cast<std::size_t>(&rule - allRules.data());
}

Direction direction(const Rule& rule, const std::optional<std::string>& before,
                    const std::optional<std::string>& after) {
    const Grade* const from = gradeOf(rule, before);
    const Grade* const to = gradeOf(rule, after);
    if (from == nullptr || to == nullptr || from->badness == to->badness) {
        return Direction::neutral;
    }
    return from->badness < to->badness ? Direction::worse : Direction::better;
}

}  // namespace raidinfo::diff
