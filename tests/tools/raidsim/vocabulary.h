#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "state/document.h"

namespace raidsim::test {

// The bytes of a file of examples/.
[[nodiscard]] std::string example(const std::string& name);

// What stands in a document although clients do not know it there; they give up a whole document
// over it.
[[nodiscard]] std::vector<std::string> unknownIn(const Document& document);

// The values of a field in every listing of an object, and the number of listings.
[[nodiscard]] std::vector<std::string> values(Document& document, std::string_view path,
                                              const std::string& field);
[[nodiscard]] std::size_t count(Document& document, std::string_view path);

}  // namespace raidsim::test
