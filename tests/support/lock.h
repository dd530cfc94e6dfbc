#pragma once

#include <pthread.h>

namespace raid::test {

// Whether another thread could take the lock; the thread that holds a recursive one always can.
[[nodiscard]] bool isFree(pthread_mutex_t& mutex);

}  // namespace raid::test
