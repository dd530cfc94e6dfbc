#pragma once

#include <utility>

namespace raid::base {

/// Owns one open descriptor; -1 stands for none.
class FileDescriptor {
public:
    explicit FileDescriptor(int owned) noexcept : descriptor(owned) {}
    FileDescriptor(FileDescriptor&& other) noexcept : descriptor(other.release()) {}
    FileDescriptor& operator=(FileDescriptor&& other) noexcept {
        FileDescriptor taken(std::move(other));
        std::swap(descriptor, taken.descriptor);
        return *this;
    }
    FileDescriptor(const FileDescriptor&) = delete;
    FileDescriptor& operator=(const FileDescriptor&) = delete;
    ~FileDescriptor();

    [[nodiscard]] int get() const noexcept { return descriptor; }

    /// Gives the descriptor up without closing it.
    int release() noexcept { return std::exchange(descriptor, -1); }

private:
    int descriptor;
};

}  // namespace raid::base
