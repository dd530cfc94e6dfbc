#pragma once

#include <cstdint>
#include <string_view>

namespace raidinfo::redact {

/// What a text tells about the owner of a server.
enum class Sort : std::uint8_t { serialNumber, address, name, message };

/// An element of the service's answers whose text does not leave the machine.
struct Element {
    std::string_view name;  ///< without its prefix
    Sort sort;
};

/// The element with this name, whatever its prefix and case; null for one that tells nothing.
[[nodiscard]] const Element* elementOf(std::string_view tagName) noexcept;

/// Whether the name is one that the service gives its elements.
[[nodiscard]] bool isOfService(std::string_view tagName) noexcept;

/// Whether two tags are of one element, whatever their prefixes and case.
[[nodiscard]] bool isSameElement(std::string_view left, std::string_view right) noexcept;

}  // namespace raidinfo::redact
