#include "doctor/examination.h"

#include <arpa/inet.h>
#include <dlfcn.h>
#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <filesystem>
#include <optional>
#include <stop_token>
#include <system_error>
#include <utility>
#include <vector>

#include "doctor/library_log.h"
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

/// Where the library looks for a file beside the working directory; nowhere if that is gone.
std::optional<fs::path> placeOf(const fs::path& name) {
    std::error_code unknown;
    const fs::path here = fs::current_path(unknown);
    return unknown ? std::nullopt : std::optional{(here / "../logs" / name).lexically_normal()};
}

constexpr auto nowhere = "nowhere, for the working directory is gone";

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

Examined settings(const Library& library) {
    const int level = *library.variable<int>("LOG_LEVEL");
    const auto place = placeOf("RAIDInstrumentation.ini");
    std::error_code unknown;
    const bool isMissing = place && !fs::exists(*place, unknown);
    return {"settings", "Settings file", Outcome::fine,
            (place ? place->string() : nowhere) + (isMissing ? ", which is not there" : "") +
                "; log level " + std::to_string(level)};
}

Examined log(const Library& library) {
    const auto place = placeOf("RAIDInstrumentation.log");
    if (*library.variable<int>("LOG_LEVEL") == 0) {
        return {"log", "Log file", Outcome::fine,
                (place ? place->string() : nowhere) + std::string{", which is off"}};
    }
    if (!place) {
        return {"log", "Log file", Outcome::noteworthy, nowhere};
    }
    std::error_code unknown;
    const fs::path written = fs::exists(*place, unknown) ? *place : place->parent_path();
    const bool writable = access(written.c_str(), W_OK) == 0;
    return {"log", "Log file", writable ? Outcome::fine : Outcome::noteworthy,
            place->string() + (writable ? "" : ": " + std::generic_category().message(errno))};
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

Examined answering(const Library& library) {
    if (library.function<int()>("enableRAIDEvent")() == 0) {
        return {"answering", "Service answers", Outcome::bad,
                "it accepts connections and gives no answer", ExitStatus::serviceUnavailable};
    }
    const int newest = *library.variable<int>("nextSequenceNumber");
    return {"answering", "Service answers", Outcome::fine,
            "its newest event is " + std::to_string(newest)};
}

Examined wellFormed(const Library& library, const std::stop_token& over) {
    const LibraryLog log{library};
    library.function<int()>("RAIDinit")();
    if (*library.variable<const void*>("raidSystem") != nullptr) {
        return {"well_formed", "Configuration", Outcome::fine, "well-formed"};
    }
    if (over.stop_requested()) {
        return {"well_formed", "Configuration", Outcome::bad,
                "it gave no answer within the --timeout", ExitStatus::serviceUnavailable};
    }
    const std::string message = log.lastError();
    return {"well_formed", "Configuration", Outcome::bad,
            message.empty() ? "no answer, or one that is not whole" : message,
            ExitStatus::malformedAnswer};
}

Examined published(const Library& library) {
    std::vector<std::string> counts;
    int adapters = 0;
    for (const Kind& kind : inventoryKinds()) {
        const int count = library.function<int()>(kind.count)();
        adapters += kind.id <= KindId::vantryAdapter ? count : 0;
        if (count > 0) {
            counts.push_back(std::to_string(count) + " " + std::string{kind.key});
        }
    }
    return {
        "published", "Lists", adapters > 0 ? Outcome::fine : Outcome::noteworthy,
        (adapters > 0 ? "" : "no adapter; ") + (counts.empty() ? "all empty" : enumerated(counts))};
}

}  // namespace

std::string_view wordOf(Outcome outcome) noexcept {
    constexpr auto words = std::to_array<std::string_view>({"ok", "look", "bad"});
    return words.at(static_cast<std::size_t>(outcome));
}

void examine(const Library& library, std::optional<std::chrono::milliseconds> limit,
             const std::function<void(const Examined&)>& tell) {
    const auto toldIsBad = [&tell](const Examined& found) {
        tell(found);
        return found.outcome == Outcome::bad;
    };
    tell(loadedFile(library));
    const auto begun = Clock::now();
    const Examined service = listening(limit);
    const auto passed = std::chrono::floor<std::chrono::milliseconds>(Clock::now() - begun);
    if (limit && passed >= *limit && service.outcome == Outcome::bad) {
        tell(service);
        return;
    }
    const Limit left = limit ? Limit{std::max(*limit - passed, Limit::value_type{1})} : limit;
    const Alarm alarm{left, library.function<void()>("cancelGetEvent")};
    // The library reads its settings with the first exchange.
    const Examined answer = answering(library);
    tell(settings(library));
    tell(log(library));
    if (toldIsBad(service) || toldIsBad(answer) || toldIsBad(wellFormed(library, alarm.over()))) {
        return;
    }
    tell(published(library));
}

}  // namespace raidinfo
