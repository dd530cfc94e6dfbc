#include "agent/saved_answers.h"

#include <climits>
#include <span>

#include "agent/document.h"
#include "agent/envelope.h"
#include "base/regular_file.h"

namespace {

/// The file whole, in a buffer of its size, handed to the processor.
int processFile(const std::string& path, int (*process)(char*, int)) {
    const auto file = raid::base::RegularFile::open(path);
    if (!file || file->size() > INT_MAX) {
        return 0;
    }
    const auto size = static_cast<std::size_t>(file->size());
    raid::agent::Document document(static_cast<char*>(std::calloc(size, 1)));
    if (!document) {
        return 0;
    }
    file->read(std::span(document.get(), size));  // what a shrinking file lost stays zero
    return process(document.release(), static_cast<int>(size));
}

}  // namespace

// Callers outside were built with strings passed by value.
// NOLINTNEXTLINE(performance-unnecessary-value-param)
int readRAIDXML(std::string path) { return processFile(path, processXML); }

// NOLINTNEXTLINE(performance-unnecessary-value-param)
int readEventRAIDXML(std::string path) { return processFile(path, processEventXML); }
