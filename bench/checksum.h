#pragma once

#include <cstdint>
#include <string>
#include <tuple>
#include <vector>

#include "model/arrays_vocabulary.h"
#include "model/channels_and_drives_vocabulary.h"
#include "model/enclosures_vocabulary.h"
#include "model/logical_drives_vocabulary.h"
#include "model/system_and_adapter_vocabulary.h"

namespace raid::bench {

/// One number over every field of a model object and of all below it, in order.
class Checksum {
public:
    template <class Model>
    void add(const Model& model) {
        addText(model.*xml::Vocabulary<Model>::type);
        if constexpr (xml::HasChildren<Model>) {
            std::apply([&](const auto&... rows) { (addRow(model, rows), ...); },
                       xml::Vocabulary<Model>::children);
        }
    }

    template <class Item>
    void addAll(const std::vector<Item>& items) {
        mix(items.size());
        for (const auto& item : items) {
            add(item);
        }
    }

    [[nodiscard]] std::uint64_t value() const { return sum; }

    /// The bytes of the texts that were added.
    [[nodiscard]] std::size_t textBytes() const { return bytes; }

private:
    template <class Model>
    void addRow(const Model& model, const xml::Child<Model>& row) {
        if (row.number != nullptr) {
            mix(static_cast<std::uint64_t>(model.*row.number));
        } else {
            addText(model.*row.text);
        }
    }
    template <class Model, class Row>
    void addRow(const Model& model, const Row& /*row*/) {
        if constexpr (requires { Row::list; }) {
            addAll(model.*Row::list);
        } else if constexpr (requires { Row::member; }) {
            add(model.*Row::member);
        }
    }

    void addText(const std::string& text) {
        bytes += text.size();
        mix(text.size());
        for (const char c : text) {
            mix(static_cast<unsigned char>(c));
        }
    }

    void mix(std::uint64_t value) { sum = (sum ^ value) * 0x100000001B3U; }

    std::uint64_t sum = 0xCBF29CE484222325U;
    std::size_t bytes = 0;
};

}  // namespace raid::bench
