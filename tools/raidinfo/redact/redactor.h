#pragma once

#include <string>
#include <string_view>

#include "redact/replacements.h"

namespace raidinfo::redact {

/// Takes out of the service's answers what tells whose server it is: serial numbers, addresses and
/// names, also where messages mention them. The same text gets the same replacement in all answers
/// of one redactor, and nothing of it can be had from its replacement but whether it was long.
/// Everything else stays as it is, byte for byte.
///
/// Malformed answers are redacted, too, and rather too much than too little: when the end tag of
/// such an element is missing, its text ends with the next tag of the service's.
class Redactor {
public:
    /// Redacts one answer's body.
    [[nodiscard]] std::string operator()(std::string_view body);

private:
    Replacements replacements;
};

}  // namespace raidinfo::redact
