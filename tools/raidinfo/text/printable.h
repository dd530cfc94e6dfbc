#pragma once

#include <string>
#include <string_view>

namespace raidinfo {

/// The text with control characters escaped, so that it can neither break a line nor reach the
/// terminal as a command.
[[nodiscard]] std::string printable(std::string_view utf8);

/// A title inside a sentence: "Physical slot" begins small, "SMART error" stays.
[[nodiscard]] std::string inSentence(std::string_view title);

}  // namespace raidinfo
