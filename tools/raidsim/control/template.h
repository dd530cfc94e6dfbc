#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "control/draw.h"

namespace raidsim {

// What scenarios call things by: `let spare adapter:1/channel:2/drive:1`.
class Names {
public:
    // Throws CommandError for what is no name, or stands for something already.
    void define(const std::string& name, const std::string& value);

    // The line with every {name} replaced. Throws CommandError for one that nothing is called.
    [[nodiscard]] std::string replacedIn(std::string_view line) const;

private:
    std::map<std::string, std::string, std::less<>> values;
};

// Which of its turns a step is at.
struct Turn {
    std::uint64_t number = 0;
    std::uint64_t of = 1;
};

// A command line that is another one at each turn: in `progress drive:3 {percent}`,
// `event deviceID={0..5} type={Warning|Critical} string="number {count}"` the braces hold what
// changes.
class Template {
public:
    // Throws CommandError.
    [[nodiscard]] static Template parse(std::string_view text);

    [[nodiscard]] bool varies() const noexcept { return variable; }

    // The line at a turn; choices are made by the draw.
    [[nodiscard]] std::string at(Turn turn, Draw draw) const;

    // Lines in which every choice is made once, and everything is at both its ends; to be checked
    // before the first turn.
    [[nodiscard]] std::vector<std::string> samples(std::uint64_t turns) const;

private:
    struct Percent {};
    struct Count {
        std::uint64_t from;
    };
    struct Range {
        int low;
        int high;
    };
    using Choices = std::vector<std::string>;
    using Choose = std::function<std::uint64_t(std::uint64_t ofSoMany)>;
    using Part = std::variant<std::string, Percent, Count, Range, Choices>;

    static Part parsePlaceholder(std::string_view text);
    [[nodiscard]] std::string filled(Turn turn, const Choose& choose) const;

    std::vector<Part> parts;
    bool variable = false;
};

}  // namespace raidsim
