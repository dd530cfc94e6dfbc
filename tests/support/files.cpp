#include "support/files.h"

#include <sys/stat.h>

#include <fstream>
#include <iterator>
#include <stdexcept>

#include "support/socket.h"

namespace raid::test {

void writeFile(const std::filesystem::path& path, std::string_view bytes) {
    std::ofstream file(path, std::ios::binary | std::ios::trunc);
    file << bytes << std::flush;
    if (!file) {
        throw std::runtime_error("cannot write " + path.string());
    }
}

void makePipe(const std::filesystem::path& path) {
    throwIfNegative(mkfifo(path.c_str(), 0600), "make the pipe " + path.string());
}

std::string readFile(const std::filesystem::path& path) {
    std::ifstream file(path, std::ios::binary);
    if (!file) {
        throw std::runtime_error("cannot read " + path.string());
    }
    return {std::istreambuf_iterator<char>(file), {}};
}

void writeLogLevel(int level) {
    writeFile(settingsPath, "LogLevel=" + std::to_string(level) + "\n");
}

std::string readLog() { return std::filesystem::exists(logPath) ? readFile(logPath) : ""; }

}  // namespace raid::test
