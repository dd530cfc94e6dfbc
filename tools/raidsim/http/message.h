#pragma once

#include <string>
#include <string_view>
#include <variant>

namespace raidsim::http {

struct Request {
    std::string method;
    std::string target;
    std::string body;
};

// A request that is answered with an error status.
struct Refusal {
    int status;
    std::string reason;
};

struct Incomplete {};

using Parsed = std::variant<Incomplete, Request, Refusal>;

// Looks at what has arrived so far. Lines end in LF or CR LF; whatever follows the protocol
// version on the request line is ignored, because the service's clients put a header there.
[[nodiscard]] Parsed parse(std::string_view received);

struct Answer {
    int status;
    std::string body;
};

// The header of an answer: bare LF line ends, "Content-Length: " with a space, as clients search
// for them.
[[nodiscard]] std::string header(int status, std::string_view length);

// The bytes of an answer.
[[nodiscard]] std::string format(const Answer& answer);

// The same bytes carrying a SOAP fault.
[[nodiscard]] Answer fault(const Refusal& refusal);

}  // namespace raidsim::http
