// Holds the readers' ways through a document against the literal state machine: with the trace,
// which takes no short way, and without it. What is read next is what the document's own tags say,
// so that every tag and every text meets each of the ways.

#include <algorithm>
#include <array>
#include <cerrno>
#include <string>
#include <string_view>
#include <vector>

#include "RAIDInstrumentation.h"
#include "support/input.h"
#include "support/require.h"
#include "support/state_machine.h"
#include "xml/space.h"
#include "xml/unit_reader.h"

namespace {

using namespace raid;

/// Names of the same length take each other's place.
int numberOf(std::string_view name) {
    return name.size() < 64 ? static_cast<int>(name.size()) : xml::unknownName;
}

constexpr auto beginnings = [] {
    std::array<std::string_view, 64> made{};
    made.fill("<as:any xsi:type=\"");
    made[7] = "<as:size xsi:type=\"";
    made[8] = "<as:state xsi:type=\"";
    made[12] = "<ac:hardDrive xsi:type=\"";
    return made;
}();
constexpr auto known = [] {
    std::array<xml::KnownTag, 65> made{};
    made[7] = {
        "<as:size xsi:type=\"xsd:int\">",
        {{.isTag = true, .opening = true, .finished = true, .name = "as:size", .type = "xsd:int"},
         7}};
    made[64] = {"</ac:fan>",
                {{.isTag = true, .closing = true, .finished = true, .name = "ac:fan"}, 6}};
    return made;
}();
constexpr xml::Names oneClass{&numberOf, known, xml::TagIndex(beginnings)};
constexpr xml::Names otherClass = oneClass;

/// Follows a reader with the state machine.
class Follower {
public:
    explicit Follower(std::string_view document)
        : units(document.data(), static_cast<int>(document.size())), rest(document) {}

    /// Reads the next unit as one of two classes; false behind the last one.
    bool next() {
        const auto& names = rest.size() % 3 == 0 ? otherClass : oneClass;
        const auto described = advance();
        const auto& [unit, number] = units.next(units.tagsOf(names));
        fuzz::require(unit.isTag == (described.kind == 1), "kind");
        fuzz::require(unit.name == described.name, "name");
        fuzz::require(unit.opening == described.opening, "opening");
        fuzz::require(unit.closing == described.closing, "closing");
        fuzz::require(unit.finished == (described.consumed != 0), "end");
        fuzz::require(unit.type == typeOf(described), "type");
        fuzz::require(number == numberOf(described.name), "number of the name");
        requireSamePlace();
        name = described.name;
        return unit.finished;
    }

    /// Takes the text and the end tag of the tag that was read last, if they are plain. The names
    /// that are known have none of the bytes that end a name.
    void takeText() {
        const bool isName = std::ranges::none_of(
            name, [](char c) { return c == '>' || c == '/' || xml::isSpaceByte(c); });
        if (!isName) {
            return;
        }
        const auto text = units.plainText("</" + name + ">");
        if (!text) {
            requireSamePlace();
            return;
        }
        auto described = advance();
        fuzz::require(*text == (described.kind == 0 ? described.name : ""), "text");
        if (described.kind == 0) {
            described = advance();
        }
        requireEndTag(described);
    }

private:
    fuzz::DescribedUnit advance() {
        auto described = fuzz::describedUnit(rest);
        rest.remove_prefix(static_cast<std::size_t>(described.consumed));
        return described;
    }

    static std::string typeOf(const fuzz::DescribedUnit& described) {
        std::string type;
        for (const auto& [attribute, value] : described.attributes) {
            type = attribute == "xsi:type" ? value : type;
        }
        return type;
    }

    void requireEndTag(const fuzz::DescribedUnit& described) {
        fuzz::require(described.kind == 1 && described.closing && !described.opening, "end tag");
        fuzz::require(described.name == name, "name of the end tag");
        requireSamePlace();
    }

    /// Space before a unit may be passed early.
    void requireSamePlace() {
        auto here = rest;
        const auto left = static_cast<std::size_t>(units.remaining());
        while (here.size() > left && xml::isSpaceByte(here.front())) {
            here.remove_prefix(1);
        }
        fuzz::require(here.size() == left, "place");
    }

    xml::UnitReader units;
    std::string_view rest;
    std::string name;
};

void follow(std::string_view document) {
    Follower follower(document);
    while (follower.next()) {
        follower.takeText();
    }
}

}  // namespace

// The log is not what is looked at here.
extern "C" int __wrap_open(const char* /*path*/, int /*flags*/, ...) {  // NOLINT
    errno = EACCES;
    return -1;
}

int LLVMFuzzerInitialize(int* /*argc*/, char*** /*argv*/) {
    configRead = 1;
    return 0;
}

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    // Twice the same, so that tags come back.
    std::vector<char> bytes(data, data + size);
    bytes.insert(bytes.end(), data, data + size);
    for (const int level : {0, 9}) {
        LOG_LEVEL = level;
        follow({bytes.data(), bytes.size()});
    }
    return 0;
}
