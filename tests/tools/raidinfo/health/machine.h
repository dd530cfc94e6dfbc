#pragma once

#include <functional>
#include <string_view>

#include "inventory/kinds.h"
#include "inventory/records.h"
#include "inventory/tree.h"

namespace raidinfo::test {

// A machine that is well, for tests to spoil: an adapter with a channel of four drives, an array of
// the first three with a logical drive, a hot spare, and an enclosure with a part of each kind.
class Machine {
public:
    Machine();
    Machine(const Machine&) = delete;
    Machine& operator=(const Machine&) = delete;
    ~Machine() = default;

    void set(KindId kind, std::size_t position, std::string_view field, Value value);

    // What the tree knows beside the fields.
    void setExtra(Node& node, std::string_view key, Value value);
    [[nodiscard]] Node& adapter();
    [[nodiscard]] Node& drive(std::size_t position);
    [[nodiscard]] Node& member(std::size_t index);

    [[nodiscard]] const Group& trees() const { return adapters; }

private:
    void add(KindId kind, const std::map<std::string_view, Value>& values);
    [[nodiscard]] Node node(KindId kind, std::size_t position, const char* title,
                            Extras extras = {}) const;
    [[nodiscard]] Group drives() const;
    [[nodiscard]] Group enclosures() const;
    [[nodiscard]] Group arrays() const;

    Snapshot snapshot;
    Group adapters;
};

using Change = std::function<void(Machine&)>;

// A change of one field.
[[nodiscard]] Change setting(KindId kind, std::size_t position, std::string_view field,
                             const Value& value);

// One change after the other.
[[nodiscard]] Change all(std::vector<Change> changes);

}  // namespace raidinfo::test
