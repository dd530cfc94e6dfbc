#include "library/text_buffer.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cerrno>
#include <system_error>

namespace raidinfo {

// A shared mapping of a sparse file in memory: unlike private memory it is not charged in advance,
// whatever the machine's overcommit policy.
TextBuffer::TextBuffer() {
    const int file = memfd_create("raidinfo-text", MFD_CLOEXEC);
    void* mapped = MAP_FAILED;
    if (file >= 0 && ftruncate(file, capacity) == 0) {
        mapped = mmap(nullptr, capacity, PROT_READ | PROT_WRITE, MAP_SHARED, file, 0);
    }
    const int error = errno;
    if (file >= 0) {
        close(file);
    }
    if (mapped == MAP_FAILED) {
        throw std::system_error{error, std::generic_category(), "cannot reserve the text buffer"};
    }
    bytes = static_cast<char*>(mapped);
}

TextBuffer::~TextBuffer() { munmap(bytes, capacity); }

}  // namespace raidinfo
