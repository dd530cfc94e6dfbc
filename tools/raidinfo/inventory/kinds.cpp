#include "inventory/kinds.h"

#include <algorithm>

namespace raidinfo {
namespace {

using enum Shape;
constexpr auto chief = Summary::column;
constexpr auto summary = Summary::yes;

constexpr auto pellionAdapterFields = std::to_array<Field>({
    {"getPellionAdapterAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getPellionAdapterOverallStatusString", "overall_status", "Overall status", statusText,
     summary},
    {"getPellionAdapterTypeName", "type_name", "Type name", text, summary},
    {"getPellionAdapterSerialNumber", "serial_number", "Serial number", text, summary},
    {"getPellionAdapterAdapterID", "adapter_id", "Adapter ID", number, chief},
    {"getPellionAdapterPhysicalSlot", "physical_slot", "Physical slot", number, summary},
    {"getPellionAdapterClustering", "clustering", "Clustering", flag},
    {"getPellionAdapterBatteryStatus", "battery_status", "Battery status", number},
    {"getPellionAdapterHotSwapRebuild", "hot_swap_rebuild", "Hot swap rebuild", flag},
    {"getPellionAdapterStripeUnitSize", "stripe_unit_size", "Stripe unit size", number},
    {"getPellionAdapterDataScrubbing", "data_scrubbing", "Data scrubbing", flag},
    {"getPellionAdapterAutoSynchronization", "auto_synchronization", "Auto synchronization", flag},
    {"getPellionAdapterUnattended", "unattended", "Unattended", flag},
    {"getPellionAdapterLimitedBIOSCompatibility", "limited_bios_compatibility",
     "Limited BIOS compatibility", flag},
    {"getPellionAdapterCacheReadPolicy", "cache_read_policy", "Cache read policy", constant},
    {"getPellionAdapterInitiatorIDs", "initiator_ids", "Initiator IDs", numbers},
    {"getPellionAdapterFirmwareVersion", "firmware_version", "Firmware version", text, summary},
    {"getPellionAdapterBiosVersion", "bios_version", "BIOS version", text},
    {"getPellionAdapterDriverVersion", "driver_version", "Driver version", text},
    {"getPellionAdapterPartNumber", "part_number", "Part number", text},
    {"getPellionAdapterFruNumber", "fru_number", "FRU number", text},
    {"getPellionAdapterBatteryFruNumber", "battery_fru_number", "Battery FRU number", text},
});

constexpr auto lsiAdapterFields = std::to_array<Field>({
    {"getLSIAdapterAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getLSIAdapterOverallStatusString", "overall_status", "Overall status", statusText, summary},
    {"getLSIAdapterTypeName", "type_name", "Type name", text, summary},
    {"getLSIAdapterSerialNumber", "serial_number", "Serial number", text, summary},
    {"getLSIAdapterAdapterID", "adapter_id", "Adapter ID", number, chief},
    {"getLSIAdapterPhysicalSlot", "physical_slot", "Physical slot", number, summary},
    {"getLSIAdapterClustering", "clustering", "Clustering", flag},
    {"getLSIAdapterBatteryStatus", "battery_status", "Battery status", number},
    {"getLSIAdapterHotSwapRebuild", "hot_swap_rebuild", "Hot swap rebuild", flag},
    {"getLSIAdapterInitiatorIDs", "initiator_ids", "Initiator IDs", numbers},
    {"getLSIAdapterFirmwareVersion", "firmware_version", "Firmware version", text, summary},
    {"getLSIAdapterBiosVersion", "bios_version", "BIOS version", text},
    {"getLSIAdapterDriverVersion", "driver_version", "Driver version", text},
    {"getLSIAdapterPartNumber", "part_number", "Part number", text},
    {"getLSIAdapterFruNumber", "fru_number", "FRU number", text},
    {"getLSIAdapterBatteryFruNumber", "battery_fru_number", "Battery FRU number", text},
});

constexpr auto vantryAdapterFields = std::to_array<Field>({
    {"getVantryAdapterAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getVantryAdapterOverallStatusString", "overall_status", "Overall status", statusText,
     summary},
    {"getVantryAdapterTypeName", "type_name", "Type name", text, summary},
    {"getVantryAdapterSerialNumber", "serial_number", "Serial number", text, summary},
    {"getVantryAdapterAdapterID", "adapter_id", "Adapter ID", number, chief},
    {"getVantryAdapterPhysicalSlot", "physical_slot", "Physical slot", number, summary},
    {"getVantryAdapterClustering", "clustering", "Clustering", flag},
    {"getVantryAdapterBatteryStatus", "battery_status", "Battery status", number},
    {"getVantryAdapterInitiatorIDs", "initiator_ids", "Initiator IDs", numbers},
    {"getVantryAdapterFirmwareVersion", "firmware_version", "Firmware version", text, summary},
    {"getVantryAdapterBiosVersion", "bios_version", "BIOS version", text},
    {"getVantryAdapterDriverVersion", "driver_version", "Driver version", text},
    {"getVantryAdapterPartNumber", "part_number", "Part number", text},
    {"getVantryAdapterFruNumber", "fru_number", "FRU number", text},
    {"getVantryAdapterBatteryFruNumber", "battery_fru_number", "Battery FRU number", text},
});

constexpr auto channelFields = std::to_array<Field>({
    {"getChannelChannelIDString", "channel_name", "Channel name", displayName},
    {"getChannelAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getChannelChannelID", "channel_id", "Channel ID", number, chief},
    {"getChannelAdapterID", "adapter_id", "Adapter ID", number, chief},
    {"getChannelType", "type", "Type", number},
    {"getChannelTransferSpeed", "transfer_speed", "Transfer speed", number, summary},
    {"getChannelInitiatorID", "initiator_id", "Initiator ID", number, summary},
});

constexpr auto arrayFields = std::to_array<Field>({
    {"getArrayArrayIDString", "array_name", "Array name", displayName},
    {"getArrayAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getArrayArrayID", "array_id", "Array ID", number, chief},
    {"getArrayAdapterID", "adapter_id", "Adapter ID", number, chief},
    {"getArraySpannedArrayIndex", "spanned_array_index", "Spanned array index", number},
    {"getArrayType", "type", "Type", number},
    {"getArraySize", "size", "Size", number, summary},
    {"getArrayFreeSpace", "free_space", "Free space", number, summary},
    {"getArrayStripeSize", "stripe_size", "Stripe size", number, summary},
});

constexpr auto spannedArrayFields = std::to_array<Field>({
    {"getSpannedArrayArrayIDString", "array_name", "Array name", displayName},
    {"getSpannedArrayAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getSpannedArrayArrayID", "array_id", "Array ID", number, chief},
    {"getSpannedArrayAdapterID", "adapter_id", "Adapter ID", number, chief},
    {"getSpannedArraySpannedArrayIndex", "spanned_array_index", "Spanned array index", number},
    {"getSpannedArrayType", "type", "Type", number},
    {"getSpannedArraySize", "size", "Size", number, summary},
    {"getSpannedArrayFreeSpace", "free_space", "Free space", number, summary},
    {"getSpannedArrayStripeSize", "stripe_size", "Stripe size", number, summary},
});

constexpr auto logicalDriveFields = std::to_array<Field>({
    {"getRAIDLogicalDriveLogicalDriveIDString", "logical_drive_name", "Logical drive name",
     displayName},
    {"getRAIDLogicalDriveArrayIDString", "array_name", "Array name", displayName},
    {"getRAIDLogicalDriveAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getRAIDLogicalDriveOverallStatusString", "overall_status", "Overall status", statusText,
     summary},
    {"getRAIDLogicalDriveLogicalDriveID", "logical_drive_id", "Logical drive ID", number, chief},
    {"getRAIDLogicalDriveArrayID", "array_id", "Array ID", number, chief},
    {"getRAIDLogicalDriveAdapterID", "adapter_id", "Adapter ID", number, chief},
    {"getRAIDLogicalDriveRaidLevel", "raid_level", "RAID level", number, summary},
    {"getRAIDLogicalDriveState", "state", "State", number, summary},
    {"getRAIDLogicalDriveDataSpace", "data_space", "Data space", number, summary},
    {"getRAIDLogicalDriveParitySpace", "parity_space", "Parity space", number},
    {"getRAIDLogicalDriveStripeUnitSize", "stripe_unit_size", "Stripe unit size", number},
    {"getRAIDLogicalDriveWriteCacheMode", "write_cache_mode", "Write cache mode", number},
    {"getRAIDLogicalDriveType", "type", "Type", number},
    {"getRAIDLogicalDriveShared", "shared", "Shared", flag},
    {"getRAIDLogicalDriveBlocked", "blocked", "Blocked", flag},
});

constexpr auto diskDriveFields = std::to_array<Field>({
    {"getRAIDDiskDriveDiskDriveIDString", "disk_drive_name", "Disk drive name", displayName},
    {"getRAIDDiskDriveChannelIDString", "channel_name", "Channel name", displayName},
    {"getRAIDDiskDriveAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getRAIDDiskDriveOverallStatusString", "overall_status", "Overall status", statusText,
     summary},
    {"getRAIDDiskDriveChannelID", "channel_id", "Channel ID", number, chief},
    {"getRAIDDiskDriveAdapterID", "adapter_id", "Adapter ID", number, chief},
    {"getRAIDDiskDriveArrayID", "array_id", "Array ID", number, chief},
    {"getRAIDDiskDriveArrayUniqueID", "array_unique_id", "Array unique ID", number},
    {"getRAIDDiskDriveVendor", "vendor", "Vendor", text, summary},
    {"getRAIDDiskDriveModel", "model", "Model", text, summary},
    {"getRAIDDiskDriveSerialNumber", "serial_number", "Serial number", text, summary},
    {"getRAIDDiskDriveFruNumber", "fru_number", "FRU number", text},
    {"getRAIDDiskDriveFirmwareLevel", "firmware_level", "Firmware level", text},
    {"getRAIDDiskDriveSize", "size", "Size", number, summary},
    {"getRAIDDiskDriveState", "state", "State", number, summary},
    {"getRAIDDiskDriveSmartError", "smart_error", "SMART error", flag, summary},
    {"getRAIDDiskDriveType", "type", "Type", number},
    {"getRAIDDiskDriveHasOSPartition", "has_os_partition", "Has OS partition", flag},
    {"getRAIDDiskDriveWriteCacheEnable", "write_cache_enable", "Write cache enable", number},
    {"getRAIDDiskDriveWriteCachEnableSupported", "write_cache_enable_supported",
     "Write cache enable supported", flag},
});

constexpr auto enclosureFields = std::to_array<Field>({
    {"getRAIDEnclosureDeviceEnclosureDeviceIDString", "enclosure_device_name",
     "Enclosure device name", displayName},
    {"getRAIDEnclosureDeviceChannelIDString", "channel_name", "Channel name", displayName},
    {"getRAIDEnclosureDeviceAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getRAIDEnclosureDeviceOverallStatusString", "overall_status", "Overall status", statusText,
     summary},
    {"getRAIDEnclosureDeviceDeviceID", "device_id", "Device ID", number, chief},
    {"getRAIDEnclosureDeviceChannelID", "channel_id", "Channel ID", number, chief},
    {"getRAIDEnclosureDeviceAdapterID", "adapter_id", "Adapter ID", number, chief},
    {"getRAIDEnclosureDeviceArrayID", "array_id", "Array ID", number},
    {"getRAIDEnclosureDeviceLogicalID", "logical_id", "Logical ID", number},
    {"getRAIDEnclosureDeviceEnclosureDeviceType", "enclosure_device_type", "Enclosure device type",
     text},
    {"getRAIDEnclosureDeviceVendor", "vendor", "Vendor", text, summary},
    {"getRAIDEnclosureDeviceModel", "model", "Model", text, summary},
    {"getRAIDEnclosureDeviceSerialNumber", "serial_number", "Serial number", text, summary},
    {"getRAIDEnclosureDeviceFruNumber", "fru_number", "FRU number", text},
    {"getRAIDEnclosureDeviceFirmwareLevel", "firmware_level", "Firmware level", text},
    {"getRAIDEnclosureDeviceState", "state", "State", number, summary},
    {"getRAIDEnclosureDeviceType", "type", "Type", number},
});

constexpr auto fanFields = std::to_array<Field>({
    {"getRAIDFanFanIDString", "fan_name", "Fan name", displayName},
    {"getRAIDFanStatusString", "status_name", "Status name", displayName},
    {"getRAIDFanChannelIDString", "channel_name", "Channel name", displayName},
    {"getRAIDFanAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getRAIDFanStatus", "status", "Status", number, summary},
    {"getRAIDFanEnclosureID", "enclosure_id", "Enclosure ID", number},
    {"getRAIDFanChannelID", "channel_id", "Channel ID", number},
    {"getRAIDFanAdapterID", "adapter_id", "Adapter ID", number},
});

constexpr auto powerSupplyFields = std::to_array<Field>({
    {"getRAIDPowerSupplyPowerSupplyIDString", "power_supply_name", "Power supply name",
     displayName},
    {"getRAIDPowerSupplyStatusString", "status_name", "Status name", displayName},
    {"getRAIDPowerSupplyChannelIDString", "channel_name", "Channel name", displayName},
    {"getRAIDPowerSupplyAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getRAIDPowerSupplyStatus", "status", "Status", number, summary},
    {"getRAIDPowerSupplyEnclosureID", "enclosure_id", "Enclosure ID", number},
    {"getRAIDPowerSupplyChannelID", "channel_id", "Channel ID", number},
    {"getRAIDPowerSupplyAdapterID", "adapter_id", "Adapter ID", number},
});

constexpr auto temperatureSensorFields = std::to_array<Field>({
    {"getRAIDTempSensorTempSensorIDString", "temp_sensor_name", "Temp sensor name", displayName},
    {"getRAIDTempSensorStatusString", "status_name", "Status name", displayName},
    {"getRAIDTempSensorChannelIDString", "channel_name", "Channel name", displayName},
    {"getRAIDTempSensorAdapterIDString", "adapter_name", "Adapter name", displayName},
    {"getRAIDTempSensorStatus", "status", "Status", number, summary},
    {"getRAIDTempSensorEnclosureID", "enclosure_id", "Enclosure ID", number},
    {"getRAIDTempSensorChannelID", "channel_id", "Channel ID", number},
    {"getRAIDTempSensorAdapterID", "adapter_id", "Adapter ID", number},
});

constexpr auto eventFields = std::to_array<Field>({
    {"getRAIDEventSequenceNumber", "sequence_number", "Sequence number", number},
    {"getRAIDEventDate", "date", "Date", text},
    {"getRAIDEventType", "type", "Type", text},
    {"getRAIDEventMessageString", "message_string", "Message string", text},
    {"getRAIDEventEventCode", "event_code", "Event code", number},
    {"getRAIDEventAdapter", "adapter", "Adapter", number},
    {"getRAIDEventChannel", "channel", "Channel", number},
    {"getRAIDEventDeviceID", "device_id", "Device ID", number},
    {"getRAIDEventEnclosureID", "enclosure_id", "Enclosure ID", number},
    {"getRAIDEventLogicalDrive", "logical_drive", "Logical drive", number},
    {"getRAIDEventServerName", "server_name", "Server name", text},
    {"getRAIDEventServerAddress", "server_address", "Server address", text},
});

constexpr auto adapterTreeFields = std::to_array<TreeField>({
    {"adapter_type", "Adapter type", text},
});

constexpr auto diskDriveTreeFields = std::to_array<TreeField>({
    {"device_id", "Device ID", number, chief},
    {"hot_spare", "Hot spare", flag, chief},
});

// The library publishes the parts of an enclosure without what they belong to: their fields for
// that are 0.
constexpr auto enclosurePartTreeFields = std::to_array<TreeField>({
    {"index", "Index", number, chief},
    {"enclosure", "Enclosure", number, chief, Holder::enclosure},
    {"channel", "Channel", number, chief, Holder::channel},
    {"adapter", "Adapter", number, chief, Holder::adapter},
});

constexpr auto allKinds = std::to_array<Kind>({
    {KindId::pellionAdapter, "getPellionAdapterCount", "pellion_adapters", "Pellion adapters",
     "Pellion adapter", "adapter_id", pellionAdapterFields, adapterTreeFields},
    {KindId::lsiAdapter, "getLSIAdapterCount", "lsi_adapters", "LSI adapters", "LSI adapter",
     "adapter_id", lsiAdapterFields, adapterTreeFields},
    {KindId::vantryAdapter, "getVantryAdapterCount", "vantry_adapters", "Vantry adapters",
     "Vantry adapter", "adapter_id", vantryAdapterFields, adapterTreeFields},
    {KindId::channel, "getChannelCount", "channels", "Channels", "Channel", "channel_id",
     channelFields},
    {KindId::array, "getArrayCount", "arrays", "Arrays", "Array", "array_id", arrayFields},
    {KindId::spannedArray, "getSpannedArrayCount", "spanned_arrays", "Spanned arrays",
     "Spanned array", "array_id", spannedArrayFields},
    {KindId::logicalDrive, "getRAIDLogicalDriveCount", "logical_drives", "Logical drives",
     "Logical drive", "logical_drive_id", logicalDriveFields},
    {KindId::diskDrive, "getRAIDDiskDriveCount", "disk_drives", "Disk drives", "Disk drive", "",
     diskDriveFields, diskDriveTreeFields},
    {KindId::enclosure, "getRAIDEnclosureDeviceCount", "enclosures", "Enclosures", "Enclosure",
     "device_id", enclosureFields},
    {KindId::fan, "getRAIDFanCount", "fans", "Fans", "Fan", "", fanFields, enclosurePartTreeFields},
    {KindId::powerSupply, "getRAIDPowerSupplyCount", "power_supplies", "Power supplies",
     "Power supply", "", powerSupplyFields, enclosurePartTreeFields},
    {KindId::temperatureSensor, "getRAIDTempSensorCount", "temperature_sensors",
     "Temperature sensors", "Temperature sensor", "", temperatureSensorFields,
     enclosurePartTreeFields},
    {KindId::event, "getRAIDEventCount", "events", "Events", "Event", "sequence_number",
     eventFields},
});

static_assert(allKinds.back().id == KindId::event);
static_assert(std::ranges::all_of(allKinds, [](const Kind& kind) {
    return &kind == &allKinds[static_cast<std::size_t>(kind.id)];
}));

}  // namespace

std::span<const Kind> inventoryKinds() noexcept {
    return std::span{allKinds}.first(allKinds.size() - 1);
}

const Kind& eventKind() noexcept { return allKinds.back(); }

std::string_view familyName(KindId adapter) noexcept {
    return adapterFamilies[static_cast<std::size_t>(std::ranges::find(adapterKinds, adapter) -
                                                    adapterKinds.begin())];
}

const Kind& kindOf(KindId id) noexcept { return allKinds[static_cast<std::size_t>(id)]; }

const Kind* findInventoryKind(std::string_view key) noexcept {
    const auto found = std::ranges::find(inventoryKinds(), key, &Kind::key);
    return found == inventoryKinds().end() ? nullptr : &*found;
}

std::ptrdiff_t fieldIndex(const Kind& kind, std::string_view key) noexcept {
    const auto found = std::ranges::find(kind.fields, key, &Field::key);
    return found == kind.fields.end() ? -1 : found - kind.fields.begin();
}

}  // namespace raidinfo
