#include "doctor/examination.h"

#include <arpa/inet.h>
#include <dlfcn.h>
#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>

#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <optional>
#include <system_error>
#include <vector>

#include "doctor/answers.h"
#include "doctor/settings_and_log.h"
#include "inventory/kinds.h"
#include "source/service_address.h"
#include "system/alarm.h"
#include "system/descriptor.h"
#include "text/enumerated.h"

namespace raidinfo {
namespace {

namespace fs = std::filesystem;
using Outcome = Examined::Outcome;
using Clock = std::chrono::steady_clock;
using Limit = std::optional<std::chrono::milliseconds>;

constexpr int bitsOfAByte = 8;

Examined loadedFile(const Library& library) {
    Dl_info information{};
    const std::string width = std::to_string(sizeof(void*) * bitsOfAByte) + " bits";
    const bool known = dladdr(library.variable<int>("LOG_LEVEL"), &information) != 0 &&
                       information.dli_fname != nullptr;
    std::error_code unknown;
    const fs::path file = known ? fs::canonical(information.dli_fname, unknown) : fs::path{};
    return {"library", "Library", Outcome::fine,
            (known && !unknown ? file.string() : "an unknown file") + ", " + width};
}

/// Waits for the connection that the socket has begun; returns what went wrong, or 0.
int connectionError(const Descriptor& socket, const Limit& limit) {
    pollfd watched{socket.get(), POLLOUT, 0};
    const int ready = poll(&watched, 1, limit ? static_cast<int>(limit->count()) : -1);
    if (ready <= 0) {
        return ready == 0 ? ETIMEDOUT : errno;
    }
    int error = 0;
    socklen_t size = sizeof error;
    return getsockopt(socket.get(), SOL_SOCKET, SO_ERROR, &error, &size) == 0 ? error : errno;
}

/// A service whose queue of connections is full neither accepts nor refuses one.
Examined listening(const Limit& limit) {
    const Descriptor probe{socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0),
                           "cannot make a socket"};
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_port = htons(ServiceAddress::port);
    inet_pton(AF_INET, ServiceAddress::host, &address.sin_addr);
    // NOLINTNEXTLINE(cppcoreguidelines-pro-type-reinterpret-cast): how sockets take addresses
    const auto* const target = reinterpret_cast<const sockaddr*>(&address);
    int error = connect(probe.get(), target, sizeof address) == 0 ? 0 : errno;
    if (error == EINPROGRESS) {
        error = connectionError(probe, limit);
    }
    if (error == 0) {
        return {"listening", "Service listens", Outcome::fine, ServiceAddress::inWords()};
    }
    return {
        "listening", "Service listens", Outcome::bad,
        "nothing on " + ServiceAddress::inWords() + ": " + std::generic_category().message(error),
        ExitStatus::serviceUnavailable};
}

Examined published(const Library& library) {
    std::vector<std::string> counts;
    int adapters = 0;
    for (const Kind& kind : inventoryKinds()) {
        const int count = library.function<int()>(kind.count)();
        adapters += std::ranges::find(adapterKinds, kind.id) != adapterKinds.end() ? count : 0;
        if (count > 0) {
            counts.push_back(std::to_string(count) + " " + std::string{kind.key});
        }
    }
    return {
        "published", "Lists", adapters > 0 ? Outcome::fine : Outcome::noteworthy,
        (adapters > 0 ? "" : "no adapter; ") + (counts.empty() ? "all empty" : enumerated(counts))};
}

}  // namespace

void examine(const Library& library, std::optional<std::chrono::milliseconds> limit,
             const std::function<void(const Examined&)>& tell) {
    const auto isGone = [&tell](const Examined& found) {
        tell(found);
        return found.status == ExitStatus::serviceUnavailable;
    };
    tell(loadedFile(library));
    readSettings(library);
    tell(examinedSettings(library));
    tell(examinedLog(library));
    const auto begun = Clock::now();
    if (isGone(listening(limit))) {
        return;
    }
    const auto passed = std::chrono::floor<std::chrono::milliseconds>(Clock::now() - begun);
    const Limit left = limit ? Limit{std::max(*limit - passed, Limit::value_type{1})} : limit;
    const Alarm alarm{left, library.function<void()>("cancelGetEvent")};
    if (isGone(examinedNewestEvent(library, alarm.over()))) {
        return;
    }
    const Examined configuration = examinedConfiguration(library, alarm.over());
    if (isGone(configuration)) {
        return;
    }
    if (configuration.outcome == Outcome::fine) {
        tell(published(library));
    }
    tell(examinedEvents(library, alarm.over()));
}

}  // namespace raidinfo
