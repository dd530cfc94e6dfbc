#pragma once

#include <cstdint>
#include <memory_resource>
#include <optional>
#include <unordered_map>

#include "model/channels_and_drives.h"
#include "model/logical_drives.h"
#include "model/system_and_adapter.h"

namespace raid {

/// Which of an adapter's basic arrays a drive or a logical drive belongs to, indexed once for the
/// adapter. Where several arrays list the same one, the last in document order holds. Arrays inside
/// spanned arrays do not count.
class ArrayMembers {
public:
    explicit ArrayMembers(const RAIDAdapter& adapter);

    /// By the drive's channel and device. An array lists its drives under channels of its own, so
    /// there the channel is the one that the drive stands in.
    [[nodiscard]] std::optional<int> arrayOf(const RAIDHardDrive& drive) const;

    [[nodiscard]] std::optional<int> arrayOf(const RAIDLogicalDrive& drive) const;

private:
    // Filled once and dropped whole, so that the entries need no freeing one by one.
    std::pmr::monotonic_buffer_resource storage{std::pmr::new_delete_resource()};
    std::pmr::unordered_map<std::uint64_t, int> arrayOfDrive{&storage};
    std::pmr::unordered_map<int, int> arrayOfLogicalDrive{&storage};
};

}  // namespace raid
