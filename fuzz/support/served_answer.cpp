#include "support/served_answer.h"

#include <algorithm>
#include <cstdlib>
#include <string_view>

namespace raid::fuzz {
namespace {

std::string served;

/// As the exchange makes it: malloc'ed, a zero byte behind it.
char* servedBody() {
    auto* const body = static_cast<char*>(std::malloc(served.size() + 1));
    std::ranges::copy(served, body);
    body[served.size()] = '\0';
    return body;
}

}  // namespace

void serve(std::string body) { served = std::move(body); }

std::string inEnvelope(const std::string& payload, const std::string& response) {
    if (payload.starts_with("<?xml")) {
        return payload;
    }
    return "<?xml version='1.0'?><env:Envelope><env:Body><m:" + response + ">" + payload +
           "</m:" + response + "></env:Body></env:Envelope>";
}

}  // namespace raid::fuzz

// getSOAPData, with a number and with a request text, under the names that the linker gives to what
// is wrapped.
char* exchangeOf(int which) __asm__("__wrap__Z11getSOAPDatai");
char* exchangeOf(const char* request) __asm__("__wrap__Z11getSOAPDataPKc");

char* exchangeOf(int /*which*/) { return raid::fuzz::servedBody(); }
char* exchangeOf(const char* request) {
    const bool waits = std::string_view(request).find("waitNextEvent") != std::string_view::npos;
    return waits ? nullptr : raid::fuzz::servedBody();
}
