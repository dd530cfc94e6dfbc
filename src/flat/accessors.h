#pragma once

#include <algorithm>
#include <array>
#include <charconv>
#include <cstddef>
#include <limits>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "RAIDInstrumentation.h"
#include "base/shared_value.h"
#include "flat/snapshot.h"
#include "xml/vocabulary.h"

namespace raid::flat {

/// A string literal as a template argument.
template <std::size_t Size>
struct Literal {
    // NOLINTNEXTLINE(google-explicit-constructor): stands for the literal
    consteval Literal(const char (&literal)[Size]) { std::ranges::copy(literal, characters); }
    [[nodiscard]] constexpr std::string_view view() const { return {characters, Size - 1}; }

    char characters[Size]{};
};

/// The member that keeps the text of a simple element, or of the "xsi:type" attribute.
template <class Record>
consteval std::string Record::*textMember(std::string_view element) {
    if (element == "xsi:type") {
        return xml::Vocabulary<Record>::type;
    }
    for (const auto& child : xml::childrenOf<Record>) {
        if (child.name == element && child.text != nullptr) {
            return child.text;
        }
    }
    throw "no text element of this name";
}

/// What a display name's format has before its "%d", which is its end.
consteval std::string_view beforeNumber(std::string_view format) {
    if (!format.ends_with("%d")) {
        throw "a display name ends with its number";
    }
    return format.substr(0, format.size() - 2);
}

/// The text of a status that has one.
inline constexpr std::array<std::string_view, 3> statusWords{"Normal", "Warning", "Critical"};

/// Writes a text and its terminating zero byte; the caller's buffer is large enough by contract.
inline void write(char* destination, std::string_view text) noexcept {
    *std::ranges::copy(text, destination).out = '\0';
}

/// Writes a decimal number without a terminating zero byte; returns the end.
inline char* writeNumber(char* destination, int value) noexcept {
    constexpr std::size_t mostCharacters = std::numeric_limits<int>::digits10 + 2;  // with the sign
    return std::to_chars(destination, destination + mostCharacters, value).ptr;
}

/// The functions of one published list, one member for each shape. A position outside the list
/// reads nothing.
template <class Record>
class Family {
public:
    constexpr explicit Family(const std::vector<Record>& published) noexcept : list(published) {}

    /// Rebuilds the lists first when a refresh is due.
    [[nodiscard]] int count() const {
        if (base::load(refresh) == 1) {
            getConfig();
        }
        return size();
    }

    [[nodiscard]] int size() const noexcept { return static_cast<int>(list.size()); }

    [[nodiscard]] const Record* at(int position) const noexcept {
        const auto index = static_cast<std::size_t>(position);  // a negative one lies outside, too
        return index < list.size() ? &list[index] : nullptr;
    }

    template <auto Getter>
    [[nodiscard]] int number(int position) const noexcept {
        const auto* const record = at(position);
        return record == nullptr ? 0 : (record->*Getter)();
    }

    /// Text is taken from its member by the element's name: a getter would make a copy first,
    /// which can fail where a C host cannot catch it.
    template <Literal Element>
    void text(char* destination, int position) const noexcept {
        constexpr auto member = textMember<Record>(Element.view());
        const auto* const record = at(position);
        write(destination, record == nullptr ? std::string_view() : record->*member);
    }

    template <Literal Format, auto Getter>
    int displayName(char* destination, int position) const noexcept {
        const auto* const record = at(position);
        auto* end = destination;
        if (record != nullptr) {
            constexpr auto before = beforeNumber(Format.view());
            end = std::ranges::copy(before, end).out;
            end = writeNumber(end, (record->*Getter)());
        }
        *end = '\0';
        return static_cast<int>(end - destination);
    }

    /// A status without a word leaves the destination as it was.
    void overallStatus(char* destination, int position) const noexcept {
        const auto* const record = at(position);
        const auto status = record == nullptr
                                ? statusWords.size()
                                : static_cast<std::size_t>(record->getOverallStatus());
        if (status < statusWords.size()) {
            write(destination, statusWords[status]);
        }
    }

private:
    const std::vector<Record>& list;
};

}  // namespace raid::flat
