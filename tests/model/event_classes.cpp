#include "model/event_classes.h"

#include "model/describe.h"
#include "model/raid_events.h"

namespace raid::test {

const std::vector<ModelClass>& eventClasses() {
    static const std::vector<ModelClass> classes{
        Describe<RAIDEvent>("RAIDEvent", "ac:event", "Event", &RAIDEvent::getEventType)
            .text("serverName", &RAIDEvent::getServerName)
            .text("serverAddress", &RAIDEvent::getServerAddress)
            .text("date", &RAIDEvent::getDate)
            .text("string", &RAIDEvent::getMessageString)
            .text("fru", &RAIDEvent::getFru)
            .number("sequenceNumber", &RAIDEvent::getSequenceNumber)
            .number("eventCode", &RAIDEvent::getEventCode)
            .text("type", &RAIDEvent::getType)
            .number("adapter", &RAIDEvent::getAdapter)
            .number("logicalDrive", &RAIDEvent::getLogicalDrive)
            .number("channel", &RAIDEvent::getChannel)
            .number("deviceID", &RAIDEvent::getDeviceID)
            .number("enclosureID", &RAIDEvent::getEnclosureID),
        Describe<RAIDEvents>("RAIDEvents", "ac:events", "Events", &RAIDEvents::getEventsType)
            .each({"ac:event"}, &RAIDEvents::getEvents),
    };
    return classes;
}

}  // namespace raid::test
