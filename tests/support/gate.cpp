#include "support/gate.h"

namespace raid::test {

void Gate::open() {
    {
        const std::lock_guard lock(mutex);
        isOpen = true;
    }
    opened.notify_all();
}

bool Gate::wait(const std::stop_token& stop) {
    std::unique_lock lock(mutex);
    return opened.wait(lock, stop, [this] { return isOpen; });
}

}  // namespace raid::test
