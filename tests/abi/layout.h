#pragma once

#include <string>

namespace raid::test {

// The size of each model class, and the offset of each of its members that holds a number, a flag
// or a text of the document: one class or member a line, called as in the documents. The members
// that hold other elements are compared with all the rest by scripts/abi.
[[nodiscard]] std::string layoutOfTheModelClasses();

}  // namespace raid::test
