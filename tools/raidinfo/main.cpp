#include "application.h"
#include "process/standard_descriptors.h"

int main(int argc, char** argv) {
    process::fillStandardDescriptors();
    return raidinfo::runProgram(argc, argv);
}
