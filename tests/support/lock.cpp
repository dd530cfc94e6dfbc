#include "support/lock.h"

#include <thread>

namespace raid::test {

bool isFree(pthread_mutex_t& mutex) {
    bool free = false;
    std::jthread([&] {
        free = pthread_mutex_trylock(&mutex) == 0;
        if (free) {
            pthread_mutex_unlock(&mutex);
        }
    }).join();
    return free;
}

}  // namespace raid::test
