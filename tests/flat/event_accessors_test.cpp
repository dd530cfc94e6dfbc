// The accessors of the published events.

#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "RAIDInstrumentation.h"
#include "support/elements.h"
#include "support/fresh_library.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

struct Number {
    int (*read)(int);
    std::string element;
};

struct Text {
    void (*read)(char*, int);
    std::string element;
};

const std::vector<Number> numbers{
    {getRAIDEventSequenceNumber, "as:sequenceNumber"},
    {getRAIDEventEventCode, "as:eventCode"},
    {getRAIDEventAdapter, "as:adapter"},
    {getRAIDEventLogicalDrive, "as:logicalDrive"},
    {getRAIDEventChannel, "as:channel"},
    {getRAIDEventDeviceID, "as:deviceID"},
    {getRAIDEventEnclosureID, "as:enclosureID"},
};

const std::vector<Text> texts{
    {getRAIDEventType, "as:type"},
    {getRAIDEventMessageString, "as:string"},
    {getRAIDEventDate, "as:date"},
    {getRAIDEventServerAddress, "as:serverAddress"},
    {getRAIDEventServerName, "as:serverName"},
};

// Two events, every field of which has a value of its own.
std::string twoEvents() {
    std::string events;
    int value = 100;
    for (const char* const suffix : {" one", " two"}) {
        std::string content;
        for (const Number& number : numbers) {
            content += element(number.element, value++);
        }
        for (const Text& text : texts) {
            content += element(text.element, text.element + suffix);
        }
        events += element("ac:event", content);
    }
    return eventsDocument(element("ac:events", events));
}

std::string textAt(const Text& text, int position) {
    std::string buffer(64, '#');
    text.read(buffer.data(), position);
    return buffer.c_str();
}

class EventAccessors : public FreshLibrary {
protected:
    EventAccessors() {
        const ScriptedService service({answering("<any/>"), answering(twoEvents())});
        getEvent();
    }
};

TEST_F(EventAccessors, ReadTheFieldsOfEachEvent) {
    ASSERT_EQ(getRAIDEventCount(), 2);
    int value = 100;
    for (const int position : {0, 1}) {
        for (const Number& number : numbers) {
            EXPECT_EQ(number.read(position), value++) << number.element;
        }
        for (const Text& text : texts) {
            EXPECT_EQ(textAt(text, position), text.element + (position == 0 ? " one" : " two"));
        }
    }
}

TEST_F(EventAccessors, ReadNothingOutsideTheList) {
    for (const int position : {-1, 2, INT_MIN, INT_MAX}) {
        for (const Number& number : numbers) {
            EXPECT_EQ(number.read(position), 0) << number.element;
        }
        for (const Text& text : texts) {
            EXPECT_EQ(textAt(text, position), "") << text.element;
        }
    }
}

TEST_F(EventAccessors, WriteATextWithItsZeroByteAndNothingBehindIt) {
    std::string buffer(64, '#');
    getRAIDEventDate(buffer.data(), 0);
    EXPECT_EQ(buffer, "as:date one" + std::string(1, '\0') + std::string(64 - 12, '#'));
}

}  // namespace
