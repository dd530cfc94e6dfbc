// Which tags are remembered, and when they are recalled.

#include "xml/tag_memory.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using namespace raid::xml;

const std::string size = "<as:size xsi:type=\"xsd:int\">";
const std::string name = "<as:name xsi:type=\"xsd:string\">";

int anyNumber(std::string_view /*name*/) { return 0; }
constexpr Names drive{&anyNumber, seedOf("ac:hardDrive")};
constexpr Names array{&anyNumber, seedOf("ac:basicArray")};

class RememberedTags : public testing::Test {
protected:
    void keep(const std::string& tag, const Names& names, int number) {
        ASSERT_EQ(memory.recall(tag, names), nullptr);
        NamedUnit found;
        found.number = number;
        memory.keep(tag, names, found);
    }

    // The number that was kept with the tag; -1 when it is not known.
    int recall(const std::string& text, const Names& names) {
        const auto* const tag = memory.recall(text, names);
        return tag == nullptr ? -1 : tag->found.number;
    }

    TagMemory memory;
};

TEST_F(RememberedTags, AreRecalledByTheirBytesAtTheFrontOfAText) {
    EXPECT_EQ(recall(size + "5</as:size>", drive), -1);
    keep(size, drive, 7);
    EXPECT_EQ(recall(size + "5</as:size>", drive), 7);
    EXPECT_EQ(recall(size, drive), 7);
    EXPECT_EQ(recall(" " + size, drive), -1);
    EXPECT_EQ(recall(name, drive), -1);
    EXPECT_EQ(recall("", drive), -1);
}

TEST_F(RememberedTags, AreRecalledWholeOnly) {
    keep(size, drive, 7);
    for (std::size_t length = 0; length < size.size(); ++length) {
        EXPECT_EQ(recall(size.substr(0, length), drive), -1) << length;
    }
    for (std::size_t place = 0; place < size.size(); ++place) {
        auto other = size;
        other[place] = '~';
        EXPECT_EQ(recall(other, drive), -1) << other;
    }
}

TEST_F(RememberedTags, TellTheBytesThatTheyAre) {
    keep(size, drive, 7);
    const auto text = size + "5";
    const auto* const tag = memory.recall(text, drive);
    ASSERT_NE(tag, nullptr);
    EXPECT_EQ(tag->bytes, size);
}

TEST_F(RememberedTags, BelongToTheClassThatWasRead) {
    keep(size, drive, 7);
    EXPECT_EQ(recall(size, array), -1);
    keep(size, array, 3);
    EXPECT_EQ(recall(size, array), 3);
    EXPECT_EQ(recall(size, drive), 7);
}

TEST_F(RememberedTags, AreRecalledInWhateverOrderTheyCome) {
    const std::vector<std::string> tags{size,
                                        name,
                                        "<as:state xsi:type=\"xsd:int\">",
                                        "<as:vendor xsi:type=\"xsd:string\">",
                                        "<as:writeCacheEnable xsi:type=\"xsd:int\">",
                                        "<as:writeCacheEnableSupported xsi:type=\"xsd:boolean\">"};
    for (std::size_t i = 0; i < tags.size(); ++i) {
        keep(tags[i], drive, static_cast<int>(i));
    }
    for (std::size_t first = 0; first < tags.size(); ++first) {
        for (std::size_t second = 0; second < tags.size(); ++second) {
            EXPECT_EQ(recall(tags[first], drive), static_cast<int>(first));
            EXPECT_EQ(recall(tags[second], drive), static_cast<int>(second));
        }
    }
}

TEST_F(RememberedTags, HaveAnAttributeAtLeast) {
    const std::string shortest = "<as:a xsi:type=\"o:Fan\">?";  // 24 bytes
    keep(shortest.substr(0, 23), drive, 1);
    EXPECT_EQ(recall(shortest, drive), -1);
    keep(shortest, drive, 2);
    EXPECT_EQ(recall(shortest, drive), 2);
}

TEST_F(RememberedTags, AreFewWhateverADocumentHolds) {
    std::vector<std::string> tags;
    for (int i = 0; i < 10'000; ++i) {
        tags.push_back("<as:field" + std::to_string(i) + " xsi:type=\"xsd:int\">");
    }
    int recalled = 0;
    for (const auto& tag : tags) {
        keep(tag, drive, 1);
    }
    for (const auto& tag : tags) {
        recalled += recall(tag, drive) == 1 ? 1 : 0;
    }
    EXPECT_EQ(recalled, 255);
}

TEST(SeedOfAClass, IsAnotherForEachElement) {
    EXPECT_NE(seedOf("ac:fan"), seedOf("ac:nfa"));
    EXPECT_NE(seedOf("ac:arrays"), seedOf("ac:array"));
}

}  // namespace
