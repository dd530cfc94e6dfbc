#include "health/report.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <iterator>
#include <tuple>
#include <vector>

#include "health/vocabulary.h"
#include "settings/setting.h"
#include "text/enumerated.h"
#include "text/printable.h"

namespace raidinfo::health {
namespace {

constexpr std::string_view indentation = "  ";

std::string upperCase(std::string_view text) {
    std::string result{text};
    std::ranges::transform(result, result.begin(), [](unsigned char character) {
        return static_cast<char>(std::toupper(character));
    });
    return result;
}

/// "1 record", "2 records"
std::string counted(std::size_t number, const std::string& noun) {
    return std::to_string(number) + " " + noun + (number == 1 ? "" : "s");
}

std::size_t recordsOf(const Verdict& verdict) {
    std::size_t records = 0;
    for (const Population& population : verdict.machine) {
        // Members of arrays are drives that have been counted, or are none.
        records += population.kind == arrayMembers ? 0 : population.records;
    }
    return records;
}

std::string titleLine(const Verdict& verdict) {
    return upperCase(word(verdict.severity)) + ": " + headline(verdict) + "\n";
}

/// As wide as the widest of the column.
std::string padded(const std::string& text, std::size_t width) {
    return text + std::string(width - std::min(width, text.size()), ' ');
}

std::string findingLine(const Finding& finding) {
    constexpr std::size_t widestWord = 8;
    return std::string{indentation} + padded(std::string{word(finding.severity)}, widestWord) +
           "  " + finding.record.address + ": " + finding.message + "\n";
}

std::string recordName(const Culprit& record) {
    return record.kind + (record.position ? " " + std::to_string(*record.position) : "");
}

std::string factsOf(const Finding& finding) {
    return enumerated(finding.facts,
                      [](const Fact& fact) { return fact.field + " = " + fact.shown; });
}

const Checked* ruleOf(const Verdict& verdict, const Finding& finding) {
    const auto found = std::ranges::find(verdict.checked, finding.rule, &Checked::rule);
    return found == verdict.checked.end() ? nullptr : &*found;
}

std::string grounds(const Verdict& verdict, const Finding& finding) {
    const std::string margin(2 * indentation.size(), ' ');
    std::string text = margin + "record: " + recordName(finding.record) + "\n" + margin +
                       "fields: " + factsOf(finding) + "\n" + margin + "rule: " + finding.rule;
    if (const Checked* const rule = ruleOf(verdict, finding)) {
        text += ", " + std::string{word(rule->severity)} + " when " + printable(rule->condition) +
                " (" + rule->place + ")";
    }
    return text + "\n";
}

using Row = std::array<std::string, 5>;

Row rowOf(const Checked& rule) {
    if (!rule.enabled) {
        return {rule.rule, std::string{word(rule.severity)}, "-", "-", "disabled"};
    }
    return {rule.rule, std::string{word(rule.severity)}, std::to_string(rule.records),
            std::to_string(rule.findings),
            enumerated(rule.kinds) + ": " + printable(rule.condition)};
}

std::string ruleTable(const Verdict& verdict) {
    std::string text = "Rules checked: " + std::to_string(verdict.checked.size()) + "\n";
    if (verdict.checked.empty()) {
        return text;
    }
    std::vector<Row> rows{{"rule", "severity", "records", "findings", "condition"}};
    std::ranges::transform(verdict.checked, std::back_inserter(rows), rowOf);
    std::array<std::size_t, std::tuple_size_v<Row>> widths{};
    for (const Row& row : rows) {
        for (std::size_t column = 0; column + 1 < row.size(); ++column) {
            widths[column] = std::max(widths[column], row[column].size());
        }
    }
    for (const Row& row : rows) {
        for (std::size_t column = 0; column < row.size(); ++column) {
            text += std::string{indentation} + padded(row[column], widths[column]);
        }
        text += "\n";
    }
    return text;
}

}  // namespace

std::string headline(const Verdict& verdict) {
    if (!verdict.reason.empty()) {
        return printable(verdict.reason);
    }
    const std::string records = counted(recordsOf(verdict), "record");
    return verdict.findings.empty()
               ? "nothing is wrong with " + records
               : counted(verdict.findings.size(), "finding") + " in " + records;
}

std::string summary(const Verdict& verdict) {
    std::string text = titleLine(verdict);
    for (const Finding& finding : verdict.findings) {
        text += findingLine(finding);
    }
    return text;
}

std::string explained(const Verdict& verdict) {
    std::string text = titleLine(verdict);
    for (const Finding& finding : verdict.findings) {
        text += findingLine(finding) + grounds(verdict, finding);
    }
    return text + ruleTable(verdict);
}

}  // namespace raidinfo::health
