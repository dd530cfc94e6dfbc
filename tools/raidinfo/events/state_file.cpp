#include "events/state_file.h"

#include <array>
#include <charconv>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>

#include "exit_status.h"
#include "system/file.h"

namespace raidinfo {
namespace {

constexpr int base = 16;  // of the number for the content

}  // namespace

StateFile::StateFile(std::filesystem::path file) : path{std::move(file)} {}

std::optional<LastShown> StateFile::read() const {
    std::error_code unknown;
    if (!std::filesystem::exists(path, unknown) && !unknown) {
        return std::nullopt;
    }
    const std::string text = readFile(path);
    const char* const end = text.data() + text.size();
    LastShown last{-1};
    const auto [behindNumber, noNumber] = std::from_chars(text.data(), end, last.number);
    const char* behind = behindNumber;
    if (behind != end && *behind == ' ') {
        std::uint64_t content = 0;
        const auto [behindContent, noContent] = std::from_chars(behind + 1, end, content, base);
        behind = noContent == std::errc{} ? behindContent : end;
        last.content = content;
    }
    if (noNumber != std::errc{} || std::string_view(behind, end) != "\n" || last.number < 0 ||
        last.number > std::numeric_limits<int>::max()) {
        throw Failure{ExitStatus::badInput,
                      path.string() + " does not hold the number of an event"};
    }
    return last;
}

void StateFile::write(const LastShown& last) const {
    std::string line = std::to_string(last.number);
    if (last.content) {
        std::array<char, 16> digits{};
        const auto end =
            std::to_chars(digits.data(), digits.data() + digits.size(), *last.content, base).ptr;
        line += " " + std::string(digits.data(), end);
    }
    replaceFile(path, line + "\n");
}

void StateFile::tryToWrite() const { checkReplaceable(path); }

}  // namespace raidinfo
