#include "inventory/value.h"

#include "overloaded.h"
#include "text/printable.h"

namespace raidinfo {
namespace {

std::string joined(const std::vector<int>& numbers) {
    std::string result;
    for (const int number : numbers) {
        result += (result.empty() ? "" : ",") + std::to_string(number);
    }
    return result;
}

}  // namespace

std::string shown(const Value& value) {
    return std::visit(
        Overloaded{[](int number) { return std::to_string(number); },
                   [](bool flag) { return std::string{flag ? "yes" : "no"}; },
                   [](const std::string& text) { return text.empty() ? "-" : printable(text); },
                   [](Unknown) { return std::string{unknownWord}; },
                   [](const std::vector<int>& numbers) {
                       return numbers.empty() ? "-" : joined(numbers);
                   }},
        value);
}

}  // namespace raidinfo
