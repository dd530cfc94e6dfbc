#include <libxml/parser.h>

#include "readers/event_reader.h"
#include "readers/reader.h"

namespace raid::bench {
namespace {

// Names come in two parts here, and the tables have them in one.
class Names {
public:
    std::string_view join(const xmlChar* prefix, const xmlChar* local) {
        name.clear();
        if (prefix != nullptr) {
            name.append(view(prefix)).push_back(':');
        }
        return name.append(view(local));
    }

    static std::string_view view(const xmlChar* text) {
        return reinterpret_cast<const char*>(text);
    }
    static std::string_view view(const xmlChar* begin, const xmlChar* end) {
        return {reinterpret_cast<const char*>(begin), static_cast<std::size_t>(end - begin)};
    }

private:
    std::string name;
};

struct Reading {
    EventReader reader;
    Names names;
};

Reading& readingOf(void* data) { return *static_cast<Reading*>(data); }

void start(void* data, const xmlChar* local, const xmlChar* prefix, const xmlChar* /*uri*/,
           int /*namespaces*/, const xmlChar** /*declared*/, int attributes, int /*defaulted*/,
           const xmlChar** values) {
    std::string_view type;
    // Each attribute is local name, prefix, URI, begin and end of the value.
    for (int i = 0; i < attributes; ++i, values += 5) {
        if (values[1] != nullptr && Names::view(values[0]) == "type" &&
            Names::view(values[1]) == "xsi") {
            type = Names::view(values[3], values[4]);
        }
    }
    auto& reading = readingOf(data);
    reading.reader.start(reading.names.join(prefix, local), type);
}

void end(void* data, const xmlChar* /*local*/, const xmlChar* /*prefix*/, const xmlChar* /*uri*/) {
    readingOf(data).reader.end();
}

void characters(void* data, const xmlChar* text, int length) {
    readingOf(data).reader.characters(Names::view(text, text + length));
}

}  // namespace

void readWithLibxml2(agent::Document document, int length) {
    Reading reading;
    xmlSAXHandler handler{};
    handler.initialized = XML_SAX2_MAGIC;
    handler.startElementNs = &start;
    handler.endElementNs = &end;
    handler.characters = &characters;
    if (xmlSAXUserParseMemory(&handler, &reading, document.get(), length) != 0) {
        throw PeerError("malformed");
    }
}

}  // namespace raid::bench
