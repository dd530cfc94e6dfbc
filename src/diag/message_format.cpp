#include "diag/message_format.h"

#include <algorithm>
#include <array>
#include <cstdint>

#include "base/decimal.h"

namespace raid::diag {
namespace {

/// "%", flags, width and precision; a longer start is somebody's trick.
constexpr std::size_t longestStart = 16;

constexpr std::string_view flagLetters = "-+ #0'";
constexpr std::string_view digits = "0123456789";
constexpr std::string_view lengthLetters = "hlLqjzt";
constexpr std::string_view integerLetters = "diouxX";
constexpr std::string_view floatingLetters = "aAeEfFgG";

/// One conversion specification, from its "%" to its letter.
struct Conversion {
    std::string_view text;
    std::string_view beforeLength;  // "%", flags, width and precision
    char letter = '\0';             // NUL when the message ends first
};

std::string_view takeWhile(std::string_view& rest, std::string_view letters) {
    const auto taken = rest.substr(0, std::min(rest.find_first_not_of(letters), rest.size()));
    rest.remove_prefix(taken.size());
    return taken;
}

Conversion conversionAt(std::string_view message) {
    Conversion conversion;
    auto rest = message.substr(1);
    takeWhile(rest, flagLetters);
    const auto width = takeWhile(rest, digits);
    std::string_view precision;
    if (rest.starts_with('.')) {
        rest.remove_prefix(1);
        precision = takeWhile(rest, digits);
    }
    const bool bounded =
        base::decimalNumber(width) <= widestField && base::decimalNumber(precision) <= widestField;
    conversion.beforeLength = message.substr(0, message.size() - rest.size());
    takeWhile(rest, lengthLetters);
    if (!rest.empty()) {
        conversion.letter = bounded ? rest.front() : '\0';
        rest.remove_prefix(1);
    }
    conversion.text = message.substr(0, message.size() - rest.size());
    return conversion;
}

#pragma GCC diagnostic push
// The format is the message's own, taken apart above so that it fits the one argument it gets.
#pragma GCC diagnostic ignored "-Wformat-nonliteral"
template <class Zero>
void printZero(std::FILE* out, std::string_view before, std::string_view length, char letter,
               Zero zero) {
    std::array<char, 2 * widestField + 64> printed{};
    std::array<char, longestStart + 3> format{};
    auto* end = std::ranges::copy(before, format.begin()).out;
    end = std::ranges::copy(length, end).out;
    *end = letter;
    const int size = std::snprintf(printed.data(), printed.size(), format.data(), zero);
    if (size > 0) {
        std::fwrite(printed.data(), 1, std::min(static_cast<std::size_t>(size), printed.size()),
                    out);
    }
}
#pragma GCC diagnostic pop

void print(std::FILE* out, const Conversion& conversion) {
    const auto isOneOf = [&](std::string_view letters) {
        return conversion.letter != '\0' && letters.find(conversion.letter) != letters.npos;
    };
    if (conversion.text == "%%") {
        std::fputc('%', out);
    } else if (isOneOf(integerLetters)) {
        printZero(out, conversion.beforeLength, "j", conversion.letter, std::intmax_t{0});
    } else if (isOneOf(floatingLetters)) {
        printZero(out, conversion.beforeLength, "", conversion.letter, 0.0);
    } else if (isOneOf("c")) {
        printZero(out, conversion.beforeLength, "", conversion.letter, 0);
    } else {
        std::fwrite(conversion.text.data(), 1, conversion.text.size(), out);
    }
}

}  // namespace

void printWithZeros(std::FILE* out, std::string_view message) {
    while (!message.empty()) {
        const auto plain = message.substr(0, std::min(message.find('%'), message.size()));
        std::fwrite(plain.data(), 1, plain.size(), out);
        message.remove_prefix(plain.size());
        if (!message.empty()) {
            const auto conversion = conversionAt(message);
            print(out, conversion);
            message.remove_prefix(conversion.text.size());
        }
    }
}

}  // namespace raid::diag
