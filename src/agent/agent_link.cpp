#include "agent/agent_link.h"

#include <pthread.h>

#include <cstring>
#include <string>

#include "RAIDInstrumentation.h"
#include "agent/document.h"
#include "agent/envelope.h"
#include "agent/exchange.h"
#include "agent/requests.h"
#include "base/shared_value.h"
#include "diag/log.h"

unsigned char cancelEvent = 0;
pthread_mutex_t mutex_handle = PTHREAD_RECURSIVE_MUTEX_INITIALIZER_NP;

namespace {

using raid::agent::Document;
using raid::diag::agentLinkLevel;

class Lock {
public:
    explicit Lock(pthread_mutex_t& locked) noexcept : mutex(locked) { pthread_mutex_lock(&mutex); }
    Lock(const Lock&) = delete;
    Lock& operator=(const Lock&) = delete;
    ~Lock() { pthread_mutex_unlock(&mutex); }

private:
    pthread_mutex_t& mutex;
};

/// Documents have fewer than 10^9 bytes.
int lengthOf(const Document& document) { return static_cast<int>(std::strlen(document.get())); }

void logAnswer(const Document& answer) { debug(agentLinkLevel, answer ? answer.get() : "(null)"); }

bool isCancelled() { return raid::base::load(cancelEvent) != 0; }

/// Event numbers wrap around as the service's 32-bit numbers do.
int offset(int number, int by) {
    return static_cast<int>(static_cast<unsigned>(number) + static_cast<unsigned>(by));
}

}  // namespace

int getRAIDXML() {
    const Lock lock(mutex_handle);
    Document answer(getSOAPData(0));
    if (!answer) {
        return 0;
    }
    const int length = lengthOf(answer);
    return processXML(answer.release(), length);
}

int getEventRAIDXML(int last) {
    debug(agentLinkLevel, "getEventRAIDXML entry\n");
    raid::base::store(cancelEvent, static_cast<unsigned char>(0));
    {
        // The answer only tells that there is something to read, and so does its absence.
        const auto request = raid::agent::waitNextEventRequest(last == 0 ? 0 : offset(last, -1));
        const Document answer(getSOAPData(request.c_str()));
        logAnswer(answer);
    }
    debug(agentLinkLevel, "getEventRAIDXML after wait\n");
    if (isCancelled()) {
        return 0;
    }
    const auto request = raid::agent::eventsRequest(last, offset(last, 100));
    Document answer(getSOAPData(request.c_str()));
    logAnswer(answer);
    debug(agentLinkLevel, "getEventRAIDXML exit\n");
    if (isCancelled() || !answer) {
        return 0;
    }
    const int length = lengthOf(answer);
    return processEventXML(answer.release(), length);
}

int getNewestEventRAIDXML() {
    debug(agentLinkLevel, "getNewestEventRAIDXML entry\n");
    const auto request = raid::agent::newestEventRequest();
    Document answer;
    try {
        answer.reset(getSOAPData(request.c_str()));
    } catch (...) {
        debug(agentLinkLevel, "getSOAPData exception exit\n");
    }
    debug(agentLinkLevel, "getNewestEventRAIDXML exit\n");
    if (!answer) {
        return -1;
    }
    logAnswer(answer);
    const int length = lengthOf(answer);
    return processReturnValueXML(answer.release(), length);
}

void cancelEventRAIDXML() {
    raid::base::store(cancelEvent, static_cast<unsigned char>(1));
    disconnectSocket();
}
