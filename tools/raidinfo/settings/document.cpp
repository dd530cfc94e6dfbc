#include "settings/document.h"

#include <toml++/toml.h>

#include <algorithm>
#include <system_error>
#include <utility>

#include "exit_status.h"
#include "system/file.h"

namespace raidinfo::settings {
namespace {

std::string textOfFile(const std::filesystem::path& path) {
    std::error_code error;
    // Anything else may never end.
    if (!std::filesystem::is_regular_file(path, error)) {
        throw Failure{ExitStatus::noInput, "cannot read " + path.string() + ": " +
                                               (error ? error.message() : "not a regular file")};
    }
    return readFile(path, longestDocument);
}

/// Each dot of a key is a table in a table, which the parser takes apart by recursion.
void refuseEndlessKeys(std::string_view text, const std::string& file) {
    std::size_t line = 1;
    int dots = 0;
    for (const char character : text) {
        if (character == '\n') {
            ++line;
            dots = 0;
        } else if (character == '.' && ++dots > mostDotsOfALine) {
            refuse({file, line}, "more dots than a line may have");
        }
    }
}

/// Makes settings of the parser's nodes.
class Conversion {
public:
    explicit Conversion(std::string name) : file{std::move(name)} {}

    [[nodiscard]] Table table(const toml::table& source, int depth) const {
        // The parser sorts by key.
        std::vector<std::pair<toml::source_position, Entry>> entries;
        for (const auto& [key, node] : source) {
            const toml::source_position position = key.source().begin;
            entries.emplace_back(position,
                                 Entry{std::string{key.str()}, setting(node, position, depth + 1)});
        }
        std::ranges::sort(entries, {}, [](const auto& entry) {
            return std::pair{entry.first.line, entry.first.column};
        });
        Table result;
        for (auto& entry : entries) {
            result.push_back(std::move(entry.second));
        }
        return result;
    }

private:
    [[nodiscard]] Setting setting(const toml::node& node, toml::source_position position,
                                  int depth) const {
        const Place place{file, position.line};
        if (depth > deepestNesting) {
            refuse(place, "nested too deeply");
        }
        if (const auto* const inner = node.as_table()) {
            return {place, table(*inner, depth)};
        }
        if (const auto* const list = node.as_array()) {
            List elements;
            for (const toml::node& element : *list) {
                elements.push_back(setting(element, element.source().begin, depth + 1));
            }
            return {place, std::move(elements)};
        }
        if (const auto* const text = node.as_string()) {
            return {place, text->get()};
        }
        if (const auto* const number = node.as_integer()) {
            return {place, number->get()};
        }
        if (const auto* const flag = node.as_boolean()) {
            return {place, flag->get()};
        }
        refuse(place, "expected a text, a whole number, true, false, a list or a table");
    }

    std::string file;
};

}  // namespace

Table parsedDocument(std::string_view text, const std::string& file) {
    refuseEndlessKeys(text, file);
    try {
        return Conversion{file}.table(toml::parse(text), 0);
    } catch (const toml::parse_error& error) {
        refuse({file, error.source().begin.line}, std::string{error.description()});
    }
}

Table readDocument(const std::filesystem::path& path) {
    return parsedDocument(textOfFile(path), path.string());
}

}  // namespace raidinfo::settings
