#pragma once

#include <string>
#include <string_view>

// Elements as the service writes them.
namespace raid::test {

// `name` stands with its prefix; without a type there is no "xsi:type" attribute.
[[nodiscard]] inline std::string element(std::string_view name, std::string_view content,
                                         std::string_view type = {}) {
    std::string text = "<";
    text.append(name);
    if (!type.empty()) {
        text.append(" xsi:type=\"").append(type).append("\"");
    }
    text.append(">").append(content).append("</").append(name).append(">");
    return text;
}

[[nodiscard]] inline std::string element(std::string_view name, int number) {
    return element(name, std::to_string(number));
}

}  // namespace raid::test
