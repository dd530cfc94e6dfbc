#include "net/line_reader.h"

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <array>
#include <string>
#include <vector>

#include "bounds.h"
#include "support/files.h"
#include "support/socket.h"

namespace raidsim {
namespace {

using raid::test::Socket;
using raid::test::throwIfNegative;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr const char* tooLong = "(too long)";

class LineReading : public testing::Test {
protected:
    // Everything that is read until the descriptor ends.
    std::vector<std::string> linesOf(int descriptor) {
        std::vector<std::string> lines;
        boost::asio::io_context context;
        LineReader reader(context, descriptor, [&](std::optional<std::string_view> line) {
            if (!line)
                lines.emplace_back(tooLong);
            else if (!line->empty())
                lines.emplace_back(*line);
        });
        context.run();
        return lines;
    }

    std::vector<std::string> linesOfFile(std::string_view text) {
        raid::test::writeFile("lines", text);
        const int opened = ::open("lines", O_RDONLY | O_CLOEXEC);
        throwIfNegative(opened, "open the lines");
        const Socket owner(opened);
        return linesOf(owner.get());
    }
};

TEST_F(LineReading, DeliversTheLinesOfAPipeUntilItEnds) {
    std::array<int, 2> ends{};
    throwIfNegative(::pipe2(ends.data(), O_CLOEXEC), "make a pipe");
    const Socket reading(ends[0]);
    Socket writing(ends[1]);
    constexpr std::string_view text = "status\nquit\nno end";
    throwIfNegative(::write(writing.get(), text.data(), text.size()), "write");
    writing.close();
    EXPECT_THAT(linesOf(reading.get()), ElementsAre("status", "quit", "no end"));
    EXPECT_EQ(::fcntl(reading.get(), F_GETFL) & O_NONBLOCK, 0);
}

TEST_F(LineReading, ReadsRegularFilesToo) {
    EXPECT_THAT(linesOfFile("one\ntwo\n"), ElementsAre("one", "two"));
}

TEST_F(LineReading, EndsAtOnceWithoutInput) {
    const int opened = ::open("/dev/null", O_RDONLY | O_CLOEXEC);
    throwIfNegative(opened, "open the null device");
    const Socket owner(opened);
    EXPECT_THAT(linesOf(owner.get()), IsEmpty());
    EXPECT_THAT(linesOf(-1), IsEmpty());
}

TEST_F(LineReading, PassesOverLinesBeyondTheLimit) {
    const std::string longLine(3 * bounds::controlLineBytes, 'x');
    EXPECT_THAT(linesOfFile("one\n" + longLine + "\ntwo\n"), ElementsAre("one", tooLong, "two"));
}

TEST_F(LineReading, MayBeStoppedByALine) {
    raid::test::writeFile("lines", "one\ntwo\n");
    const int opened = ::open("lines", O_RDONLY | O_CLOEXEC);
    throwIfNegative(opened, "open the lines");
    const Socket owner(opened);
    std::vector<std::string> lines;
    boost::asio::io_context context;
    LineReader reader(context, owner.get(), [&](std::optional<std::string_view> line) {
        lines.emplace_back(line.value_or(tooLong));
        reader.stop();
    });
    context.run();
    EXPECT_THAT(lines, ElementsAre("one"));
}

}  // namespace
}  // namespace raidsim
