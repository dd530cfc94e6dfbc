// The C header, the tables of the tests and the built library name the same functions.

#include <gtest/gtest.h>

#include <map>
#include <sstream>
#include <string>

#include "accessor_families.h"
#include "exported.h"
#include "support/files.h"

namespace {

using namespace raid::test;

// Each function's signature, without the names of its parameters.
using Signatures = std::map<std::string, std::string>;

// "char* destination, int position" becomes "char*, int".
std::string withoutNames(const std::string& parameters) {
    std::istringstream each(parameters);
    std::string types;
    for (std::string parameter; std::getline(each >> std::ws, parameter, ',');) {
        types += (types.empty() ? "" : ", ") + parameter.substr(0, parameter.rfind(' '));
    }
    return types;
}

// Every declaration of the header stands on a line of its own.
Signatures declaredInHeader() {
    Signatures signatures;
    std::istringstream header(readFile(RAID_HEADER));
    for (std::string line; std::getline(header, line);) {
        const bool isFunction = line.starts_with("int ") || line.starts_with("void ");
        if (!isFunction || !line.ends_with(");")) {
            continue;
        }
        const auto name = line.find(' ') + 1;
        const auto open = line.find('(');
        const auto parameters = line.substr(open + 1, line.size() - 2 - (open + 1));
        signatures[line.substr(name, open - name)] =
            line.substr(0, name - 1) + "(" + withoutNames(parameters) + ")";
    }
    return signatures;
}

std::string signatureOf(Shape shape) {
    switch (shape) {
        case Shape::number:
        case Shape::flag:
            return "int(int)";
        case Shape::text:
        case Shape::status:
            return "void(char*, int)";
        case Shape::displayName:
            break;
    }
    return "int(char*, int)";
}

Signatures calledByTests() {
    Signatures signatures{
        {"RAIDinit", "int(void)"},
        {"setRefreshFlag", "void(void)"},
        {"getPellionIndex", "int(int)"},
        {"getPellionAdapterCacheReadPolicy", "int(void)"},
        {"getPellionAdapterInitiatorIDs", "void(char*, int)"},
        {"getLSIAdapterInitiatorIDs", "void(char*, int)"},
        {"getVantryAdapterInitiatorIDs", "void(char*, int)"},
        {"enableRAIDEvent", "int(void)"},
        {"setRAIDEventSequenceNumber", "void(int)"},
        {"getEvent", "int(void)"},
        {"cancelGetEvent", "void(void)"},
        {"getRAIDEventCount", "int(void)"},
    };
    for (const char* const number : {"SequenceNumber", "EventCode", "Adapter", "LogicalDrive",
                                     "Channel", "DeviceID", "EnclosureID"}) {
        signatures[std::string("getRAIDEvent") + number] = "int(int)";
    }
    for (const char* const text :
         {"Type", "MessageString", "Date", "ServerAddress", "ServerName"}) {
        signatures[std::string("getRAIDEvent") + text] = "void(char*, int)";
    }
    for (const AccessorFamily& family : accessorFamilies) {
        signatures["get" + family.name + "Count"] = "int(void)";
        for (const Field& field : family.fields) {
            signatures["get" + family.name + field.name] = signatureOf(field.shape);
        }
    }
    return signatures;
}

TEST(Header, DeclaresTheFunctionsThatTheTestsCallAndNoOthers) {
    EXPECT_EQ(declaredInHeader(), calledByTests());
}

TEST(Header, DeclaresExportedFunctionsOnly) {
    for (const auto& [name, signature] : declaredInHeader()) {
        EXPECT_NO_THROW((void)exported<void()>(name)) << signature;
    }
}

}  // namespace
