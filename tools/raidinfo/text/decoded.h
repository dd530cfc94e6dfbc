#pragma once

#include <string>
#include <string_view>

namespace raidinfo {

/// A text of the service as people and JSON get it: the five predefined entity references and
/// numeric character references are decoded once, other references stay as they are; every byte
/// sequence that is not UTF-8 becomes U+FFFD.
[[nodiscard]] std::string decoded(std::string_view sent);

}  // namespace raidinfo
