#include "sample.h"

#include <stdexcept>
#include <string>

namespace raidinfo::test {
namespace {

Value blank(Shape shape) {
    switch (shape) {
        case Shape::number:
        case Shape::constant:
            return 0;
        case Shape::flag:
            return false;
        case Shape::numbers:
            return std::vector<int>{};
        case Shape::text:
        case Shape::statusText:
        case Shape::displayName:
            break;
    }
    return std::string{};
}

}  // namespace

Record sample(const Kind& kind, const std::map<std::string_view, Value>& values) {
    Record record;
    for (const Field& field : kind.fields) {
        record.push_back(blank(field.shape));
    }
    for (const auto& [key, value] : values) {
        const auto index = fieldIndex(kind, key);
        if (index < 0) {
            throw std::invalid_argument{"no field " + std::string{key}};
        }
        record[static_cast<std::size_t>(index)] = value;
    }
    return record;
}

}  // namespace raidinfo::test
