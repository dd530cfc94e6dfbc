#include <RAIDInstrumentation.h>
#include <string.h>

/* Asks the service nothing; the lists are empty. */
int main(void) {
    char text[8] = "before";
    setRAIDEventSequenceNumber(17);
    getRAIDDiskDriveVendor(text, 0);
    return getPellionIndex(5) == 5 && getRAIDEventCount() == 0 && nextSequenceNumber == 17 &&
                   strcmp(text, "") == 0
               ? 0
               : 1;
}
