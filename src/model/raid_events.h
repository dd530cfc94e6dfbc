#pragma once

#include <string>
#include <vector>

#include "../xml/blank.h"

// A batch of controller events. All classes are plain values: getters return copies, and a text or
// a number that the document does not have stays empty or 0. A reading constructor takes the text
// at the element's start tag and its length, reports the bytes of the element through consumed,
// and throws RAIDXMLError for a malformed element.

/// ac:event
class [[gnu::visibility("default")]] RAIDEvent {
public:
    RAIDEvent() = default;
    RAIDEvent(const char* text, int length, int* consumed);

    /// The xsi:type attribute; what kind of event it is, getType tells.
    [[nodiscard]] std::string getEventType() const { return eventType; }
    [[nodiscard]] std::string getServerName() const { return serverName; }
    [[nodiscard]] std::string getServerAddress() const { return serverAddress; }
    /// As sent; not parsed.
    [[nodiscard]] std::string getDate() const { return date; }
    [[nodiscard]] std::string getMessageString() const { return messageString; }
    [[nodiscard]] std::string getFru() const { return fru; }
    [[nodiscard]] int getSequenceNumber() const { return sequenceNumber; }
    [[nodiscard]] int getEventCode() const { return eventCode; }
    [[nodiscard]] std::string getType() const { return type; }
    [[nodiscard]] int getAdapter() const { return adapter; }
    [[nodiscard]] int getLogicalDrive() const { return logicalDrive; }
    [[nodiscard]] int getChannel() const { return channel; }
    [[nodiscard]] int getDeviceID() const { return deviceID; }
    [[nodiscard]] int getEnclosureID() const { return enclosureID; }
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDEvent>;

    std::string eventType;  // xsi:type
    std::string serverName;
    std::string serverAddress;
    std::string date;
    std::string messageString;  // as:string
    std::string fru;
    int sequenceNumber = 0;
    int eventCode = 0;
    std::string type;
    int adapter = 0;
    int logicalDrive = 0;
    int channel = 0;
    int deviceID = 0;
    int enclosureID = 0;
};

/// ac:events
class [[gnu::visibility("default")]] RAIDEvents {
public:
    RAIDEvents() = default;
    RAIDEvents(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getEventsType() const { return eventsType; }
    [[nodiscard]] std::vector<RAIDEvent> getEvents() const { return events; }

private:
    friend struct raid::xml::Vocabulary<RAIDEvents>;

    std::string eventsType;         // xsi:type
    std::vector<RAIDEvent> events;  // in the service's order
};
