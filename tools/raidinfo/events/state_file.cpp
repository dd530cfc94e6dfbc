#include "events/state_file.h"

#include <charconv>
#include <string>
#include <system_error>
#include <utility>

#include "exit_status.h"
#include "system/file.h"

namespace raidinfo {

StateFile::StateFile(std::filesystem::path file) : path{std::move(file)} {}

std::optional<std::int64_t> StateFile::read() const {
    std::error_code unknown;
    if (!std::filesystem::exists(path, unknown) && !unknown) {
        return std::nullopt;
    }
    const std::string text = readFile(path);
    std::int64_t number = 0;
    const auto [stop, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error != std::errc{} || std::string_view{stop} != "\n" || number < 0) {
        throw Failure{ExitStatus::badInput,
                      path.string() + " does not hold the number of an event"};
    }
    return number;
}

void StateFile::write(std::int64_t number) const {
    replaceFile(path, std::to_string(number) + "\n");
}

}  // namespace raidinfo
