// The processors of answers: the walk through the envelope and what becomes of the models.

#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "agent_documents.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/row.h"

namespace {

using namespace raid::test;

std::string replaced(std::string text, std::string_view from, std::string_view to) {
    for (auto at = text.find(from); at != text.npos; at = text.find(from, at + to.size())) {
        text.replace(at, from.size(), to);
    }
    return text;
}

// A document that yields no model, and the log of it at level 1.
struct Rejected : Row {
    std::string document;
    std::string log;
};

const std::string system =
    element("ac:system", element("as:name", "host") + element("ac:adapter", "", "o:LSIAdapter"));
const std::string good = configDocument(system);

std::string withAdapter(std::string_view content) {
    return configDocument(
        element("ac:system", element("as:name", "host") + element("ac:adapter", content)));
}

const std::vector<Rejected> rejected{
    {"Empty", "", ""},
    {"OnlyText", "nothing here", ""},
    {"WithoutProlog", good.substr(good.find("<env:")), ""},
    {"OfAnotherProlog", replaced(good, "?xml", "?xmm"), ""},
    {"OfAnotherEnvelope", replaced(good, "env:Envelope", "soap:Envelope"), ""},
    {"OfAnEnvelopeInOtherCase", replaced(good, "env:Envelope", "env:envelope"), ""},
    {"OfAnotherBody", replaced(good, "env:Body", "env:Header"), ""},
    {"OfAnotherResponse", replaced(good, "m:getConfigResponse", "m:getConfig"), ""},
    {"OfTheEventsResponse", eventsNumbered(1, 2), ""},
    {"CutInTheEnvelope", good.substr(0, good.find("<env:Body") + 4), ""},
    {"CutBehindTheResponse", good.substr(0, good.find("<ac:system")),
     "XML syntax error: End of \"system\" is missing before : \nsystem:\n"},
    {"CutInThePayload", good.substr(0, good.find("</ac:system")),
     "XML syntax error: End of \"system\" is missing before : \nsystem:host\n"},
    {"OfAnEmptyResponse", configDocument(""),
     "XML syntax error: Unknown element in   : m:getConfigResponse\nsystem:\n"},
    {"OfAnotherPayload", configDocument(element("ac:adapter", "")),
     "XML syntax error: Unknown element in   : ac:adapter\nsystem:\n"},
    {"OfAnUnknownElement", withAdapter(element("as:color", "red")),
     "XML syntax error: Unknown element in   : as:color\nRAIDSystem:\n\nsystem:host\n"},
    {"OfAWrongEndTag", withAdapter("<as:adapterID>1</as:type>"),
     "XML syntax error: End of \"adapterID\" is missing before : as:type\nRAIDSystem:\n"
     "\nsystem:host\n"},
    {"OfAnErrorThreeLevelsDeep",
     withAdapter(element("ac:physicalDrives", element("ac:channel", "<as:type>1</as:size>"))),
     "XML syntax error: End of \"type\" is missing before : as:size\nassociation:\n"
     "\nassociation:\n\nRAIDSystem:\n\nsystem:host\n"},
    {"OfConversionsInAName", withAdapter("<as:%s%n%d/>"),
     "XML syntax error: Unknown element in   : as:%s%n0\nRAIDSystem:\n\nsystem:host\n"},
};

class RejectedConfiguration : public FreshLibrary, public testing::WithParamInterface<Rejected> {};

TEST_P(RejectedConfiguration, LeavesNoSystemAndLogsItsError) {
    writeLogLevel(1);
    process(processXML, systemNamed("before"));
    EXPECT_EQ(currentSystem(), "before");
    EXPECT_EQ(process(processXML, GetParam().document), 0);
    EXPECT_EQ(currentSystem(), "none");
    EXPECT_EQ(readLog(), GetParam().log);
}

INSTANTIATE_TEST_SUITE_P(Documents, RejectedConfiguration, testing::ValuesIn(rejected), nameOfRow);

const std::string goodEvents = eventsNumbered(1, 2);

const std::vector<Rejected> rejectedEvents{
    {"Empty", "", ""},
    {"OfAnotherProlog", replaced(goodEvents, "?xml", "xml"), ""},
    {"OfAnotherEnvelope", replaced(goodEvents, "env:Envelope", "Envelope"), ""},
    {"OfAnotherBody", replaced(goodEvents, "env:Body", "body"), ""},
    {"OfAnotherResponse", replaced(goodEvents, "m:getEventsResponse", "m:getEvents"), ""},
    {"OfTheConfigurationResponse", good, ""},
    {"OfAnotherPayload", eventsDocument(system),
     "XML syntax error: Unknown element in   : ac:system\nassociation:\n"},
    {"OfAWrongEndTag",
     eventsDocument(element("ac:events", element("ac:event", "<as:date>now</as:fru>"))),
     "XML syntax error: End of \"date\" is missing before : as:fru\nassociation:\n"
     "\nassociation:\n"},
};

class RejectedEvents : public FreshLibrary, public testing::WithParamInterface<Rejected> {};

TEST_P(RejectedEvents, LeaveNoBatchAndLogTheirError) {
    writeLogLevel(1);
    process(processEventXML, eventsNumbered(1, 3));
    EXPECT_EQ(currentEvents(), 3);
    EXPECT_EQ(process(processEventXML, GetParam().document), 0);
    EXPECT_EQ(currentEvents(), -1);
    EXPECT_EQ(readLog(), GetParam().log);
}

INSTANTIATE_TEST_SUITE_P(Documents, RejectedEvents, testing::ValuesIn(rejectedEvents), nameOfRow);

class Envelope : public FreshLibrary {};

TEST_F(Envelope, ReplacesTheModelByTheNextOne) {
    for (const char* const name : {"one", "two"}) {
        EXPECT_EQ(process(processXML, systemNamed(name)), 0);
        EXPECT_EQ(currentSystem(), name);
        EXPECT_EQ(getRAIDSystem(), raidSystem);
    }
    for (const int count : {2, 0, 5}) {
        EXPECT_EQ(process(processEventXML, eventsNumbered(1, count)), 0);
        EXPECT_EQ(currentEvents(), count);
        EXPECT_EQ(getRAIDEvents(), raidEvents);
    }
}

TEST_F(Envelope, KeepsConfigurationAndEventsApart) {
    process(processXML, systemNamed("host"));
    process(processEventXML, eventsNumbered(1, 2));
    process(processEventXML, "");
    EXPECT_EQ(currentSystem(), "host");
    process(processEventXML, eventsNumbered(1, 2));
    process(processXML, "");
    EXPECT_EQ(currentEvents(), 2);
}

TEST_F(Envelope, ReadsNoFurtherThanTheLengthItIsGiven) {
    const std::string behind = good + systemNamed("behind");
    processXML(handOver(behind), static_cast<int>(good.size()));
    EXPECT_NE(getRAIDSystem(), nullptr);
    processXML(handOver(good), static_cast<int>(good.find("</ac:system")));
    EXPECT_EQ(getRAIDSystem(), nullptr);
}

TEST_F(Envelope, AcceptsSpaceBetweenItsElements) {
    process(processXML, replaced(good, "><", ">\r\n\t <"));
    ASSERT_NE(getRAIDSystem(), nullptr);
    EXPECT_EQ(getRAIDSystem()->getAdapters().size(), 1U);
}

struct Returned : Row {
    std::string document;
    int number;
};

std::string returning(std::string_view value) { return newestEventDocument(value); }

const std::vector<Returned> returned{
    {"Number", returning("17"), 17},
    {"Zero", returning("0"), 0},
    {"NegativeNumber", returning("-3"), -3},
    {"SignedNumber", returning("+3"), 3},
    {"NumberInSpace", returning(" \n12 "), 12},
    {"LeadingDigits", returning("12abc"), 12},
    {"Letters", returning("abc"), 0},
    {"Nothing", returning(""), 0},
    {"LargestNumber", returning("2147483647"), INT_MAX},
    {"SmallestNumber", returning("-2147483648"), INT_MIN},
    {"NumberAboveTheLargest", returning("99999999999"), INT_MAX},
    {"NumberBelowTheSmallest", returning("-99999999999"), INT_MIN},
    {"NumberInAnyResponse", replaced(returning("5"), "m:getNewestEventResponse", "x"), 5},
    {"NumberInAnyReturnElement", replaced(returning("5"), "as:return", "y"), 5},
    {"NumberBehindAnotherProlog", replaced(returning("5"), "?xml", "?xmm"), 0},
    {"NumberInAnotherEnvelope", replaced(returning("5"), "env:Envelope", "Envelope"), 0},
    {"NumberInAnotherBody", replaced(returning("5"), "env:Body", "Body"), 0},
    {"EmptyAnswer", "", 0},
};

class ReturnedNumber : public FreshLibrary, public testing::WithParamInterface<Returned> {};

TEST_P(ReturnedNumber, IsReadFromTheReturnElement) {
    writeLogLevel(8);
    EXPECT_EQ(process(processReturnValueXML, GetParam().document), GetParam().number);
    // Whether a number was looked for, and that the document went, shows in the log.
    EXPECT_TRUE(readLog().ends_with("before free\nafter free\n"));
}

INSTANTIATE_TEST_SUITE_P(Documents, ReturnedNumber, testing::ValuesIn(returned), nameOfRow);

TEST_F(Envelope, TellsOfTheReturnedNumberInTheLog) {
    writeLogLevel(8);
    EXPECT_EQ(process(processReturnValueXML, returning("5")), 5);
    EXPECT_EQ(readLog(), "before atoi\nafter atoi\nbefore free\nafter free\n");
}

TEST_F(Envelope, LooksForNoReturnedNumberInAnotherEnvelope) {
    writeLogLevel(8);
    EXPECT_EQ(process(processReturnValueXML, replaced(returning("5"), "env:Body", "Body")), 0);
    EXPECT_EQ(readLog(), "before free\nafter free\n");
}

}  // namespace
