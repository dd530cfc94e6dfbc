#include <RAIDInstrumentation.h>

#include <RAIDInstrumentation/agent/agent_link.h>
#include <RAIDInstrumentation/agent/envelope.h>
#include <RAIDInstrumentation/agent/exchange.h>
#include <RAIDInstrumentation/agent/saved_answers.h>
#include <RAIDInstrumentation/diag/debug.h>
#include <RAIDInstrumentation/flat/lists.h>
#include <RAIDInstrumentation/flat/packing.h>
#include <RAIDInstrumentation/flat/snapshot.h>
#include <RAIDInstrumentation/xml/parse_def_unit.h>
#include <RAIDInstrumentation/xml/raid_xml_error.h>
#include <iostream>
#include <string>
#include <string_view>

namespace {

RAIDSystem read(std::string_view text) {
    int consumed = 0;
    return {text.data(), static_cast<int>(text.size()), &consumed};
}

std::string errorOf(std::string_view text) {
    try {
        (void)read(text);
    } catch (const RAIDXMLError& error) {
        return error.getMessage();
    }
    return "none";
}

}  // namespace

// Reads a model object, and catches the library's exception on this side of its boundary.
int main() {
    const RAIDSystem system = read(
        "<ac:system><as:os>Linux</as:os><ac:adapter xsi:type=\"o:LSIAdapter\">"
        "<as:adapterID>3</as:adapterID></ac:adapter></ac:system>");
    const bool works = system.getOS() == "Linux" && system.getAdapters().size() == 1 &&
                       system.getAdapters().front().getAdapterID() == 3 &&
                       errorOf("<ac:system><as:color>").starts_with("XML syntax error: ") &&
                       getRAIDSystem() == nullptr && RAIDDiskDriveList.empty();
    std::cout << (works ? "works\n" : "does not work\n");
    return works ? 0 : 1;
}
