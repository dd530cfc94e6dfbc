#pragma once

#include <string>

namespace raid::fuzz {

/// Lets the next exchange yield this body; the answers to waitNextEvent are lost. The linker puts
/// these exchanges in the place of the library's (the target links served_answer).
void serve(std::string body);

/// The body as the service would send it: a payload, unless it is a document of its own, in the
/// envelope of this response.
[[nodiscard]] std::string inEnvelope(const std::string& payload, const std::string& response);

}  // namespace raid::fuzz
