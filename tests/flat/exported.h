#pragma once

#include <dlfcn.h>

#include <bit>
#include <stdexcept>
#include <string>

namespace raid::test {

// A function of the built library by its name; throws when the library does not export it.
template <class Function>
[[nodiscard]] Function* exported(const std::string& name, void* library = RTLD_DEFAULT) {
    void* const found = dlsym(library, name.c_str());
    if (found == nullptr) {
        throw std::runtime_error("the library does not export " + name);
    }
    return std::bit_cast<Function*>(found);
}

}  // namespace raid::test
