#include <expat.h>

#include <cstring>

#include "readers/event_reader.h"
#include "readers/reader.h"

namespace raid::bench {
namespace {

EventReader& readerOf(void* data) { return *static_cast<EventReader*>(data); }

void start(void* data, const char* name, const char** attributes) {
    std::string_view type;
    for (; *attributes != nullptr; attributes += 2) {
        if (std::strcmp(attributes[0], "xsi:type") == 0) {
            type = attributes[1];
        }
    }
    readerOf(data).start(name, type);
}

void end(void* data, const char* /*name*/) { readerOf(data).end(); }

void characters(void* data, const char* text, int length) {
    readerOf(data).characters({text, static_cast<std::size_t>(length)});
}

struct FreeParser {
    void operator()(XML_Parser parser) const { XML_ParserFree(parser); }
};

}  // namespace

void readWithExpat(agent::Document document, int length) {
    EventReader reader;
    const std::unique_ptr<XML_ParserStruct, FreeParser> parser(XML_ParserCreate("UTF-8"));
    XML_SetUserData(parser.get(), &reader);
    XML_SetElementHandler(parser.get(), &start, &end);
    XML_SetCharacterDataHandler(parser.get(), &characters);
    if (XML_Parse(parser.get(), document.get(), length, 1) != XML_STATUS_OK) {
        throw PeerError("malformed");
    }
}

}  // namespace raid::bench
