#include "source/recorded.h"

#include <fcntl.h>
#include <sys/resource.h>
#include <unistd.h>

#include <optional>
#include <string>

#include "exit_status.h"
#include "source/service_failures.h"
#include "system/file.h"
#include "system/memory_file.h"

namespace raidinfo {
namespace {

using recording::Question;

/// While it lives the process gets no new descriptor, so that the library gets no socket: it then
/// publishes what it has read from a saved answer instead of asking a service that may be running.
class NoExchange {
public:
    NoExchange() {
        getrlimit(RLIMIT_NOFILE, &before);
        const Descriptor lowestFree{fcntl(STDIN_FILENO, F_DUPFD_CLOEXEC, STDERR_FILENO + 1),
                                    "cannot find a free descriptor"};
        rlimit none = before;
        none.rlim_cur = static_cast<rlim_t>(lowestFree.get());
        setrlimit(RLIMIT_NOFILE, &none);
    }
    NoExchange(const NoExchange&) = delete;
    NoExchange& operator=(const NoExchange&) = delete;
    ~NoExchange() { setrlimit(RLIMIT_NOFILE, &before); }

private:
    rlimit before{};
};

// Functions of the library that take a std::string: their names in the exported list.
constexpr auto readConfiguration =
    "_Z11readRAIDXMLNSt7__cxx1112basic_stringIcSt11char_traitsIcESaIcEEE";
constexpr auto readEvents =
    "_Z16readEventRAIDXMLNSt7__cxx1112basic_stringIcSt11char_traitsIcESaIcEEE";

void readSaved(const Library& library, const char* function, const std::string& body) {
    const MemoryFile file{body};
    library.function<int(std::string)>(function)(file.path());
}

void callWithoutExchange(const Library& library, const char* function) {
    const NoExchange guard;
    library.function<int()>(function)();
}

/// Of a recording without an answer to the question that this is about.
Failure nothingRecorded(const recording::Recording& recorded, const std::string& what) {
    return {ExitStatus::serviceUnavailable,
            "the recording holds no " + what +
                (recorded.cutShort ? "; its last entry is cut short" : "")};
}

}  // namespace

recording::Recording readRecording(const std::filesystem::path& path) {
    const std::string text = readFile(path);
    try {
        return recording::parse(text);
    } catch (const recording::RecordingError& error) {
        throw Failure{ExitStatus::badInput, path.string() + ": " + error.what()};
    }
}

RecordedInventory recordedInventory(const Library& library, const recording::Recording& recorded) {
    const RAIDSystem* const* const system = library.variable<const RAIDSystem*>("raidSystem");
    std::size_t malformed = 0;
    for (std::size_t before = recorded.entries.size(); before-- > 0;) {
        const recording::Entry& entry = recorded.entries[before];
        if (entry.question != Question::configuration || !entry.body) {
            continue;
        }
        if (publishConfiguration(library, *entry.body)) {
            return {{RecordReader{library}.readInventory(), (*system)->getAdapters()}, malformed};
        }
        ++malformed;
    }
    throw malformed > 0 ? malformedAnswer() : nothingRecorded(recorded, "configuration");
}

bool publishConfiguration(const Library& library, const std::string& body) {
    readSaved(library, readConfiguration, body);
    if (*library.variable<const void*>("raidSystem") == nullptr) {
        return false;
    }
    callWithoutExchange(library, "RAIDinit");
    return true;
}

std::optional<Records> eventsIn(const Library& library, RecordReader& reader,
                                const std::string& body) {
    readSaved(library, readEvents, body);
    if (*library.variable<const void*>("raidEvents") == nullptr) {
        return std::nullopt;
    }
    callWithoutExchange(library, "getEvent");
    return reader.read(eventKind());
}

RecordedEvents::RecordedEvents(const Library& loaded, const recording::Recording& read)
    : library{loaded}, recorded{read}, reader{loaded} {}

std::optional<Records> RecordedEvents::next() {
    for (; place != recorded.entries.size(); ++place) {
        const recording::Entry& entry = recorded.entries[place];
        if (entry.question != Question::events || !entry.body) {
            continue;
        }
        if (auto batch = eventsIn(library, reader, *entry.body)) {
            ++place;
            ++wellFormed;
            return batch;
        }
        ++malformed;
    }
    if (wellFormed == 0) {
        throw malformed == 0 ? nothingRecorded(recorded, "events") : malformedAnswer();
    }
    return std::nullopt;
}

}  // namespace raidinfo
