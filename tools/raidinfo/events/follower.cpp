#include <algorithm>
#include <chrono>
#include <condition_variable>
#include <cstdint>
#include <limits>
#include <mutex>
#include <set>

#include "service.h"
#include "service_failures.h"

namespace raidinfo {
namespace {

constexpr std::chrono::milliseconds pauseAfterNothing{200};

/// An answering service whose events could not be read this often in a row sends malformed ones.
constexpr int malformedReads = 2;

class Follower {
public:
    explicit Follower(const Library& library)
        : reader{library},
          askNewest{library.function<int()>("enableRAIDEvent")},
          setNext{library.function<void(int)>("setRAIDEventSequenceNumber")},
          wait{library.function<int()>("getEvent")},
          batch{library.variable<const void*>("raidEvents")} {
        checkService();
        // The check has set it.
        // NOLINTNEXTLINE(cppcoreguidelines-prefer-member-initializer)
        next = *library.variable<int>("nextSequenceNumber");
    }

    /// Waits for a batch and returns what in it is new: a wait that was cancelled or failed
    /// publishes the batch before it once more.
    Records readNew() {
        setNext(static_cast<int>(std::min<std::int64_t>(next, std::numeric_limits<int>::max())));
        wait();
        Records records = reader.read(eventKind());
        std::set<std::int64_t> fresh;
        std::erase_if(records, [this, &fresh](const Record& event) {
            const int number = numberOf(eventKind(), event, "sequence_number");
            return number < next || !fresh.insert(number).second;
        });
        if (!fresh.empty()) {
            next = *fresh.rbegin() + 1;
            failedReads = 0;
        }
        return records;
    }

    /// Fails if nothing new came because of a failure; an empty batch is none.
    void examineReadOfNothing() {
        checkService();
        failedReads = *batch == nullptr ? failedReads + 1 : 0;
        if (failedReads == malformedReads) {
            throw malformedAnswer();
        }
    }

private:
    /// Leaves the library's next number at the service's newest.
    void checkService() const {
        if (askNewest() == 0) {
            throw serviceUnavailable();
        }
    }

    RecordReader reader;
    int (*askNewest)();
    void (*setNext)(int);
    int (*wait)();
    const void* const* batch;  ///< the library's: null after a malformed answer
    std::int64_t next = 0;     ///< the least number not shown yet
    int failedReads = 0;
};

void pauseUnlessStopped(const std::stop_token& stop) {
    std::mutex mutex;
    std::condition_variable_any never;
    std::unique_lock lock{mutex};
    never.wait_for(lock, stop, pauseAfterNothing, [] { return false; });
}

}  // namespace

void followEvents(const Library& library, const std::function<void(const Records&)>& show,
                  const std::stop_token& stop) {
    Follower follower{library};
    while (!stop.stop_requested()) {
        const Records events = follower.readNew();
        if (!events.empty()) {
            show(events);
        } else if (!stop.stop_requested()) {
            follower.examineReadOfNothing();
            pauseUnlessStopped(stop);
        }
    }
}

}  // namespace raidinfo
