#include "events/raid_events_vocabulary.h"
#include "flat/accessors.h"
#include "flat/lists.h"

using namespace raid::flat;

// Unlike the inventory counts, this one never asks the service.
int getRAIDEventCount() { return static_cast<int>(RAIDEventList.size()); }

int getRAIDEventSequenceNumber(int position) {
    return number<&RAIDEvent::getSequenceNumber>(RAIDEventList, position);
}
int getRAIDEventEventCode(int position) {
    return number<&RAIDEvent::getEventCode>(RAIDEventList, position);
}
int getRAIDEventAdapter(int position) {
    return number<&RAIDEvent::getAdapter>(RAIDEventList, position);
}
int getRAIDEventLogicalDrive(int position) {
    return number<&RAIDEvent::getLogicalDrive>(RAIDEventList, position);
}
int getRAIDEventChannel(int position) {
    return number<&RAIDEvent::getChannel>(RAIDEventList, position);
}
int getRAIDEventDeviceID(int position) {
    return number<&RAIDEvent::getDeviceID>(RAIDEventList, position);
}
int getRAIDEventEnclosureID(int position) {
    return number<&RAIDEvent::getEnclosureID>(RAIDEventList, position);
}

void getRAIDEventType(char* destination, int position) {
    text<"as:type">(destination, RAIDEventList, position);
}
void getRAIDEventMessageString(char* destination, int position) {
    text<"as:string">(destination, RAIDEventList, position);
}
void getRAIDEventDate(char* destination, int position) {
    text<"as:date">(destination, RAIDEventList, position);
}
void getRAIDEventServerAddress(char* destination, int position) {
    text<"as:serverAddress">(destination, RAIDEventList, position);
}
void getRAIDEventServerName(char* destination, int position) {
    text<"as:serverName">(destination, RAIDEventList, position);
}
