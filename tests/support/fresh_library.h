#pragma once

#include <gtest/gtest.h>

#include <cstdlib>

#include "RAIDInstrumentation.h"
#include "agent/envelope.h"
#include "flat/lists.h"
#include "support/inventory_lists.h"

namespace raid::test {

// Starts each test with the library as a host finds it after loading, also where several tests run
// in one process.
class FreshLibrary : public testing::Test {
protected:
    FreshLibrary() {
        LOG_LEVEL = 0;
        configRead = 1;  // so that nothing of this is logged
        // An empty answer leaves no configuration and no events.
        processXML(emptyAnswer(), 0);
        processEventXML(emptyAnswer(), 0);
        forEachInventoryList([](auto& list) { list.clear(); });
        RAIDEventList.clear();
        endFlag = 0;
        cancelEvent = 0;
        refresh = 0;
        nextSequenceNumber = 0;
        configRead = 0;
    }

private:
    static char* emptyAnswer() { return static_cast<char*>(std::calloc(1, 1)); }
};

}  // namespace raid::test
