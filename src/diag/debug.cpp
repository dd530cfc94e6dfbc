#include "diag/debug.h"

#include <algorithm>
#include <array>
#include <cstdarg>
#include <cstdio>
#include <memory>
#include <string>

#include "base/defer_cancellation.h"
#include "diag/log.h"
#include "diag/message_format.h"

namespace {

struct CloseFile {
    void operator()(std::FILE* file) const noexcept { std::fclose(file); }
};

/// Opened anew for every message, so that the log can be moved or removed under a running host.
void append(const char* message) {
    const raid::base::DeferCancellation deferred;
    const std::unique_ptr<std::FILE, CloseFile> log(
        std::fopen("../logs/RAIDInstrumentation.log", "a+e"));
    if (log) {
        raid::diag::printWithZeros(log.get(), message);
    }
}

}  // namespace

void debug(int level, const char* message) {
    if (raid::diag::passes(level)) {
        append(message);
    }
}

namespace raid::diag {

void log(int level, const char* format, ...) {
    if (!passes(level)) {
        return;
    }
    std::array<char, 256> line{};
    std::va_list arguments;
    va_start(arguments, format);
    std::va_list again;
    va_copy(again, arguments);
    const auto size = static_cast<std::size_t>(
        std::max(std::vsnprintf(line.data(), line.size(), format, arguments), 0));
    va_end(arguments);
    if (size < line.size()) {
        debug(level, line.data());
    } else {
        // Names and texts of the service's documents have any length.
        std::string message(size, '\0');
        std::vsnprintf(message.data(), size + 1, format, again);
        debug(level, message.c_str());
    }
    va_end(again);
}

}  // namespace raid::diag
