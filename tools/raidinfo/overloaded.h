#pragma once

namespace raidinfo {

/// One visitor of a variant out of several lambdas.
template <typename... Functions>
struct Overloaded : Functions... {
    using Functions::operator()...;
};

template <typename... Functions>
Overloaded(Functions...) -> Overloaded<Functions...>;  // clang 14 does not deduce it by itself

}  // namespace raidinfo
