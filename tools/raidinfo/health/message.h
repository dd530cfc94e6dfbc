#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "settings/setting.h"

namespace raidinfo::health {

/// What a rule says of a record: a text with {field} where a value of the record stands, and {{ or
/// }} for a brace.
class Message {
public:
    /// A brace without its other half is a Failure.
    explicit Message(const settings::Setting& setting);

    [[nodiscard]] std::vector<std::string> fields() const;

    [[nodiscard]] std::string filled(
        const std::function<std::string(const std::string& field)>& shown) const;

private:
    struct Part {
        bool isField;
        std::string text;
    };

    std::vector<Part> parts;
};

}  // namespace raidinfo::health
