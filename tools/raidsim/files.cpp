#include "files.h"

#include <filesystem>
#include <fstream>
#include <system_error>

#include "bounds.h"

namespace raidsim {

std::string readFile(const std::string& path) {
    std::error_code error;
    if (!std::filesystem::is_regular_file(path, error))
        throw FileError(error ? error.message() : std::string("Not a regular file"));
    const auto size = std::filesystem::file_size(path, error);
    if (error)
        throw FileError(error.message());
    if (size > bounds::fileBytes)
        throw FileError("File too large");
    std::string text(static_cast<std::size_t>(size), '\0');
    std::ifstream in(path, std::ios::binary);
    if (!in.read(text.data(), static_cast<std::streamsize>(text.size())))
        throw FileError("Cannot be read");
    return text;
}

}  // namespace raidsim
