#include "source/exchange.h"

#include <algorithm>
#include <cstdlib>
#include <limits>
#include <memory>

namespace raidinfo {

Exchange::Exchange(const Library& library)
    : exchange{library.function<char*(const char*)>("_Z11getSOAPDataPKc")} {}

std::optional<std::string> Exchange::operator()(const std::string& request) const {
    struct Free {
        void operator()(char* bytes) const {
            std::free(bytes);  // NOLINT(cppcoreguidelines-no-malloc): the library's is malloc'ed
        }
    };
    const std::unique_ptr<char, Free> body{exchange(request.c_str())};
    return body ? std::optional<std::string>{body.get()} : std::nullopt;
}

int boundedNumber(std::int64_t number) noexcept {
    return static_cast<int>(std::min<std::int64_t>(number, std::numeric_limits<int>::max()));
}

}  // namespace raidinfo
