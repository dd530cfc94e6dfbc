// The error of malformed documents and its context.

#include <gtest/gtest.h>

#include "xml/raid_xml_error.h"

namespace {

TEST(XMLError, BeginsItsTextWithWhatItIs) {
    EXPECT_EQ(RAIDXMLError("what").getMessage(), "XML syntax error: what");
    EXPECT_EQ(RAIDXMLError("").getMessage(), "XML syntax error: ");
}

TEST(XMLError, IsAValue) {
    const RAIDXMLError error("what");
    const RAIDXMLError copied(error);
    EXPECT_EQ(copied.getMessage(), error.getMessage());
    RAIDXMLError assigned("else");
    assigned = error;
    EXPECT_EQ(assigned.getMessage(), error.getMessage());
}

TEST(XMLError, GathersContextFromTheInsideOut) {
    std::string message;
    try {
        try {
            try {
                throw RAIDXMLError("what");
            } catch (RAIDXMLError& error) {
                processException("association", "", error);
            }
        } catch (RAIDXMLError& error) {
            processException("system", "host", error);
        }
    } catch (const RAIDXMLError& error) {
        message = error.getMessage();
    }
    EXPECT_EQ(message, "XML syntax error: what\nassociation:\n\nsystem:host\n");
}

}  // namespace
