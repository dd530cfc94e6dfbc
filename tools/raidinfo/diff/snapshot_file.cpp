#include "diff/snapshot_file.h"

#include <algorithm>
#include <array>
#include <string>
#include <utility>

#include "diff/entries.h"
#include "inventory/tree.h"
#include "schema_version.h"
#include "text/printable.h"

namespace raidinfo::diff {
namespace {

/// The service's arrays nest 256 deep at most, with a record and a list each. The bound keeps what
/// walks through a tree off the end of the stack.
constexpr int deepestNesting = 1024;

Json parsed(std::string_view text) {
    const auto bounded = [](int depth, Json::parse_event_t /*event*/, const Json& /*value*/) {
        if (depth > deepestNesting) {
            throw SnapshotError{"not a snapshot: it is nested too deep"};
        }
        return true;
    };
    try {
        return Json::parse(text, bounded);
    } catch (const Json::parse_error& error) {
        throw SnapshotError{"not a snapshot: no JSON at byte " + std::to_string(error.byte)};
    } catch (const Json::exception&) {
        throw SnapshotError{"not a snapshot: it holds a number that is too large"};
    }
}

/// Of 1, "1" or "1.2" the first number counts.
void requireVersion(const Json& version) {
    const std::string text = version.is_string() ? version.get<std::string>() : version.dump();
    const std::string_view major = majorVersion(text);
    constexpr std::string_view expected = majorVersion(schemaVersion);
    if (major != expected) {
        throw SnapshotError{"a snapshot of schema version " + printable(major) +
                            ", where only version " + std::string{expected} + " is understood"};
    }
}

/// The message of the first error in the envelope; empty where there is none.
std::string firstError(const Json& file) {
    const auto errors = file.find("errors");
    if (errors == file.end() || !errors->is_array() || errors->empty() ||
        !errors->front().is_object()) {
        return {};
    }
    const auto message = errors->front().find("message");
    return message != errors->front().end() && message->is_string()
               ? printable(message->get<std::string>())
               : std::string{};
}

void requireComplete(const Json& file) {
    if (file["complete"] != true) {
        const std::string error = firstError(file);
        throw SnapshotError{"the snapshot is not complete" + (error.empty() ? "" : ": " + error)};
    }
}

/// The logical view repeats drives and leaves out the channels.
void requirePhysical(const Json& data) {
    const Json none = Json::array();
    const bool isLogical = std::ranges::any_of(
        data.is_object() ? data.value(std::string{adaptersKey}, none) : none,
        [](const Json& adapter) { return adapter.is_object() && adapter.contains(hotSparesKey); });
    if (isLogical) {
        throw SnapshotError{"not a snapshot: it is the logical view of one"};
    }
}

}  // namespace

Json snapshotData(std::string_view fileText) {
    Json file = parsed(fileText);
    for (const char* const key : std::to_array({"schema_version", "complete", "data"})) {
        if (!file.is_object() || !file.contains(key)) {
            throw SnapshotError{"not a snapshot: it has no \"" + std::string{key} + "\""};
        }
    }
    requireVersion(file["schema_version"]);
    requireComplete(file);
    Json data = std::move(file["data"]);
    requirePhysical(data);
    [[maybe_unused]] const Entries accepted{data};
    return data;
}

}  // namespace raidinfo::diff
