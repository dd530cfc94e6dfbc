// Packed values, byte by byte.

#include "flat/packing.h"

#include <gtest/gtest.h>

#include <climits>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "support/row.h"

namespace {

using namespace std::string_literals;
using namespace raid::test;

struct Packing : Row {
    std::function<void*(void*)> pack;
    std::string bytes;
};

std::string words(std::initializer_list<unsigned> values) {
    std::string bytes;
    for (const unsigned value : values) {
        for (const unsigned shift : {0U, 8U, 16U, 24U}) {
            bytes += static_cast<char>(value >> shift & 0xffU);
        }
    }
    return bytes;
}

auto integer(int value) {
    return [value](void* to) { return packI(to, value); };
}
auto text(const std::string& value) {
    return [value](void* to) { return packS(to, value); };
}
auto integers(const std::vector<int>& values) {
    return [values](void* to) { return packAI(to, values); };
}
auto texts(const std::vector<std::string>& values) {
    return [values](void* to) { return packAS(to, values); };
}

// A byte that is passed and not written stays "#".
const std::vector<Packing> packings{
    {"Zero", integer(0), words({0, 0})},
    {"Integer", integer(0x01020304), "\0\0\0\0\x04\x03\x02\x01"s},
    {"NegativeInteger", integer(-2), words({0, 0xfffffffe})},
    {"LargestInteger", integer(INT_MAX), words({0, 0x7fffffff})},
    {"SmallestInteger", integer(INT_MIN), words({0, 0x80000000})},
    {"EmptyString", text(""), words({1, 0}) + "\0"s},
    {"String", text("abc"), words({1, 3}) + "abc\0"s},
    {"LongString", text(std::string(300, 'x')), words({1, 300}) + std::string(300, 'x') + "\0"s},
    {"StringWithAZeroByte", text("ab\0cd"s), words({1, 5}) + "ab\0###"s},
    {"StringOfAZeroByte", text("\0"s), words({1, 1}) + "\0#"s},
    {"NoIntegers", integers({}), words({2, 0})},
    {"Integers", integers({7, -1}), words({2, 2, 0, 7, 0, 0xffffffff})},
    {"NoStrings", texts({}), words({3, 0})},
    {"Strings", texts({"a", "", "bcd"}),
     words({3, 3, 1, 1}) + "a\0"s + words({1, 0}) + "\0"s + words({1, 3}) + "bcd\0"s},
};

class PackedValue : public testing::TestWithParam<Packing> {};

TEST_P(PackedValue, HasItsBytesAndEndsBehindThem) {
    // At an odd place, too: nothing is aligned.
    for (const std::size_t offset : {0U, 1U}) {
        std::string buffer(512, '#');
        char* const start = buffer.data() + offset;
        EXPECT_EQ(GetParam().pack(start), start + GetParam().bytes.size());
        EXPECT_EQ(buffer, std::string(offset, '#') + GetParam().bytes +
                              std::string(512 - offset - GetParam().bytes.size(), '#'));
    }
}

INSTANTIATE_TEST_SUITE_P(Values, PackedValue, testing::ValuesIn(packings), nameOfRow);

TEST(PackedValues, FollowEachOtherWithoutGaps) {
    std::string buffer(64, '#');
    void* end = packS(buffer.data(), "a");
    end = packI(end, 5);
    end = packAI(end, {6});
    const std::string bytes = words({1, 1}) + "a\0"s + words({0, 5, 2, 1, 0, 6});
    EXPECT_EQ(end, buffer.data() + bytes.size());
    EXPECT_TRUE(buffer.starts_with(bytes + "#"));
}

}  // namespace
