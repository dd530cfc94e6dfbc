#include <nlohmann/json.hpp>
#include <optional>
#include <string>

#include "commands/commands.h"
#include "redact/redactor.h"
#include "source/recorder.h"
#include "system/file.h"
#include "system/timestamp.h"

namespace raidinfo {

int runCommand(const Session& session, const RecordOptions& record) {
    const std::string startedAt = presentTimestamp();
    const bool toOutput = isStandardOutput(record.file);
    std::optional<GrowingFile> file;  // from the first answer on: a recording that is there is kept
    std::optional<redact::Redactor> redactor;
    if (record.redact) {
        redactor.emplace();
    }
    std::size_t answers = 0;
    bool knowsNames = false;
    const auto sink = [&](const recording::Entry& entry) {
        if (entry.question == recording::Question::configuration) {
            knowsNames = entry.body.has_value();
        } else if (redactor && entry.body && !knowsNames) {
            return;  // The messages may mention what only the lost configuration tells.
        }
        ++answers;
        recording::Entry kept = entry;
        if (redactor && kept.body) {
            kept.body = (*redactor)(*kept.body);
        }
        std::string text = recording::written(kept);
        if (answers == 1) {
            text.insert(0, recording::heading(startedAt));
        }
        if (toOutput) {
            session.output().write(text);
            return;
        }
        if (!file) {
            file.emplace(record.file);
        }
        file->append(text);
    };
    recordAnswers(session.library(), sink, {record.duration, session.options().limit},
                  session.stop());
    if (session.options().json && !toOutput) {
        session.print(Json::object({{"file", record.file.string()}, {"answers", answers}}));
    }
    return 0;
}

}  // namespace raidinfo
