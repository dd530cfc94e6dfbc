#pragma once

namespace raid::test {

// While it lives, every other call of open and read in this program fails as if a signal had come
// first. For a local file no signal does that: the file system of a network may.
class InterruptedCalls {
public:
    InterruptedCalls();
    InterruptedCalls(const InterruptedCalls&) = delete;
    InterruptedCalls& operator=(const InterruptedCalls&) = delete;
    ~InterruptedCalls();

    // The calls that failed so.
    [[nodiscard]] static int count();
};

}  // namespace raid::test
