#include "state/edit.h"

#include <algorithm>
#include <string>
#include <vector>

namespace raidsim {

namespace {

constexpr const char* progress = "ac:progress";
constexpr const char* channel = "ac:channel";
constexpr const char* hardDrive = "ac:hardDrive";
constexpr const char* physicalDrives = "ac:physicalDrives";
constexpr const char* channelId = "as:channelID";

// The channel of that number in an array, or null.
xml::Tree* channelIn(xml::Tree& physical, const std::string& id) {
    for (auto& [name, child] : physical) {
        if (name == channel && xml::textOf(child, channelId) == id)
            return &child;
    }
    return nullptr;
}

// Goes down to where an array lists the drives of a channel, making what is missing.
void enterChannel(std::vector<xml::Tree*>& way, const xml::Tree& original) {
    xml::Tree* physical = xml::childOf(*way.back(), physicalDrives);
    if (physical == nullptr) {
        physical =
            &way.back()->push_back({physicalDrives, xml::element("o:PhysicalDrives")})->second;
    }
    way.push_back(physical);
    xml::Tree* listed = channelIn(*physical, xml::textOf(original, channelId));
    if (listed == nullptr) {
        xml::Tree copy;
        for (const auto& [name, child] : original) {
            if (!name.starts_with("ac:"))
                xml::addChild(copy, name, child);
        }
        listed = &physical->push_back({channel, std::move(copy)})->second;
    }
    way.push_back(listed);
}

struct Membership {
    Match drive;
    std::vector<xml::Tree*> way;  // from the system to the collection
    Match listing;                // the drive in the collection; no node when it is not listed
};

Membership membership(xml::Tree& system, const Path& drive, const Path& target) {
    checkMembership(drive, target);
    Membership found{findAtHome(system, drive), {}, {}};
    Match collection = findOne(system, target);
    found.way = std::move(collection.ancestors);
    if (std::ranges::find(found.way, found.drive.ancestors[1]) == found.way.end())
        throw EditError(target.text() + " belongs to another adapter");
    found.way.push_back(collection.node);
    for (Match& match : findAll(system, drive)) {
        if (std::ranges::find(match.ancestors, collection.node) != match.ancestors.end())
            found.listing = std::move(match);
    }
    return found;
}

}  // namespace

void checkProgress(const Path& path) {
    if (!path.kind().takesProgress)
        throw EditError("no task runs on \"" + std::string(path.kind().name) + "\"");
}

void checkMembership(const Path& drive, const Path& collection) {
    if (drive.kind().name != "drive")
        throw EditError(drive.text() + " is not a drive");
    if (collection.kind().name != "array" && collection.kind().name != "spares")
        throw EditError(collection.text() + " is neither an array nor the spares");
}

void setFields(Document& document, const Path& path, const Fields& fields) {
    std::vector<Match> matches = findSome(document.edit(), path);
    std::vector<std::pair<xml::Tree*, const std::string*>> writes;
    for (const auto& [field, value] : fields) {
        const std::size_t before = writes.size();
        for (const Match& match : matches) {
            if (xml::Tree* const child = xml::childOf(*match.node, "as:" + field))
                writes.emplace_back(child, &value);
        }
        if (writes.size() == before)
            throw EditError(path.text() + " has no field \"" + field + "\"");
    }
    for (const auto& [child, value] : writes)
        child->data() = *value;
    if (std::ranges::none_of(
            fields, [](const auto& field) { return "as:" + field.first == overallStatus; }))
        return;
    for (const Match& match : matches)
        showWorstOutwards(match.ancestors);
}

void setProgress(Document& document, const Path& path, int percent) {
    checkProgress(path);
    for (const Match& match : findSome(document.edit(), path)) {
        match.node->erase(progress);
        xml::Tree task = xml::element("o:Progress");
        xml::addText(task, "as:percentComplete", "xsd:int", std::to_string(percent));
        xml::addChild(*match.node, progress, task);
    }
}

void clearProgress(Document& document, const Path& path) {
    checkProgress(path);
    for (const Match& match : findSome(document.edit(), path))
        match.node->erase(progress);
}

void join(Document& document, const Path& drive, const Path& collection) {
    Membership place = membership(document.edit(), drive, collection);
    if (place.listing.node != nullptr)
        throw EditError(collection.text() + " already lists " + drive.text());
    if (collection.kind().name == "array")
        enterChannel(place.way, *place.drive.ancestors.back());
    xml::addChild(*place.way.back(), hardDrive, *place.drive.node);
    showWorstOutwards(place.way);
}

void leave(Document& document, const Path& drive, const Path& collection) {
    const Membership place = membership(document.edit(), drive, collection);
    if (place.listing.node == nullptr)
        throw EditError(collection.text() + " does not list " + drive.text());
    xml::Tree& list = *place.listing.ancestors.back();
    list.erase(std::ranges::find_if(
        list, [&](const auto& child) { return &child.second == place.listing.node; }));
    showWorstOutwards(place.listing.ancestors);
}

}  // namespace raidsim
