#pragma once

#include <string>

namespace raid::test {

// What every accessor shows of every record of the twelve lists, as one text.
[[nodiscard]] std::string publishedConfiguration();

}  // namespace raid::test
