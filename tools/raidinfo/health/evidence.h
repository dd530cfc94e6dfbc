#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "codebook/code_book.h"
#include "health/condition.h"
#include "health/policy.h"
#include "health/subject.h"
#include "health/verdict.h"

namespace raidinfo::health {

/// The records of a machine with what the policy counts for them; a record goes by its index.
class Evidence {
public:
    Evidence(const Group& adapters, const std::vector<Count>& countsOfPolicy,
             const CodeBook& codeBook);

    [[nodiscard]] const std::vector<Subject>& subjects() const noexcept { return records; }

    [[nodiscard]] std::size_t numberOf(std::string_view kind) const;

    [[nodiscard]] bool holdAll(const std::vector<Condition>& conditions, std::size_t index) const;

    /// A field with its value as people read it.
    [[nodiscard]] Fact fact(std::size_t index, const std::string& field) const;

private:
    [[nodiscard]] std::optional<Value> valueOf(std::size_t index, const std::string& field) const;
    [[nodiscard]] int counted(const Count& count, std::size_t index) const;
    [[nodiscard]] std::optional<std::size_t> containerOf(std::size_t index,
                                                         Count::Within within) const;
    [[nodiscard]] bool isKnown(std::size_t index, const std::string& field,
                               const Value& value) const;

    std::vector<Subject> records;
    const std::vector<Count>& counts;
    const CodeBook& book;
};

}  // namespace raidinfo::health
