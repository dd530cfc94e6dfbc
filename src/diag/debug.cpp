#include "diag/debug.h"

#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cstdarg>
#include <cstdio>
#include <memory>
#include <string>
#include <string_view>

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
raid::base::FileDescriptor openLog() noexcept {
    constexpr int mode = O_RDWR | O_CREAT | O_APPEND | O_CLOEXEC;
    constexpr mode_t everybody = 0666;  // less what the host's mask takes
    return raid::base::FileDescriptor(raid::base::repeatOnSignal(
        [] { return ::open("../logs/RAIDInstrumentation.log", mode, everybody); }));
}

/// The write function of a stream that stands for a descriptor. The stream of an opened file gives
/// up at a signal and loses the rest of the message where the log is a pipe or a terminal.
ssize_t writeWhole(void* descriptor, const char* bytes, std::size_t size) noexcept {
    const int log = static_cast<const raid::base::FileDescriptor*>(descriptor)->get();
    std::string_view rest(bytes, size);
    while (!rest.empty()) {
        const auto count =
            raid::base::repeatOnSignal([&] { return ::write(log, rest.data(), rest.size()); });
        if (count <= 0) {
            break;
        }
        rest.remove_prefix(static_cast<std::size_t>(count));
    }
    return static_cast<ssize_t>(size - rest.size());
}

void append(const char* message) {
    const raid::base::DeferCancellation deferred;
    auto log = openLog();
    if (log.get() < 0) {
        return;
    }
    const File stream(::fopencookie(&log, "a", {nullptr, writeWhole, nullptr, nullptr}));
    if (stream) {
        raid::diag::printWithZeros(stream.get(), message);
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
