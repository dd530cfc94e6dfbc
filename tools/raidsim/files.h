#pragma once

#include <stdexcept>
#include <string>

namespace raidsim {

class FileError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The bytes of a regular file of at most bounds::fileBytes. Throws FileError.
[[nodiscard]] std::string readFile(const std::string& path);

}  // namespace raidsim
