#include "system/timestamp.h"

#include <charconv>
#include <chrono>
#include <cstdint>
#include <cstdlib>
#include <string_view>

namespace raidinfo {
namespace {

std::chrono::sys_seconds present() {
    using std::chrono::seconds;
    using std::chrono::sys_seconds;
    // The program changes no environment, whatever its threads.
    // NOLINTNEXTLINE(concurrency-mt-unsafe)
    if (const char* const fixed = std::getenv("SOURCE_DATE_EPOCH"); fixed != nullptr) {
        const std::string_view digits{fixed};
        std::uint32_t since = 0;
        const char* const end = digits.data() + digits.size();
        if (const auto [stop, error] = std::from_chars(digits.data(), end, since);
            error == std::errc{} && stop == end) {
            return sys_seconds{seconds{since}};
        }
    }
    return std::chrono::floor<seconds>(std::chrono::system_clock::now());
}

std::string twoDigits(std::int64_t number) {
    return (number < 10 ? "0" : "") + std::to_string(number);
}

}  // namespace

std::string presentTimestamp() {
    const std::chrono::sys_seconds time = present();
    const auto day = std::chrono::floor<std::chrono::days>(time);
    const std::chrono::year_month_day date{day};
    const std::chrono::hh_mm_ss clock{time - day};
    return std::to_string(static_cast<int>(date.year())) + "-" +
           twoDigits(static_cast<unsigned>(date.month())) + "-" +
           twoDigits(static_cast<unsigned>(date.day())) + "T" + twoDigits(clock.hours().count()) +
           ":" + twoDigits(clock.minutes().count()) + ":" + twoDigits(clock.seconds().count()) +
           "Z";
}

}  // namespace raidinfo
