#include "model/arrays.h"

#include "model/arrays_vocabulary.h"

RAIDBasicArray::RAIDBasicArray(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDArrays::RAIDArrays(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDSpannedArray::RAIDSpannedArray(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}
