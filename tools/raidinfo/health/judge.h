#pragma once

#include "codebook/code_book.h"
#include "health/policy.h"
#include "health/verdict.h"
#include "inventory/tree.h"

namespace raidinfo::health {

/// The verdict of the policy on the trees of all adapters. The book is the one with which the
/// policy was read. Without an adapter, or without a rule for what is there, it is unknown.
[[nodiscard]] Verdict judge(const Group& adapters, const Policy& policy, const CodeBook& book);

}  // namespace raidinfo::health
