#include "health/judge.h"

#include <algorithm>
#include <functional>
#include <iterator>

#include "health/evidence.h"
#include "health/vocabulary.h"
#include "text/decoded.h"
#include "text/printable.h"

namespace raidinfo::health {
namespace {

/// A rule whose conditions hold for a record.
struct Report {
    const Rule* rule;
    const Scope* scope;
    std::size_t record;
};

int gravityOf(const Report& report) { return gravity(report.rule->severity); }

std::vector<Report> reportsOf(const Policy& policy, const Evidence& evidence) {
    std::vector<Report> reports;
    for (const Rule& rule : policy.rules) {
        for (const Scope& scope : rule.scopes) {
            for (std::size_t record = 0; record < evidence.subjects().size(); ++record) {
                if (evidence.subjects()[record].kind == scope.kind &&
                    evidence.holdAll(scope.when, record)) {
                    reports.push_back({&rule, &scope, record});
                }
            }
        }
    }
    return reports;
}

/// Whether what a fallback rule reports follows from something as grave in the record itself or
/// below it. Other fallback rules are no explanation: they may follow from the same.
bool isExplained(const Report& report, const std::vector<Report>& reports,
                 const std::vector<Subject>& subjects) {
    return report.rule->fallback && std::ranges::any_of(reports, [&](const Report& other) {
               const auto& above = subjects[other.record].above;
               const bool isThere = other.record == report.record ||
                                    std::ranges::find(above, report.record) != above.end();
               return isThere && !other.rule->fallback && gravityOf(other) >= gravityOf(report);
           });
}

/// The reports that nothing else explains, the gravest first.
std::vector<Report> decisive(const std::vector<Report>& reports,
                             const std::vector<Subject>& subjects) {
    std::vector<Report> result;
    std::ranges::copy_if(reports, std::back_inserter(result), [&](const Report& report) {
        return !isExplained(report, reports, subjects);
    });
    std::ranges::stable_sort(result, std::ranges::greater{}, &gravityOf);
    return result;
}

Culprit culpritOf(const Subject& subject) {
    const Node& node = *subject.node;
    const bool isPublished = subject.kind != arrayMembers && node.kind != nullptr;
    return {std::string{isPublished ? node.kind->key : subject.kind}, node.position,
            subject.address};
}

Finding findingOf(const Report& report, const Evidence& evidence) {
    const Rule& rule = *report.rule;
    Finding finding{.severity = rule.severity,
                    .rule = rule.name,
                    .message = printable(rule.message.filled([&](const std::string& field) {
                        return evidence.fact(report.record, field).shown;
                    })),
                    .record = culpritOf(evidence.subjects()[report.record]),
                    .facts = {}};
    for (const Condition& condition : report.scope->when) {
        const auto& facts = finding.facts;
        if (std::ranges::find(facts, condition.field, &Fact::field) == facts.end()) {
            finding.facts.push_back(evidence.fact(report.record, condition.field));
        }
    }
    return finding;
}

Checked checkOf(const Rule& rule, const std::vector<Report>& reports, const Evidence& evidence) {
    Checked checked{.rule = rule.name,
                    .place = settings::shown(rule.place),
                    .severity = rule.severity,
                    .enabled = rule.enabled,
                    .kinds = {},
                    .condition = inWords(rule)};
    for (const Scope& scope : rule.scopes) {
        checked.kinds.push_back(scope.kind);
        checked.records += evidence.numberOf(scope.kind);
    }
    checked.findings = static_cast<std::size_t>(std::ranges::count(reports, &rule, &Report::rule));
    return checked;
}

}  // namespace

Verdict judge(const Group& adapters, const Policy& policy, const CodeBook& book) {
    if (adapters.nodes.empty()) {
        return unknownBecause("there is no RAID adapter");
    }
    const Evidence evidence{adapters, policy.counts, book};
    const auto reports = decisive(reportsOf(policy, evidence), evidence.subjects());
    Verdict verdict;
    for (const Report& report : reports) {
        verdict.findings.push_back(findingOf(report, evidence));
    }
    for (const Rule& rule : policy.rules) {
        verdict.checked.push_back(checkOf(rule, reports, evidence));
    }
    for (const std::string& kind : ruleKinds()) {
        verdict.machine.push_back({kind, evidence.numberOf(kind)});
    }
    if (std::ranges::all_of(verdict.checked,
                            [](const Checked& rule) { return rule.records == 0; })) {
        verdict.reason = "the policy has no rule for anything that is there";
    } else {
        verdict.severity = reports.empty() ? Severity::ok : reports.front().rule->severity;
    }
    return verdict;
}

Verdict unknownBecause(const std::string& reason) {
    return {.severity = Severity::unknown,
            .reason = decoded(reason),  // it may cite the name of a file, which may be any bytes
            .findings = {},
            .checked = {},
            .machine = {}};
}

int exitStatus(const Verdict& verdict) { return static_cast<int>(verdict.severity); }

}  // namespace raidinfo::health
