#include "inventory/kinds.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <set>
#include <string>
#include <string_view>
#include <vector>

namespace raidinfo {
namespace {

using testing::IsEmpty;

const std::map<Shape, std::string> signatures{
    {Shape::number, "int (int position)"},
    {Shape::flag, "int (int position)"},
    {Shape::constant, "int (void)"},
    {Shape::text, "void (char* destination, int position)"},
    {Shape::statusText, "void (char* destination, int position)"},
    {Shape::displayName, "int (char* destination, int position)"},
    {Shape::numbers, "void (char* destination, int position)"},
};

std::vector<Kind> allKinds() {
    std::vector<Kind> kinds{inventoryKinds().begin(), inventoryKinds().end()};
    kinds.push_back(eventKind());
    return kinds;
}

// The declared functions that begin with "get", by name; each declaration is one line.
std::map<std::string, std::string> declaredGetters() {
    std::ifstream header{RAID_PUBLIC_HEADER};
    std::map<std::string, std::string> getters;
    for (std::string line; std::getline(header, line);) {
        const auto name = line.find(" get") + 1;
        const auto parameters = line.find('(', name);
        const std::string result = line.substr(0, name);
        if ((result == "int " || result == "void ") && line.ends_with(");")) {
            getters[line.substr(name, parameters - name)] =
                result + line.substr(parameters, line.size() - parameters - 1);
        }
    }
    return getters;
}

bool isSnakeCase(std::string_view key) {
    const auto isPart = [](char character) {
        return (character >= 'a' && character <= 'z') || (character >= '0' && character <= '9') ||
               character == '_';
    };
    return std::ranges::all_of(key, isPart) && key.find("__") == std::string_view::npos &&
           !key.starts_with('_') && !key.ends_with('_');
}

TEST(Kinds, ReadEveryAccessorOfThePublicHeaderWithItsSignature) {
    auto getters = declaredGetters();
    EXPECT_EQ(getters.erase("getPellionIndex"), 1U);
    EXPECT_EQ(getters.erase("getEvent"), 1U);
    for (const Kind& kind : allKinds()) {
        EXPECT_EQ(getters[kind.count], "int (void)") << kind.count;
        getters.erase(kind.count);
        for (const Field& field : kind.fields) {
            EXPECT_EQ(getters[field.function], signatures.at(field.shape)) << field.function;
            getters.erase(field.function);
        }
    }
    EXPECT_THAT(getters, IsEmpty());
}

TEST(Kinds, HaveSnakeCaseKeysThatAreUnique) {
    std::set<std::string> kindKeys;
    for (const Kind& kind : allKinds()) {
        EXPECT_TRUE(kindKeys.emplace(kind.key).second) << kind.key;
        EXPECT_TRUE(isSnakeCase(kind.key)) << kind.key;
        std::set<std::string> keys{"position"};
        for (const Field& field : kind.fields) {
            EXPECT_TRUE(keys.emplace(field.key).second) << kind.key << " " << field.key;
            EXPECT_TRUE(isSnakeCase(field.key)) << field.key;
        }
    }
}

TEST(Kinds, AreFoundByTheirId) {
    for (const Kind& kind : allKinds()) {
        EXPECT_EQ(kindOf(kind.id).key, kind.key);
    }
}

TEST(Kinds, FindAFieldByItsKey) {
    const Kind& fans = kindOf(KindId::fan);
    EXPECT_EQ(fans.fields[static_cast<std::size_t>(fieldIndex(fans, "status"))].function,
              std::string{"getRAIDFanStatus"});
    EXPECT_EQ(fieldIndex(fans, "speed"), -1);
}

}  // namespace
}  // namespace raidinfo
