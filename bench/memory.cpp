// The memory that reading and publishing take, in multiples of the document.
//
//   bench_memory FILE
//
// prints a line for each reader: its name, what the process takes at most while it reads (the
// document, which is freed then, included), how much the lists add to what it then holds, and the
// bytes of heap in the model and in the lists, which are those that reading and publishing copy.
// Each is measured in a process of its own.

#include <malloc.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>
#include <fstream>
#include <iostream>
#include <string>

#include "RAIDInstrumentation.h"
#include "documents.h"
#include "flat/snapshot.h"
#include "readers/reader.h"

namespace {

using namespace raid;
using namespace raid::bench;

/// A line of the kernel's account of this process, in bytes.
double inUse(const std::string& line) {
    std::ifstream status("/proc/self/status");
    for (std::string name; status >> name;) {
        if (name == line + ":") {
            double kilobytes = 0;
            status >> kilobytes;
            return kilobytes * 1024;
        }
        std::getline(status, name);
    }
    throw std::runtime_error("the kernel does not tell " + line);
}

/// From now on VmHWM counts from what there is.
void forgetPeak() { std::ofstream("/proc/self/clear_refs") << 5 << std::flush; }

double heap() {
    const auto all = mallinfo2();
    return static_cast<double>(all.uordblks) + static_cast<double>(all.hblkhd);
}

void measure(const Reader& reader, const std::string& path) {
    const double before = inUse("VmRSS");
    const double heapBefore = heap();
    auto document = copyOf(load(path));
    const auto length = static_cast<int>(std::filesystem::file_size(path));
    forgetPeak();
    reader.read(std::move(document), length);
    const double reading = inUse("VmHWM") - before;
    const double read = inUse("VmRSS");
    const double model = heap() - heapBefore;
    forgetPeak();
    flat::publish(*reader.model());
    const double lists = inUse("VmHWM") - read;
    const double published = heap() - heapBefore - model;
    std::printf("%s %.2f %.2f %.2f %.2f\n", std::string(reader.name).c_str(), reading / length,
                lists / length, model / length, published / length);
}

/// Whether it went well.
bool measureApart(const Reader& reader, const std::string& path) {
    const pid_t child = fork();
    if (child == 0) {
        try {
            measure(reader, path);
            std::fflush(stdout);
            _exit(0);
        } catch (const std::exception& error) {
            std::cerr << "bench_memory: " << error.what() << std::endl;
            _exit(70);
        }
    }
    int status = 0;
    return child > 0 && waitpid(child, &status, 0) == child && status == 0;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 2) {
        std::cerr << "usage: bench_memory FILE\n";
        return 64;
    }
    configRead = 1;
    for (const auto& reader : readers()) {
        if (!measureApart(reader, argv[1])) {
            return 70;
        }
    }
    return 0;
}
