#pragma once

#include <pthread.h>

namespace raid::base {

/// Holds back a pthread_cancel of the calling thread while it lives. The system calls in between
/// would otherwise unwind through code that must run to its end: a lock would be kept or the host
/// aborted.
class DeferCancellation {
public:
    DeferCancellation() noexcept { pthread_setcancelstate(PTHREAD_CANCEL_DISABLE, &before); }
    DeferCancellation(const DeferCancellation&) = delete;
    DeferCancellation& operator=(const DeferCancellation&) = delete;
    ~DeferCancellation() { pthread_setcancelstate(before, nullptr); }

private:
    int before = PTHREAD_CANCEL_ENABLE;
};

}  // namespace raid::base
