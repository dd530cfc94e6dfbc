#pragma once

#include <string>
#include <utility>
#include <vector>

namespace raidinfo::test {

// <ac:name xsi:type="type"> content </ac:name>
[[nodiscard]] std::string complex(const std::string& name, const std::string& type,
                                  const std::string& content);

using Fields = std::vector<std::pair<std::string, std::string>>;

// <as:key>value</as:key> for each.
[[nodiscard]] std::string simple(const Fields& fields);

// An answer with these adapters.
[[nodiscard]] std::string configuration(const std::string& adapters);

// Two channels with an enclosure each, arrays of both sorts, a hot spare, a member that is gone.
[[nodiscard]] std::string sampleAdapter();

// An answer with an event for each number, its message "event <number>".
[[nodiscard]] std::string eventBatch(const std::vector<int>& numbers);

// The same with other messages: the events of a service that has begun to count anew.
[[nodiscard]] std::string otherEventBatch(const std::vector<int>& numbers);

}  // namespace raidinfo::test
