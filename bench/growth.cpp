// How the search for the array of each drive grows with the drives and the arrays of an adapter.
//
//   bench_growth DRIVES [arguments of the harness]
//
// names the most drives to try.

#include <algorithm>
#include <memory>
#include <sstream>
#include <string>

#include "RAIDInstrumentation.h"
#include "harness/harness.h"
#include "model/navigation.h"
#include "model/numbering.h"
#include "model/system_and_adapter.h"

namespace {

using namespace raid;
using namespace raid::bench;

/// Elements that hold each other.
void wrap(std::ostream& out, const std::string& name, const auto& content) {
    out << '<' << name << " xsi:type=\"x\">";
    content();
    out << "</" << name << '>';
}

void number(std::ostream& out, const char* name, int value) {
    wrap(out, name, [&] { out << value; });
}

/// On one channel, by their device numbers.
void drives(std::ostream& out, int from, int to) {
    wrap(out, "ac:physicalDrives", [&] {
        wrap(out, "ac:channel", [&] {
            number(out, "as:channelID", 0);
            for (int device = from; device < to; ++device) {
                wrap(out, "ac:hardDrive", [&] {
                    number(out, "as:channelID", 0);
                    number(out, "as:deviceID", device);
                });
            }
        });
    });
}

/// One adapter, whose arrays have the same number of drives each.
std::string document(int driveCount, int arrayCount) {
    std::ostringstream out;
    wrap(out, "ac:system", [&] {
        wrap(out, "ac:adapter", [&] {
            wrap(out, "ac:arrays", [&] {
                const int each = driveCount / arrayCount;
                for (int array = 0; array < arrayCount; ++array) {
                    wrap(out, "ac:basicArray", [&] {
                        number(out, "as:arrayID", array);
                        drives(out, array * each, (array + 1) * each);
                    });
                }
            });
            drives(out, 0, driveCount);
        });
    });
    return out.str();
}

/// For every drive; its ID must be found.
void search(const RAIDAdapter& adapter) {
    const ArrayMembers members(adapter);
    for (const auto& channel : Navigation::channels(adapter)) {
        for (const auto& drive : Navigation::hardDrives(channel)) {
            if (!members.arrayOf(drive)) {
                throw std::runtime_error("a drive has lost its array");
            }
        }
    }
}

Benchmark searching(int driveCount, int arrayCount) {
    const auto text = document(driveCount, arrayCount);
    const auto system =
        std::make_shared<RAIDSystem>(text.data(), static_cast<int>(text.size()), nullptr);
    return {"search/" + std::to_string(driveCount) + "/" + std::to_string(arrayCount),
            static_cast<double>(driveCount), [system] {
                return processorTime([&] { search(Navigation::adapters(*system).front()); });
            }};
}

std::vector<Benchmark> benchmarksFor(const std::string& drives) {
    configRead = 1;
    std::vector<Benchmark> made;
    for (int count = 100; count <= std::stoi(drives); count *= 10) {
        for (int arrays = 1; arrays <= std::min(count / 10, 1000); arrays *= 10) {
            made.push_back(searching(count, arrays));
        }
    }
    return made;
}

}  // namespace

int main(int argc, char** argv) { return measureAll(&benchmarksFor, argc, argv); }
