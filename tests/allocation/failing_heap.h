#pragma once

namespace raid::test {

enum class Failing { never, once, forGood };

// While it lives, the allocations of its thread are counted, and fail when it says so. Other
// threads do not notice. In sanitizer builds only operator new is looked after, the rest of the
// heap being the sanitizer's.
class FailingHeap {
public:
    // Lets the allocation of this number (from 1) fail, and with forGood all that come after it.
    FailingHeap(Failing failing, long number);
    FailingHeap(const FailingHeap&) = delete;
    FailingHeap& operator=(const FailingHeap&) = delete;
    ~FailingHeap();

    // Whether there were so many allocations that one has failed.
    [[nodiscard]] static bool hasFailed();

    // The blocks that the thread allocated and did not free, under all heaps that it ever made.
    [[nodiscard]] static long liveBlocks();
};

}  // namespace raid::test
