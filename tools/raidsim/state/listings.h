#pragma once

#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "state/path.h"
#include "xml/tree.h"

// What the changes of the document have in common: finding what a path names, and what follows for
// everything around.
namespace raidsim {

class EditError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

using Fields = std::vector<std::pair<std::string, std::string>>;

inline constexpr const char* overallStatus = "as:overallStatus";

// At least one, or just one; throws EditError otherwise.
[[nodiscard]] std::vector<Match> findSome(xml::Tree& system, const Path& path);
[[nodiscard]] Match findOne(xml::Tree& system, const Path& path);

// The one thing that the path names, where it is at home: a drive under a channel of its adapter
// rather than in an array. Throws EditError.
[[nodiscard]] Match findAtHome(xml::Tree& system, const Path& path);

// Everything around shows the worst overallStatus of what it holds.
void showWorstOutwards(const std::vector<xml::Tree*>& outermostFirst);

}  // namespace raidsim
