#include "agent/exchange.h"

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <optional>
#include <span>
#include <string_view>

#include "RAIDInstrumentation.h"
#include "agent/document.h"
#include "agent/first_chunk.h"
#include "agent/requests.h"
#include "base/decimal.h"
#include "base/defer_cancellation.h"
#include "base/shared_value.h"
#include "base/stream_socket.h"
#include "diag/log.h"

unsigned char endFlag = 0;

namespace raid::agent {
namespace {

constexpr const char* serviceAddress = "127.0.0.1";
constexpr std::uint16_t servicePort = 34572;
constexpr std::chrono::seconds waitSlice{5};
constexpr std::size_t spareBytes = 10;

using diag::agentLinkLevel;
using diag::log;

/// The result of the connect, which is an error when the exchange was told to give up. A service
/// that hangs accepts nobody, and its queue is full sooner or later.
int connectTo(const base::StreamSocket& socket) {
    auto rc = socket.connect(serviceAddress, servicePort, waitSlice);
    while (!rc) {
        if (base::load(endFlag) != 0) {
            return -1;
        }
        rc = socket.waitConnected(waitSlice);
    }
    return *rc;
}

/// False when the exchange was told to give up; there is no other limit.
bool waitForData(const base::StreamSocket& socket) {
    while (socket.waitReadable(waitSlice) <= 0) {
        if (base::load(endFlag) != 0) {
            return false;
        }
    }
    return true;
}

/// The announced length. A run of ten digits or more is no length: it counts as 0, unlogged.
std::size_t contentLength(std::string_view digits) {
    if (digits.size() >= 10) {
        return 0;
    }
    const int length = base::decimalNumber(digits);
    log(agentLinkLevel, "Content_Length: %d\n", length);
    return static_cast<std::size_t>(length);
}

/// Receives until the body is whole or the service stops sending; returns the bytes it holds, or
/// nothing when the exchange was told to give up.
std::optional<std::size_t> receiveRest(const base::StreamSocket& socket, std::span<char> body,
                                       std::size_t held) {
    while (held < body.size()) {
        // A service that sends a little now and then must not outlast a cancel.
        if (base::load(endFlag) != 0 || !waitForData(socket)) {
            return std::nullopt;
        }
        const auto count = socket.receive(body.subspan(held));
        log(agentLinkLevel, "Data received %d\n", static_cast<int>(count));
        if (count <= 0) {
            break;
        }
        held += static_cast<std::size_t>(count);
    }
    return held;
}

Document receiveBody(const base::StreamSocket& socket, const FirstChunk& chunk) {
    const auto digits = chunk.lengthDigits();
    if (!digits) {
        return nullptr;
    }
    const auto length = contentLength(*digits);
    Document document(static_cast<char*>(std::malloc(length + spareBytes)));
    if (!document) {
        return nullptr;
    }
    document.get()[0] = '\0';
    const auto first = chunk.body();
    if (!first) {
        return document;
    }
    const std::span body(document.get(), length);
    const auto kept = first->first(std::min(first->size(), length));
    std::ranges::copy(kept, body.begin());
    // Of what came too much nothing is kept, but the log counts it.
    log(agentLinkLevel, "remaining data: %d\n",
        static_cast<int>(length) - static_cast<int>(first->size()));
    const auto held = receiveRest(socket, body, kept.size());
    if (!held) {
        return nullptr;
    }
    document.get()[*held] = '\0';
    return document;
}

Document exchange(const char* request) {
    const base::DeferCancellation deferred;
    base::store(endFlag, static_cast<unsigned char>(0));
    debug(agentLinkLevel, "RAIDCommunication\n");

    base::StreamSocket socket;
    log(agentLinkLevel, "Socket handle=%d\n", socket.handle());
    const int rc = connectTo(socket);
    log(agentLinkLevel, "Connect rc=%d\n", rc);
    if (rc < 0) {
        return nullptr;
    }

    const auto sent = static_cast<int>(socket.send(request));
    log(agentLinkLevel, "Send size=%d\n", sent);
    debug(agentLinkLevel, request);
    // Hosts know this line on their standard output. The set of descriptors that it speaks of
    // holds the socket always.
    std::printf("sent size %d, FD isset %d\n", sent, 1);

    debug(agentLinkLevel, "Waiting for data\n");
    if (!waitForData(socket)) {
        // A cancelled wait leaves its connection to the service open.
        socket.abandon();
        return nullptr;
    }
    debug(diag::errorLevel, "Data are available\n");

    FirstChunk chunk;
    const auto count = socket.receive(chunk.space());
    chunk.received(count);
    log(agentLinkLevel, "Data received %d\n", static_cast<int>(count));
    debug(agentLinkLevel, chunk.text());
    auto document = receiveBody(socket, chunk);
    socket.close();
    debug(agentLinkLevel, "Return from getSOPEData\n");
    return document;
}

}  // namespace
}  // namespace raid::agent

char* getSOAPData(const char* request) { return raid::agent::exchange(request).release(); }

char* getSOAPData(int which) {
    return getSOAPData(which == 0 ? raid::agent::configurationRequest
                                  : raid::agent::eventListRequest);
}

void disconnectSocket() { raid::base::store(endFlag, static_cast<unsigned char>(1)); }
