#include <nlohmann/json.hpp>
#include <optional>

#include "commands/commands.h"
#include "exit_status.h"
#include "redact/redactor.h"
#include "source/recorder.h"
#include "system/file.h"
#include "system/timestamp.h"

namespace raidinfo {

int runCommand(const Session& session, const RecordOptions& record) {
    if (session.recorded()) {
        throw Failure{ExitStatus::usage, "record saves what the service answers, not a recording"};
    }
    GrowingFile file{record.file};
    file.append(recording::heading(presentTimestamp()));
    std::optional<redact::Redactor> redactor;
    if (record.redact) {
        redactor.emplace();
    }
    std::size_t answers = 0;
    const auto sink = [&](const recording::Entry& entry) {
        ++answers;
        recording::Entry kept = entry;
        if (redactor && kept.body) {
            kept.body = (*redactor)(*kept.body);
        }
        file.append(recording::written(kept));
    };
    recordAnswers(session.library(), sink, record.duration, session.stop());
    if (session.options().json) {
        session.print(Json::object({{"file", record.file.string()}, {"answers", answers}}));
    }
    return 0;
}

}  // namespace raidinfo
