// The searches that look at a word at a time find what a plain loop finds, wherever it stands and
// wherever the text ends.

#include "xml/bytes.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace {

using namespace raid::xml;

// In a buffer of its size, so that a byte read behind it is seen by the checkers of memory.
template <class Search>
std::size_t offsetOf(Search search, std::string_view text) {
    const std::vector<char> bytes(text.begin(), text.end());
    const char* const begin = bytes.data();
    return between(begin, search(begin, begin + bytes.size()));
}

TEST(FindTag, FindsTheFirstOpeningBracketAtEveryPlace) {
    for (std::size_t length = 0; length < 40; ++length) {
        EXPECT_EQ(offsetOf(findTag, std::string(length, '=')), length);
        for (std::size_t place = 0; place < length; ++place) {
            std::string text(length, '=');
            text[place] = '<';
            EXPECT_EQ(offsetOf(findTag, text), place);
            std::fill(text.begin() + static_cast<std::ptrdiff_t>(place), text.end(), '<');
            EXPECT_EQ(offsetOf(findTag, text), place);
        }
    }
}

TEST(FindTag, TakesNoOtherByteForABracket) {
    for (int byte = 0; byte < 256; ++byte) {
        const std::string text = std::string(12, static_cast<char>(byte)) + "<";
        EXPECT_EQ(offsetOf(findTag, text), byte == '<' ? 0U : 12U) << byte;
    }
}

TEST(PassSpace, EndsAtTheFirstByteThatIsNoSpace) {
    for (std::size_t length = 0; length < 40; ++length) {
        for (const auto* const start : {"", "\n", "\r\n", "\t", "\n\n"}) {
            const auto space = start + std::string(length, ' ');
            EXPECT_EQ(offsetOf(passSpace, space), space.size());
            EXPECT_EQ(offsetOf(passSpace, space + "<a>"), space.size());
            EXPECT_EQ(offsetOf(passSpace, space + "a       "), space.size());
        }
    }
}

TEST(PassSpace, KnowsEverySpace) {
    for (int byte = 0; byte < 256; ++byte) {
        const char c = static_cast<char>(byte);
        const std::string text = std::string(12, c) + "<";
        EXPECT_EQ(offsetOf(passSpace, text), isSpaceByte(c) ? 12U : 0U) << byte;
    }
}

TEST(Trimmed, LosesTheSpaceAtItsEndsOnly) {
    EXPECT_EQ(trimmed(""), "");
    EXPECT_EQ(trimmed(" \n\t"), "");
    EXPECT_EQ(trimmed("a"), "a");
    EXPECT_EQ(trimmed(" \n a b\t\x7f "), "a b");
}

TEST(StandsAt, ComparesEveryByteOfTheName) {
    const std::string text = "as:limitedBIOSCompatibility";
    for (std::size_t length = 1; length <= text.size(); ++length) {
        const auto name = text.substr(0, length);
        EXPECT_TRUE(standsAt(text.data(), name)) << name;
        for (std::size_t place = 0; place < length; ++place) {
            auto other = name;
            other[place] = '~';
            EXPECT_FALSE(standsAt(text.data(), other)) << other;
        }
    }
}

TEST(StandsAt, ReadsNothingBehindTheName) {
    const std::string_view name = "as:serialNumber";
    for (std::size_t length = 1; length <= name.size(); ++length) {
        const auto part = name.substr(0, length);
        const std::vector<char> bytes(part.begin(), part.end());
        EXPECT_TRUE(standsAt(bytes.data(), part));
    }
}

}  // namespace
