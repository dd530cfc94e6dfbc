#include <iostream>

#include "layout.h"

int main() { std::cout << raid::test::layoutOfTheModelClasses(); }
