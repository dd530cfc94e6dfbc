#include "c_header_test.h"

#include <gtest/gtest.h>

#include "support/elements.h"
#include "support/fresh_library.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

class CHeader : public FreshLibrary {};

TEST_F(CHeader, ServesAProgramInC) {
    const auto adapter = element(
        "ac:adapter",
        element("as:adapterID", 3) + element("as:typeName", "C") + element("as:overallStatus", 2),
        "o:PellionAdapter");
    const auto event = element("ac:event", element("as:sequenceNumber", 9));
    const ScriptedService service({answering(configDocument(element("ac:system", adapter))),
                                   answering("<any/>"),
                                   answering(eventsDocument(element("ac:events", event)))});
    const char* const fault = faultThatCFinds();
    EXPECT_EQ(fault, nullptr) << fault;
}

}  // namespace
