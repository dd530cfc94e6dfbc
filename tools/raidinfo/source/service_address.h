#pragma once

#include <cstdint>
#include <string>

namespace raidinfo {

/// Where the RAID management service listens: the library knows no other place.
struct ServiceAddress {
    static constexpr auto host = "127.0.0.1";
    static constexpr std::uint16_t port = 34572;

    /// As it stands in a sentence.
    [[nodiscard]] static std::string inWords() {
        return std::string{host} + " port " + std::to_string(port);
    }

    /// As programs write it.
    [[nodiscard]] static std::string inShort() {
        return std::string{host} + ":" + std::to_string(port);
    }
};

}  // namespace raidinfo
