// From the bytes of an answer to the published lists, against readers built on XML libraries.
//
//   bench_reading DOCUMENTS [arguments of the harness]

#include <malloc.h>

#include <climits>
#include <iostream>
#include <map>

#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "agent/envelope.h"
#include "checksum.h"
#include "documents.h"
#include "flat/lists.h"
#include "flat/snapshot.h"
#include "harness/harness.h"
#include "readers/reader.h"

namespace {

using namespace raid;
using namespace raid::bench;

auto lists() {
    return std::tie(PellionAdapterList, LSIAdapterList, VantryAdapterList, ChannelList,
                    RAIDArrayList, SpannedRAIDArrayList, RAIDLogicalDriveList, RAIDDiskDriveList,
                    RAIDEnclosureDeviceList, RAIDFanList, RAIDPowerSupplyList, RAIDTempSensorList);
}

template <class... Lists>
std::tuple<Lists...> copyOf(const std::tuple<Lists&...>& originals) {
    return std::tuple<Lists...>(originals);
}

/// Over the model and everything that is published of it.
std::uint64_t checksumOf(const Reader& reader, const std::string& document) {
    reader.read(bench::copyOf(document), static_cast<int>(document.size()));
    flat::publish(*reader.model());
    Checksum sum;
    sum.add(*reader.model());
    std::apply([&](const auto&... list) { (sum.addAll(list), ...); }, lists());
    return sum.value();
}

void requireSameOutcome(const std::string& name, const std::string& document) {
    const auto expected = checksumOf(readers().front(), document);
    for (const auto& reader : readers()) {
        if (checksumOf(reader, document) != expected) {
            throw std::runtime_error(name + ": " + std::string(reader.name) +
                                     " reads another model than the library");
        }
    }
}

/// The copy of the document that is read is made before the time begins.
std::chrono::nanoseconds timeOfReading(const Reader& reader, const std::string& document,
                                       bool publishes) {
    auto copy = bench::copyOf(document);
    return processorTime([&] {
        reader.read(std::move(copy), static_cast<int>(document.size()));
        if (publishes) {
            flat::publish(*reader.model());
        }
    });
}

class Suite {
public:
    explicit Suite(std::filesystem::path folder) : documents(std::move(folder)) {}

    /// Whatever sizes and shapes scripts/bench has made.
    void addEverythingThere() {
        for (const auto& file : std::filesystem::directory_iterator(documents)) {
            const auto name = file.path().stem().string();
            if (name.starts_with("events-")) {
                addEvents(name);
            } else {
                addReaders(name);
                if (name.ends_with("-compact")) {
                    addPublishing(name);
                }
            }
        }
    }

    void addReaders(const std::string& name) {
        const auto& document = loaded(name);
        requireSameOutcome(name, document);
        for (const auto& reader : readers()) {
            for (const bool publishes : {false, true}) {
                add((publishes ? "publish/" : "read/") + name + "/" + std::string(reader.name),
                    document, [&reader, &document, publishes] {
                        return timeOfReading(reader, document, publishes);
                    });
            }
        }
    }

    /// What is published against a plain copy of it that is dropped again; both make and destroy
    /// every record once.
    void addPublishing(const std::string& name) {
        const auto& document = loaded(name);
        const auto prepare = [&document] {
            const auto& reader = readers().front();
            reader.read(bench::copyOf(document), static_cast<int>(document.size()));
            flat::publish(*reader.model());
        };
        add("lists/" + name + "/publish", document, [prepare] {
            prepare();
            return processorTime([] { flat::publish(*readers().front().model()); });
        });
        add("lists/" + name + "/copy", document, [prepare] {
            prepare();
            return processorTime([] { use(copyOf(lists())); });
        });
    }

    void addEvents(const std::string& name) {
        const auto& document = loaded(name);
        add("read/" + name + "/library", document, [&document] {
            auto copy = bench::copyOf(document);
            return processorTime(
                [&] { processEventXML(copy.release(), static_cast<int>(document.size())); });
        });
    }

    void addLogLevels(const std::string& name) {
        const auto& document = loaded(name);
        for (const int level : {0, 1, 8}) {
            add("log/" + name + "/level " + std::to_string(level), document, [&document, level] {
                LOG_LEVEL = level;
                const auto time = timeOfReading(readers().front(), document, true);
                LOG_LEVEL = 0;
                return time;
            });
        }
        constexpr int calls = 1000;
        benchmarks.push_back({"log/a call below its level", calls, [] {
                                  return processorTime([] {
                                      for (int i = 0; i < calls; ++i) {
                                          debug(9, "not written\n");
                                      }
                                  });
                              }});
    }

    int run(int argc, char** argv) { return measure(std::move(benchmarks), argc, argv); }

private:
    const std::string& loaded(const std::string& name) {
        auto& document = texts[name];
        if (document.empty()) {
            document = load(documents / (name + ".xml"));
        }
        return document;
    }

    void add(std::string name, const std::string& document,
             std::function<std::chrono::nanoseconds()> run) {
        benchmarks.push_back({std::move(name), static_cast<double>(document.size()),
                              [run = std::move(run)] { return run(); }});
    }

    std::filesystem::path documents;
    std::map<std::string, std::string> texts;
    std::vector<Benchmark> benchmarks;
};

}  // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        std::cerr << "usage: bench_reading DOCUMENTS [arguments of the harness]\n";
        return 64;
    }
    // As in a host that has run for a while: memory that was freed stays with the process.
    mallopt(M_MMAP_THRESHOLD, INT_MAX);
    mallopt(M_TRIM_THRESHOLD, INT_MAX);
    configRead = 1;
    try {
        Suite suite(argv[1]);
        argv[1] = argv[0];
        const std::vector<std::string> sizes =
            std::getenv("RAID_BENCH_SIZES") == nullptr
                ? std::vector<std::string>{"small", "1MB"}
                : std::vector<std::string>{"small", "1MB", "20MB"};
        for (const auto& size : sizes) {
            for (const auto* const shape : {"compact", "indented", "shuffled"}) {
                suite.addReaders(size + "-" + shape);
            }
            suite.addPublishing(size + "-compact");
        }
        suite.addEvents("events-100");
        suite.addEvents("events-10000");
        suite.addLogLevels("small-compact");
        return suite.run(argc - 1, argv + 1);
    } catch (const std::exception& error) {
        std::cerr << "bench_reading: " << error.what() << '\n';
        return 70;
    }
}
