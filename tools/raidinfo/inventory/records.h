#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "inventory/kinds.h"
#include "inventory/value.h"
#include "library/library.h"
#include "library/text_buffer.h"

namespace raidinfo {

/// The fields of one record, in the order of its kind's fields.
using Record = std::vector<Value>;
using Records = std::vector<Record>;

/// The value of the field with this key, which must be a number of the kind.
[[nodiscard]] int numberOf(const Kind& kind, const Record& record, std::string_view key);

/// The greatest sequence number of events, 0 if there are none.
[[nodiscard]] std::int64_t greatestNumber(const Records& events);

/// The inventory as it stood at one moment: the records of each kind by position.
class Snapshot {
public:
    [[nodiscard]] const Records& of(KindId id) const { return lists[static_cast<std::size_t>(id)]; }
    [[nodiscard]] Records& of(KindId id) { return lists[static_cast<std::size_t>(id)]; }

private:
    std::array<Records, static_cast<std::size_t>(KindId::event)> lists;
};

/// Reads records through the library's count functions and accessors.
class RecordReader {
public:
    explicit RecordReader(Library library);

    [[nodiscard]] Records read(const Kind& kind);
    [[nodiscard]] Snapshot readInventory();

private:
    void readColumn(const Field& field, Records& records);
    [[nodiscard]] char* textBuffer();

    Library lib;
    std::optional<TextBuffer> buffer;  ///< reserved when first needed
};

}  // namespace raidinfo
