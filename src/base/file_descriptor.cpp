#include "base/file_descriptor.h"

#include <unistd.h>

#include "base/defer_cancellation.h"

namespace raid::base {

FileDescriptor::~FileDescriptor() {
    if (descriptor >= 0) {
        const DeferCancellation deferred;
        ::close(descriptor);
    }
}

}  // namespace raid::base
