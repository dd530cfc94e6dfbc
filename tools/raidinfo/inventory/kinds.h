#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

namespace raidinfo {

/// How a field is read from the library and what it means to the reader.
enum class Shape : std::uint8_t {
    number,       ///< int(int position)
    flag,         ///< int(int position), 0 or 1
    constant,     ///< int(void)
    text,         ///< void(char*, int position)
    statusText,   ///< void(char*, int position); an unknown status leaves the buffer alone
    displayName,  ///< int(char*, int position)
    numbers,      ///< void(char*, int position), decimal numbers separated by commas
};

/// Where people see a field besides `show`: in the columns that a listing has unless others are
/// asked for, and in the one-line summary of a record, too.
enum class Summary : std::uint8_t { no, column, yes };

/// One field of a kind: the library's function, the JSON key, the column title.
struct Field {
    const char* function;
    std::string_view key;
    std::string_view title;
    Shape shape;
    Summary summary = Summary::no;
};

/// Whose number a field of the tree is.
enum class Holder : std::uint8_t { adapter, channel, enclosure };

/// What only the library's model tells of a record: the tree has it among the record's extras, or
/// it is the number of what the record belongs to.
struct TreeField {
    std::string_view key;
    std::string_view title;
    Shape shape;
    Summary summary = Summary::no;
    std::optional<Holder> holder = std::nullopt;
};

enum class KindId : std::uint8_t {
    pellionAdapter,
    lsiAdapter,
    vantryAdapter,
    channel,
    array,
    spannedArray,
    logicalDrive,
    diskDrive,
    enclosure,
    fan,
    powerSupply,
    temperatureSensor,
    event,
};

/// The key of a list with the adapters of every family, such as the trees begin with.
inline constexpr std::string_view adaptersKey = "adapters";

/// The kinds of the adapters' records, and their families in the same order.
inline constexpr auto adapterKinds =
    std::to_array({KindId::pellionAdapter, KindId::lsiAdapter, KindId::vantryAdapter});
inline constexpr auto adapterFamilies =
    std::to_array<std::string_view>({"pellion", "lsi", "vantry"});
static_assert(adapterFamilies.size() == adapterKinds.size());

/// One kind of record: how many there are, what they are called, which fields they have.
struct Kind {
    KindId id;
    const char* count;
    std::string_view key;       ///< of the list in JSON
    std::string_view plural;    ///< title of the list
    std::string_view singular;  ///< begins the summary of a record
    std::string_view idKey;     ///< key of the number that follows it there, if any
    std::span<const Field> fields;
    std::span<const TreeField> fromTree = {};
};

/// The kinds of the inventory, in the order in which they are listed.
[[nodiscard]] std::span<const Kind> inventoryKinds() noexcept;

/// The kind of the event records.
[[nodiscard]] const Kind& eventKind() noexcept;

/// The family of the adapters of one of their kinds.
[[nodiscard]] std::string_view familyName(KindId adapter) noexcept;

[[nodiscard]] const Kind& kindOf(KindId id) noexcept;

/// The kind of the inventory whose list has this key; null if there is none.
[[nodiscard]] const Kind* findInventoryKind(std::string_view key) noexcept;

/// The place of the field with this key among the kind's fields; -1 if there is none.
[[nodiscard]] std::ptrdiff_t fieldIndex(const Kind& kind, std::string_view key) noexcept;

}  // namespace raidinfo
