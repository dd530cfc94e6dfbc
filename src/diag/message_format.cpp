#include "diag/message_format.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdint>

#include "base/decimal.h"

namespace raid::diag {
namespace {

constexpr std::string_view flagLetters = "-+ #0'";
constexpr std::string_view digits = "0123456789";
constexpr std::string_view lengthLetters = "hlLqjzt";
constexpr std::string_view integerLetters = "diouxX";
constexpr std::string_view floatingLetters = "aAeEfFgG";

/// One conversion of a format, taken apart. Its letter is NUL when the message ends first.
struct Conversion {
    std::string_view text;  // from its "%" to its letter
    std::string_view flags;
    std::string_view width;
    std::string_view precision;  // with its point
    char letter = '\0';

    [[nodiscard]] bool isBounded() const {
        return base::decimalNumber(width) <= widestField &&
               base::decimalNumber(precision.substr(precision.empty() ? 0 : 1)) <= widestField;
    }
};

std::string_view takeWhile(std::string_view& rest, std::string_view letters) {
    const auto taken = rest.substr(0, std::min(rest.find_first_not_of(letters), rest.size()));
    rest.remove_prefix(taken.size());
    return taken;
}

Conversion conversionAt(std::string_view message) {
    Conversion conversion;
    auto rest = message.substr(1);
    conversion.flags = takeWhile(rest, flagLetters);
    conversion.width = takeWhile(rest, digits);
    if (rest.starts_with('.')) {
        const auto precision = rest;
        rest.remove_prefix(1);
        takeWhile(rest, digits);
        conversion.precision = precision.substr(0, precision.size() - rest.size());
    }
    takeWhile(rest, lengthLetters);
    if (!rest.empty()) {
        conversion.letter = rest.front();
        rest.remove_prefix(1);
    }
    conversion.text = message.substr(0, message.size() - rest.size());
    return conversion;
}

/// The format of a bounded conversion. However long the message spelled it (flags repeat, numbers
/// begin with zeros), it is written in full in this many characters: "%", every flag once, width
/// and precision of three digits, a length letter, the letter and a zero byte.
class Format {
public:
    Format(const Conversion& conversion, std::string_view length) {
        put("%");
        for (const char& flag : flagLetters) {
            if (conversion.flags.find(flag) != std::string_view::npos) {
                put({&flag, 1});
            }
        }
        if (!conversion.width.empty()) {
            putNumber(conversion.width);
        }
        if (!conversion.precision.empty()) {
            put(".");
            putNumber(conversion.precision.substr(1));
        }
        put(length);
        put({&conversion.letter, 1});
    }

    [[nodiscard]] const char* text() const noexcept { return characters.data(); }

private:
    void put(std::string_view piece) { end = std::ranges::copy(piece, end).out; }
    void putNumber(std::string_view number) {
        static_assert(widestField < 1000);
        end = std::to_chars(end, end + 3, base::decimalNumber(number)).ptr;
    }

    std::array<char, 1 + flagLetters.size() + 3 + 1 + 3 + 1 + 1 + 1> characters{};
    char* end = characters.data();
};

#pragma GCC diagnostic push
// The format is the message's own, put together above so that it fits the one argument it gets.
#pragma GCC diagnostic ignored "-Wformat-nonliteral"
template <class Zero>
void printZero(std::FILE* out, const Conversion& conversion, std::string_view length, Zero zero) {
    std::fprintf(out, Format(conversion, length).text(), zero);
}
#pragma GCC diagnostic pop

void print(std::FILE* out, const Conversion& conversion) {
    const auto isOneOf = [&](std::string_view letters) {
        return conversion.letter != '\0' && conversion.isBounded() &&
               letters.find(conversion.letter) != std::string_view::npos;
    };
    if (conversion.letter == '%') {
        std::fputc('%', out);
    } else if (isOneOf(integerLetters)) {
        printZero(out, conversion, "j", std::intmax_t{0});
    } else if (isOneOf(floatingLetters)) {
        printZero(out, conversion, "", 0.0);
    } else if (isOneOf("c")) {
        printZero(out, conversion, "", 0);
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
