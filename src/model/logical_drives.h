#pragma once

#include <string>
#include <vector>

#include "../xml/blank.h"

// Logical drives, as they stand under the adapter and again inside each array. Codes and units are
// the service's own. All classes are plain values: getters return copies, and a text or a number
// that the document does not have stays empty or 0. A reading constructor takes the text at the
// element's start tag and its length, reports the bytes of the element through consumed, and
// throws RAIDXMLError for a malformed element.

/// ac:chunks; its content is not kept.
class [[gnu::visibility("default")]] RAIDChunks {
public:
    RAIDChunks() = default;
    RAIDChunks(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getChunksType() const { return chunksType; }
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDChunks>;

    std::string chunksType;  // xsi:type
};

/// ac:limits, which is stepped over.
class [[gnu::visibility("default")]] RAIDLimits {
public:
    RAIDLimits(const char* text, int length, int* consumed);
    [[gnu::visibility("hidden")]] explicit RAIDLimits(raid::Blank) {}

private:
    friend struct raid::xml::Vocabulary<RAIDLimits>;

    std::string limitsType;  // xsi:type
};

/// ac:progress, which is stepped over: the progress of a running task is not kept.
class [[gnu::visibility("default")]] RAIDProgress {
public:
    RAIDProgress(const char* text, int length, int* consumed);
    [[gnu::visibility("hidden")]] explicit RAIDProgress(raid::Blank) {}

private:
    friend struct raid::xml::Vocabulary<RAIDProgress>;

    std::string progressType;  // xsi:type
};

/// ac:logicalDrive
class [[gnu::visibility("default")]] RAIDLogicalDrive {
public:
    RAIDLogicalDrive(const char* text, int length, int* consumed);
    [[gnu::visibility("hidden")]] explicit RAIDLogicalDrive(raid::Blank) {}

    [[nodiscard]] std::string getLogicalDriveType() const { return logicalDriveType; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] int getType() const { return type; }
    [[nodiscard]] int getStripeUnitSize() const { return stripeUnitSize; }
    [[nodiscard]] int getBlocked() const { return blocked; }
    [[nodiscard]] int getWriteCacheMode() const { return writeCacheMode; }
    [[nodiscard]] int getRaidLevel() const { return raidLevel; }
    [[nodiscard]] int getLogicalDriveID() const { return logicalDriveID; }
    [[nodiscard]] int getDataSpace() const { return dataSpace; }
    [[nodiscard]] int getParitySpace() const { return paritySpace; }
    [[nodiscard]] int getShared() const { return shared; }
    [[nodiscard]] int getState() const { return state; }
    [[nodiscard]] int getR5eeSubstate() const { return r5eeSubstate; }
    [[nodiscard]] std::string getName() const { return name; }
    [[nodiscard]] int getReadCacheMode() const { return readCacheMode; }
    [[nodiscard]] RAIDChunks getChunks() const { return chunks; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getArrayID() const { return arrayID; }
    [[nodiscard]] int getLogicalID() const { return logicalID; }

    void setArrayID(int array) { arrayID = array; }
    void setStructureData(int adapter, int array) {
        adapterID = adapter;
        arrayID = array;
    }
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDLogicalDrive>;

    std::string logicalDriveType;  // xsi:type
    int overallStatus = 0;
    int type = 0;
    int stripeUnitSize = 0;
    int blocked = 0;
    int writeCacheMode = 0;
    int raidLevel = 0;
    int logicalDriveID = 0;
    int dataSpace = 0;
    int paritySpace = 0;
    int shared = 0;
    int state = 0;
    int r5eeSubstate = 0;
    std::string name;
    int readCacheMode = 0;
    RAIDChunks chunks;
    int adapterID = 0;
    int arrayID = -1;  // in no array until numbering tells
    int logicalID = 0;
};

/// ac:logicalDrives
class [[gnu::visibility("default")]] RAIDLogicalDrives {
public:
    RAIDLogicalDrives() = default;
    RAIDLogicalDrives(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getLogicalDrivesType() const { return logicalDrivesType; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] std::vector<RAIDLogicalDrive> getLogicalDrive() const { return logicalDrive; }
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDLogicalDrives>;
    friend struct raid::Navigation;

    std::string logicalDrivesType;  // xsi:type
    int overallStatus = 0;
    std::vector<RAIDLogicalDrive> logicalDrive;  // in document order
};
