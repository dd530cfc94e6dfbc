#include "agent/envelope.h"

#include <algorithm>
#include <array>
#include <memory>
#include <string_view>
#include <utility>

#include "agent/agent_link.h"
#include "agent/document.h"
#include "base/decimal.h"
#include "diag/log.h"
#include "xml/raid_xml_error.h"
#include "xml/unit_reader.h"

RAIDSystem* raidSystem = nullptr;
RAIDEvents* raidEvents = nullptr;

namespace {

using raid::agent::Document;
using raid::xml::UnitReader;

/// Deletes what the two pointers hold when the library is unloaded.
const struct Unloading {
    Unloading() = default;
    Unloading(const Unloading&) = delete;
    Unloading& operator=(const Unloading&) = delete;
    ~Unloading() {
        install(raidSystem, std::unique_ptr<RAIDSystem>());
        install(raidEvents, std::unique_ptr<RAIDEvents>());
    }

    /// The globals are plain pointers for their readers; ownership passes through here only.
    template <class Model>
    static void install(Model*& global, std::unique_ptr<Model> next) noexcept {
        const std::unique_ptr<Model> previous(std::exchange(global, next.release()));
    }
} unloading;

/// Passes the prolog and the two outer elements; false at the first unit of another name.
bool entersBody(UnitReader& units) {
    constexpr std::array<std::string_view, 3> outer{"?xml", "env:Envelope", "env:Body"};
    return std::ranges::all_of(outer,
                               [&](std::string_view name) { return units.next().name == name; });
}

/// Runs one processor over the document and logs the error of a malformed one.
template <class Process>
void processAnswer(const Document& document, int length, Process process) {
    try {
        UnitReader units(document.get(), length);
        process(units);
    } catch (const RAIDXMLError& error) {
        debug(raid::diag::errorLevel, error.getMessage().c_str());
    }
}

/// Reads the one model object that stands in the named response. The previous object goes before
/// anything is read, so that a malformed answer leaves null.
template <class Model>
std::unique_ptr<Model> readResponse(UnitReader& units, std::string_view response) {
    if (!entersBody(units) || units.next().name != response) {
        return nullptr;
    }
    const char* const payload = units.position();
    const int length = units.remaining();
    // The start tag of the payload is looked at once before its own reader does; the trace of
    // every answer shows it so.
    units.next();
    int consumed = 0;
    return std::make_unique<Model>(payload, length, &consumed);
}

}  // namespace

RAIDSystem* getRAIDSystem() { return raidSystem; }
RAIDEvents* getRAIDEvents() { return raidEvents; }

int processXML(char* document, int length) {
    const Document owned(document);
    Unloading::install(raidSystem, std::unique_ptr<RAIDSystem>());
    processAnswer(owned, length, [](UnitReader& units) {
        if (auto system = readResponse<RAIDSystem>(units, "m:getConfigResponse")) {
            Unloading::install(raidSystem, std::move(system));
            raidSystem->setStructureData();
        }
    });
    return 0;
}

int processEventXML(char* document, int length) {
    const Document owned(document);
    Unloading::install(raidEvents, std::unique_ptr<RAIDEvents>());
    processAnswer(owned, length, [](UnitReader& units) {
        Unloading::install(raidEvents, readResponse<RAIDEvents>(units, "m:getEventsResponse"));
    });
    return 0;
}

int processReturnValueXML(char* document, int length) {
    int result = 0;
    Document owned(document);
    processAnswer(owned, length, [&](UnitReader& units) {
        if (!entersBody(units)) {
            return;
        }
        units.next();  // the response element
        units.next();  // the return element
        const auto returned = units.next();
        debug(raid::diag::agentLinkLevel, "before atoi\n");
        result = raid::base::decimalNumber(returned.name);
        debug(raid::diag::agentLinkLevel, "after atoi\n");
    });
    debug(raid::diag::agentLinkLevel, "before free\n");
    owned.reset();
    debug(raid::diag::agentLinkLevel, "after free\n");
    return result;
}
