#pragma once

#include <span>
#include <string_view>

#include "agent/document.h"
#include "model/system_and_adapter.h"

// Readers of a configuration answer: the library's own, and what one could build on a well-kept XML
// library in its place. Each fills the same model and gives the same outcomes: a text has its ends
// trimmed as the service counts space, an unknown element and a wrong end tag are errors, and the
// model that was there before goes first. References are left alone, but for those on events, whose
// parsers decode them; the documents that are measured have none.
namespace raid::bench {

struct Reader {
    std::string_view name;
    /// Reads the document, which it frees, into the model that model() then shows.
    void (*read)(agent::Document document, int length);
    const RAIDSystem* (*model)();
};

/// The library's first.
[[nodiscard]] std::span<const Reader> readers();

void readWithLibrary(agent::Document document, int length);
void readWithExpat(agent::Document document, int length);
void readWithLibxml2(agent::Document document, int length);
void readWithPugixml(agent::Document document, int length);
void readWithRapidxml(agent::Document document, int length);

}  // namespace raid::bench
