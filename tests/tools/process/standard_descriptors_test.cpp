#include "process/standard_descriptors.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <cerrno>
#include <filesystem>
#include <string>
#include <vector>

#include "support/socket.h"

namespace process {
namespace {

using raid::test::Socket;

// Standard descriptors that are closed, until the test ends.
class Closed {
public:
    explicit Closed(const std::vector<int>& descriptors) : numbers(descriptors) {
        for (const int number : numbers) {
            constexpr int highEnough = 100;
            originals.emplace_back(::fcntl(number, F_DUPFD_CLOEXEC, highEnough));
            ::close(number);
        }
    }
    ~Closed() {
        for (std::size_t i = 0; i < numbers.size(); ++i)
            ::dup2(originals[i].get(), numbers[i]);
    }
    Closed(const Closed&) = delete;
    Closed& operator=(const Closed&) = delete;

private:
    std::vector<int> numbers;
    std::vector<Socket> originals;
};

std::string fileOf(int descriptor) {
    std::error_code none;
    return std::filesystem::read_symlink("/proc/self/fd/" + std::to_string(descriptor), none);
}

std::vector<std::string> filesAfterFilling(const std::vector<int>& closed) {
    const Closed closing(closed);
    fillStandardDescriptors();
    return {fileOf(STDIN_FILENO), fileOf(STDOUT_FILENO), fileOf(STDERR_FILENO)};
}

const std::string null = "/dev/null";

TEST(StandardDescriptors, AreLeftAsTheyAreWhenTheyAreOpen) {
    const std::vector<std::string> before{fileOf(0), fileOf(1), fileOf(2)};
    EXPECT_EQ(filesAfterFilling({}), before);
}

TEST(StandardDescriptors, OfInputAndErrorsLeadToTheNullDeviceWhenTheyAreClosed) {
    const std::string output = fileOf(STDOUT_FILENO);
    EXPECT_EQ(filesAfterFilling({0, 2}), (std::vector{null, output, null}));
}

TEST(StandardDescriptors, OfOutputLeadsToWhatRefusesToBeWrittenWhenItIsClosed) {
    const Closed closing({STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO});
    fillStandardDescriptors();
    EXPECT_EQ(fileOf(STDOUT_FILENO), null);
    errno = 0;
    EXPECT_EQ(::write(STDOUT_FILENO, "x", 1), -1);
    EXPECT_EQ(errno, EBADF);
    EXPECT_EQ(::write(STDERR_FILENO, "x", 1), 1);
}

TEST(StandardDescriptors, AreFilledByWhatAStartedProgramKeeps) {
    const Closed closing({STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO});
    fillStandardDescriptors();
    for (const int descriptor : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO})
        EXPECT_EQ(::fcntl(descriptor, F_GETFD), 0) << descriptor;
}

}  // namespace
}  // namespace process
