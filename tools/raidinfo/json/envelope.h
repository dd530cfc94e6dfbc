#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "exit_status.h"
#include "json/json.h"

namespace raidinfo {

/// What a document tells about.
struct Source {
    std::string_view type;  ///< "service", "recording", "files" (of a diff), "none"
    std::string name;       ///< the service's address, a file
};

/// Why data is missing; `code` is for programs, the message for people.
struct Trouble {
    std::string_view code;
    std::string message;
};

/// The word for a failure of the program.
[[nodiscard]] std::string_view troubleCode(ExitStatus status) noexcept;

/// Puts the data into the envelope that every JSON output has. It is complete when there is no
/// trouble.
[[nodiscard]] Json enveloped(const Source& source, const std::vector<Trouble>& troubles, Json data);

/// As a document for people and pipes, indented.
[[nodiscard]] std::string document(const Json& json);

/// As one line of a stream.
[[nodiscard]] std::string documentLine(const Json& json);

}  // namespace raidinfo
