#pragma once

#include "support/answering_service.h"
#include "support/documents.h"
#include "support/elements.h"
#include "support/files.h"

namespace raid::test {

// Answers that put something into every list.
inline Answers fullAnswers() {
    return {.configuration = readFile(RAID_EXAMPLES "/mixed.xml"),
            .events = eventsDocument(element("ac:events", "<ac:event/><ac:event/>")),
            .newestEvent = "7"};
}

}  // namespace raid::test
