#include "support/whole_request.h"

#include <algorithm>
#include <cctype>
#include <charconv>
#include <string>

namespace raid::test {

namespace {

std::string lowered(std::string_view text) {
    std::string result(text);
    std::ranges::transform(result, result.begin(), [](unsigned char character) {
        return static_cast<char>(std::tolower(character));
    });
    return result;
}

// Where the header ends (CR LF or bare LF), or npos.
std::size_t bodyStart(std::string_view request) {
    std::size_t start = std::string_view::npos;
    for (const std::string_view blankLine : {"\n\n", "\r\n\r\n"}) {
        if (const auto found = request.find(blankLine); found != std::string_view::npos) {
            start = std::min(start, found + blankLine.size());
        }
    }
    return start;
}

std::size_t contentLength(std::string_view header) {
    constexpr std::string_view name = "content-length:";
    const std::string text = lowered(header);
    const auto found = text.find(name);
    if (found == std::string::npos) {
        return 0;
    }
    const auto digits = text.find_first_not_of(' ', found + name.size());
    std::size_t length = 0;
    if (digits != std::string::npos) {
        std::from_chars(text.data() + digits, text.data() + text.size(), length);
    }
    return length;
}

}  // namespace

bool isWholeRequest(std::string_view request) {
    const std::size_t start = bodyStart(request);
    return start != std::string_view::npos &&
           request.size() >= start + contentLength(request.substr(0, start));
}

}  // namespace raid::test
