// A host that cancels the thread that waits in the library.

#include <gtest/gtest.h>
#include <pthread.h>

#include "RAIDInstrumentation.h"
#include "support/elements.h"
#include "support/fresh_library.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

class ThreadCancellation : public FreshLibrary {};

TEST_F(ThreadCancellation, DoesNotBreakACallThatWaits) {
    Gate gate;
    const ScriptedService service(
        {{.pieces = {{answer("an event"), &gate}}},
         answering(eventsDocument(element("ac:events", "<ac:event></ac:event>")))});
    const auto follow = [](void*) -> void* {
        getEvent();
        // What happens to the thread now is its own affair.
        pthread_setcancelstate(PTHREAD_CANCEL_DISABLE, nullptr);
        return nullptr;
    };
    pthread_t thread{};
    ASSERT_EQ(pthread_create(&thread, nullptr, follow, nullptr), 0);
    service.waitFor(0, Stage::requestRead);
    ASSERT_EQ(pthread_cancel(thread), 0);
    gate.open();
    void* result = &gate;
    ASSERT_EQ(pthread_join(thread, &result), 0);
    EXPECT_EQ(result, nullptr) << "the thread returned";
    EXPECT_EQ(getRAIDEventCount(), 1);
}

}  // namespace
