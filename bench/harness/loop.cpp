// The same as google.cpp, for a width in which Google Benchmark is not packaged. It takes the
// arguments that scripts/bench gives: how often each benchmark is repeated, for how long at least,
// and where the results go; and --benchmark_filter.

#include <algorithm>
#include <fstream>
#include <iostream>
#include <map>
#include <nlohmann/json.hpp>
#include <random>
#include <regex>
#include <string_view>

#include "harness/harness.h"

namespace raid::bench {
namespace {

std::map<std::string, std::string, std::less<>> optionsOf(int argc, char** argv) {
    std::map<std::string, std::string, std::less<>> options;
    for (int i = 1; i < argc; ++i) {
        const std::string_view argument(argv[i]);
        const auto equals = argument.find('=');
        options.emplace(argument.substr(0, equals), argument.substr(equals + 1));
    }
    return options;
}

/// Nanoseconds a run, over as many runs as fill the time.
double oneRepetition(const Benchmark& benchmark, std::chrono::duration<double> atLeast) {
    benchmark.run();  // which disposes of what the benchmark before this one left
    std::chrono::nanoseconds taken{};
    int runs = 0;
    do {
        taken += benchmark.run();
        ++runs;
    } while (taken < atLeast);
    return static_cast<double>(taken.count()) / runs;
}

}  // namespace

int measure(std::vector<Benchmark> benchmarks, int argc, char** argv) {
    const auto options = optionsOf(argc, argv);
    const int repetitions = std::stoi(options.at("--benchmark_repetitions"));
    const std::chrono::duration<double> atLeast(std::stod(options.at("--benchmark_min_time")));
    if (const auto filter = options.find("--benchmark_filter"); filter != options.end()) {
        const std::regex wanted(filter->second);
        std::erase_if(benchmarks, [&wanted](const Benchmark& each) {
            return !std::regex_search(each.name, wanted);
        });
    }
    std::mt19937 random(1);
    nlohmann::json results = nlohmann::json::array();
    for (int repetition = 0; repetition < repetitions; ++repetition) {
        std::ranges::shuffle(benchmarks, random);
        for (const auto& each : benchmarks) {
            results.push_back({{"name", each.name},
                               {"run_type", "iteration"},
                               {"real_time", oneRepetition(each, atLeast)},
                               {"time_unit", "ns"},
                               {"items", each.items}});
        }
    }
    std::ofstream out(options.at("--benchmark_out"));
    out << nlohmann::json{{"benchmarks", results}}.dump(1) << std::endl;
    if (!out) {
        std::cerr << "The results cannot be written.\n";
        return 74;
    }
    return 0;
}

}  // namespace raid::bench
