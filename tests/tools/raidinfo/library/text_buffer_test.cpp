#include "library/text_buffer.h"

#include <gtest/gtest.h>

namespace raidinfo {
namespace {

TEST(TextBuffer, HoldsTheLongestText) {
    const TextBuffer buffer;
    buffer.data()[0] = 'a';
    buffer.data()[TextBuffer::capacity - 1] = 'z';
    EXPECT_EQ(buffer.data()[0], 'a');
    EXPECT_EQ(buffer.data()[TextBuffer::capacity - 1], 'z');
}

}  // namespace
}  // namespace raidinfo
