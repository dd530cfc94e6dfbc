#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "support/row.h"

// The model classes as tables: what their elements are called and which getter shows which child.
namespace raid::test {

enum class Kind { number, flag, text };

struct Field {
    std::string name;  // of its element, without the prefix
    Kind kind;
    std::string endWord;  // in the message about its missing end tag
};

// What became of reading one element.
struct Reading {
    [[nodiscard]] bool operator==(const Reading&) const = default;

    std::string error = {};  // message, or empty
    int consumed = 0;
    std::string type = {};                 // of the "xsi:type" attribute
    std::vector<std::string> values = {};  // of the fields, in their order
    // Of the elements inside, kind by kind in the order of the class's description.
    std::vector<std::vector<Reading>> inside = {};
};

// A kind of elements inside an element that a getter shows: where they stand below it, and whether
// there is one of them at most, the last.
struct Inside {
    std::vector<std::string> path;
    bool single;
};

struct ModelClass : Row {
    ModelClass(const char* className, std::string_view elementName, std::string_view word)
        : Row(className), element(elementName), endWord(word), exitName(className) {}

    std::string element;
    std::string endWord;   // in the messages about its own end tag
    std::string exitName;  // in its last line of the trace
    std::string context = "\nassociation:\n";
    std::vector<Field> fields;
    std::vector<Inside> inside;
    std::vector<std::string> unshown;  // children that are known and that no getter shows
    std::function<Reading(const std::string& text)> read;
    // Reads a good element, and shows it and its copies.
    std::function<std::vector<Reading>(const std::string& text)> readAsValues;

    [[nodiscard]] std::string missing(std::string_view word, std::string_view found) const;
    [[nodiscard]] std::string unknown(std::string_view found) const;
};

// All classes of the configuration that have a vocabulary.
[[nodiscard]] const std::vector<ModelClass>& modelClasses();

// Those that pass over whatever they contain.
[[nodiscard]] const std::vector<ModelClass>& passedClasses();

}  // namespace raid::test
