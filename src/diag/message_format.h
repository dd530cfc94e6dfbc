#pragma once

#include <cstdio>
#include <string_view>

namespace raid::diag {

/// Widths and precisions above this are printed as they stand instead of being obeyed.
inline constexpr int widestField = 255;

/// Prints the message as a format whose arguments are all zero. Texts from the service come here
/// unseen, so a conversion that could read or write memory through an argument, name an argument
/// or print without bound is printed as it stands.
void printWithZeros(std::FILE* out, std::string_view message);

}  // namespace raid::diag
