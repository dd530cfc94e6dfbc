// Lets one exchange receive an answer in any pieces, with silences, signals, resets and a
// cancellation in between, and compares the body with a plain reading of the same bytes.
//
// The input is a list of lines: "piece N" and the next N bytes of what stands behind the first
// empty line, "silence", "signal", "reset", "disconnect". What is left of the bytes is one last
// piece.

#include <algorithm>
#include <charconv>
#include <cstdio>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "RAIDInstrumentation.h"
#include "agent/document.h"
#include "agent/exchange.h"
#include "support/input.h"
#include "support/require.h"
#include "support/scripted_stream.h"

namespace {

using namespace raid;
using fuzz::Happening;
using Kind = Happening::Kind;

constexpr std::size_t mostAnnounced = 1U << 20U;  // more is slow under the sanitizers

std::optional<Kind> kindOf(std::string_view line) {
    if (line == "silence") {
        return Kind::silence;
    }
    if (line == "signal") {
        return Kind::signal;
    }
    if (line == "reset") {
        return Kind::reset;
    }
    return line == "disconnect" ? std::optional(Kind::disconnect) : std::nullopt;
}

std::string takeFront(std::string_view& bytes, std::size_t count) {
    const std::string front(bytes.substr(0, count));
    bytes.remove_prefix(front.size());
    return front;
}

std::vector<Happening> parse(std::string_view input) {
    std::vector<Happening> script;
    const auto blank = std::min(input.find("\n\n"), input.size());
    std::string_view lines = input.substr(0, blank);
    std::string_view bytes = input.substr(std::min(blank + 2, input.size()));
    while (!lines.empty()) {
        const std::string line = takeFront(lines, std::min(lines.find('\n'), lines.size()));
        lines.remove_prefix(lines.empty() ? 0 : 1);
        std::size_t size = 0;
        if (line.starts_with("piece ")) {
            std::from_chars(line.data() + 6, line.data() + line.size(), size);
            script.push_back({Kind::piece, takeFront(bytes, size)});
        } else if (const auto kind = kindOf(line)) {
            script.push_back({*kind});
        }
    }
    script.push_back({Kind::piece, std::string(bytes)});
    std::erase_if(script,
                  [](const Happening& h) { return h.kind == Kind::piece && h.bytes.empty(); });
    return script;
}

/// The receives of an exchange, as the script lets them come.
class Receives {
public:
    explicit Receives(std::vector<Happening> played) : script(std::move(played)) {}

    /// Passes what is no data; false when the exchange is told to give up meanwhile.
    bool wait() {
        while (at < script.size() && script[at].kind != Kind::piece &&
               script[at].kind != Kind::reset) {
            disconnected = disconnected || script[at].kind == Kind::disconnect;
            ++at;
            if (disconnected) {
                return false;
            }
        }
        return true;
    }

    /// At most size bytes; empty at the end and for a reset.
    std::string receive(std::size_t size) {
        if (at == script.size() || script[at].kind == Kind::reset) {
            at += at == script.size() ? 0 : 1;
            return {};
        }
        std::string& piece = script[at].bytes;
        const auto taken = piece.substr(0, size);
        piece.erase(0, taken.size());
        at += piece.empty() ? 1 : 0;
        return taken;
    }

private:
    std::vector<Happening> script;
    std::size_t at = 0;
    bool disconnected = false;
};

struct Expected {
    std::optional<std::string> body;
    bool leavesOpen = false;
};

std::optional<std::size_t> announcedIn(std::string_view header) {
    constexpr std::string_view name = "Content-Length: ";
    const auto found = header.find(name);
    if (found == std::string_view::npos) {
        return std::nullopt;
    }
    std::string digits;
    for (const char c : header.substr(found + name.size())) {
        if (c < '0' || c > '9') {
            break;
        }
        digits += c;
    }
    return digits.empty() || digits.size() >= 10 ? 0 : std::stoul(digits);
}

Expected expectedOf(Receives receives) {
    if (!receives.wait()) {
        return {std::nullopt, true};
    }
    const std::string first = receives.receive(3023);
    const std::string header = first.substr(0, first.find('\0'));
    const auto length = announcedIn(header);
    if (!length) {
        return {};
    }
    const auto end = header.find("\n\n");
    if (end == std::string::npos) {
        return {""};
    }
    std::string body = first.substr(end + 2, *length);
    while (body.size() < *length) {
        if (!receives.wait()) {
            return {};
        }
        const auto more = receives.receive(*length - body.size());
        if (more.empty()) {
            break;
        }
        body += more;
    }
    return {body};
}

std::size_t mostAnnouncedIn(const std::vector<Happening>& script) {
    std::string all;
    for (const auto& happening : script) {
        all += happening.bytes;
    }
    std::replace(all.begin(), all.end(), '\0', ' ');
    return announcedIn(all).value_or(0);
}

}  // namespace

int LLVMFuzzerInitialize(int* /*argc*/, char*** /*argv*/) {
    configRead = 1;
    // Every exchange prints a line there.
    return std::freopen("/dev/null", "w", stdout) != nullptr ? 0 : 1;
}

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto script = parse(fuzz::textOf(data, size));
    if (mostAnnouncedIn(script) > mostAnnounced) {
        return -1;
    }
    const auto expected = expectedOf(Receives(script));
    fuzz::play(script);
    const agent::Document body(getSOAPData("GET / HTTP/1.1\r\n\r\n"));
    fuzz::require(fuzz::isClosed() != expected.leavesOpen, "only a cancelled wait leaves it open");
    fuzz::require((body != nullptr) == expected.body.has_value(), "whether there is a body");
    if (body) {
        fuzz::require(std::equal(expected.body->c_str(),
                                 expected.body->c_str() + expected.body->size() + 1, body.get()),
                      "the body and the zero byte behind it");
    }
    return 0;
}
