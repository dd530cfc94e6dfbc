#pragma once

#include <functional>

namespace raidsim {

// Whether the service is there at all. While it is down nobody listens; connections that were open
// have been reset.
class Presence {
public:
    [[nodiscard]] bool isDown() const noexcept { return down; }

    void goDown() { change(true); }
    // Throws when nobody can listen, and stays down then.
    void comeUp() { change(false); }

    std::function<void()> changed = [] {};

private:
    void change(bool toDown) {
        const bool before = down;
        down = toDown;
        try {
            changed();
        } catch (...) {
            down = before;
            throw;
        }
    }

    bool down = false;
};

}  // namespace raidsim
