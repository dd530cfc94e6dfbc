#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace raidinfo {

/// A text of the service as people and JSON get it: the five predefined entity references and
/// numeric character references are decoded once, other references stay as they are; every byte
/// sequence that is not UTF-8 becomes U+FFFD.
[[nodiscard]] std::string decoded(std::string_view sent);

/// The text with control characters escaped, so that it can neither break a line nor reach the
/// terminal as a command.
[[nodiscard]] std::string printable(std::string_view utf8);

/// The text, cut with "…" where it takes more columns than there are.
[[nodiscard]] std::string shortened(std::string_view printable, std::size_t columns);

/// A title inside a sentence: "Physical slot" begins small, "SMART error" stays.
[[nodiscard]] std::string inSentence(std::string_view title);

/// The columns that a printable UTF-8 text takes on a terminal.
[[nodiscard]] std::size_t displayWidth(std::string_view utf8) noexcept;

}  // namespace raidinfo
