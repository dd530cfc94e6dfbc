#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "fault/fault.h"

namespace raidsim {

// A fault file: one case, or one for every combination of the values of what varies in it. Cases
// are made when they are asked for, since there may be many.
class FaultFile {
public:
    // Reads the file and makes its first and its last case, so that most mistakes show here. Throws
    // FileError or FaultError.
    explicit FaultFile(const std::string& path);

    // The path without its folders and its ending.
    [[nodiscard]] const std::string& name() const noexcept { return fileName; }
    [[nodiscard]] const std::string& title() const noexcept { return sentence; }
    [[nodiscard]] std::size_t cases() const noexcept { return count; }

    // Counted from 0. Throws FaultError.
    [[nodiscard]] FaultCase at(std::size_t number) const;

private:
    struct Line {
        std::size_t number;
        std::vector<std::string> words;
    };
    struct Variable {
        std::string name;
        std::vector<std::string> values;  // or else a range of numbers
        std::int64_t first = 0;
        std::int64_t last = -1;

        [[nodiscard]] std::size_t size() const;
        [[nodiscard]] std::string at(std::size_t index) const;
    };

    void take(Line line);
    void checkNames() const;
    static Variable variableOf(const std::vector<std::string>& words);

    std::string folder;
    std::string fileName;
    std::string sentence;
    std::vector<Variable> variables;
    std::vector<Line> lines;
    std::size_t count = 1;
};

// Cuts a line of a fault file into words. Inside double quotes blanks are kept, and the escapes
// that docs/faults.md lists stand for one byte. Throws FaultError.
[[nodiscard]] std::vector<std::string> faultWords(std::string_view line);

}  // namespace raidsim
