#include "state/plug.h"

#include <algorithm>
#include <iterator>
#include <optional>
#include <string>
#include <vector>

namespace raidsim {

namespace {

using Way = std::vector<xml::Tree*>;  // from the system to a list

constexpr const char* logicalDrives = "ac:logicalDrives";
constexpr const char* task = "ac:progress";

bool isLogical(const Path& path) { return path.kind().plugsInto == "adapter"; }

Path placeOf(const Path& path) {
    checkUnplug(path);
    if (path.id() == "*")
        throw EditError(path.text() + " does not name one thing");
    const std::string wanted(path.kind().plugsInto);
    auto place = path.parent();
    const bool array = place && isLogical(path) &&
                       (place->kind().name == "array" || place->kind().name == "spanned");
    if (!place || (place->kind().name != wanted && !array))
        throw EditError(path.text() + " does not say in which " + wanted);
    return std::move(*place);
}

Way wayTo(const Match& match) {
    Way way = match.ancestors;
    way.push_back(match.node);
    return way;
}

// The list of logical drives there. Who has had none yet gets one.
xml::Tree& logicalsOf(xml::Tree& owner) {
    if (xml::Tree* const there = xml::childOf(owner, logicalDrives))
        return *there;
    xml::Tree& made = xml::addChild(owner, logicalDrives, xml::element("o:LogicalDrives"));
    xml::addText(made, overallStatus, "xsd:int", "0");
    return made;
}

// Every list that the thing gets into.
std::vector<Way> listsOf(const Path& path, const Way& owner) {
    if (!isLogical(path))
        return {owner};
    std::vector<Way> ways{{owner[0], owner[1]}};
    if (owner.size() > 2)
        ways.push_back(owner);
    for (Way& way : ways)
        way.push_back(&logicalsOf(*way.back()));
    return ways;
}

// Numbers of logical drives count for the whole adapter.
bool isTaken(xml::Tree& system, const Path& path, const Way& owner) {
    if (!findAll(system, path).empty())
        return true;
    const xml::Tree* const home = xml::childOf(*owner[1], logicalDrives);
    return isLogical(path) && home != nullptr && std::ranges::any_of(*home, [&](const auto& child) {
               return child.first == path.kind().element &&
                      xml::textOf(child.second, std::string(path.kind().idField)) == path.id();
           });
}

void overwrite(xml::Tree& thing, const std::string& field, const std::string& value,
               const Path& path) {
    xml::Tree* const child = xml::childOf(thing, field);
    if (child == nullptr) {
        throw EditError(path.text() + " has no field \"" + field.substr(field.find(':') + 1) +
                        "\"");
    }
    child->data() = value;
}

// What is around a thing is told in the thing, too, as far as it has such fields.
void adapt(xml::Tree& thing, const Way& around) {
    for (const char* const field : {"as:adapterID", "as:channelID"}) {
        for (const xml::Tree* const outer : around) {
            if (xml::childOf(*outer, field) != nullptr && xml::childOf(thing, field) != nullptr)
                xml::childOf(thing, field)->data() = xml::textOf(*outer, field);
        }
    }
}

// Behind the last one of its kind, or at the end.
void enlist(xml::Tree& list, const std::string& element, const xml::Tree& thing) {
    const auto last = std::find_if(list.rbegin(), list.rend(),
                                   [&](const auto& child) { return child.first == element; });
    list.insert(last == list.rend() ? list.end() : last.base(), {element, thing});
}

}  // namespace

void checkUnplug(const Path& path) {
    if (path.kind().plugsInto.empty()) {
        throw EditError("\"" + std::string(path.kind().name) +
                        "\" is not added or removed while the system runs");
    }
}

void checkPlug(const Path& path) { (void)placeOf(path); }

void checkPlugLike(const Path& path, const Path& model) {
    checkPlug(path);
    if (&model.kind() != &path.kind())
        throw EditError(model.text() + " is no " + std::string(path.kind().name));
}

void unplug(Document& document, const Path& path) {
    checkUnplug(path);
    for (const Match& match : findSome(document.edit(), path)) {
        xml::Tree& list = *match.ancestors.back();
        list.erase(std::ranges::find_if(
            list, [&](const auto& child) { return &child.second == match.node; }));
        showWorstOutwards(match.ancestors);
    }
}

void plugLike(Document& document, const Path& path, const Path& model, const Fields& fields) {
    checkPlugLike(path, model);
    plug(document, path, *findAtHome(document.edit(), model).node, fields);
}

void plug(Document& document, const Path& path, const xml::Tree& thing, const Fields& fields) {
    const Path place = placeOf(path);
    xml::Tree copy = thing;
    copy.erase(task);
    xml::Tree& system = document.edit();
    const Way owner = wayTo(findAtHome(system, place));
    adapt(copy, owner);
    overwrite(copy, std::string(path.kind().idField), path.id(), path);
    for (const auto& [field, value] : fields)
        overwrite(copy, "as:" + field, value, path);
    if (isTaken(system, path, owner))
        throw EditError("the document has " + path.text() + " already");
    for (const Way& way : listsOf(path, owner)) {
        enlist(*way.back(), std::string(path.kind().element), copy);
        showWorstOutwards(way);
    }
}

xml::Tree parseThing(std::string_view text, const Path& path) {
    const xml::Tree document = xml::parse(text);
    const auto& [name, thing] = document.front();
    if (name != path.kind().element) {
        throw EditError("the file holds \"" + name + "\" in place of \"" +
                        std::string(path.kind().element) + "\"");
    }
    return thing;
}

}  // namespace raidsim
