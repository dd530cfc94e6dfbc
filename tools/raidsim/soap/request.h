#pragma once

#include <stdexcept>
#include <string_view>
#include <variant>

namespace raidsim::soap {

struct GetNewestEvent {};

struct WaitNextEvent {
    int lastRetrieved;
};

struct GetEvents {
    int start;
    int end;
};

using Request = std::variant<GetNewestEvent, WaitNextEvent, GetEvents>;

// What the client got wrong, in words.
class RequestError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Reads the envelope of a POST. Prefixes are the client's own choice; local names count.
// Throws RequestError.
[[nodiscard]] Request decode(std::string_view body);

}  // namespace raidsim::soap
