#pragma once

#include "json/json.h"

namespace raidinfo {

/// The JSON schema (draft 2020-12) of every document that `--json` prints. The data of each
/// subcommand is a definition of its own, so that a program can ask for more than "one of them".
[[nodiscard]] Json schema();

}  // namespace raidinfo
