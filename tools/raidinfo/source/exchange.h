#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "library/library.h"

namespace raidinfo {

/// The library's exchange with the service, for questions that none of its functions asks.
class Exchange {
public:
    explicit Exchange(const Library& library);

    /// The body of the answer; nothing if none came or cancelGetEvent was called.
    [[nodiscard]] std::optional<std::string> operator()(const std::string& request) const;

private:
    char* (*exchange)(const char*);
};

/// For the library's requests, which take numbers to the largest int.
[[nodiscard]] int boundedNumber(std::int64_t number) noexcept;

}  // namespace raidinfo
