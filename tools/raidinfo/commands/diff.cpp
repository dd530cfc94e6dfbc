#include "diff/diff.h"

#include <nlohmann/json.hpp>
#include <string>

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

Json inventoryIn(const std::string& path, const Session& session) {
    const std::string text = readFile(path);
    if (text.starts_with("raid-recording ")) {
        return treeJson(
            Trees{recordedInventory(session.library(), readRecording(path))}.adapters());
    }
    try {
        return diff::snapshotData(text);
    } catch (const diff::SnapshotError& error) {
        throw Failure{ExitStatus::badInput, path + ": " + error.what()};
    }
}

}  // namespace

int runCommand(const Session& session, const DiffOptions& compared) {
    const Json before = inventoryIn(compared.before, session);
    const Json after = compared.after.empty() ? treeJson(session.inventory().adapters())
                                              : inventoryIn(compared.after, session);
    const auto changes = diff::changes(before, after, session.codeBook());
    if (session.options().json) {
        session.print(diff::changesData(changes));
    } else {
        session.output().write(diff::told(changes));
    }
    return changes.empty() ? same : different;
}

}  // namespace raidinfo
