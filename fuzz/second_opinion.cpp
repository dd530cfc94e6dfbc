// Holds the reader of the library against libxml2: of every document that both take for XML they
// must make the same objects, or both must reject it.

#include <algorithm>
#include <string>

#include "support/input.h"
#include "support/require.h"
#include "support/second_opinion.h"

namespace {

using namespace raid;
using test::Reading;

/// XML turns a line end inside an attribute into a blank.
std::string withBlanks(std::string type) {
    std::ranges::replace(type, '\n', ' ');
    return type;
}

void requireSame(const Reading& ours, const Reading& theirs) {
    fuzz::require(withBlanks(ours.type) == theirs.type, "the type");
    fuzz::require(ours.values == theirs.values, "the values of the fields");
    fuzz::require(ours.inside.size() == theirs.inside.size(), "the kinds of elements inside");
    for (std::size_t kind = 0; kind < ours.inside.size(); ++kind) {
        fuzz::require(std::ranges::equal(ours.inside[kind], theirs.inside[kind],
                                         [](const Reading& left, const Reading& right) {
                                             requireSame(left, right);
                                             return true;
                                         }),
                      "the number of elements inside");
    }
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto document = fuzz::textOf(data, size);
    const auto opinion = fuzz::secondOpinion(document);
    if (!opinion) {
        return 0;
    }
    const auto reading = opinion->root->read(document);
    fuzz::require(reading.error.empty() == opinion->reading.has_value(), "the same verdict");
    if (opinion->reading) {
        requireSame(reading, *opinion->reading);
    }
    return 0;
}
