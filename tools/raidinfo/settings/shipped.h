#pragma once

#include <filesystem>
#include <string_view>

#include "settings/setting.h"

namespace raidinfo::settings {

/// A file that comes with the program, as it was when the program was built.
struct ShippedFile {
    std::string_view name;
    std::string_view text;
};

extern const ShippedFile shippedCodes;
extern const ShippedFile shippedPolicy;

/// The file as it stands in this folder, where an administrator may have changed it; the one that
/// was compiled in where there is none.
[[nodiscard]] Table shippedDocument(const ShippedFile& file, const std::filesystem::path& folder);

/// The folder of the installed files, as seen from the running program; empty when that cannot tell
/// where it lies.
[[nodiscard]] std::filesystem::path shippedFolder();

}  // namespace raidinfo::settings
