#include "inventory/records.h"

#include <algorithm>
#include <charconv>
#include <string_view>
#include <utility>

#include "text/decoded.h"

namespace raidinfo {
namespace {

std::vector<int> parsedNumbers(std::string_view list) {
    std::vector<int> result;
    while (!list.empty()) {
        int number = 0;
        const char* const end = list.data() + list.size();
        const auto [stop, error] = std::from_chars(list.data(), end, number);
        if (error != std::errc{}) {
            break;
        }
        result.push_back(number);
        list.remove_prefix(static_cast<std::size_t>(stop - list.data()));
        list.remove_prefix(list.starts_with(',') ? 1 : 0);
    }
    return result;
}

}  // namespace

int numberOf(const Kind& kind, const Record& record, std::string_view key) {
    return std::get<int>(record.at(static_cast<std::size_t>(fieldIndex(kind, key))));
}

std::int64_t greatestNumber(const Records& events) {
    std::int64_t greatest = 0;
    for (const Record& event : events) {
        greatest =
            std::max<std::int64_t>(greatest, numberOf(eventKind(), event, "sequence_number"));
    }
    return greatest;
}

RecordReader::RecordReader(Library library) : lib{std::move(library)} {}

Records RecordReader::read(const Kind& kind) {
    const int count = lib.function<int()>(kind.count)();
    Records records(static_cast<std::size_t>(count > 0 ? count : 0));
    for (Record& record : records) {
        record.reserve(kind.fields.size());
    }
    for (const Field& field : kind.fields) {
        readColumn(field, records);
    }
    return records;
}

void RecordReader::readColumn(const Field& field, Records& records) {
    const auto fill = [&records](const auto& valueAt) {
        for (int position = 0; Record & record : records) {
            record.emplace_back(valueAt(position++));
        }
    };
    const auto fillText = [this, &fill](auto* write, const auto& valueOf) {
        char* const destination = textBuffer();
        fill([&](int position) {
            destination[0] = '\0';
            write(destination, position);
            return valueOf(std::string_view{destination});
        });
    };
    switch (field.shape) {
        case Shape::number:
            return fill(lib.function<int(int)>(field.function));
        case Shape::flag:
            return fill([get = lib.function<int(int)>(field.function)](int position) {
                return get(position) != 0;
            });
        case Shape::constant:
            return fill([get = lib.function<int()>(field.function)](int) { return get(); });
        case Shape::text:
            return fillText(lib.function<void(char*, int)>(field.function), decoded);
        case Shape::displayName:
            return fillText(lib.function<int(char*, int)>(field.function), decoded);
        case Shape::statusText:
            return fillText(lib.function<void(char*, int)>(field.function),
                            [](std::string_view text) {
                                return text.empty() ? Value{Unknown{}} : Value{decoded(text)};
                            });
        case Shape::numbers:
            return fillText(lib.function<void(char*, int)>(field.function), parsedNumbers);
    }
}

char* RecordReader::textBuffer() {
    if (!buffer) {
        buffer.emplace();
    }
    return buffer->data();
}

Snapshot RecordReader::readInventory() {
    Snapshot snapshot;
    for (const Kind& kind : inventoryKinds()) {
        snapshot.of(kind.id) = read(kind);
    }
    return snapshot;
}

}  // namespace raidinfo
