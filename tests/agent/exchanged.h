#pragma once

#include <cstdlib>
#include <memory>
#include <optional>
#include <string>

#include "agent/document.h"
#include "agent/exchange.h"

namespace raid::test {

// The body as its readers see it, up to its zero byte, or nothing.
[[nodiscard]] inline std::optional<std::string> textOf(char* body) {
    const agent::Document owned(body);
    return body == nullptr ? std::nullopt : std::optional<std::string>(body);
}

// One exchange whose request does not matter.
[[nodiscard]] inline std::optional<std::string> exchanged() {
    return textOf(getSOAPData("GET / HTTP/1.1\r\n\r\n"));
}

}  // namespace raid::test
