#include "text.h"

#include <algorithm>
#include <charconv>
#include <cstdint>

namespace raidsim {

namespace {

constexpr char lower(char c) noexcept {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

template <typename Number>
std::optional<Number> parseWhole(std::string_view text) noexcept {
    Number value = 0;
    const char* const end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, value);
    if (error != std::errc{} || stop != end)
        return std::nullopt;
    return value;
}

constexpr bool isDigit(char c) noexcept { return c >= '0' && c <= '9'; }

std::string digits(std::int64_t number, std::size_t width) {
    const std::string text = std::to_string(number);
    return std::string(width - std::min(width, text.size()), '0') + text;
}

}  // namespace

std::optional<int> parseInt(std::string_view text) noexcept {
    static_assert(sizeof(int) == sizeof(std::int32_t));
    return parseWhole<int>(text);
}

std::optional<std::uint64_t> parseCount(std::string_view text) noexcept {
    return parseWhole<std::uint64_t>(text);
}

std::optional<std::chrono::milliseconds> parseSeconds(std::string_view text) noexcept {
    constexpr double longest = 1e6;
    constexpr std::size_t decimals = 3;
    if (const auto point = text.find('.');
        point != std::string_view::npos && text.size() - point - 1 > decimals)
        return std::nullopt;
    double seconds = 0;
    const char* const end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, seconds, std::chars_format::fixed);
    // Written so that "nan" fails too.
    if (error != std::errc{} || stop != end || !(seconds >= 0 && seconds <= longest))
        return std::nullopt;
    return std::chrono::round<std::chrono::milliseconds>(std::chrono::duration<double>(seconds));
}

std::string formatSeconds(std::chrono::milliseconds time) {
    std::string text = std::to_string(time.count() / 1000) + '.' + digits(time.count() % 1000, 3);
    text.resize(text.find_last_not_of('0') + 1);
    if (text.back() == '.')
        text.pop_back();
    return text;
}

std::optional<std::chrono::sys_seconds> parseUtc(std::string_view text) noexcept {
    using namespace std::chrono;
    constexpr std::string_view pattern = "0000-00-00T00:00:00Z";
    const auto fits = [](char c, char wanted) { return wanted == '0' ? isDigit(c) : c == wanted; };
    if (!std::ranges::equal(text, pattern, fits))
        return std::nullopt;
    const auto number = [&](std::size_t at, std::size_t width) {
        return parseInt(text.substr(at, width)).value_or(0);
    };
    const auto part = [&](std::size_t at) { return static_cast<unsigned>(number(at, 2)); };
    const year_month_day date(year(number(0, 4)), month(part(5)), day(part(8)));
    if (!date.ok() || part(11) > 23 || part(14) > 59 || part(17) > 59)
        return std::nullopt;
    return sys_days(date) + hours(part(11)) + minutes(part(14)) + seconds(part(17));
}

std::string formatUtc(std::chrono::sys_seconds when) {
    using namespace std::chrono;
    const auto midnight = floor<days>(when);
    const year_month_day date(midnight);
    const hh_mm_ss time(when - midnight);
    return digits(static_cast<int>(date.year()), 4) + '-' +
           digits(static_cast<unsigned>(date.month()), 2) + '-' +
           digits(static_cast<unsigned>(date.day()), 2) + 'T' + digits(time.hours().count(), 2) +
           ':' + digits(time.minutes().count(), 2) + ':' + digits(time.seconds().count(), 2) + 'Z';
}

std::string_view trim(std::string_view text) noexcept {
    constexpr std::string_view blanks = " \t\r\n";
    const auto first = text.find_first_not_of(blanks);
    if (first == std::string_view::npos)
        return {};
    return text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

std::vector<std::string_view> split(std::string_view text, char separator) {
    std::vector<std::string_view> parts;
    for (;;) {
        const auto end = text.find(separator);
        parts.push_back(text.substr(0, end));
        if (end == std::string_view::npos)
            return parts;
        text.remove_prefix(end + 1);
    }
}

bool equalIgnoringCase(std::string_view left, std::string_view right) noexcept {
    return std::ranges::equal(left, right, {}, lower, lower);
}

}  // namespace raidsim
