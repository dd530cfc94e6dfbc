#include "system/file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstddef>
#include <cstdio>
#include <system_error>
#include <utility>

#include "exit_status.h"

namespace raidinfo {
namespace {

constexpr mode_t readableByAll = 0644;

Failure failure(ExitStatus status, const std::string& what, const std::filesystem::path& path) {
    return {status, what + " " + path.string() + ": " + std::generic_category().message(errno)};
}

int opened(const std::filesystem::path& path, int flags) {
    // NOLINTNEXTLINE(cppcoreguidelines-pro-type-vararg): open has no other form
    return open(path.c_str(), flags | O_CLOEXEC, readableByAll);
}

int created(const std::filesystem::path& path) {
    const int number = opened(path, O_WRONLY | O_CREAT | O_TRUNC);
    if (number < 0) {
        throw failure(ExitStatus::cannotCreate, "cannot write", path);
    }
    return number;
}

bool writeAll(const Descriptor& file, std::string_view content) {
    while (!content.empty()) {
        const ssize_t written = write(file.get(), content.data(), content.size());
        if (written < 0 && errno != EINTR) {
            return false;
        }
        content.remove_prefix(written > 0 ? static_cast<std::size_t>(written) : 0);
    }
    return true;
}

}  // namespace

std::string readFile(const std::filesystem::path& path) {
    const int number = opened(path, O_RDONLY);
    if (number < 0) {
        throw failure(ExitStatus::noInput, "cannot read", path);
    }
    const Descriptor file{number, "cannot read a file"};
    std::string content;
    std::array<char, 65536> piece{};
    while (true) {
        const ssize_t size = read(file.get(), piece.data(), piece.size());
        if (size == 0) {
            return content;
        }
        if (size > 0) {
            content.append(piece.data(), static_cast<std::size_t>(size));
        } else if (errno != EINTR) {
            throw failure(ExitStatus::noInput, "cannot read", path);
        }
    }
}

void replaceFile(const std::filesystem::path& path, std::string_view content) {
    std::filesystem::path temporary = path;
    temporary += ".new";
    const Descriptor file{created(temporary), "cannot write a file"};
    if (!writeAll(file, content) || fsync(file.get()) != 0 ||
        std::rename(temporary.c_str(), path.c_str()) != 0) {
        const int reason = errno;
        unlink(temporary.c_str());
        errno = reason;
        throw failure(ExitStatus::cannotCreate, "cannot write", path);
    }
}

GrowingFile::GrowingFile(std::filesystem::path path)
    : name{std::move(path)}, file{created(name), "cannot write a file"} {}

void GrowingFile::append(std::string_view piece) const {
    if (!writeAll(file, piece)) {
        throw failure(ExitStatus::cannotCreate, "cannot write", name);
    }
}

}  // namespace raidinfo
