#include "state/path.h"

#include <algorithm>
#include <array>

#include "text.h"

namespace raidsim {

namespace {

constexpr std::string_view onChannels = "ac:physicalDrives";

constexpr std::array<Kind, 16> kinds{{
    {"system", "ac:system", ""},
    {"adapter", "ac:adapter", "as:adapterID", true},
    {"channel", "ac:channel", "as:channelID", false, onChannels, 3},
    {"drive", "ac:hardDrive", "as:deviceID", true, onChannels, 4, "channel"},
    {"enclosure", "ac:enclosure", "as:deviceID", false, onChannels, 4, "channel"},
    {"fan", "ac:fan", "as:index", false, onChannels, 5, "enclosure"},
    {"supply", "ac:powerSupply", "as:index", false, onChannels, 5, "enclosure"},
    {"sensor", "ac:tempSensor", "as:index", false, onChannels, 5, "enclosure"},
    {"slot", "ac:deviceSlotID", "as:index", false, onChannels, 5, "enclosure"},
    {"array", "ac:basicArray", "as:arrayID"},
    {"spanned", "ac:spannedArray", "as:arrayID"},
    {"logical", "ac:logicalDrive", "as:logicalDriveID", true, "ac:logicalDrives", 3, "adapter"},
    {"arrays", "ac:arrays", ""},
    {"logicals", "ac:logicalDrives", ""},
    {"physicals", "ac:physicalDrives", ""},
    {"spares", "ac:hotSpareDrives", ""},
}};

Path::Step parseStep(std::string_view text) {
    const auto colon = text.find(':');
    const std::string_view name = text.substr(0, colon);
    const auto kind = std::ranges::find(kinds, name, &Kind::name);
    if (kind == kinds.end())
        throw PathError("there is no kind of object \"" + std::string(name) + "\"");
    const bool numbered = colon != std::string_view::npos;
    if (numbered == kind->idField.empty()) {
        throw PathError("\"" + std::string(name) + "\" " +
                        (numbered ? "takes no number" : "needs a number"));
    }
    const std::string_view id = numbered ? text.substr(colon + 1) : std::string_view();
    if (numbered && id != "*" && !parseInt(id))
        throw PathError("\"" + std::string(id) + "\" is not a number");
    return {&*kind, std::string(id)};
}

class Finder {
public:
    explicit Finder(const Path& wanted) : path(wanted) {}

    void visit(const std::string& name, xml::Tree& node) {
        names.push_back(name);
        if (matches(node))
            found.push_back({&node, ancestors});
        ancestors.push_back(&node);
        for (auto& [childName, child] : node) {
            if (childName.starts_with("ac:"))
                visit(childName, child);
        }
        ancestors.pop_back();
        names.pop_back();
    }

    std::vector<Match> found;

private:
    static bool is(const Path::Step& step, const std::string& name, const xml::Tree& node) {
        return name == step.kind->element && hasId(step, node);
    }

    static bool hasId(const Path::Step& step, const xml::Tree& node) {
        return step.kind->idField.empty() || step.id == "*" ||
               xml::textOf(node, std::string(step.kind->idField)) == step.id;
    }

    // A hot spare, or a member listed directly in its array, stands below no channel: there the
    // object's own field tells.
    static bool saysOfItself(const Path::Step& step, const xml::Tree& node) {
        const bool refers = step.kind->name == "channel" || step.kind->name == "adapter";
        return refers && xml::childOf(node, std::string(step.kind->idField)) != nullptr &&
               hasId(step, node);
    }

    [[nodiscard]] bool liesBelow(const Path::Step& step, const xml::Tree& node) const {
        for (std::size_t i = 0; i < ancestors.size(); ++i) {
            if (is(step, names[i], *ancestors[i]))
                return true;
        }
        return saysOfItself(step, node);
    }

    [[nodiscard]] bool matches(const xml::Tree& node) const {
        const auto& steps = path.steps();
        return is(steps.back(), names.back(), node) &&
               std::all_of(steps.begin(), steps.end() - 1,
                           [&](const Path::Step& step) { return liesBelow(step, node); });
    }

    const Path& path;
    std::vector<std::string> names;
    std::vector<xml::Tree*> ancestors;
};

}  // namespace

Path Path::parse(std::string_view text) {
    Path path;
    path.written = text;
    for (const std::string_view step : split(text, '/'))
        path.list.push_back(parseStep(step));
    return path;
}

std::optional<Path> Path::parent() const {
    if (list.size() == 1)
        return std::nullopt;
    return parse(std::string_view(written).substr(0, written.rfind('/')));
}

std::vector<Match> findAll(xml::Tree& system, const Path& path) {
    Finder finder(path);
    finder.visit("ac:system", system);
    return std::move(finder.found);
}

}  // namespace raidsim
