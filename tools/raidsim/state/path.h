#pragma once

#include <cstddef>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "xml/tree.h"

namespace raidsim {

// A kind of object that control commands can name.
struct Kind {
    std::string_view name;
    std::string_view element;
    std::string_view idField;  // empty for the collections, which need no number
    bool takesProgress = false;
    // Things may be listed in several places. They are at home in this collection of their adapter,
    // so many levels below the system; no collection: there is only one listing.
    std::string_view home{};
    std::size_t depth = 0;
    // The kind of the things that it is put into and taken out of while the system runs; empty for
    // what stays.
    std::string_view plugsInto{};
};

class PathError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// "adapter:1/channel:1/drive:3": steps from the outside in; any number of levels may be left
// out, "*" stands for every number.
class Path {
public:
    struct Step {
        const Kind* kind;
        std::string id;
    };

    // Throws PathError.
    static Path parse(std::string_view text);

    [[nodiscard]] const std::string& text() const noexcept { return written; }
    [[nodiscard]] const std::vector<Step>& steps() const noexcept { return list; }
    [[nodiscard]] const Kind& kind() const noexcept { return *list.back().kind; }
    [[nodiscard]] const std::string& id() const noexcept { return list.back().id; }

    // The path without its last step; nothing when that is the only one.
    [[nodiscard]] std::optional<Path> parent() const;

private:
    std::string written;
    std::vector<Step> list;
};

// One listing of an object in the document. The pointers hold while nothing is removed.
struct Match {
    xml::Tree* node = nullptr;
    std::vector<xml::Tree*> ancestors;  // outermost first
};

// Every listing of the objects that the path names, in document order. One object may be listed
// several times: a drive under its channel, in its array and among the hot spares.
[[nodiscard]] std::vector<Match> findAll(xml::Tree& system, const Path& path);

}  // namespace raidsim
