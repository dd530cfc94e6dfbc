#include "xml/parse_def_unit.h"

#include <algorithm>
#include <cctype>
#include <string_view>

#include "xml/space.h"
#include "xml/unit.h"

namespace {

/// Copies everything that a scan finds into the public unit.
class CopyingSink {
public:
    static constexpr bool tracesCharacters = false;

    explicit CopyingSink(ParseDefUnit& filled) noexcept : unit(filled) {}

    void text(std::string_view found) { unit.name = found; }
    void tag() noexcept { unit.kind = 1; }
    void opens() noexcept { unit.opening = true; }
    void closes() noexcept { unit.closing = true; }
    void element(std::string_view name) { unit.name = name; }
    void attribute(std::string_view name, std::string_view value) {
        unit.attributes.emplace_back(name, value);
    }

private:
    ParseDefUnit& unit;
};

}  // namespace

bool isSpace(unsigned char c) { return raid::xml::spaceBytes[c]; }

bool ci_equal(const std::string& left, const std::string& right) {
    return std::ranges::equal(
        left, right, {}, [](unsigned char c) { return std::tolower(c); },
        [](unsigned char c) { return std::tolower(c); });
}

ParseDefUnit::ParseDefUnit(const char* text, int length) {
    CopyingSink sink(*this);
    consumed = raid::xml::readUnit(text, length, sink);
}

ParseDefUnit::ParseDefUnit(const ParseDefUnit&) = default;
ParseDefUnit::ParseDefUnit(ParseDefUnit&&) noexcept = default;
ParseDefUnit& ParseDefUnit::operator=(const ParseDefUnit&) = default;
ParseDefUnit& ParseDefUnit::operator=(ParseDefUnit&&) noexcept = default;
ParseDefUnit::~ParseDefUnit() = default;
