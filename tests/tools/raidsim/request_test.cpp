#include "soap/request.h"

#include <gtest/gtest.h>

#include <string>

namespace raidsim::soap {
namespace {

std::string calling(const std::string& call) {
    return "<?xml version='1.0' ?><e:Envelope><e:Header/><e:Body>" + call +
           "</e:Body></e:Envelope>";
}

std::string errorOf(const std::string& body) {
    try {
        (void)decode(body);
    } catch (const RequestError& error) {
        return error.what();
    }
    return "none";
}

TEST(SoapRequest, NewestEventHasNoArguments) {
    EXPECT_TRUE(std::holds_alternative<GetNewestEvent>(
        decode(calling("<m:getNewestEvent></m:getNewestEvent>"))));
}

TEST(SoapRequest, WaitTellsTheLastRetrievedEvent) {
    const auto request =
        decode(calling("<m:waitNextEvent><as:lastRetrieved "
                       "xsi:type=\"x\">56</as:lastRetrieved></m:waitNextEvent>"));
    EXPECT_EQ(std::get<WaitNextEvent>(request).lastRetrieved, 56);
}

TEST(SoapRequest, EventsTellTheirRangeWithAnyPrefixAndBlanks) {
    const auto request =
        decode(calling("<getEvents> <x:end> 157 </x:end> <start>-1</start> </getEvents>"));
    EXPECT_EQ(std::get<GetEvents>(request).start, -1);
    EXPECT_EQ(std::get<GetEvents>(request).end, 157);
}

TEST(SoapRequest, ErrorsSayWhatIsWrong) {
    EXPECT_EQ(errorOf(""), "The request is not well-formed: line 1: there is no element");
    EXPECT_EQ(errorOf("<a/>"), "The request has no Envelope element");
    EXPECT_EQ(errorOf("<Envelope/>"), "The request has no Body element");
    EXPECT_EQ(errorOf(calling("")), "The request's Body is empty");
    EXPECT_EQ(errorOf(calling("<m:reboot/>")), "Unknown method reboot");
    EXPECT_EQ(errorOf(calling("<m:waitNextEvent/>")), "The argument lastRetrieved is missing");
    EXPECT_EQ(errorOf(calling("<m:getEvents><start>1</start></m:getEvents>")),
              "The argument end is missing");
    EXPECT_EQ(errorOf(calling("<m:getEvents><start>1x</start><end>2</end></m:getEvents>")),
              "The argument start is not a number");
    EXPECT_EQ(errorOf(calling("<m:getEvents><start>1</start><end>2147483648</end></m:getEvents>")),
              "The argument end is not a number");
}

}  // namespace
}  // namespace raidsim::soap
