#include "application.h"

int main(int argc, char** argv) { return raidinfo::runProgram(argc, argv); }
