#pragma once

#include <chrono>
#include <ctime>
#include <functional>
#include <string>
#include <vector>

// What measures: Google Benchmark where there is one, a plain loop with the same output where there
// is none for the width. The runs of all benchmarks are interleaved, so that what else the machine
// does meets all of them.
namespace raid::bench {

struct Benchmark {
    std::string name;
    double items = 1;  // what a run does so many times
    std::function<std::chrono::nanoseconds()> run;
};

/// Measures all and writes JSON to the file that the arguments name (see scripts/bench).
int measure(std::vector<Benchmark> benchmarks, int argc, char** argv);

/// What main() of a benchmark does: `benchmarksFor` gets the first argument, the harness the
/// others.
int measureAll(std::vector<Benchmark> (*benchmarksFor)(const std::string& argument), int argc,
               char** argv);

/// The time that something takes on this thread's processor.
template <class Work>
std::chrono::nanoseconds processorTime(Work work) {
    const auto now = [] {
        timespec time{};
        clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
        return std::chrono::seconds(time.tv_sec) + std::chrono::nanoseconds(time.tv_nsec);
    };
    const auto start = now();
    work();
    return now() - start;
}

/// The time that passes, where others work, too.
template <class Work>
std::chrono::nanoseconds passingTime(Work work) {
    const auto start = std::chrono::steady_clock::now();
    work();
    return std::chrono::steady_clock::now() - start;
}

/// Makes the compiler believe that the value is looked at.
template <class Value>
void use(const Value& value) {
    asm volatile("" : : "r,m"(value) : "memory");
}

}  // namespace raid::bench
