#pragma once

#include "state/document.h"
#include "state/listings.h"
#include "state/path.h"

// Changes of the document. Each throws EditError, having changed nothing, when the document has
// no such object or field.
namespace raidsim {

// Throw EditError for what no document can hold, so that it shows before there is one.
void checkProgress(const Path& path);
void checkMembership(const Path& drive, const Path& collection);

// Writes fields (named without "as:") in every listing that has them. A written overallStatus
// rises: everything around the object then shows the worst overallStatus that it holds, until
// it is written itself.
void setFields(Document& document, const Path& path, const Fields& fields);

// Shows a running task of that many percent in every listing of the object; ends it.
void setProgress(Document& document, const Path& path, int percent);
void clearProgress(Document& document, const Path& path);

// Lists a drive in an array (under its channel there) or among the hot spares; takes it out. The
// overallStatus of what is around rises likewise.
void join(Document& document, const Path& drive, const Path& collection);
void leave(Document& document, const Path& drive, const Path& collection);

}  // namespace raidsim
