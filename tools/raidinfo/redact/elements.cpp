#include "redact/elements.h"

#include <algorithm>
#include <array>
#include <cctype>

namespace raidinfo::redact {
namespace {

constexpr auto elements = std::to_array<Element>({
    {"serialNumber", Sort::serialNumber},  // of adapters, drives, enclosures
    {"serverAddress", Sort::address},      // of an event
    {"serverName", Sort::name},            // of an event
    {"name", Sort::name},                  // of the system, arrays, logical drives
    {"preferredOwner", Sort::name},        // of arrays
    {"string", Sort::message},             // of an event
});

std::string_view withoutPrefix(std::string_view tagName) {
    return tagName.substr(tagName.rfind(':') + 1);
}

}  // namespace

const Element* elementOf(std::string_view tagName) noexcept {
    const auto found = std::ranges::find_if(elements, [tagName](const Element& element) {
        return isSameElement(element.name, tagName);
    });
    return found == elements.end() ? nullptr : &*found;
}

bool isOfService(std::string_view tagName) noexcept {
    return tagName.starts_with("as:") || tagName.starts_with("ac:");
}

bool isSameElement(std::string_view left, std::string_view right) noexcept {
    return std::ranges::equal(
        withoutPrefix(left), withoutPrefix(right), {},
        [](unsigned char c) { return std::tolower(c); },
        [](unsigned char c) { return std::tolower(c); });
}

}  // namespace raidinfo::redact
