#include "presentation/tree.h"

#include <nlohmann/json.hpp>

#include "commands/commands.h"
#include "inventory/structure.h"
#include "inventory/tree.h"
#include "json/json.h"

namespace raidinfo {

int runCommand(const Session& session, const TreeOptions& tree) {
    const Trees trees = session.inventory();
    const Group roots = tree.logical ? logicalView(trees.adapters()) : trees.adapters();
    if (session.options().json) {
        session.print(treeJson(roots));
    } else {
        session.output().write(drawn(roots, session.codeBook(), session.painter()));
    }
    return 0;
}

}  // namespace raidinfo
