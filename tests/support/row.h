#pragma once

#include <ostream>
#include <string>

namespace raid::test {

// Base of a row in the table of a table-driven test; its test is called after it.
struct Row {
    Row(const char* rowName) : name(rowName) {}

    std::string name;

    friend std::ostream& operator<<(std::ostream& out, const Row& row) { return out << row.name; }
};

// The last argument of INSTANTIATE_TEST_SUITE_P.
inline constexpr auto nameOfRow = [](const auto& instance) { return instance.param.name; };

}  // namespace raid::test
