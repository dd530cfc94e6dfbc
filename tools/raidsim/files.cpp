#include "files.h"

#include <filesystem>
#include <fstream>
#include <system_error>

namespace raidsim {

std::string readFile(const std::string& path, std::size_t most) {
    std::error_code error;
    if (!std::filesystem::is_regular_file(path, error))
        throw FileError(error ? error.message() : std::string("Not a regular file"));
    const auto size = std::filesystem::file_size(path, error);
    if (error)
        throw FileError(error.message());
    if (size > most)
        throw FileError("File too large");
    std::string text(static_cast<std::size_t>(size), '\0');
    std::ifstream in(path, std::ios::binary);
    if (!in.read(text.data(), static_cast<std::streamsize>(text.size())))
        throw FileError("Cannot be read");
    return text;
}

std::string folderOf(const std::string& path) {
    return std::filesystem::path(path).parent_path().string();
}

std::string pathFrom(const std::string& folder, const std::string& path) {
    return (std::filesystem::path(folder) / path).string();
}

}  // namespace raidsim
