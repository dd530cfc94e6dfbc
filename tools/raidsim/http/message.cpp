#include "http/message.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <optional>
#include <utility>
#include <vector>

#include "bounds.h"
#include "soap/envelope.h"
#include "text.h"

namespace raidsim::http {

namespace {

constexpr std::array<std::pair<int, std::string_view>, 11> reasons{{
    {200, "OK"},
    {400, "Bad Request"},
    {404, "Not Found"},
    {405, "Method Not Allowed"},
    {408, "Request Timeout"},
    {411, "Length Required"},
    {413, "Content Too Large"},
    {431, "Request Header Fields Too Large"},
    {500, "Internal Server Error"},
    {501, "Not Implemented"},
    {503, "Service Unavailable"},
}};

std::string_view reasonOf(int status) {
    const auto found = std::ranges::find(reasons, status, &std::pair<int, std::string_view>::first);
    return found == reasons.end() ? std::string_view("Unknown") : found->second;
}

struct Split {
    std::string_view header;
    std::string_view rest;
};

std::optional<Split> splitAtBlankLine(std::string_view received) {
    for (auto end = received.find('\n'); end != std::string_view::npos;
         end = received.find('\n', end + 1)) {
        std::string_view rest = received.substr(end + 1);
        if (rest.starts_with('\r'))
            rest.remove_prefix(1);
        if (rest.starts_with('\n'))
            return Split{received.substr(0, end), rest.substr(1)};
    }
    return std::nullopt;
}

std::vector<std::string_view> words(std::string_view line) {
    std::vector<std::string_view> found = split(line, ' ');
    std::erase_if(found, [](std::string_view word) { return word.empty(); });
    return found;
}

std::optional<std::string_view> headerValue(const std::vector<std::string_view>& lines,
                                            std::string_view name) {
    for (const std::string_view line : lines) {
        const auto colon = line.find(':');
        if (colon != std::string_view::npos && equalIgnoringCase(trim(line.substr(0, colon)), name))
            return trim(line.substr(colon + 1));
    }
    return std::nullopt;
}

std::optional<std::size_t> parseLength(std::string_view digits) {
    std::size_t length = 0;
    const char* const end = digits.data() + digits.size();
    const auto [stop, error] = std::from_chars(digits.data(), end, length);
    if (stop != end || error == std::errc::invalid_argument)
        return std::nullopt;
    return error == std::errc::result_out_of_range ? bounds::requestBodyBytes + 1 : length;
}

Parsed withBody(Request request, const std::vector<std::string_view>& lines,
                std::string_view rest) {
    if (headerValue(lines, "Transfer-Encoding"))
        return Refusal{501, "Transfer encodings are not supported"};
    const auto announced = headerValue(lines, "Content-Length");
    if (!announced)
        return Refusal{411, "The request announces no Content-Length"};
    const auto length = parseLength(*announced);
    if (!length)
        return Refusal{400, "The Content-Length is not a number"};
    if (*length > bounds::requestBodyBytes)
        return Refusal{413, "The request is too long"};
    if (rest.size() < *length)
        return Incomplete{};
    request.body = rest.substr(0, *length);
    return request;
}

}  // namespace

Parsed parse(std::string_view received) {
    const std::size_t arrived = received.size();
    received.remove_prefix(std::min(received.find_first_not_of("\r\n"), arrived));
    const auto parts = splitAtBlankLine(received);
    if ((parts ? parts->header.size() : arrived) > bounds::headerBytes)
        return Refusal{431, "The request header is too long"};
    if (!parts)
        return Incomplete{};
    const auto lines = split(parts->header, '\n');
    const auto first = words(trim(lines.front()));
    if (first.size() < 3 || !first[2].starts_with("HTTP/"))
        return Refusal{400, "The request line is malformed"};
    Request request{std::string(first[0]), std::string(first[1]), {}};
    if (request.method == "GET")
        return request;
    if (request.method == "POST")
        return withBody(std::move(request), lines, parts->rest);
    return Refusal{405, "Only GET and POST are supported"};
}

std::string header(int status, std::string_view length) {
    std::string out = "HTTP/1.1 " + std::to_string(status) + ' ';
    out.append(reasonOf(status));
    out.append("\nContent-Type: application/soap+xml; charset=\"utf-8\"\nContent-Length: ");
    return out.append(length).append("\nConnection: close\n\n");
}

std::string format(const Answer& answer) {
    return header(answer.status, std::to_string(answer.body.size())).append(answer.body);
}

Answer fault(const Refusal& refusal) {
    const auto blame = refusal.status < 500 ? soap::Blame::sender : soap::Blame::receiver;
    return {refusal.status, soap::faultBody(blame, refusal.reason)};
}

}  // namespace raidsim::http
