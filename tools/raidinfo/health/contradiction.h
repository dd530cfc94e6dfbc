#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "codebook/code_book.h"
#include "health/condition.h"
#include "health/vocabulary.h"

namespace raidinfo::health {

/// What is wrong with conditions on one field that no value of it fulfils together; empty where
/// there are none. The names of a field without codes count for nothing: the code book may have
/// them again. Nor does one condition on codes: a rule goes with a book that has few of them.
[[nodiscard]] std::string contradictionIn(const std::vector<Condition>& conditions,
                                          std::string_view kind,
                                          const std::vector<RuleField>& fields,
                                          const CodeBook& book);

}  // namespace raidinfo::health
