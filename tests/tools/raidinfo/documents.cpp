#include "documents.h"

#include <cstddef>

#include "support/documents.h"

namespace raidinfo::test {
namespace {

std::string drive(int channel, int device) {
    return complex("hardDrive", "o:HardDrive",
                   simple({{"adapterID", "0"},
                           {"channelID", std::to_string(channel)},
                           {"deviceID", std::to_string(device)},
                           {"vendor", "Smith &amp; Sons"},
                           {"size", "34715"}}));
}

std::string enclosure(int channel, int device, int fans) {
    std::string parts;
    for (int index = 0; index < fans; ++index) {
        parts +=
            complex("fan", "o:Fan", simple({{"index", std::to_string(index)}, {"status", "1"}}));
    }
    return complex(
        "enclosure", "o:Enclosure",
        simple({{"channelID", std::to_string(channel)}, {"deviceID", std::to_string(device)}}) +
            parts + complex("tempSensor", "o:TempSensor", simple({{"status", "40"}})));
}

std::string channel(int id, const std::string& content) {
    return complex("channel", "o:Channel",
                   simple({{"channelID", std::to_string(id)}, {"initiatorID", "7"}}) + content);
}

std::string logicalDrive(int id) {
    return complex("logicalDrive", "o:LogicalDrive",
                   simple({{"logicalDriveID", std::to_string(id)}, {"raidLevel", "5"}}));
}

std::string basicArray(int id, const std::string& logicalDrives, const std::string& channels) {
    return complex("basicArray", "o:BasicArray",
                   simple({{"arrayID", std::to_string(id)}}) +
                       complex("logicalDrives", "o:LogicalDrives", logicalDrives) +
                       complex("physicalDrives", "o:PhysicalDrives", channels));
}

}  // namespace

std::string complex(const std::string& name, const std::string& type, const std::string& content) {
    return "<ac:" + name + " xsi:type=\"" + type + "\">" + content + "</ac:" + name + ">";
}

std::string simple(const Fields& fields) {
    std::string text;
    for (const auto& [key, value] : fields) {
        text += "<as:" + key + " xsi:type=\"xsd:string\">" + value + "</as:" + key + ">";
    }
    return text;
}

std::string configuration(const std::string& adapters) {
    return raid::test::configDocument(complex("system", "o:System", adapters));
}

std::string sampleAdapter() {
    const std::string spanned = complex(
        "spannedArray", "o:SpannedArray",
        simple({{"arrayID", "5"}}) + complex("logicalDrives", "o:LogicalDrives", logicalDrive(1)) +
            complex("arrays", "o:Arrays", basicArray(6, "", channel(2, drive(2, 0)))));
    return complex(
        "adapter", "o:PellionAdapter",
        simple({{"adapterID", "0"}, {"typeName", "Pellion 4220"}, {"overallStatus", "1"}}) +
            complex(
                "arrays", "o:Arrays",
                basicArray(0, logicalDrive(0), channel(1, drive(1, 0) + drive(1, 9))) + spanned) +
            complex("logicalDrives", "o:LogicalDrives",
                    logicalDrive(0) + logicalDrive(1) + logicalDrive(2)) +
            complex("hotSpareDrives", "o:HotSpareDrives", drive(1, 2)) +
            complex("physicalDrives", "o:PhysicalDrives",
                    channel(1, drive(1, 0) + drive(1, 2) + enclosure(1, 15, 1)) +
                        channel(2, drive(2, 0) + enclosure(2, 14, 2))));
}

namespace {

std::string batchOf(const std::vector<int>& numbers, const std::string& message) {
    std::string events;
    for (const int number : numbers) {
        events += complex("event", "o:Event",
                          simple({{"sequenceNumber", std::to_string(number)},
                                  {"date", "2006-10-02"},
                                  {"type", "Warning"},
                                  {"string", message + " " + std::to_string(number)},
                                  {"channel", "1"},
                                  {"deviceID", "3"}}));
    }
    return raid::test::eventsDocument(complex("events", "o:Events", events));
}

}  // namespace

std::string eventBatch(const std::vector<int>& numbers) { return batchOf(numbers, "event"); }

std::string otherEventBatch(const std::vector<int>& numbers) {
    return batchOf(numbers, "other event");
}

}  // namespace raidinfo::test
