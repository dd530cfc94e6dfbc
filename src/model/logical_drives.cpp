#include "model/logical_drives.h"

#include "model/logical_drives_vocabulary.h"

RAIDChunks::RAIDChunks(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDLimits::RAIDLimits(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDProgress::RAIDProgress(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDLogicalDrive::RAIDLogicalDrive(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDLogicalDrives::RAIDLogicalDrives(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}
