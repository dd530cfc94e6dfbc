#include "state/listings.h"

#include <algorithm>

#include "text.h"

namespace raidsim {

namespace {

void showWorst(xml::Tree& node) {
    xml::Tree* const own = xml::childOf(node, overallStatus);
    if (own == nullptr)
        return;
    int worst = 0;
    for (const auto& [name, child] : node)
        worst = std::max(worst, parseInt(xml::textOf(child, overallStatus)).value_or(0));
    own->data() = std::to_string(worst);
}

bool isAtHome(const Kind& kind, const Match& match) {
    const auto& around = match.ancestors;  // system / adapter / collection / ...
    return kind.home.empty() || (around.size() == kind.depth &&
                                 xml::childOf(*around[1], std::string(kind.home)) == around[2]);
}

}  // namespace

std::vector<Match> findSome(xml::Tree& system, const Path& path) {
    auto matches = findAll(system, path);
    if (matches.empty())
        throw EditError("the document has no " + path.text());
    return matches;
}

Match findOne(xml::Tree& system, const Path& path) {
    auto matches = findSome(system, path);
    if (matches.size() > 1)
        throw EditError(path.text() + " names more than one object");
    return std::move(matches.front());
}

Match findAtHome(xml::Tree& system, const Path& path) {
    const Kind& kind = path.kind();
    auto found = findSome(system, path);
    std::erase_if(found, [&](const Match& match) { return !isAtHome(kind, match); });
    if (found.size() != 1)
        throw EditError(path.text() + " does not name one " + std::string(kind.name));
    return std::move(found.front());
}

void showWorstOutwards(const std::vector<xml::Tree*>& outermostFirst) {
    std::for_each(outermostFirst.rbegin(), outermostFirst.rend(),
                  [](xml::Tree* node) { showWorst(*node); });
}

}  // namespace raidsim
