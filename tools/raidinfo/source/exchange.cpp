#include "source/exchange.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <memory>
#include <new>

#include "agent/requests.h"

namespace raidinfo {
namespace {

struct FreeBytes {
    void operator()(char* bytes) const {
        std::free(bytes);  // NOLINT(cppcoreguidelines-no-malloc): the library's is malloc'ed
    }
};

using Bytes = std::unique_ptr<char, FreeBytes>;

int bounded(std::int64_t number) {
    return static_cast<int>(std::min<std::int64_t>(number, std::numeric_limits<int>::max()));
}

}  // namespace

Exchange::Exchange(const Library& library)
    : exchange{library.function<char*(const char*)>("_Z11getSOAPDataPKc")} {}

std::optional<std::string> Exchange::configuration() const {
    return answerTo(raid::agent::configurationRequest);
}

std::optional<std::string> Exchange::newestEvent() const {
    return answerTo(raid::agent::newestEventRequest());
}

std::optional<std::string> Exchange::allEvents() const {
    return answerTo(raid::agent::eventListRequest);
}

std::optional<std::string> Exchange::events(std::int64_t first, std::int64_t last) const {
    return answerTo(raid::agent::eventsRequest(bounded(first), bounded(last)));
}

std::optional<std::string> Exchange::nextEvent(std::int64_t number) const {
    return answerTo(raid::agent::waitNextEventRequest(bounded(number)));
}

std::optional<std::string> Exchange::answerTo(const std::string& request) const {
    const Bytes body{exchange(request.c_str())};
    return body ? std::optional<std::string>{body.get()} : std::nullopt;
}

int newestEventIn(const Library& library, const std::string& body) {
    Bytes copy{strdup(body.c_str())};
    if (!copy) {
        throw std::bad_alloc{};
    }
    // The library frees what it reads.
    return library.function<int(char*, int)>("_Z21processReturnValueXMLPci")(
        copy.release(), static_cast<int>(body.size()));
}

}  // namespace raidinfo
