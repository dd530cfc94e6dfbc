#include "watch/picture.h"

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <string_view>
#include <utility>

#include "text/width.h"

namespace raidinfo {
namespace {

using Change = TreeLine::Change;
using Lines = std::vector<PictureLine>;

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

std::string beginningOf(const TreeLine& line) {
    return std::string{markOf(line.change)} + line.margin;
}

Style styleOf(const TreeLine& line) {
    return line.change == Change::none ? Style::plain : Style::changed;
}

bool isBelow(const TreeLine& line, const TreeLine& other) {
    return line.path.size() > other.path.size() && line.path.starts_with(other.path) &&
           line.path[other.path.size()] == '/';
}

enum class Rank : std::uint8_t { changed, above, rest };

std::vector<Rank> ranksOf(const std::vector<TreeLine>& tree) {
    std::vector<Rank> found(tree.size(), Rank::rest);
    std::vector<std::size_t> branch;  // from the root down to the line before
    for (std::size_t index = 0; index < tree.size(); ++index) {
        while (!branch.empty() && !isBelow(tree[index], tree[branch.back()])) {
            branch.pop_back();
        }
        if (tree[index].change != Change::none) {
            found[index] = Rank::changed;
            for (const std::size_t above : branch) {
                found[above] = std::min(found[above], Rank::above);
            }
        }
        branch.push_back(index);
    }
    return found;
}

PictureLine shortLine(const TreeLine& line, std::size_t columns) {
    return {shortened(beginningOf(line) + line.text, columns), styleOf(line)};
}

Lines fullLine(const TreeLine& line, std::size_t columns) {
    Lines lines;
    for (std::string& part : folded(beginningOf(line), line.text, columns)) {
        lines.push_back({std::move(part), styleOf(line)});
    }
    return lines;
}

/// Shows in full what is shown and changed, as far as there are rows to spare; returns how many
/// that takes. From below, for a disk drive says more than its adapter.
std::size_t unfold(const std::vector<TreeLine>& tree, std::size_t columns, std::size_t spare,
                   std::vector<Lines>& shown) {
    const std::size_t before = spare;
    for (std::size_t index = tree.size(); index-- > 0;) {
        if (tree[index].change != Change::none && !shown[index].empty()) {
            Lines full = fullLine(tree[index], columns);
            if (full.size() - 1 <= spare) {
                spare -= full.size() - 1;
                shown[index] = std::move(full);
            }
        }
    }
    return before - spare;
}

/// The tree in so many rows.
Lines fittedTree(const std::vector<TreeLine>& tree, std::size_t columns, std::size_t rows) {
    const std::vector<Rank> rankOf = ranksOf(tree);
    const bool hasRoomForAll = tree.size() <= rows;
    // Otherwise the last row tells of the lines that find none.
    std::size_t room = hasRoomForAll || rows == 0 ? rows : rows - 1;
    std::vector<Lines> shown(tree.size());
    const auto take = [&](Rank rank) {
        for (std::size_t index = 0; index < tree.size() && room > 0; ++index) {
            if (rankOf[index] == rank) {
                shown[index] = {shortLine(tree[index], columns)};
                --room;
            }
        }
    };
    take(Rank::changed);
    const auto others =
        tree.size() - static_cast<std::size_t>(std::ranges::count(rankOf, Rank::changed));
    room -= unfold(tree, columns, hasRoomForAll ? room - others : room, shown);
    take(Rank::above);
    take(Rank::rest);
    const auto hidden = std::ranges::count(shown, true, &Lines::empty);
    Lines lines;
    for (Lines& line : shown) {
        std::ranges::move(line, std::back_inserter(lines));
    }
    if (hidden > 0 && rows > 0) {
        lines.push_back({shortened(
            std::to_string(hidden) + (hidden == 1 ? " more line" : " more lines"), columns)});
    }
    return lines;
}

}  // namespace

std::vector<PictureLine> wholePicture(const Picture& picture) {
    Lines lines = picture.above;
    for (const TreeLine& line : picture.tree) {
        lines.push_back({beginningOf(line) + line.text, styleOf(line)});
    }
    lines.insert(lines.end(), picture.below.begin(), picture.below.end());
    return lines;
}

std::vector<PictureLine> fittedPicture(const Picture& picture, std::size_t columns,
                                       std::size_t rows) {
    const std::size_t above = std::min(picture.above.size(), rows);
    const std::size_t below = std::min(picture.below.size(), rows - above);
    Lines lines;
    const auto add = [&lines, columns](auto first, auto last) {
        std::transform(first, last, std::back_inserter(lines), [columns](const PictureLine& line) {
            return PictureLine{shortened(line.text, columns), line.style};
        });
    };
    add(picture.above.begin(), picture.above.begin() + static_cast<std::ptrdiff_t>(above));
    std::ranges::move(fittedTree(picture.tree, columns, rows - above - below),
                      std::back_inserter(lines));
    add(picture.below.end() - static_cast<std::ptrdiff_t>(below), picture.below.end());
    return lines;
}

}  // namespace raidinfo
