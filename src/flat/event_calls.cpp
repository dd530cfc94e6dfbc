#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "flat/lists.h"

int nextSequenceNumber = 0;

int enableRAIDEvent() {
    nextSequenceNumber = getNewestEventRAIDXML();
    return nextSequenceNumber != -1 ? 1 : 0;
}

void setRAIDEventSequenceNumber(int number) { nextSequenceNumber = number; }

int getEvent() {
    getEventRAIDXML(nextSequenceNumber);
    // After a cancelled or failed wait this is the previous batch once more; callers count on the
    // number advancing with every batch that is published.
    const auto* const batch = getRAIDEvents();
    RAIDEventList = batch == nullptr ? std::vector<RAIDEvent>() : batch->getEvents();
    nextSequenceNumber = static_cast<int>(static_cast<unsigned>(nextSequenceNumber) +
                                          static_cast<unsigned>(RAIDEventList.size()));
    return 0;
}

void cancelGetEvent() { cancelEventRAIDXML(); }
