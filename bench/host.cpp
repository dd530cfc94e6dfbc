// A host that asks once and reads one count: the least that a program can do with the library. The
// commands of raidinfo are measured against it (see client.py).

#include "RAIDInstrumentation.h"

int main() {
    RAIDinit();
    return getRAIDDiskDriveCount() > 0 ? 0 : 1;
}
