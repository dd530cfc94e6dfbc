#include <malloc.h>

#include <climits>
#include <exception>
#include <iostream>

#include "harness/harness.h"

namespace raid::bench {

int measureAll(std::vector<Benchmark> (*benchmarksFor)(const std::string& argument), int argc,
               char** argv) {
    if (argc < 2) {
        std::cerr << "usage: " << argv[0] << " ARGUMENT [arguments of the harness]\n";
        return 64;
    }
    // As in a host that has run for a while: memory that was freed stays with the process.
    mallopt(M_MMAP_THRESHOLD, INT_MAX);
    mallopt(M_TRIM_THRESHOLD, INT_MAX);
    try {
        auto benchmarks = benchmarksFor(argv[1]);
        argv[1] = argv[0];
        return measure(std::move(benchmarks), argc - 1, argv + 1);
    } catch (const std::exception& error) {
        std::cerr << argv[0] << ": " << error.what() << '\n';
        return 70;
    }
}

}  // namespace raid::bench
