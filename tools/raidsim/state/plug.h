#pragma once

#include "state/document.h"
#include "state/listings.h"
#include "state/path.h"
#include "xml/tree.h"

// Things that are put in and taken out while the system runs: drives, enclosures and their parts,
// and logical drives. Each throws EditError, having changed nothing, when that is not possible.
namespace raidsim {

// Throw EditError for paths that fit no document, so that it shows before there is one.
void checkUnplug(const Path& path);
void checkPlug(const Path& path);
void checkPlugLike(const Path& path, const Path& model);

// Takes a thing, or all that the path names, out of every place where it is listed.
void unplug(Document& document, const Path& path);

// Puts a thing in where the path says, as a copy of another of its kind, or of an element. It takes
// the number in the path and those of the adapter and the channel it comes to; fields (named
// without "as:") are written over what the copy has. A logical drive is listed in its array, if the
// path names one, and by the adapter.
void plugLike(Document& document, const Path& path, const Path& model, const Fields& fields);
void plug(Document& document, const Path& path, const xml::Tree& thing, const Fields& fields);

// The element in a file's text, which must be of the kind that the path names. Throws EditError or
// XmlError.
[[nodiscard]] xml::Tree parseThing(std::string_view text, const Path& path);

}  // namespace raidsim
