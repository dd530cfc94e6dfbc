#include "library/library.h"

#include <dlfcn.h>

#include <string>
#include <system_error>

#include "exit_status.h"

namespace raidinfo {
namespace {

constexpr auto buildName = "libRAIDInstrumentation.so";
constexpr auto installedName = "libRAIDInstrumentation.so.1";

std::string fileToLoad(const std::optional<std::filesystem::path>& path) {
    if (path) {
        // A name without a slash would be searched for in the system's folders.
        return path->has_parent_path() ? path->string() : "./" + path->string();
    }
    std::error_code unreadable;
    const auto program = std::filesystem::read_symlink("/proc/self/exe", unreadable);
    if (const auto beside = program.parent_path() / buildName;
        !unreadable && std::filesystem::exists(beside, unreadable)) {
        return beside.string();
    }
    return installedName;
}

std::string loaderMessage() {
    const char* const message = dlerror();
    return message == nullptr ? "unknown reason" : message;
}

}  // namespace

Library::Library(const std::optional<std::filesystem::path>& path) {
    void* const opened = dlopen(fileToLoad(path).c_str(), RTLD_NOW | RTLD_LOCAL);
    if (opened == nullptr) {
        throw Failure{ExitStatus::unusableLibrary, "cannot load the library: " + loaderMessage()};
    }
    handle = {opened, [](void* loaded) { dlclose(loaded); }};
}

void* Library::address(const char* name) const {
    void* const found = dlsym(handle.get(), name);
    if (found == nullptr) {
        throw Failure{ExitStatus::unusableLibrary, "the library is unfit: " + loaderMessage()};
    }
    return found;
}

}  // namespace raidinfo
