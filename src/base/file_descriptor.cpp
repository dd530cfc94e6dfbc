#include "base/file_descriptor.h"

#include <unistd.h>

namespace raid::base {

FileDescriptor::~FileDescriptor() {
    if (descriptor >= 0) {
        ::close(descriptor);
    }
}

}  // namespace raid::base
