#pragma once

#include <chrono>
#include <filesystem>
#include <optional>
#include <string>
#include <variant>
#include <vector>

#include "inventory/kinds.h"
#include "listing/column_choice.h"
#include "listing/filter.h"
#include "presentation/terminal.h"

namespace raidinfo {

using Path = std::filesystem::path;

struct ListOptions {
    const Kind* kind = nullptr;  ///< null: every list
    std::optional<ColumnChoice> columns = std::nullopt;
    std::vector<Filter> filters = {};
    bool headings = true;
};

struct ShowOptions {
    const Kind* kind = nullptr;
    int position = 0;
};

struct TreeOptions {
    bool logical = false;
};

struct EventsOptions {
    std::optional<int> since = std::nullopt;  ///< the first number to show
    std::optional<int> count = std::nullopt;  ///< how many to show
    std::string command = {};                 ///< run for each event
    std::optional<Path> state = std::nullopt;
    std::chrono::seconds interval{30};
};

struct WatchOptions {
    std::chrono::seconds interval{5};
};

struct HealthOptions {
    bool explain = false;
    bool nagios = false;
    std::optional<Path> policy = std::nullopt;
};

struct SnapshotOptions {
    Path file;
};

struct DiffOptions {
    std::string before;
    std::string after;
};

struct RecordOptions {
    Path file;
    bool redact = false;
    std::optional<std::chrono::seconds> duration = std::nullopt;
};

struct DoctorOptions {};
struct CompletionOptions {};
struct SchemaOptions {};

/// In the order in which the help lists the subcommands.
using CommandOptions = std::variant<ListOptions, ShowOptions, TreeOptions, EventsOptions,
                                    WatchOptions, HealthOptions, SnapshotOptions, DiffOptions,
                                    RecordOptions, DoctorOptions, CompletionOptions, SchemaOptions>;

struct Options {
    CommandOptions command = {};
    bool json = false;
    ColorChoice color = ColorChoice::automatic;
    std::optional<Path> library = std::nullopt;
    std::optional<Path> recording = std::nullopt;  ///< to read instead of the service
    std::optional<Path> codes = std::nullopt;
    std::optional<std::chrono::milliseconds> limit = std::nullopt;  ///< of the wait for an answer
};

/// A text that was asked for instead of a command: help or the version.
struct Information {
    std::string text;
};

/// Reads the command line; a wrong one is a usage Failure.
[[nodiscard]] std::variant<Options, Information> parseOptions(int argc, const char* const* argv);

/// The completion of the command line for bash, as a script to source.
[[nodiscard]] std::string bashCompletion();

}  // namespace raidinfo
