#include "commands/commands.h"
#include "exit_status.h"
#include "health/health_json.h"
#include "health/judge.h"
#include "health/nagios.h"
#include "health/policy.h"
#include "health/report.h"

namespace raidinfo {
namespace {

bool isUnknownState(const Failure& failure) {
    return failure.status() == ExitStatus::serviceUnavailable ||
           failure.status() == ExitStatus::malformedAnswer;
}

health::Verdict verdictOf(const Session& session, const HealthOptions& options,
                          std::vector<Trouble>& troubles) {
    const CodeBook& book = session.codeBook();
    const health::Policy policy =
        options.policy ? health::readPolicy(*options.policy, book) : health::defaultPolicy(book);
    try {
        return health::judge(session.inventory().adapters(), policy, book);
    } catch (const Failure& failure) {
        if (!isUnknownState(failure)) {
            throw;
        }
        troubles.push_back({troubleCode(failure.status()), failure.what()});
        return health::unknownBecause(failure.what());
    }
}

}  // namespace

int runCommand(const Session& session, const HealthOptions& options) {
    std::vector<Trouble> troubles;
    const health::Verdict verdict = verdictOf(session, options, troubles);
    if (session.options().json) {
        session.print(health::healthData(verdict), troubles);
    } else if (options.nagios) {
        session.output().write(health::nagiosLine(verdict));
    } else {
        session.output().write(options.explain ? health::explained(verdict)
                                               : health::summary(verdict));
    }
    return health::exitStatus(verdict);
}

}  // namespace raidinfo
