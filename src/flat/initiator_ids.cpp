#include "flat/initiator_ids.h"

#include "flat/accessors.h"
#include "model/navigation.h"

namespace raid::flat {

void initiatorIDs(char* destination, const RAIDAdapter* adapter) noexcept {
    char* end = destination;
    if (adapter != nullptr) {
        for (const auto& channel : Navigation::channels(*adapter)) {
            if (end != destination) {
                *end++ = ',';
            }
            end = writeNumber(end, channel.getInitiatorID());
        }
    }
    *end = '\0';
}

}  // namespace raid::flat
