// Every allocation that a call makes fails in turn, once or with all that come after it. The call
// returns or throws std::bad_alloc; nothing is left behind or half done, and the next call works.

#include <gtest/gtest.h>
#include <pthread.h>

#include <cstdio>
#include <filesystem>
#include <initializer_list>
#include <new>
#include <string>
#include <thread>
#include <tuple>
#include <vector>

#include "../agent/agent_documents.h"
#include "RAIDInstrumentation.h"
#include "agent/saved_answers.h"
#include "diag/debug.h"
#include "failing_heap.h"
#include "flat/lists.h"
#include "support/answering_service.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/inventory_lists.h"
#include "support/lock.h"
#include "support/row.h"

namespace {

using namespace raid::test;

constexpr int firstEvent = 40;
constexpr int eventCount = 9;
constexpr int newestEvent = 77;

// Too long to be kept within a string.
constexpr const char* savedConfiguration = "./saved-answer-of-the-configuration.xml";
constexpr const char* savedEvents = "./saved-answer-of-the-events.xml";

using Sizes = std::vector<std::size_t>;

Sizes inventorySizes() {
    Sizes sizes;
    forEachInventoryList([&](const auto& list) { sizes.push_back(list.size()); });
    return sizes;
}

constexpr auto release = [](auto& list) { std::decay_t<decltype(list)>().swap(list); };

// A size of its own, which tells the list from a new one, in storage that is too small for most.
constexpr auto mark = [](auto& list) {
    if (!list.empty()) {
        std::decay_t<decltype(list)>(list.size() == 1 ? 2 : 1, list.front()).swap(list);
    }
};

// A call, and what must hold around it.
struct Subject : Row {
    void (*prepare)();                     // so that the call has to make all its allocations
    void (*call)();                        // the call
    void (*expectWhole)();                 // after a call that met no failure
    void (*expectOldOrWhole)(bool threw);  // after one that did
    int logLevel = 0;
    std::string example = "small-server.xml";
};

void forgetInventory() { forEachInventoryList(release); }

Sizes wholeInventory;
Sizes markedInventory;

void expectWholeInventory() {
    ASSERT_NE(raidSystem, nullptr);
    ASSERT_EQ(inventorySizes(), wholeInventory);
    char type[64] = {};
    getPellionAdapterTypeName(type, 0);
    ASSERT_TRUE(std::string(type).starts_with("Pellion ")) << type;
}

// What was published before stays until a configuration is there; then a failure leaves what was
// appended so far.
void expectOldOrNewInventory(bool threw) {
    const Sizes sizes = inventorySizes();
    if (sizes == markedInventory || (!threw && sizes == wholeInventory)) {
        return;
    }
    ASSERT_TRUE(threw);
    for (std::size_t list = 0; list < sizes.size(); ++list) {
        ASSERT_LE(sizes.at(list), wholeInventory.at(list)) << "list " << list;
    }
}

const Subject ofInit{{"RAIDinit"},
                     forgetInventory,
                     [] { RAIDinit(); },
                     expectWholeInventory,
                     expectOldOrNewInventory};

Subject named(const char* name, Subject subject, int logLevel, const char* example) {
    subject.name = name;
    subject.logLevel = logLevel;
    subject.example = example;
    return subject;
}

const std::vector<Subject> subjects{
    ofInit,
    named("RAIDinitWithATrace", ofInit, 8, "small-server.xml"),
    named("RAIDinitOfAllKinds", ofInit, 0, "mixed.xml"),
    {{"CountAfterSetRefreshFlag"},
     forgetInventory,
     [] {
         setRefreshFlag();
         (void)getRAIDFanCount();
     },
     expectWholeInventory,
     expectOldOrNewInventory},
    {{"getEvent"},
     [] {
         release(RAIDEventList);
         setRAIDEventSequenceNumber(firstEvent);
     },
     [] { getEvent(); },
     [] {
         ASSERT_EQ(getRAIDEventCount(), eventCount);
         ASSERT_EQ(nextSequenceNumber, firstEvent + eventCount);
         ASSERT_EQ(getRAIDEventSequenceNumber(eventCount - 1), firstEvent + eventCount - 1);
     },
     [](bool threw) {
         // The first call moved the number on to where this one began.
         const int began = firstEvent + eventCount;
         ASSERT_EQ(getRAIDEventCount(), threw ? 1 : eventCount);
         ASSERT_EQ(nextSequenceNumber, threw ? began : began + eventCount);
     }},
    {{"enableRAIDEvent"},
     [] { setRAIDEventSequenceNumber(firstEvent); },
     [] { enableRAIDEvent(); },
     [] { ASSERT_EQ(nextSequenceNumber, newestEvent); },
     [](bool threw) {
         // Begun with the number that the first call found.
         ASSERT_TRUE(nextSequenceNumber == newestEvent || (!threw && nextSequenceNumber == -1))
             << nextSequenceNumber;
     }},
    {{"enableRAIDEventWithTheFirstMessage"},
     [] { setRAIDEventSequenceNumber(firstEvent); },
     [] {
         configRead = 0;
         enableRAIDEvent();
     },
     [] { ASSERT_EQ(nextSequenceNumber, newestEvent); },
     [](bool /*threw*/) {
         ASSERT_TRUE(nextSequenceNumber == newestEvent || nextSequenceNumber == -1)
             << nextSequenceNumber;
     }},
    {{"readRAIDXML"},
     [] {},
     [] { readRAIDXML(savedConfiguration); },
     [] {
         ASSERT_NE(raidSystem, nullptr);
         ASSERT_EQ(currentSystem(), "Linux");
     },
     [](bool threw) {
         ASSERT_TRUE(threw || raidSystem != nullptr);
         ASSERT_TRUE(raidSystem == nullptr || currentSystem() == "Linux");
     }},
    {{"readEventRAIDXML"},
     [] {},
     [] { readEventRAIDXML(savedEvents); },
     [] { ASSERT_EQ(currentEvents(), eventCount); },
     [](bool threw) {
         ASSERT_TRUE(threw || raidEvents != nullptr);
         ASSERT_TRUE(raidEvents == nullptr || currentEvents() == eventCount);
     }},
    {{"FirstMessage"},
     [] { std::filesystem::remove(logPath); },
     [] {
         LOG_LEVEL = 0;
         configRead = 0;
         debug(1, "message\n");
     },
     [] { ASSERT_EQ(readLog(), "message\n"); },
     [](bool threw) {
         const std::string log = readLog();
         ASSERT_TRUE(log == "message\n" || (!threw && log == "message\nmessage\n")) << log;
     }},
};

class AllocationFailure : public FreshLibrary,
                          public testing::WithParamInterface<std::tuple<Subject, Failing>> {
protected:
    AllocationFailure() {
        writeFile(savedConfiguration, readFile(RAID_EXAMPLES "/small-server.xml"));
        writeFile(savedEvents, eventsNumbered(firstEvent, eventCount));
        writeLogLevel(1);
        // What the system's library allocates once for the process.
        std::puts("");
        try {
            throw std::bad_alloc();
        } catch (const std::bad_alloc&) {
        }
    }

    // Makes the call without a failure.
    void prepare() const {
        const FailingHeap heap(Failing::never, 0);
        subject.prepare();
        subject.call();
    }

    // Returns whether the allocation was reached.
    bool failAt(long number) const {
        {
            const FailingHeap heap(Failing::never, 0);
            forEachInventoryList(mark);
            mark(RAIDEventList);
        }
        markedInventory = inventorySizes();
        bool threw = false;
        {
            const FailingHeap heap(failing, number);
            try {
                subject.call();
            } catch (const std::bad_alloc&) {
                threw = true;
            }
        }
        EXPECT_TRUE(isFree(mutex_handle));
        const bool failed = FailingHeap::hasFailed();
        EXPECT_TRUE(failed || !threw);
        subject.expectOldOrWhole(threw);
        return failed;
    }

    const Subject subject = std::get<Subject>(GetParam());
    const Failing failing = std::get<Failing>(GetParam());
    const AnsweringService service{{.configuration = readFile(RAID_EXAMPLES "/" + subject.example),
                                    .events = eventsNumbered(firstEvent, eventCount),
                                    .newestEvent = std::to_string(newestEvent)}};
};

TEST_P(AllocationFailure, LosesAndLeavesNothingWhicheverItIs) {
    configRead = 1;
    LOG_LEVEL = subject.logLevel;
    prepare();
    wholeInventory = inventorySizes();
    prepare();
    subject.expectWhole();
    const long live = FailingHeap::liveBlocks();
    long number = 1;
    while (failAt(number) && !HasFailure()) {
        prepare();
        subject.expectWhole();
        ASSERT_EQ(FailingHeap::liveBlocks(), live) << number;
        ++number;
    }
    EXPECT_FALSE(HasFailure()) << "allocation " << number;
    EXPECT_GT(number, 1);
    EXPECT_TRUE(service.keepsOnly(0));
    RecordProperty("allocations", static_cast<int>(number - 1));
}

INSTANTIATE_TEST_SUITE_P(Calls, AllocationFailure,
                         testing::Combine(testing::ValuesIn(subjects),
                                          testing::Values(Failing::once, Failing::forGood)),
                         [](const auto& instance) {
                             const bool once = std::get<Failing>(instance.param) == Failing::once;
                             return std::get<Subject>(instance.param).name +
                                    (once ? "Once" : "ForGood");
                         });

}  // namespace
