#pragma once

#include <filesystem>
#include <string_view>

#include "system/descriptor.h"

namespace raidinfo {

/// Whether a file to write stands for the standard output: "-", or the device, which leads to the
/// null device while there is an Output.
[[nodiscard]] bool isStandardOutput(const std::filesystem::path& file);

/// The program's standard output, kept clean: the library prints a line per exchange on descriptor
/// 1, so that one is pointed at the null device and the program writes to a copy of the original.
/// That there is none is told when something is to be written.
class Output {
public:
    Output();

    /// Writes all of the text, or fails with the reason.
    void write(std::string_view text) const;

    [[nodiscard]] int descriptor() const noexcept { return original.get(); }

private:
    Descriptor original;
};

}  // namespace raidinfo
