#include "health/message.h"

namespace raidinfo::health {

Message::Message(const settings::Setting& setting) {
    std::string_view rest = textOf(setting);
    while (!rest.empty()) {
        const std::size_t brace = rest.find_first_of("{}");
        if (brace != 0) {
            parts.push_back({false, std::string{rest.substr(0, brace)}});
            rest.remove_prefix(parts.back().text.size());
        } else if (rest.substr(1).starts_with(rest.front())) {
            parts.push_back({false, std::string{rest.front()}});
            rest.remove_prefix(2);
        } else {
            const std::size_t end = rest.find('}');
            if (end == 0 || end == std::string_view::npos) {
                refuse(setting.place, "a brace stands alone; {{ and }} mean one in the text");
            }
            parts.push_back({true, std::string{rest.substr(1, end - 1)}});
            rest.remove_prefix(end + 1);
        }
    }
    if (parts.empty()) {
        refuse(setting.place, "the message is empty");
    }
}

std::vector<std::string> Message::fields() const {
    std::vector<std::string> names;
    for (const Part& part : parts) {
        if (part.isField) {
            names.push_back(part.text);
        }
    }
    return names;
}

std::string Message::filled(
    const std::function<std::string(const std::string& field)>& shown) const {
    std::string text;
    for (const Part& part : parts) {
        text += part.isField ? shown(part.text) : part.text;
    }
    return text;
}

}  // namespace raidinfo::health
