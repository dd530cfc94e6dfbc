#include <benchmark/benchmark.h>

#include "harness/harness.h"

namespace raid::bench {

int measure(std::vector<Benchmark> benchmarks, int argc, char** argv) {
    for (const auto& each : benchmarks) {
        benchmark::RegisterBenchmark(each.name.c_str(), [&each](benchmark::State& state) {
            each.run();  // which disposes of what the benchmark before this one left
            for ([[maybe_unused]] const auto round : state) {
                state.SetIterationTime(std::chrono::duration<double>(each.run()).count());
            }
            state.counters["items"] = each.items;
        })->UseManualTime();
    }
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) {
        return 64;
    }
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}

}  // namespace raid::bench
