#pragma once

#include <stdexcept>
#include <string>

#include "file_kind.h"
#include "files.h"

namespace raidsim {

enum class ExitStatus {
    ok = 0,
    usage = 64,
    badInput = 65,
    noInput = 66,
    cannotListen = 69,
    internal = 70,
    cannotWrite = 74
};

// Why the program could not start.
class StartError : public std::runtime_error {
public:
    StartError(ExitStatus why, const std::string& message)
        : std::runtime_error(message), exitStatus(why) {}
    [[nodiscard]] ExitStatus status() const noexcept { return exitStatus; }

private:
    ExitStatus exitStatus;
};

// Does something with a file of that kind. Its errors become StartErrors that name the file; a
// FileError means that it cannot be read, any other that it is not understood.
template <typename Action>
auto loading(const std::string& path, FileKind kind, Action action) {
    const auto complaint = [&](const std::runtime_error& error) {
        return path + ": " + error.what() + hintFor(path, kind);
    };
    try {
        return action();
    } catch (const FileError& error) {
        throw StartError(ExitStatus::noInput, complaint(error));
    } catch (const std::runtime_error& error) {
        throw StartError(ExitStatus::badInput, complaint(error));
    }
}

}  // namespace raidsim
