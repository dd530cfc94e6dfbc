#include "orvo/property_file.h"

#include <algorithm>
#include <stdexcept>
#include <string_view>

#include "base/regular_file.h"

namespace Orvo {
namespace {

constexpr std::string_view blanks = " \t\r\v\f";
constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

std::string_view trimmed(std::string_view text) {
    const auto first = text.find_first_not_of(blanks);
    if (first == std::string_view::npos) {
        return {};
    }
    return text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

bool isSetting(std::string_view line) {
    return !line.empty() && line.front() != '#' && line.front() != ';' && line.front() != '[' &&
           line.find('=') != std::string_view::npos;
}

std::string readWhole(const std::string& name) {
    const auto file = raid::base::RegularFile::open(name);
    if (file && file->size() <= PropertyFile::sizeLimit) {
        std::string text(static_cast<std::size_t>(file->size()), '\0');
        if (file->read(text) == text.size()) {
            return text;
        }
    }
    throw std::runtime_error("cannot read " + name);
}

}  // namespace

// Bytes and wide characters of the same value: settings are plain text, and no locale of the host
// may change them.

std::wstring make_wstring(const std::string& narrow) {
    std::wstring wide(narrow.size(), L'\0');
    std::ranges::transform(narrow, wide.begin(),
                           [](char c) -> wchar_t { return static_cast<unsigned char>(c); });
    return wide;
}

std::string make_string(const std::wstring& wide) {
    std::string narrow(wide.size(), '\0');
    std::ranges::transform(wide, narrow.begin(), [](wchar_t c) { return static_cast<char>(c); });
    return narrow;
}

void PropertyFile::open(int /*mode*/) {
    const std::string text = readWhole(path.string());
    std::string_view rest = text;
    if (rest.starts_with(byteOrderMark)) {
        rest.remove_prefix(byteOrderMark.size());
    }
    values.clear();
    while (!rest.empty()) {
        const auto end = std::min(rest.find('\n'), rest.size());
        const auto line = trimmed(rest.substr(0, end));
        rest.remove_prefix(std::min(end + 1, rest.size()));
        if (isSetting(line)) {
            const auto equals = line.find('=');
            values[make_wstring(std::string(trimmed(line.substr(0, equals))))] =
                make_wstring(std::string(trimmed(line.substr(equals + 1))));
        }
    }
}

const std::wstring& PropertyFile::getValue(const std::wstring& key) const { return values.at(key); }

}  // namespace Orvo
