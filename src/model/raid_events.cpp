#include "model/raid_events.h"

#include "model/raid_events_vocabulary.h"

RAIDEvent::RAIDEvent(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDEvents::RAIDEvents(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}
