#pragma once

#include <string>
#include <vector>

#include "support/row.h"

namespace raid::test {

enum class Shape { number, flag, text, displayName, status };

// One accessor and the element whose value it reads; none when no element sets the value.
struct Field {
    std::string name;
    Shape shape;
    std::string element;
    std::string before = {};  // of a display name, what stands before its number
    int fallback = 0;         // of a number or a display name, the value without the element
};

// The accessors of one list. The family's name is what stands between "get" and the field's name.
struct AccessorFamily : Row {
    std::vector<std::string> around;  // the elements around a record, the outermost first
    std::string element;              // a record
    std::string type;                 // its type
    std::vector<Field> fields;
};

extern const std::vector<AccessorFamily> accessorFamilies;

}  // namespace raid::test
