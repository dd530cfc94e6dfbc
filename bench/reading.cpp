// From the bytes of an answer to the published lists, against readers built on XML libraries.
//
//   bench_reading DOCUMENTS [arguments of the harness]
//
// names the folder of the documents that scripts/bench has made.

#include <array>
#include <memory>

#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "agent/envelope.h"
#include "checksum.h"
#include "documents.h"
#include "flat/snapshot.h"
#include "harness/harness.h"
#include "published.h"
#include "readers/reader.h"

namespace {

using namespace raid;
using namespace raid::bench;

struct Text {
    std::string name;
    std::shared_ptr<const std::string> bytes;
};

using Benchmarks = std::vector<Benchmark>;

void read(const Reader& reader, const Text& text) {
    reader.read(copyOf(*text.bytes), static_cast<int>(text.bytes->size()));
}

/// Over the model and everything that is published of it.
std::uint64_t checksumOf(const Reader& reader, const Text& text) {
    read(reader, text);
    flat::publish(*reader.model());
    Checksum sum;
    sum.add(*reader.model());
    std::apply([&](const auto&... list) { (sum.addAll(list), ...); }, publishedLists());
    return sum.value();
}

void requireSameOutcome(const Text& text) {
    const auto expected = checksumOf(readers().front(), text);
    for (const auto& reader : readers()) {
        if (checksumOf(reader, text) != expected) {
            throw std::runtime_error(text.name + ": " + std::string(reader.name) +
                                     " reads another model than the library");
        }
    }
}

bool refuses(const Reader& reader, const Text& text) {
    try {
        read(reader, text);
        return reader.model() == nullptr;
    } catch (const std::exception&) {
        return true;
    }
}

/// The text with the first of something replaced.
Text broken(const Text& text, const std::string& found, const std::string& instead) {
    auto bytes = *text.bytes;
    bytes.replace(bytes.find(found), found.size(), instead);
    return {text.name + " with " + instead, std::make_shared<const std::string>(bytes)};
}

void requireSameErrors(const Text& text) {
    for (const auto& wrong :
         {broken(text, "<as:vendor xsi:type=\"xsd:string\">", "<as:vendor/><as:x>"),
          broken(text, "</as:vendor>", "</as:model>")}) {
        for (const auto& reader : readers()) {
            if (!refuses(reader, wrong)) {
                throw std::runtime_error(std::string(reader.name) + " accepts " + wrong.name);
            }
        }
    }
}

/// The copy of the document that is read is made before the time begins.
std::chrono::nanoseconds timeOfReading(const Reader& reader, const Text& text, bool publishes) {
    auto copy = copyOf(*text.bytes);
    return processorTime([&] {
        reader.read(std::move(copy), static_cast<int>(text.bytes->size()));
        if (publishes) {
            flat::publish(*reader.model());
        }
    });
}

template <class Run>
void add(Benchmarks& to, std::string name, const Text& text, Run run) {
    to.push_back({std::move(name), static_cast<double>(text.bytes->size()), std::move(run)});
}

void addReaders(Benchmarks& to, const Text& text) {
    requireSameOutcome(text);
    for (const auto& reader : readers()) {
        for (const bool publishes : {false, true}) {
            add(to, (publishes ? "publish/" : "read/") + text.name + "/" + std::string(reader.name),
                text,
                [&reader, text, publishes] { return timeOfReading(reader, text, publishes); });
        }
    }
}

template <class... Lists>
std::tuple<Lists...> valuesOf(const std::tuple<Lists&...>& originals) {
    return std::tuple<Lists...>(originals);
}

/// What is published against a plain copy of it that is dropped again; both make and destroy every
/// record once.
void addPublishing(Benchmarks& to, const Text& text) {
    const auto afterReading = [text](auto work) {
        const auto& reader = readers().front();
        read(reader, text);
        flat::publish(*reader.model());
        return processorTime(work);
    };
    add(to, "lists/" + text.name + "/publish", text,
        [afterReading] { return afterReading([] { flat::publish(*readers().front().model()); }); });
    add(to, "lists/" + text.name + "/copy", text,
        [afterReading] { return afterReading([] { use(valuesOf(publishedLists())); }); });
}

void addEvents(Benchmarks& to, const Text& text) {
    add(to, "read/" + text.name + "/library", text, [text] {
        auto copy = copyOf(*text.bytes);
        return processorTime(
            [&] { processEventXML(copy.release(), static_cast<int>(text.bytes->size())); });
    });
}

/// Of the sizes and shapes, what the folder has; a quick run makes fewer.
Benchmarks benchmarksFor(const std::string& folder) {
    configRead = 1;
    const auto file = [&folder](const std::string& name) {
        return std::filesystem::path(folder) / (name + ".xml");
    };
    const auto text = [&file](const std::string& name) {
        return Text{name, std::make_shared<const std::string>(load(file(name)))};
    };
    requireSameErrors(text("small-compact"));
    Benchmarks made;
    for (const std::string size : {"small", "1MB", "20MB", "100MB"}) {
        for (const auto* const shape : {"-compact", "-indented", "-shuffled"}) {
            if (exists(file(size + shape))) {
                addReaders(made, text(size + shape));
            }
        }
        if (exists(file(size + "-compact"))) {
            addPublishing(made, text(size + "-compact"));
        }
    }
    addEvents(made, text("events-100"));
    addEvents(made, text("events-10000"));
    return made;
}

}  // namespace

int main(int argc, char** argv) { return measureAll(&benchmarksFor, argc, argv); }
