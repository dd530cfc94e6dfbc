// The configuration request and the lock around it.

#include <gtest/gtest.h>

#include <string>
#include <thread>

#include "agent_documents.h"
#include "support/blocked_call.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/lock.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

class ConfigurationRequest : public FreshLibrary {};

TEST_F(ConfigurationRequest, ReadsTheAnswerIntoTheSystem) {
    const ScriptedService service({answering(systemNamed("host"))});
    EXPECT_EQ(getRAIDXML(), 0);
    EXPECT_EQ(currentSystem(), "host");
    EXPECT_EQ(service.request(0),
              "GET /SOAPService/DataProcessor?getConfig HTTP/1.1 Accept */*\r\n\r\n");
}

TEST_F(ConfigurationRequest, KeepsTheSystemWhenNoAnswerComes) {
    process(processXML, systemNamed("before"));
    EXPECT_EQ(getRAIDXML(), 0);
    EXPECT_EQ(currentSystem(), "before");
}

TEST_F(ConfigurationRequest, LeavesNoSystemWhenTheAnswerIsMalformed) {
    process(processXML, systemNamed("before"));
    writeLogLevel(1);
    configRead = 0;
    const ScriptedService service({answering(configDocument("<ac:system><as:os>x</as:"))});
    EXPECT_EQ(getRAIDXML(), 0);
    EXPECT_EQ(currentSystem(), "none");
    EXPECT_EQ(readLog(),
              "Data are available\n"
              "XML syntax error: End of \"os\" is missing before : as:<\nsystem:\n");
}

TEST_F(ConfigurationRequest, HoldsTheLockDuringTheExchangeOnly) {
    Gate gate;
    const ScriptedService service({{.pieces = {{answer(systemNamed("host")), &gate}}}});
    EXPECT_TRUE(isFree(mutex_handle));
    BlockedCall blocked(getRAIDXML);
    service.waitFor(0, Stage::requestRead);
    EXPECT_FALSE(isFree(mutex_handle));
    gate.open();
    EXPECT_EQ(blocked.wait(), 0);
    EXPECT_TRUE(isFree(mutex_handle));
}

TEST_F(ConfigurationRequest, FreesTheLockWhateverTheAnswer) {
    getRAIDXML();
    EXPECT_TRUE(isFree(mutex_handle)) << "no service";
    const ScriptedService service(
        {Connection{}, answering("<ac:system>"), answering(configDocument("<ac:system>"))});
    for (const char* const what : {"no answer", "no envelope", "a malformed payload"}) {
        getRAIDXML();
        EXPECT_TRUE(isFree(mutex_handle)) << what;
    }
}

TEST_F(ConfigurationRequest, CanBeMadeByTheThreadThatHoldsTheLock) {
    ASSERT_EQ(pthread_mutex_lock(&mutex_handle), 0);
    ASSERT_EQ(pthread_mutex_lock(&mutex_handle), 0);
    {
        const ScriptedService service({answering(systemNamed("host"))});
        getRAIDXML();
    }
    EXPECT_FALSE(isFree(mutex_handle));
    EXPECT_EQ(pthread_mutex_unlock(&mutex_handle), 0);
    EXPECT_FALSE(isFree(mutex_handle));
    EXPECT_EQ(pthread_mutex_unlock(&mutex_handle), 0);
    EXPECT_TRUE(isFree(mutex_handle));
    EXPECT_EQ(currentSystem(), "host");
}

TEST_F(ConfigurationRequest, GoesOnWhileAnotherThreadWaitsForEvents) {
    Gate gate;
    const ScriptedService service({{.pieces = {{answer("<any/>"), &gate}}},
                                   answering(systemNamed("host")),
                                   answering(eventsNumbered(7, 2))});
    BlockedCall blocked([] { return getEventRAIDXML(7); });
    service.waitFor(0, Stage::requestRead);
    getRAIDXML();
    EXPECT_EQ(currentSystem(), "host");
    gate.open();
    EXPECT_EQ(blocked.wait(), 0);
    EXPECT_EQ(currentEvents(), 2);
}

}  // namespace
