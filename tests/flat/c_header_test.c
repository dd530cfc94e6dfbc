#include "c_header_test.h"

#include <stddef.h>
#include <string.h>

#include "RAIDInstrumentation.h"

/* Without C++ in between, every shape is a plain C function type. */
typedef int Count(void);
typedef int Number(int);
typedef void Text(char*, int);
typedef int DisplayName(char*, int);

static Count* const counts[] = {
    getPellionAdapterCount,   getLSIAdapterCount,      getVantryAdapterCount,
    getChannelCount,          getArrayCount,           getSpannedArrayCount,
    getRAIDLogicalDriveCount, getRAIDDiskDriveCount,   getRAIDEnclosureDeviceCount,
    getRAIDFanCount,          getRAIDPowerSupplyCount, getRAIDTempSensorCount,
};

static const char* faultOfInventory(void) {
    Number* const id = getPellionAdapterAdapterID;
    Text* const typeName = getPellionAdapterTypeName;
    Text* const status = getPellionAdapterOverallStatusString;
    DisplayName* const name = getPellionAdapterAdapterIDString;
    char buffer[32] = "";
    size_t at = 0;

    setRefreshFlag();
    for (at = 0; at < sizeof counts / sizeof *counts; ++at) {
        if (counts[at]() != (at == 0 ? 1 : 0)) {
            return "a count";
        }
    }
    if (id(0) != 3) {
        return "a number";
    }
    typeName(buffer, 0);
    if (strcmp(buffer, "C") != 0) {
        return "a text";
    }
    status(buffer, 0);
    if (strcmp(buffer, "Critical") != 0) {
        return "a status text";
    }
    if (name(buffer, 0) != 17 || strcmp(buffer, "Pellion Adapter 3") != 0) {
        return "a display name";
    }
    return NULL;
}

static const char* faultOfEvents(void) {
    setRAIDEventSequenceNumber(9);
    if (getEvent() != 0 || getRAIDEventCount() != 1 || getRAIDEventSequenceNumber(0) != 9 ||
        nextSequenceNumber != 10) {
        return "the events";
    }
    return NULL;
}

static const char* faultOfGlobals(void) {
    if (refresh != 0 || initialized != 0 || endFlag != 0 || cancelEvent != 0 || configRead == 0 ||
        LOG_LEVEL != 0) {
        return "a flag";
    }
    if (pthread_mutex_lock(&mutex_handle) != 0 || pthread_mutex_unlock(&mutex_handle) != 0) {
        return "the lock";
    }
    return NULL;
}

const char* faultThatCFinds(void) {
    const char* fault = faultOfInventory();
    if (fault == NULL) {
        fault = faultOfEvents();
    }
    return fault != NULL ? fault : faultOfGlobals();
}
