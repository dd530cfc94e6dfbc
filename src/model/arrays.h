#pragma once

#include <string>
#include <vector>

#include "../xml/blank.h"
#include "channels_and_drives.h"
#include "logical_drives.h"

// An adapter's arrays. A spanned array is built over other arrays and holds them in a collection of
// its own, so the structure repeats itself inside. Codes and units are the service's own. All
// classes are plain values: getters return copies, and a text or a number that the document does
// not have stays empty or 0. A reading constructor takes the text at the element's start tag and
// its length, reports the bytes of the element through consumed, and throws RAIDXMLError for a
// malformed element.

/// ac:basicArray
class [[gnu::visibility("default")]] RAIDBasicArray {
public:
    RAIDBasicArray(const char* text, int length, int* consumed);
    [[gnu::visibility("hidden")]] explicit RAIDBasicArray(raid::Blank) {}

    [[nodiscard]] std::string getBasicArrayType() const { return basicArrayType; }
    [[nodiscard]] int getIsSubArray() const { return isSubArray; }
    [[nodiscard]] int getType() const { return type; }
    [[nodiscard]] int getStripeSize() const { return stripeSize; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] int getFreeSpace() const { return freeSpace; }
    [[nodiscard]] std::string getPreferredOwner() const { return preferredOwner; }
    [[nodiscard]] int getSize() const { return size; }
    [[nodiscard]] std::string getName() const { return name; }
    [[nodiscard]] int getArrayID() const { return arrayID; }
    [[nodiscard]] RAIDLogicalDrives getLogicalDrives() const { return logicalDrives; }
    [[nodiscard]] RAIDPhysicalDrives getPhysicalDrives() const { return physicalDrives; }
    [[nodiscard]] std::vector<RAIDHardDrive> getHardDrives() const { return hardDrives; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getSpannedArrayIndex() const { return spannedArrayIndex; }

    void setSpannedArrayIndex(int index) { spannedArrayIndex = index; }
    void setStructureData(int adapter);
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDBasicArray>;
    friend struct raid::Navigation;

    std::string basicArrayType;  // xsi:type
    int isSubArray = 0;
    int type = 0;
    int stripeSize = 0;
    int overallStatus = 0;
    int freeSpace = 0;
    std::string preferredOwner;
    int size = 0;
    std::string name;
    int arrayID = 0;
    RAIDLogicalDrives logicalDrives;
    RAIDPhysicalDrives physicalDrives;      // the members, grouped by channel
    std::vector<RAIDHardDrive> hardDrives;  // direct members, in document order
    int adapterID = 0;
    int spannedArrayIndex = -1;
};

class RAIDSpannedArray;

/// ac:arrays
class [[gnu::visibility("default")]] RAIDArrays {
public:
    RAIDArrays() = default;
    RAIDArrays(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getArraysType() const { return arraysType; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] std::vector<RAIDBasicArray> getBasicArray() const { return basicArray; }
    [[nodiscard]] std::vector<RAIDSpannedArray> getSpannedArray() const;
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDArrays>;
    friend struct raid::Navigation;

    std::string arraysType;  // xsi:type
    int overallStatus = 0;
    std::vector<RAIDBasicArray> basicArray;      // in document order of their kind
    std::vector<RAIDSpannedArray> spannedArray;  // in document order of their kind
};

/// ac:spannedArray
class [[gnu::visibility("default")]] RAIDSpannedArray {
public:
    RAIDSpannedArray(const char* text, int length, int* consumed);
    [[gnu::visibility("hidden")]] explicit RAIDSpannedArray(raid::Blank) {}

    [[nodiscard]] std::string getSpannedArrayType() const { return spannedArrayType; }
    [[nodiscard]] int getType() const { return type; }
    [[nodiscard]] int getStripeSize() const { return stripeSize; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] int getFreeSpace() const { return freeSpace; }
    [[nodiscard]] std::string getPreferredOwner() const { return preferredOwner; }
    [[nodiscard]] int getSize() const { return size; }
    [[nodiscard]] std::string getName() const { return name; }
    [[nodiscard]] int getArrayID() const { return arrayID; }
    [[nodiscard]] RAIDLogicalDrives getLogicalDrives() const { return logicalDrives; }
    [[nodiscard]] RAIDArrays getArrays() const { return arrays; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getSpannedArrayIndex() const { return spannedArrayIndex; }

    void setSpannedArrayIndex(int index) { spannedArrayIndex = index; }
    void setStructureData(int adapter);
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDSpannedArray>;
    friend struct raid::Navigation;

    std::string spannedArrayType;  // xsi:type
    int type = 0;
    int stripeSize = 0;
    int overallStatus = 0;
    int freeSpace = 0;
    std::string preferredOwner;
    int size = 0;
    std::string name;
    int arrayID = 0;
    RAIDLogicalDrives logicalDrives;
    RAIDArrays arrays;  // what the array is built over
    int adapterID = 0;
    int spannedArrayIndex = -1;
};

inline std::vector<RAIDSpannedArray> RAIDArrays::getSpannedArray() const { return spannedArray; }
