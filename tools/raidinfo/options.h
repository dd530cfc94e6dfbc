#pragma once

#include <chrono>
#include <cstdint>
#include <filesystem>
#include <optional>
#include <span>
#include <string>
#include <variant>

namespace raidinfo {

enum class Command : std::uint8_t { list, tree, events };

struct Options {
    Command command = Command::list;
    bool json = false;
    std::optional<std::filesystem::path> library = std::nullopt;
    std::optional<std::chrono::milliseconds> limit = std::nullopt;  ///< none for events
};

/// A text that was asked for instead of a command: help or the version.
struct Information {
    std::string text;
};

/// Reads the command line; a wrong one is a usage Failure.
[[nodiscard]] std::variant<Options, Information> parseOptions(int argc, const char* const* argv);

}  // namespace raidinfo
