#include "table.h"

#include <algorithm>
#include <string_view>
#include <utility>
#include <vector>

#include "overloaded.h"
#include "text.h"

namespace raidinfo {
namespace {

struct Column {
    bool toTheRight = false;
    std::vector<std::string> cells;  ///< the title first
};

constexpr std::string_view gap = "  ";

std::string joined(const std::vector<int>& numbers) {
    std::string result;
    for (const int number : numbers) {
        result += (result.empty() ? "" : ",") + std::to_string(number);
    }
    return result;
}

Column positions(std::size_t count) {
    Column column{true, {"#"}};
    for (std::size_t position = 0; position < count; ++position) {
        column.cells.push_back(std::to_string(position));
    }
    return column;
}

Column fieldColumn(const Field& field, std::size_t index, const Records& records) {
    Column column{field.shape == Shape::number || field.shape == Shape::constant,
                  {std::string{field.title}}};
    for (const Record& record : records) {
        column.cells.push_back(shown(record.at(index)));
    }
    return column;
}

std::vector<std::string> aligned(Column column) {
    std::size_t width = 0;
    for (const std::string& cell : column.cells) {
        width = std::max(width, displayWidth(cell));
    }
    for (std::string& cell : column.cells) {
        cell.insert(column.toTheRight ? 0 : cell.size(), width - displayWidth(cell), ' ');
    }
    return std::move(column.cells);
}

}  // namespace

std::string shown(const Value& value) {
    return std::visit(
        Overloaded{[](int number) { return std::to_string(number); },
                   [](bool flag) { return std::string{flag ? "yes" : "no"}; },
                   [](const std::string& text) { return text.empty() ? "-" : printable(text); },
                   [](UnknownStatus) { return std::string{"unknown"}; },
                   [](const std::vector<int>& numbers) {
                       return numbers.empty() ? "-" : joined(numbers);
                   }},
        value);
}

std::string table(const Kind& kind, const Records& records) {
    std::string result = std::string{kind.plural} + ": " + std::to_string(records.size()) + "\n";
    if (records.empty()) {
        return result;
    }
    std::vector<std::vector<std::string>> columns{aligned(positions(records.size()))};
    for (std::size_t index = 0; index < kind.fields.size(); ++index) {
        columns.push_back(aligned(fieldColumn(kind.fields[index], index, records)));
    }
    for (std::size_t row = 0; row <= records.size(); ++row) {
        std::string line;
        for (const auto& column : columns) {
            line += gap;
            line += column[row];
        }
        line.erase(line.find_last_not_of(' ') + 1);
        result += line + "\n";
    }
    return result;
}

std::string tables(const Snapshot& snapshot) {
    std::string result;
    for (const Kind& kind : inventoryKinds()) {
        result += (result.empty() ? "" : "\n") + table(kind, snapshot.of(kind.id));
    }
    return result;
}

}  // namespace raidinfo
