#include "events/event_line.h"

#include "inventory/value.h"

namespace raidinfo {

std::string eventLine(const Record& event) {
    const auto field = [&event](std::string_view key) {
        return shown(event.at(static_cast<std::size_t>(fieldIndex(eventKind(), key))));
    };
    std::string line;
    for (const std::string_view key : {"sequence_number", "date", "type", "message_string"}) {
        line += field(key) + "  ";
    }
    return line + "(code " + field("event_code") + ", adapter " + field("adapter") + ", channel " +
           field("channel") + ", device " + field("device_id") + ", enclosure " +
           field("enclosure_id") + ", logical drive " + field("logical_drive") + ", server " +
           field("server_name") + ", address " + field("server_address") + ")\n";
}

}  // namespace raidinfo
