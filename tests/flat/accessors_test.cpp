// Every accessor of every family, called by its exported name. Each record of a published list has
// one element of its own: an accessor shows its value for that record and nothing for the others.

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <string>
#include <vector>

#include "accessor_families.h"
#include "exported.h"
#include "published.h"
#include "support/fresh_library.h"

namespace {

using namespace raid::test;

class Accessors : public FreshLibrary, public testing::WithParamInterface<AccessorFamily> {
protected:
    static std::string exportedName(const std::string& field) {
        return "get" + GetParam().name + field;
    }

    static int count() { return exported<int()>(exportedName("Count"))(); }

    // One field that reads the element of each record, in the order of the records.
    static std::vector<Field> records() {
        std::vector<Field> distinct;
        for (const Field& field : GetParam().fields) {
            if (!field.element.empty() &&
                std::ranges::find(distinct, field.element, &Field::element) == distinct.end()) {
                distinct.push_back(field);
            }
        }
        return distinct;
    }

    static void publishRecords() {
        const auto& family = GetParam();
        std::string content;
        int position = 0;
        for (const Field& field : records()) {
            const std::string value = textInDocument(field, position++);
            content += field.element == "xsi:type"
                           ? element(family.element, "", value)
                           : element(family.element, element(field.element, value), family.type);
        }
        publish(inside(family.around, content));
    }

    static std::string textInDocument(const Field& field, int position) {
        switch (field.shape) {
            case Shape::flag:
                return "true";
            case Shape::text:
                return "text of " + field.element;
            case Shape::status:
                return "1";
            case Shape::number:
            case Shape::displayName:
                break;
        }
        return std::to_string(1000 + position);
    }

    // What the accessor gives for a record that has this field's element.
    static std::string expected(const Field& accessor, const Field& record, int position) {
        const bool isSet = accessor.element == record.element;
        const auto number = std::to_string(isSet ? 1000 + position : accessor.fallback);
        switch (accessor.shape) {
            case Shape::number:
                return number;
            case Shape::flag:
                return isSet ? "1" : "0";
            case Shape::text:
                return isSet ? "text of " + accessor.element : "";
            case Shape::status:
                return isSet ? "Warning" : "Normal";
            case Shape::displayName:
                break;
        }
        return accessor.before + number;
    }

    static std::string given(const Field& accessor, int position) {
        const auto name = exportedName(accessor.name);
        switch (accessor.shape) {
            case Shape::number:
            case Shape::flag:
                return std::to_string(exported<int(int)>(name)(position));
            case Shape::text:
            case Shape::status:
                return written(exported<void(char*, int)>(name), position);
            case Shape::displayName:
                break;
        }
        auto* const read = exported<int(char*, int)>(name);
        auto text = written(read, position);
        std::string buffer(256, '#');
        EXPECT_EQ(read(buffer.data(), position), static_cast<int>(text.size())) << name;
        EXPECT_TRUE(buffer.starts_with(text + '\0' + '#')) << name;
        return text;
    }

    static void expectNothingAt(int position) {
        for (const Field& accessor : GetParam().fields) {
            const bool isNumber = accessor.shape == Shape::number || accessor.shape == Shape::flag;
            const char* const nothing = accessor.shape == Shape::status ? "untouched" : "";
            EXPECT_EQ(given(accessor, position), isNumber ? "0" : nothing)
                << exportedName(accessor.name) << " at " << position;
        }
    }
};

TEST_P(Accessors, ReadEachFieldFromItsElement) {
    publishRecords();
    ASSERT_EQ(count(), static_cast<int>(records().size()));
    int position = 0;
    for (const Field& record : records()) {
        for (const Field& accessor : GetParam().fields) {
            EXPECT_EQ(given(accessor, position), expected(accessor, record, position))
                << exportedName(accessor.name) << " of a record with " << record.element;
        }
        ++position;
    }
}

TEST_P(Accessors, ReadNothingOutsideTheList) {
    publishRecords();
    for (const int position : {-1, count(), INT_MIN, INT_MAX}) {
        expectNothingAt(position);
    }
}

TEST_P(Accessors, ReadNothingFromAnEmptyList) {
    ASSERT_EQ(count(), 0);
    for (const int position : {-1, 0, 1, INT_MIN, INT_MAX}) {
        expectNothingAt(position);
    }
}

INSTANTIATE_TEST_SUITE_P(Families, Accessors, testing::ValuesIn(accessorFamilies), nameOfRow);

}  // namespace
