#pragma once

#include <string>

namespace raid::test {

// The size of each model class, and the offset of each of its members that a row of its vocabulary
// names: one class or member a line, called as in the documents.
[[nodiscard]] std::string layoutOfTheModelClasses();

}  // namespace raid::test
