// Hosts of the library that are programs in C, and end in different manners.

#include <gtest/gtest.h>
#include <sys/wait.h>

#include <array>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "full_answers.h"
#include "support/files.h"
#include "support/row.h"

namespace {

using namespace raid::test;

struct Ended {
    int status;
    std::string output;  // of both streams
};

Ended run(const std::string& command) {
    FILE* const stream = popen((command + " 2>&1").c_str(), "re");
    if (stream == nullptr) {
        throw std::runtime_error("cannot run " + command);
    }
    std::string output;
    std::array<char, 4096> buffer{};
    while (const auto count = fread(buffer.data(), 1, buffer.size(), stream)) {
        output.append(buffer.data(), count);
    }
    const int status = pclose(stream);
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status), output};
}

std::string quoted(const std::string& word) { return "'" + word + "'"; }

struct Manner : Row {
    using Row::Row;
};

class CHost : public testing::TestWithParam<Manner> {
protected:
    static void expectSuccess(const std::string& host, const std::string& library) {
        const AnsweringService service(fullAnswers());
        const auto ended =
            run(quoted(host) + " " + quoted(library) + " " + quoted(GetParam().name));
        EXPECT_EQ(ended.status, 0) << ended.output;
        EXPECT_EQ(ended.output.find("rror"), std::string::npos) << ended.output;
    }
};

TEST_P(CHost, LoadsTheLibraryAndEndsWell) { expectSuccess(RAID_C_HOST, RAID_LIBRARY); }

TEST_P(CHost, IsLinkedWithTheLibraryAndEndsWell) { expectSuccess(RAID_LINKED_C_HOST, ""); }

INSTANTIATE_TEST_SUITE_P(Manners, CHost,
                         testing::Values("unload", "unloadInAThread", "loadAgain", "unloadAtExit",
                                         "unloadAtExitLate", "callAtExit", "exitQuickly", "never"),
                         nameOfRow);

TEST(CHost, SaysWhatIsWrong) {
    const auto ended = run(quoted(RAID_C_HOST) + " ./nothing.so unload");
    EXPECT_EQ(ended.status, 1);
    EXPECT_TRUE(ended.output.starts_with("cannot load: ./nothing.so")) << ended.output;
}

}  // namespace
