#pragma once

#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

#include "RAIDInstrumentation.h"
#include "support/elements.h"
#include "support/scripted_service.h"

namespace raid::test {

// Lets the library read and publish a configuration with these adapters.
inline void publish(std::string_view adapters) {
    const ScriptedService service(
        {answering(configDocument(element("ac:system", adapters, "o:System")))});
    RAIDinit();
}

// The content inside the elements, the outermost first.
[[nodiscard]] inline std::string inside(const std::vector<std::string>& elements,
                                        std::string content) {
    for (auto name = elements.rbegin(); name != elements.rend(); ++name) {
        content = element(*name, content);
    }
    return content;
}

// What a number accessor returns for each position of its list.
[[nodiscard]] inline std::vector<int> all(int (*count)(), int (*read)(int)) {
    std::vector<int> values;
    for (int at = 0; at < count(); ++at) {
        values.push_back(read(at));
    }
    return values;
}

// What an accessor writes into a buffer that held "untouched".
template <class Result>
[[nodiscard]] std::string written(Result (*read)(char*, int), int position) {
    std::string buffer(256, '\0');
    buffer.replace(0, 9, "untouched");
    read(buffer.data(), position);
    return buffer.c_str();
}

}  // namespace raid::test
