#include "flat/accessors.h"
#include "flat/lists.h"
#include "model/raid_events_vocabulary.h"

namespace {

using Event = RAIDEvent;
constexpr raid::flat::Family events(RAIDEventList);

}  // namespace

// Unlike the inventory counts, this one never asks the service.
int getRAIDEventCount() { return events.size(); }

int getRAIDEventSequenceNumber(int at) { return events.number<&Event::getSequenceNumber>(at); }
int getRAIDEventEventCode(int at) { return events.number<&Event::getEventCode>(at); }
int getRAIDEventAdapter(int at) { return events.number<&Event::getAdapter>(at); }
int getRAIDEventLogicalDrive(int at) { return events.number<&Event::getLogicalDrive>(at); }
int getRAIDEventChannel(int at) { return events.number<&Event::getChannel>(at); }
int getRAIDEventDeviceID(int at) { return events.number<&Event::getDeviceID>(at); }
int getRAIDEventEnclosureID(int at) { return events.number<&Event::getEnclosureID>(at); }

void getRAIDEventType(char* to, int at) { events.text<"as:type">(to, at); }
void getRAIDEventMessageString(char* to, int at) { events.text<"as:string">(to, at); }
void getRAIDEventDate(char* to, int at) { events.text<"as:date">(to, at); }
void getRAIDEventServerAddress(char* to, int at) { events.text<"as:serverAddress">(to, at); }
void getRAIDEventServerName(char* to, int at) { events.text<"as:serverName">(to, at); }
