#pragma once

#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>

#include "agent/document.h"

namespace raid::bench {

/// A document that scripts/bench has made.
inline std::string load(const std::filesystem::path& path) {
    std::ifstream in(path, std::ios::binary);
    std::string text(std::istreambuf_iterator<char>(in), {});
    if (!in || text.empty()) {
        throw std::runtime_error(path.string() + ": cannot be read");
    }
    return text;
}

/// As the exchange hands it over: malloc'ed, a zero byte behind it.
inline agent::Document copyOf(const std::string& text) {
    agent::Document copy(static_cast<char*>(std::malloc(text.size() + 1)));
    if (!copy) {
        throw std::bad_alloc();
    }
    std::memcpy(copy.get(), text.c_str(), text.size() + 1);
    return copy;
}

}  // namespace raid::bench
