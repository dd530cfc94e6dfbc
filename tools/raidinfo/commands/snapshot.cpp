#include <nlohmann/json.hpp>

#include "commands/commands.h"
#include "json/json.h"
#include "system/file.h"

namespace raidinfo {

int runCommand(const Session& session, const SnapshotOptions& snapshot) {
    Json data = treeJson(session.inventory().adapters());
    const Json saved =
        enveloped(sourceOf(session.options()), session.troublesOfSource(), std::move(data));
    if (isStandardOutput(snapshot.file)) {
        session.output().write(document(saved));
        return 0;
    }
    replaceFile(snapshot.file, document(saved));
    if (session.options().json) {
        session.print(Json::object({{"file", snapshot.file.string()}}));
    }
    return 0;
}

}  // namespace raidinfo
