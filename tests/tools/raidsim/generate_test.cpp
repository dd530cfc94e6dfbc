#include "generate/generate.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "state/document.h"
#include "vocabulary.h"

namespace raidsim::test {

namespace {

using generate::generate;
using testing::IsEmpty;

std::size_t occurrences(const std::string& text, const std::string& of) {
    std::size_t found = 0;
    for (auto at = text.find(of); at != std::string::npos; at = text.find(of, at + 1))
        ++found;
    return found;
}

TEST(GeneratedRack, HoldsWhatWasOrdered) {
    const auto text = generate({.rack = {.adapters = 3, .channels = 2, .drives = 14}});
    EXPECT_EQ(occurrences(text, "<ac:adapter "), 3U);
    // A channel stands below its adapter and, with the members, below each array on it.
    EXPECT_EQ(occurrences(text, "xsi:type=\"o:Channel\""), 3U * 2 * (1 + 2));
    EXPECT_EQ(occurrences(text, "<ac:enclosure "), 3U * 2 * 2);
    EXPECT_THAT(unknownIn(Document::parse(text)), IsEmpty());
}

TEST(GeneratedRack, MayHoldNothing) {
    const auto text = generate({.rack = {.adapters = 0}});
    EXPECT_EQ(occurrences(text, "<ac:adapter"), 0U);
    EXPECT_THAT(unknownIn(Document::parse(text)), IsEmpty());
}

TEST(GeneratedRack, IsTheSameWithoutItsIndentation) {
    const auto indented = generate({});
    const auto compact = generate({.layout = xml::Layout::compact});
    EXPECT_EQ(occurrences(compact, "\n"), 0U);
    EXPECT_EQ(xml::format(xml::parse(compact)), indented);
}

TEST(GeneratedRack, IsShuffledInTheSameWayByTheSameSeed) {
    const auto plain = generate({});
    const auto first = generate({.shuffle = 1});
    EXPECT_EQ(first, generate({.shuffle = 1}));
    EXPECT_NE(first, generate({.shuffle = 2}));
    EXPECT_NE(first, plain);
    EXPECT_EQ(first.size(), plain.size());
    for (const auto* const field : {"<as:serialNumber ", "<ac:hardDrive ", "<as:name "})
        EXPECT_EQ(occurrences(first, field), occurrences(plain, field));
    EXPECT_THAT(unknownIn(Document::parse(first)), IsEmpty());
}

TEST(GeneratedEvents, AreAsManyAsWereOrdered) {
    const auto text = generate({.events = 120});
    EXPECT_EQ(occurrences(text, "<ac:event "), 120U);
    EXPECT_EQ(occurrences(text, ">120</as:sequenceNumber>"), 1U);
}

}  // namespace

}  // namespace raidsim::test
