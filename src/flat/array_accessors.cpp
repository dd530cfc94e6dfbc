#include "flat/accessors.h"
#include "flat/lists.h"

namespace {

using BasicArray = RAIDBasicArray;
constexpr raid::flat::Family arrays(RAIDArrayList);
using SpannedArray = RAIDSpannedArray;
constexpr raid::flat::Family spannedArrays(SpannedRAIDArrayList);

}  // namespace

int getArrayCount() { return arrays.count(); }

int getArrayAdapterID(int at) { return arrays.number<&BasicArray::getAdapterID>(at); }
int getArraySpannedArrayIndex(int at) {
    return arrays.number<&BasicArray::getSpannedArrayIndex>(at);
}
int getArraySize(int at) { return arrays.number<&BasicArray::getSize>(at); }
int getArrayFreeSpace(int at) { return arrays.number<&BasicArray::getFreeSpace>(at); }
int getArrayType(int at) { return arrays.number<&BasicArray::getType>(at); }
int getArrayArrayID(int at) { return arrays.number<&BasicArray::getArrayID>(at); }
int getArrayStripeSize(int at) { return arrays.number<&BasicArray::getStripeSize>(at); }

int getArrayAdapterIDString(char* to, int at) {
    return arrays.displayName<"RAID Adapter %d", &BasicArray::getAdapterID>(to, at);
}
int getArrayArrayIDString(char* to, int at) {
    return arrays.displayName<"RAID Array %d", &BasicArray::getArrayID>(to, at);
}

int getSpannedArrayCount() { return spannedArrays.count(); }

int getSpannedArraySpannedArrayIndex(int at) {
    return spannedArrays.number<&SpannedArray::getSpannedArrayIndex>(at);
}
int getSpannedArrayAdapterID(int at) {
    return spannedArrays.number<&SpannedArray::getAdapterID>(at);
}
int getSpannedArraySize(int at) { return spannedArrays.number<&SpannedArray::getSize>(at); }
int getSpannedArrayFreeSpace(int at) {
    return spannedArrays.number<&SpannedArray::getFreeSpace>(at);
}
int getSpannedArrayType(int at) { return spannedArrays.number<&SpannedArray::getType>(at); }
int getSpannedArrayArrayID(int at) { return spannedArrays.number<&SpannedArray::getArrayID>(at); }
int getSpannedArrayStripeSize(int at) {
    return spannedArrays.number<&SpannedArray::getStripeSize>(at);
}

int getSpannedArrayAdapterIDString(char* to, int at) {
    return spannedArrays.displayName<"RAID Adapter %d", &SpannedArray::getAdapterID>(to, at);
}
int getSpannedArrayArrayIDString(char* to, int at) {
    return spannedArrays.displayName<"RAID Array %d", &SpannedArray::getArrayID>(to, at);
}
