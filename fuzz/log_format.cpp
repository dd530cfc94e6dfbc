// Lets the log print any message as a format, and compares the harmless ones with what printf
// prints when all arguments are zero.

#include <array>
#include <cstdio>
#include <regex>
#include <string>

#include "diag/message_format.h"
#include "support/input.h"
#include "support/require.h"

namespace {

using namespace raid;

constexpr std::size_t mostConversions = 8;

/// The text as a file receives it.
std::string printed(const std::string& message) {
    char* text = nullptr;
    std::size_t size = 0;
    std::FILE* const out = open_memstream(&text, &size);
    diag::printWithZeros(out, message);
    std::fclose(out);
    std::string result(text, size);
    std::free(text);
    return result;
}

/// Whether every "%" begins a conversion that printf and the log must agree on.
bool isHarmless(const std::string& message) {
    static const std::regex conversion(
        "%[-+ #0]*([0-9]{0,2}(\\.[0-9]{0,2})?(hh|h|ll|l|j|z|t)?[diouxX]|[0-9]{0,2}(\\.[0-9]{0,2})?"
        "[aAeEfFgGc]|%)");
    std::size_t count = 0;
    std::string rest = message;
    for (std::smatch found; std::regex_search(rest, found, std::regex("%"));) {
        rest = rest.substr(static_cast<std::size_t>(found.position()));
        if (++count > mostConversions ||
            !std::regex_search(rest, found, conversion, std::regex_constants::match_continuous)) {
            return false;
        }
        rest = found.suffix();
    }
    return message.find('\0') == std::string::npos;
}

#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat-nonliteral"
std::string printedByLibc(const std::string& message) {
    std::string text(message.size() + mostConversions * 400, '\0');
    // Numbers of both kinds, so that whatever a conversion takes is zero.
    const int size =
        std::snprintf(text.data(), text.size(), message.c_str(), 0LL, 0LL, 0LL, 0LL, 0LL, 0LL, 0LL,
                      0LL, 0LL, 0LL, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0);
    fuzz::require(size >= 0, "printf takes the message");
    text.resize(static_cast<std::size_t>(size));
    return text;
}
#pragma GCC diagnostic pop

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size > 4096) {
        return -1;
    }
    const auto message = fuzz::textOf(data, size);
    const auto text = printed(message);
    fuzz::require(text.size() <= message.size() * (diag::widestField + 10), "a bounded line");
    if (isHarmless(message)) {
        fuzz::require(text == printedByLibc(message), "the same text as printf's");
    }
    return 0;
}
