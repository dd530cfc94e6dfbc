#pragma once

#include <unistd.h>

#include <cerrno>
#include <system_error>
#include <utility>

namespace raidinfo {

/// Owns an open file descriptor.
class Descriptor {
public:
    /// Takes the result of the call that opened it; throws for a negative one.
    Descriptor(int opened, const char* purpose) : number{opened} {
        if (opened < 0) {
            throw std::system_error{errno, std::generic_category(), purpose};
        }
    }
    Descriptor(Descriptor&& other) noexcept : number{std::exchange(other.number, -1)} {}
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    Descriptor& operator=(Descriptor&&) = delete;
    ~Descriptor() {
        if (number >= 0) {
            close(number);
        }
    }

    [[nodiscard]] int get() const noexcept { return number; }

private:
    int number;
};

}  // namespace raidinfo
