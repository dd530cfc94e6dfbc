#pragma once

#include <cstdlib>
#include <memory>

namespace raid::agent {

struct FreeBuffer {
    void operator()(char* buffer) const noexcept { std::free(buffer); }
};

/// Owns the body of one answer. It is malloc'ed, since it crosses the interface as a plain pointer
/// that the receiver frees.
using Document = std::unique_ptr<char, FreeBuffer>;

}  // namespace raid::agent
