#pragma once

namespace raidinfo {

/// Notices a service that ends each wait at once and has nothing new: its newest event has a lower
/// number than others, or its events cannot be read. Without a pause it would keep both sides busy.
class IdleWaits {
public:
    void ended(bool byTheService, bool withNews) noexcept {
        inARow = byTheService && !withNews ? inARow + 1 : 0;
    }

    [[nodiscard]] bool needPause() const noexcept { return inARow > 1; }

private:
    int inARow = 0;
};

}  // namespace raidinfo
