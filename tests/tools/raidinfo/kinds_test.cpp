#include "kinds.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <map>
#include <regex>
#include <set>
#include <sstream>
#include <string>

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

// The declared functions that begin with "get", by name.
std::map<std::string, std::string> declaredGetters() {
    std::ifstream file{RAID_PUBLIC_HEADER};
    std::stringstream text;
    text << file.rdbuf();
    const std::string header = text.str();
    const std::regex declaration{R"(\n(int|void) (get\w+)(\([^)]*\));)"};
    std::map<std::string, std::string> getters;
    for (std::sregex_iterator found{header.begin(), header.end(), declaration}, end; found != end;
         ++found) {
        getters[(*found)[2]] = (*found)[1].str() + " " + (*found)[3].str();
    }
    return getters;
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
    const std::regex snakeCase{"[a-z][a-z0-9]*(_[a-z0-9]+)*"};
    std::set<std::string> kindKeys;
    for (const Kind& kind : allKinds()) {
        EXPECT_TRUE(kindKeys.emplace(kind.key).second) << kind.key;
        EXPECT_TRUE(std::regex_match(std::string{kind.key}, snakeCase)) << kind.key;
        std::set<std::string> keys{"position"};
        for (const Field& field : kind.fields) {
            EXPECT_TRUE(keys.emplace(field.key).second) << kind.key << " " << field.key;
            EXPECT_TRUE(std::regex_match(std::string{field.key}, snakeCase)) << field.key;
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
