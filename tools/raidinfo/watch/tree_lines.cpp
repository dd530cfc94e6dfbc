#include "watch/tree_lines.h"

#include <map>
#include <string_view>
#include <unordered_map>
#include <utility>

#include "presentation/tree.h"

namespace raidinfo {
namespace {

using Change = TreeLine::Change;

/// Below each path several nodes may have the same title; they are counted.
class Paths {
public:
    std::string numbered(std::string path) {
        const int number = ++counts[path];
        return number == 1 ? std::move(path) : path + "#" + std::to_string(number);
    }

private:
    std::unordered_map<std::string, int> counts;
};

void addPaths(const Group& group, const std::string& above, Paths& paths,
              std::map<const Node*, std::string>& found) {
    for (const Node& node : group.nodes) {
        const std::string& path =
            found.emplace(&node, paths.numbered(above + "/" + node.title)).first->second;
        for (const Group& below : node.groups) {
            addPaths(below, path, paths, found);
        }
    }
}

/// Those that are there.
using LinesByPath = std::unordered_map<std::string_view, const TreeLine*>;

LinesByPath byPath(const std::vector<TreeLine>& lines) {
    LinesByPath found;
    for (const TreeLine& line : lines) {
        if (line.change != Change::gone) {
            found.emplace(line.path, &line);
        }
    }
    return found;
}

}  // namespace

std::vector<TreeLine> treeLines(const Group& roots, const CodeBook& book) {
    std::map<const Node*, std::string> paths;
    Paths numbering;
    addPaths(roots, "", numbering, paths);
    std::vector<TreeLine> lines;
    for (DrawnLine& line : linesOf(roots, book)) {
        lines.push_back({paths[line.node], std::move(line.margin), std::move(line.text)});
    }
    return lines;
}

bool markChanges(std::vector<TreeLine>& now, const std::vector<TreeLine>& before) {
    LinesByPath earlier = byPath(before);
    bool any = false;
    for (TreeLine& line : now) {
        const auto found = earlier.find(line.path);
        if (found == earlier.end() || found->second->text != line.text) {
            line.change = Change::changed;
            any = true;
        }
        if (found != earlier.end()) {
            earlier.erase(found);
        }
    }
    for (const TreeLine& line : before) {
        if (earlier.contains(line.path) && line.change != Change::gone) {
            now.push_back({line.path, "", line.path.substr(1) + ": gone", Change::gone});
            any = true;
        }
    }
    return any;
}

void keepMarks(std::vector<TreeLine>& now, const std::vector<TreeLine>& before) {
    const LinesByPath earlier = byPath(before);
    for (TreeLine& line : now) {
        const auto found = earlier.find(line.path);
        if (found != earlier.end() && found->second->change == Change::changed &&
            line.change == Change::none) {
            line.change = Change::changed;
        }
    }
    const LinesByPath present = byPath(now);
    std::vector<TreeLine> gone;
    for (const TreeLine& line : before) {
        if (line.change == Change::gone && !present.contains(line.path)) {
            gone.push_back(line);
        }
    }
    now.insert(now.end(), gone.begin(), gone.end());
}

}  // namespace raidinfo
