#include "watch/tree_lines.h"

#include <map>
#include <string_view>
#include <unordered_map>
#include <utility>

#include "presentation/tree.h"

namespace raidinfo {
namespace {

using Change = TreeLine::Change;

std::string_view markOf(Change change) {
    switch (change) {
        case Change::changed:
            return "* ";
        case Change::gone:
            return "- ";
        case Change::none:
            break;
    }
    return "  ";
}

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
    if (before.empty()) {
        return false;
    }
    std::unordered_map<std::string_view, const TreeLine*> earlier;
    for (const TreeLine& line : before) {
        if (line.change != Change::gone) {
            earlier.emplace(line.path, &line);
        }
    }
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

std::vector<ScreenLine> drawnLines(const std::vector<TreeLine>& lines) {
    std::vector<ScreenLine> drawn;
    drawn.reserve(lines.size());
    for (const TreeLine& line : lines) {
        drawn.push_back({std::string{markOf(line.change)} + line.margin + line.text,
                         line.change == Change::none ? Style::plain : Style::changed});
    }
    return drawn;
}

}  // namespace raidinfo
