#pragma once

#include <nlohmann/json.hpp>

#include "codebook/code_book.h"
#include "inventory/kinds.h"

namespace raidinfo::diff::test {

using Json = nlohmann::ordered_json;

// What the numbers mean as the program comes.
[[nodiscard]] const CodeBook& codes();

// A record as the tree holds it: what only the tree knows, then every field of the kind, 0, false
// or empty where no value is given.
[[nodiscard]] Json record(KindId kind, const Json& extras, const Json& values = Json::object());

// One adapter, two channels with six drives, an enclosure, an array over five of the drives with
// two logical drives, and a hot spare.
[[nodiscard]] Json smallServer();

// The same with a spanned array over two others, a member that is not present, a logical drive
// outside the arrays, and an adapter of an unknown type.
[[nodiscard]] Json mixedServer();

// Records of the first adapter.
[[nodiscard]] Json& adapterOf(Json& tree);
[[nodiscard]] Json& drivesOf(Json& tree, int channel);
[[nodiscard]] Json& driveOf(Json& tree, int channel, int device);
[[nodiscard]] Json& arrayOf(Json& tree);
[[nodiscard]] Json& logicalDriveOf(Json& tree, int id);
[[nodiscard]] Json& enclosureOf(Json& tree);

// A record with the place and the fields of a drive.
[[nodiscard]] Json drive(int channel, int device, int position, const std::string& serial);

// A reference to a drive in the array's list.
[[nodiscard]] Json member(int channel, int device, int position);

// Takes the record whose field has this value out of a list.
Json taken(Json& list, const std::string& key, const Json& value);

}  // namespace raidinfo::diff::test
