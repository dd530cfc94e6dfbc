#pragma once

#include <optional>
#include <string>

#include "model/classes.h"

namespace raid::fuzz {

/// What a document means to somebody who reads it with libxml2 and the tables of the tests.
struct Opinion {
    const test::ModelClass* root = nullptr;
    std::optional<test::Reading> reading;  // none when the vocabulary forbids the document
};

/// None for a document that is not well-formed, or that uses what the library's reader does not
/// know on purpose: references, comments, CDATA sections, declarations, and an element that is
/// passed over within another of its kind.
[[nodiscard]] std::optional<Opinion> secondOpinion(const std::string& document);

}  // namespace raid::fuzz
