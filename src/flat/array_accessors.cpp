#include "flat/accessors.h"
#include "flat/lists.h"

using namespace raid::flat;

int getArrayCount() { return count(RAIDArrayList); }

int getArrayAdapterID(int position) {
    return number<&RAIDBasicArray::getAdapterID>(RAIDArrayList, position);
}
int getArraySpannedArrayIndex(int position) {
    return number<&RAIDBasicArray::getSpannedArrayIndex>(RAIDArrayList, position);
}
int getArraySize(int position) { return number<&RAIDBasicArray::getSize>(RAIDArrayList, position); }
int getArrayFreeSpace(int position) {
    return number<&RAIDBasicArray::getFreeSpace>(RAIDArrayList, position);
}
int getArrayType(int position) { return number<&RAIDBasicArray::getType>(RAIDArrayList, position); }
int getArrayArrayID(int position) {
    return number<&RAIDBasicArray::getArrayID>(RAIDArrayList, position);
}
int getArrayStripeSize(int position) {
    return number<&RAIDBasicArray::getStripeSize>(RAIDArrayList, position);
}

int getArrayAdapterIDString(char* destination, int position) {
    return displayName<"RAID Adapter %d", &RAIDBasicArray::getAdapterID>(destination, RAIDArrayList,
                                                                         position);
}
int getArrayArrayIDString(char* destination, int position) {
    return displayName<"RAID Array %d", &RAIDBasicArray::getArrayID>(destination, RAIDArrayList,
                                                                     position);
}

int getSpannedArrayCount() { return count(SpannedRAIDArrayList); }

int getSpannedArraySpannedArrayIndex(int position) {
    return number<&RAIDSpannedArray::getSpannedArrayIndex>(SpannedRAIDArrayList, position);
}
int getSpannedArrayAdapterID(int position) {
    return number<&RAIDSpannedArray::getAdapterID>(SpannedRAIDArrayList, position);
}
int getSpannedArraySize(int position) {
    return number<&RAIDSpannedArray::getSize>(SpannedRAIDArrayList, position);
}
int getSpannedArrayFreeSpace(int position) {
    return number<&RAIDSpannedArray::getFreeSpace>(SpannedRAIDArrayList, position);
}
int getSpannedArrayType(int position) {
    return number<&RAIDSpannedArray::getType>(SpannedRAIDArrayList, position);
}
int getSpannedArrayArrayID(int position) {
    return number<&RAIDSpannedArray::getArrayID>(SpannedRAIDArrayList, position);
}
int getSpannedArrayStripeSize(int position) {
    return number<&RAIDSpannedArray::getStripeSize>(SpannedRAIDArrayList, position);
}

int getSpannedArrayAdapterIDString(char* destination, int position) {
    return displayName<"RAID Adapter %d", &RAIDSpannedArray::getAdapterID>(
        destination, SpannedRAIDArrayList, position);
}
int getSpannedArrayArrayIDString(char* destination, int position) {
    return displayName<"RAID Array %d", &RAIDSpannedArray::getArrayID>(
        destination, SpannedRAIDArrayList, position);
}
