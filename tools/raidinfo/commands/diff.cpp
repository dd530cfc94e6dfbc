#include "diff/diff.h"

#include <nlohmann/json.hpp>
#include <string>
#include <utility>
#include <vector>

#include "commands/commands.h"
#include "diff/snapshot_file.h"
#include "exit_status.h"
#include "json/json.h"
#include "source/recorded.h"
#include "system/file.h"

namespace raidinfo {
namespace {

constexpr int same = 0;
constexpr int different = 1;

Json inventoryIn(const std::string& path, const Session& session, std::vector<Trouble>& troubles) {
    const std::string text = readFile(path);
    if (recording::isNamedRecording(text)) {
        const recording::Recording recorded = readRecording(path);
        RecordedInventory read = recordedInventory(session.library(), recorded);
        Json tree = treeJson(Trees{std::move(read.inventory)}.adapters());
        for (Trouble& trouble : troublesOf(recorded, path, read.leftOut)) {
            complain(trouble.message);
            troubles.push_back(std::move(trouble));
        }
        return tree;
    }
    try {
        return diff::snapshotData(text);
    } catch (const diff::SnapshotError& error) {
        throw Failure{ExitStatus::badInput, path + ": " + error.what()};
    }
}

}  // namespace

int runCommand(const Session& session, const DiffOptions& compared) {
    std::vector<Trouble> troubles;
    const Json before = inventoryIn(compared.before, session, troubles);
    const Json after = compared.after.empty() ? treeJson(session.inventory().adapters())
                                              : inventoryIn(compared.after, session, troubles);
    const auto changes = diff::changes(before, after, session.codeBook());
    if (session.options().json) {
        session.print(diff::changesData(changes), std::move(troubles));
    } else {
        session.output().write(diff::told(changes));
    }
    return changes.empty() ? same : different;
}

}  // namespace raidinfo
