#include "model/enclosures.h"

#include "model/enclosures_vocabulary.h"

RAIDFan::RAIDFan(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDPowerSupply::RAIDPowerSupply(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDTempSensor::RAIDTempSensor(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDDeviceSlotID::RAIDDeviceSlotID(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDEnclosureDevice::RAIDEnclosureDevice(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}
