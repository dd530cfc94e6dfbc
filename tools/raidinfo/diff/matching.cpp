#include "diff/matching.h"

#include <iterator>

namespace raidinfo::diff {
namespace {

/// The record with what stands below it and its position left out, to tell whether two are equal
/// and to bring them into an order.
std::string contentOf(const Entry& entry) {
    std::string content;
    for (const auto& [key, value] : entry.record->items()) {
        if (key != "position" && !isList(*entry.subject, key)) {
            content += key + value.dump();
        }
    }
    for (const auto* const lists : {&entry.holders, &entry.missing}) {
        for (const std::string& item : *lists) {
            content += item + "\n";
        }
    }
    return content;
}

struct Described {
    std::string content;
    Entry* entry;
};

std::vector<Described> inOrder(const std::vector<Entry*>& entries) {
    std::vector<Described> described;
    for (Entry* const entry : entries) {
        described.push_back({contentOf(*entry), entry});
    }
    std::ranges::stable_sort(described, {}, &Described::content);
    return described;
}

std::vector<Entry*> without(const std::vector<Described>& all, const std::vector<Described>& some) {
    std::vector<Described> rest;
    std::ranges::set_difference(all, some, std::back_inserter(rest), {}, &Described::content,
                                &Described::content);
    std::vector<Entry*> entries;
    for (const Described& described : rest) {
        entries.push_back(described.entry);
    }
    return entries;
}

void identify(const std::vector<Entry*>& entries, const std::string& identity) {
    for (Entry* const entry : entries) {
        entry->identity = identity;
    }
}

}  // namespace

std::string serialOf(const Entry& entry) {
    const Json* const serial = entry.field("serial_number");
    if (serial == nullptr || !serial->is_string()) {
        return {};
    }
    const auto& text = serial->get_ref<const std::string&>();
    const auto first = text.find_first_not_of(' ');
    return first == std::string::npos ? std::string{}
                                      : text.substr(first, text.find_last_not_of(' ') + 1 - first);
}

std::string addressOf(const Entry& entry) {
    return (entry.within == nullptr ? "" : entry.within->identity) + "/" + entry.number().dump();
}

void matchAlike(Alike alike, const std::string& address, Matching& matching) {
    const bool inBoth = !alike.before.empty() && !alike.after.empty();
    identify(alike.before, (inBoth ? "" : "before ") + address);
    identify(alike.after, (inBoth ? "" : "after ") + address);
    if (inBoth && !alike.isUnique()) {
        const auto before = inOrder(alike.before);
        const auto after = inOrder(alike.after);
        alike = {without(before, after), without(after, before)};
    }
    const std::size_t both = std::min(alike.before.size(), alike.after.size());
    for (std::size_t index = 0; index < both; ++index) {
        matching.both.push_back({alike.before[index], alike.after[index], false});
    }
    const auto rest = [both](const std::vector<Entry*>& entries, std::vector<const Entry*>& to) {
        std::copy(entries.begin() + static_cast<std::ptrdiff_t>(both), entries.end(),
                  std::back_inserter(to));
    };
    rest(alike.before, matching.removed);
    rest(alike.after, matching.added);
}

}  // namespace raidinfo::diff
