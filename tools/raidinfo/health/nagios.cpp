#include "health/nagios.h"

#include <algorithm>
#include <array>

#include "health/report.h"
#include "text/printable.h"

namespace raidinfo::health {
namespace {

constexpr auto stateWords =
    std::to_array<std::string_view>({"OK", "WARNING", "CRITICAL", "UNKNOWN"});

/// A message on a pager tells what decides; --explain tells all.
constexpr std::size_t mostFindings = 3;

/// Monitoring systems cut longer lines, and then the performance data would be lost.
constexpr std::size_t longestText = 1000;

/// The bar begins the performance data, a line break ends the text.
std::string withoutBars(std::string_view text) {
    std::string result = printable(text);
    std::ranges::replace(result, '|', '/');
    return result;
}

/// Cuts between characters.
std::string shortened(std::string text) {
    constexpr std::string_view ellipsis = "...";
    if (text.size() <= longestText) {
        return text;
    }
    std::size_t end = longestText - ellipsis.size();
    const auto continues = [&text](std::size_t index) {
        return (static_cast<unsigned char>(text[index]) & 0xC0U) == 0x80U;
    };
    while (end > 0 && continues(end)) {
        --end;
    }
    return text.substr(0, end).append(ellipsis);
}

std::string textOf(const Verdict& verdict) {
    std::string text = headline(verdict);
    const std::size_t told = std::min(verdict.findings.size(), mostFindings);
    for (std::size_t index = 0; index < told; ++index) {
        const Finding& finding = verdict.findings[index];
        text += "; " + std::string{word(finding.severity)} + ": " + finding.record.address + ": " +
                finding.message;
    }
    return shortened(withoutBars(text));
}

std::size_t findings(const Verdict& verdict, Severity severity) {
    return static_cast<std::size_t>(
        std::ranges::count(verdict.findings, severity, &Finding::severity));
}

/// The same figures in the same order whatever was found, as graphs need it.
std::string figures(const Verdict& verdict) {
    std::string text =
        performanceData({"critical findings", findings(verdict, Severity::critical), {}, 0}) + " " +
        performanceData({"warning findings", findings(verdict, Severity::warning), 0}) + " " +
        performanceData({"unknown findings", findings(verdict, Severity::unknown)});
    for (const Population& population : verdict.machine) {
        std::string label = population.kind;
        std::ranges::replace(label, '_', ' ');
        text += " " + performanceData({label, population.records});
    }
    return text;
}

}  // namespace

std::string performanceData(const Measurement& measurement) {
    std::string label = printable(measurement.label);
    std::erase_if(label, [](char character) {
        return character == '\'' || character == '=' || character == '|';
    });
    const char* const quote = label.find(' ') == std::string::npos ? "" : "'";
    const auto threshold = [](const std::optional<int>& limit) {
        return ";" + (limit ? std::to_string(*limit) : "");
    };
    return std::string{quote} + label + quote + "=" + std::to_string(measurement.value) +
           threshold(measurement.warning) + threshold(measurement.critical) + ";0";
}

std::string nagiosLine(const Verdict& verdict) {
    const auto state = stateWords[static_cast<std::size_t>(verdict.severity)];
    const std::string line = "RAID " + std::string{state} + " - " + textOf(verdict);
    return line + (verdict.machine.empty() ? "" : " | " + figures(verdict)) + "\n";
}

}  // namespace raidinfo::health
