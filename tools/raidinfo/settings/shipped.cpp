#include "settings/shipped.h"

#include <string>
#include <system_error>

#include "settings/document.h"

namespace raidinfo::settings {

Table shippedDocument(const ShippedFile& file, const std::filesystem::path& folder) {
    const std::filesystem::path path = folder / file.name;
    std::error_code error;
    if (path.is_absolute() && std::filesystem::exists(path, error)) {
        return readDocument(path);
    }
    return parsedDocument(file.text, std::string{file.name});
}

std::filesystem::path shippedFolder() {
    std::error_code unreadable;
    const auto program = std::filesystem::read_symlink("/proc/self/exe", unreadable);
    return unreadable ? ""
                      : (program.parent_path() / RAIDINFO_SHARE_FROM_PROGRAM).lexically_normal();
}

}  // namespace raidinfo::settings
