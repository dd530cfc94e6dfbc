#include "diag/debug.h"

#include <fcntl.h>

#include <algorithm>
#include <array>
#include <cstdarg>
#include <cstdio>
#include <memory>
#include <string>

#include "base/defer_cancellation.h"
#include "base/file_descriptor.h"
#include "base/repeat_on_signal.h"
#include "diag/log.h"
#include "diag/message_format.h"

namespace {

struct CloseFile {
    void operator()(std::FILE* file) const noexcept { std::fclose(file); }
};
using File = std::unique_ptr<std::FILE, CloseFile>;

/// Opened anew for every message, so that the log can be moved or removed under a running host.
/// O_NONBLOCK matters for a pipe only: one that nobody reads would otherwise hold the host up.
File openLog() noexcept {
    constexpr int mode = O_RDWR | O_CREAT | O_APPEND | O_CLOEXEC | O_NONBLOCK;
    constexpr mode_t everybody = 0666;  // less what the host's mask takes
    raid::base::FileDescriptor descriptor(raid::base::repeatOnSignal(
        [] { return ::open("../logs/RAIDInstrumentation.log", mode, everybody); }));
    File log(descriptor.get() < 0 ? nullptr : ::fdopen(descriptor.get(), "a+"));
    if (log) {
        descriptor.release();
    }
    return log;
}

void append(const char* message) {
    const raid::base::DeferCancellation deferred;
    if (const File log = openLog()) {
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
    const auto size = static_cast<std::size_t>(
        std::max(std::vsnprintf(line.data(), line.size(), format, arguments), 0));
    va_end(arguments);
    if (size < line.size()) {
        debug(level, line.data());
        return;
    }
    // Names and texts of the service's documents have any length.
    std::string message(size, '\0');
    va_start(arguments, format);
    std::vsnprintf(message.data(), size + 1, format, arguments);
    va_end(arguments);
    debug(level, message.c_str());
}

}  // namespace raid::diag
