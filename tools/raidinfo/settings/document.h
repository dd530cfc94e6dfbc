#pragma once

#include <cstddef>
#include <filesystem>
#include <string>
#include <string_view>

#include "settings/setting.h"

namespace raidinfo::settings {

/// Far more than a policy or a code book needs, and little enough that no file can take the
/// program's memory, time or stack.
constexpr std::size_t longestDocument = std::size_t{256} * 1024;
constexpr int deepestNesting = 16;
constexpr int mostDotsOfALine = 32;

/// The TOML document in a text; failures name it after the file.
[[nodiscard]] Table parsedDocument(std::string_view text, const std::string& file);

/// The TOML document in a file.
[[nodiscard]] Table readDocument(const std::filesystem::path& path);

}  // namespace raidinfo::settings
