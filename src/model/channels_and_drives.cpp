#include "model/channels_and_drives.h"

#include "model/channels_and_drives_vocabulary.h"

RAIDHardDrive::RAIDHardDrive(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDChannel::RAIDChannel(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDPhysicalDrives::RAIDPhysicalDrives(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDHotSpareDrives::RAIDHotSpareDrives(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}
