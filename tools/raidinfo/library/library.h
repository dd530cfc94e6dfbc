#pragma once

#include <filesystem>
#include <memory>
#include <optional>

namespace raidinfo {

/// The library asks for the events of so many numbers at once.
constexpr int numbersAsked = 101;

/// The loaded libRAIDInstrumentation, unloaded with its last copy. The program calls it only
/// through the exported names looked up here; of the library's sources it has compiled in the
/// classes of the model, whose getters are inline, and what it takes to ask the service, to read
/// the settings and to know blanks as the library does.
class Library {
public:
    /// Loads `path`; without one the library beside this program, else the installed one.
    explicit Library(const std::optional<std::filesystem::path>& path);

    /// The exported function `name`, called as `int(int)` and the like. A library without it is
    /// reported as unusable.
    template <typename Signature>
    [[nodiscard]] Signature* function(const char* name) const {
        // NOLINTNEXTLINE(cppcoreguidelines-pro-type-reinterpret-cast): what dlsym is made for
        return reinterpret_cast<Signature*>(address(name));
    }

    /// The exported variable `name`.
    template <typename T>
    [[nodiscard]] T* variable(const char* name) const {
        return static_cast<T*>(address(name));
    }

private:
    [[nodiscard]] void* address(const char* name) const;

    std::shared_ptr<void> handle;
};

}  // namespace raidinfo
