#pragma once

#include <cstddef>
#include <stdexcept>
#include <string>

#include "bounds.h"

namespace raidsim {

class FileError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The bytes of a regular file, which is refused when it is too large. Throws FileError.
[[nodiscard]] std::string readFile(const std::string& path, std::size_t most = bounds::fileBytes);

// The folder that holds a file; empty when the path names none.
[[nodiscard]] std::string folderOf(const std::string& path);

// A path as it is written in a file of that folder.
[[nodiscard]] std::string pathFrom(const std::string& folder, const std::string& path);

}  // namespace raidsim
