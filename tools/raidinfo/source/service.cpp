#include "source/service.h"

#include "source/service_failures.h"

namespace raidinfo {

// A model is there exactly when the last answer was read well. When there is none, the reason is
// not told; enableRAIDEvent is the one function that reports whether the service answers at all.
// The service may have come up in between, so an answer that does come is given a second chance
// before it is called malformed.
Inventory readInventory(const Library& library, const std::stop_token& stop) {
    const RAIDSystem* const* const system = library.variable<const RAIDSystem*>("raidSystem");
    const auto read = library.function<int()>("RAIDinit");
    read();
    if (*system == nullptr && !stop.stop_requested()) {
        if (library.function<int()>("enableRAIDEvent")() == 0) {
            throw serviceUnavailable();
        }
        read();
    }
    if (*system == nullptr) {
        throw malformedAnswer();
    }
    return {RecordReader{library}.readInventory(), (*system)->getAdapters()};
}

}  // namespace raidinfo
