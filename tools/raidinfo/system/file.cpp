#include "system/file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstddef>
#include <cstdio>
#include <optional>
#include <system_error>
#include <utility>

#include "exit_status.h"
#include "system/blocking_io.h"

namespace raidinfo {
namespace {

static_assert(sizeof(off_t) == 8 && sizeof(time_t) == 8,
              "a recording may grow over 2 GiB, and a file may be younger than 2038");

constexpr mode_t readableByAll = 0644;
constexpr mode_t permissionBits = 07777;
constexpr int longestChain = 40;  ///< of links, as for the system

Failure failure(ExitStatus status, const std::string& what, const std::filesystem::path& path) {
    return {status, what + " " + path.string() + ": " + std::generic_category().message(errno)};
}

int opened(const std::filesystem::path& path, int flags, mode_t mode = readableByAll) {
    // NOLINTNEXTLINE(cppcoreguidelines-pro-type-vararg): open has no other form
    return open(path.c_str(), flags | O_CLOEXEC, mode);
}

/// What stands there, behind all links. A file of which nothing can be known is not replaced: its
/// owner and its permissions would be lost.
std::optional<struct stat> statusOf(const std::filesystem::path& path) {
    struct stat status = {};
    if (stat(path.c_str(), &status) == 0) {
        return status;
    }
    if (errno != ENOENT) {
        throw failure(ExitStatus::cannotCreate, "cannot write", path);
    }
    return std::nullopt;
}

/// Where the links lead to, be something there or not.
std::filesystem::path withoutLinks(std::filesystem::path path) {
    std::error_code noLink;
    for (int link = 0; link <= longestChain; ++link) {
        const std::filesystem::path target = std::filesystem::read_symlink(path, noLink);
        if (noLink) {
            return path;
        }
        path = path.parent_path() / target;
    }
    errno = ELOOP;
    throw failure(ExitStatus::cannotCreate, "cannot write", path);
}

int created(const std::filesystem::path& path) {
    const int number = opened(path, O_WRONLY | O_CREAT | O_TRUNC);
    if (number < 0) {
        throw failure(ExitStatus::cannotCreate, "cannot write", path);
    }
    return number;
}

/// A file beside the one that it is going to replace, of a name that no other has; gone in the end
/// if it was not moved there.
class NewFile {
public:
    NewFile(const std::filesystem::path& place, const std::optional<struct stat>& before)
        : file{make(place, before ? before->st_mode & permissionBits : readableByAll),
               "cannot write a file"} {
        if (before) {
            // Who may not give the file away keeps it. Changing the owner takes special bits away,
            // and the umask has taken others.
            [[maybe_unused]] const int owner = fchown(file.get(), before->st_uid, before->st_gid);
            fchmod(file.get(), before->st_mode & permissionBits);
        }
    }
    NewFile(const NewFile&) = delete;
    NewFile& operator=(const NewFile&) = delete;
    ~NewFile() {
        const int reason = errno;
        unlink(name.c_str());
        errno = reason;
    }

    [[nodiscard]] const Descriptor& descriptor() const noexcept { return file; }

    [[nodiscard]] bool moveTo(const std::filesystem::path& place) const {
        return fsync(file.get()) == 0 && std::rename(name.c_str(), place.c_str()) == 0;
    }

private:
    /// The process number keeps two runs apart, and what an ended run has left is passed by.
    int make(const std::filesystem::path& place, mode_t mode) {
        for (int attempt = 0;; ++attempt) {
            name = place;
            name += "." + std::to_string(getpid()) + "-" + std::to_string(attempt) + ".new";
            const int number = opened(name, O_WRONLY | O_CREAT | O_EXCL, mode);
            if (number >= 0) {
                return number;
            }
            if (errno != EEXIST) {
                throw failure(ExitStatus::cannotCreate, "cannot write", place);
            }
        }
    }

    std::filesystem::path name;
    Descriptor file;
};

}  // namespace

std::string readFile(const std::filesystem::path& path, std::size_t most) {
    const int number = opened(path, O_RDONLY);
    if (number < 0) {
        throw failure(ExitStatus::noInput, "cannot read", path);
    }
    const Descriptor file{number, "cannot read a file"};
    std::string content;
    std::array<char, 65536> piece{};
    while (true) {
        const ssize_t size = readSome(file.get(), piece);
        if (size < 0) {
            throw failure(ExitStatus::noInput, "cannot read", path);
        }
        if (size == 0) {
            return content;
        }
        content.append(piece.data(), static_cast<std::size_t>(size));
        if (content.size() > most) {
            throw Failure{ExitStatus::badInput,
                          path.string() + " is longer than " + std::to_string(most) + " bytes"};
        }
    }
}

void replaceFile(const std::filesystem::path& path, std::string_view content) {
    const auto before = statusOf(path);
    if (before && !S_ISREG(before->st_mode)) {
        GrowingFile{path}.append(content);
        return;
    }
    const std::filesystem::path place = withoutLinks(path);
    const NewFile beside{place, before};
    if (!writeAll(beside.descriptor().get(), content) || !beside.moveTo(place)) {
        throw failure(ExitStatus::cannotCreate, "cannot write", path);
    }
}

void checkReplaceable(const std::filesystem::path& path) {
    const auto before = statusOf(path);
    if (!before || S_ISREG(before->st_mode)) {
        const NewFile beside{withoutLinks(path), before};
    }
}

GrowingFile::GrowingFile(std::filesystem::path path)
    : name{std::move(path)}, file{created(name), "cannot write a file"} {}

void GrowingFile::append(std::string_view piece) const {
    if (!writeAll(file.get(), piece)) {
        throw failure(ExitStatus::cannotCreate, "cannot write", name);
    }
}

}  // namespace raidinfo
