"""The kinds of record and their fields: the one table of what the library's accessors are.

Every class is a kind. Its PREFIX begins the names of the kind's functions, and the annotation of a
field says how it is read and how the name of its function ends.

Numbers (states, types, levels, sizes) are the service's own codes and units, passed on unchanged. A
number that the service did not send is 0, a text empty.
"""

from dataclasses import dataclass
from typing import Annotated, ClassVar

from .shapes import (
    Constant,
    DisplayName,
    Flag,
    Number,
    Numbers,
    OverallStatus,
    Status,
    Text,
)


@dataclass(frozen=True, slots=True, kw_only=True)
class Record:
    """What the service told of one thing at one moment."""

    PREFIX: ClassVar[str]


@dataclass(frozen=True, slots=True, kw_only=True)
class InventoryRecord(Record):
    """A record of the inventory; its position is that in the list of its kind."""

    position: int


@dataclass(frozen=True, slots=True, kw_only=True)
class Adapter(InventoryRecord):
    """What the adapters of all families have; initiator_ids has one number for each channel."""

    adapter_name: Annotated[str, DisplayName("AdapterIDString")]
    overall_status: Annotated[OverallStatus | None, Status("OverallStatusString")]
    type_name: Annotated[str, Text("TypeName")]
    serial_number: Annotated[str, Text("SerialNumber")]
    adapter_id: Annotated[int, Number("AdapterID")]
    physical_slot: Annotated[int, Number("PhysicalSlot")]
    clustering: Annotated[bool, Flag("Clustering")]
    battery_status: Annotated[int, Number("BatteryStatus")]
    initiator_ids: Annotated[tuple[int, ...], Numbers("InitiatorIDs")]
    firmware_version: Annotated[str, Text("FirmwareVersion")]
    bios_version: Annotated[str, Text("BiosVersion")]
    driver_version: Annotated[str, Text("DriverVersion")]
    part_number: Annotated[str, Text("PartNumber")]
    fru_number: Annotated[str, Text("FruNumber")]
    battery_fru_number: Annotated[str, Text("BatteryFruNumber")]


@dataclass(frozen=True, slots=True, kw_only=True)
class PellionAdapter(Adapter):
    """An adapter of the Pellion or Mirrel type; cache_read_policy is always 0."""

    PREFIX: ClassVar[str] = "getPellionAdapter"

    hot_swap_rebuild: Annotated[bool, Flag("HotSwapRebuild")]
    stripe_unit_size: Annotated[int, Number("StripeUnitSize")]
    data_scrubbing: Annotated[bool, Flag("DataScrubbing")]
    auto_synchronization: Annotated[bool, Flag("AutoSynchronization")]
    unattended: Annotated[bool, Flag("Unattended")]
    limited_bios_compatibility: Annotated[bool, Flag("LimitedBIOSCompatibility")]
    cache_read_policy: Annotated[int, Constant("CacheReadPolicy")]


@dataclass(frozen=True, slots=True, kw_only=True)
class LSIAdapter(Adapter):
    """An adapter of the LSI type."""

    PREFIX: ClassVar[str] = "getLSIAdapter"

    hot_swap_rebuild: Annotated[bool, Flag("HotSwapRebuild")]


@dataclass(frozen=True, slots=True, kw_only=True)
class VantryAdapter(Adapter):
    """An adapter of the Dorvel type."""

    PREFIX: ClassVar[str] = "getVantryAdapter"


@dataclass(frozen=True, slots=True, kw_only=True)
class Channel(InventoryRecord):
    """A channel of an adapter."""

    PREFIX: ClassVar[str] = "getChannel"

    channel_name: Annotated[str, DisplayName("ChannelIDString")]
    adapter_name: Annotated[str, DisplayName("AdapterIDString")]
    channel_id: Annotated[int, Number("ChannelID")]
    adapter_id: Annotated[int, Number("AdapterID")]
    type: Annotated[int, Number("Type")]
    transfer_speed: Annotated[int, Number("TransferSpeed")]
    initiator_id: Annotated[int, Number("InitiatorID")]


@dataclass(frozen=True, slots=True, kw_only=True)
class DriveArray(InventoryRecord):
    """What basic and spanned arrays have; spanned_array_index is always -1."""

    array_name: Annotated[str, DisplayName("ArrayIDString")]
    adapter_name: Annotated[str, DisplayName("AdapterIDString")]
    array_id: Annotated[int, Number("ArrayID")]
    adapter_id: Annotated[int, Number("AdapterID")]
    spanned_array_index: Annotated[int, Number("SpannedArrayIndex")]
    type: Annotated[int, Number("Type")]
    size: Annotated[int, Number("Size")]
    free_space: Annotated[int, Number("FreeSpace")]
    stripe_size: Annotated[int, Number("StripeSize")]


@dataclass(frozen=True, slots=True, kw_only=True)
class BasicArray(DriveArray):
    """An array of drives, be it inside a spanned array or not."""

    PREFIX: ClassVar[str] = "getArray"


@dataclass(frozen=True, slots=True, kw_only=True)
class SpannedArray(DriveArray):
    """An array over other arrays."""

    PREFIX: ClassVar[str] = "getSpannedArray"


@dataclass(frozen=True, slots=True, kw_only=True)
class LogicalDrive(InventoryRecord):
    """A logical drive; array_id is -1 where no array is known.

    The names are the library's: array_name and adapter_name begin with "Logical Drive", too.
    """

    PREFIX: ClassVar[str] = "getRAIDLogicalDrive"

    logical_drive_name: Annotated[str, DisplayName("LogicalDriveIDString")]
    array_name: Annotated[str, DisplayName("ArrayIDString")]
    adapter_name: Annotated[str, DisplayName("AdapterIDString")]
    overall_status: Annotated[OverallStatus | None, Status("OverallStatusString")]
    logical_drive_id: Annotated[int, Number("LogicalDriveID")]
    array_id: Annotated[int, Number("ArrayID")]
    adapter_id: Annotated[int, Number("AdapterID")]
    raid_level: Annotated[int, Number("RaidLevel")]
    state: Annotated[int, Number("State")]
    data_space: Annotated[int, Number("DataSpace")]
    parity_space: Annotated[int, Number("ParitySpace")]
    stripe_unit_size: Annotated[int, Number("StripeUnitSize")]
    write_cache_mode: Annotated[int, Number("WriteCacheMode")]
    type: Annotated[int, Number("Type")]
    shared: Annotated[bool, Flag("Shared")]
    blocked: Annotated[bool, Flag("Blocked")]


@dataclass(frozen=True, slots=True, kw_only=True)
class DiskDrive(InventoryRecord):
    """A hard drive of a channel; array_id is 0 for the array 0 and where no array is known.

    disk_drive_name is the library's, made of array_unique_id.
    """

    PREFIX: ClassVar[str] = "getRAIDDiskDrive"

    disk_drive_name: Annotated[str, DisplayName("DiskDriveIDString")]
    channel_name: Annotated[str, DisplayName("ChannelIDString")]
    adapter_name: Annotated[str, DisplayName("AdapterIDString")]
    overall_status: Annotated[OverallStatus | None, Status("OverallStatusString")]
    channel_id: Annotated[int, Number("ChannelID")]
    adapter_id: Annotated[int, Number("AdapterID")]
    array_id: Annotated[int, Number("ArrayID")]
    array_unique_id: Annotated[int, Number("ArrayUniqueID")]
    vendor: Annotated[str, Text("Vendor")]
    model: Annotated[str, Text("Model")]
    serial_number: Annotated[str, Text("SerialNumber")]
    fru_number: Annotated[str, Text("FruNumber")]
    firmware_level: Annotated[str, Text("FirmwareLevel")]
    size: Annotated[int, Number("Size")]
    state: Annotated[int, Number("State")]
    smart_error: Annotated[bool, Flag("SmartError")]
    type: Annotated[int, Number("Type")]
    has_os_partition: Annotated[bool, Flag("HasOSPartition")]
    write_cache_enable: Annotated[int, Number("WriteCacheEnable")]
    # The library spells it so.
    write_cache_enable_supported: Annotated[bool, Flag("WriteCachEnableSupported")]


@dataclass(frozen=True, slots=True, kw_only=True)
class Enclosure(InventoryRecord):
    """An enclosure of a channel; its name, which begins with "Disk Drive", is the library's."""

    PREFIX: ClassVar[str] = "getRAIDEnclosureDevice"

    enclosure_device_name: Annotated[str, DisplayName("EnclosureDeviceIDString")]
    channel_name: Annotated[str, DisplayName("ChannelIDString")]
    adapter_name: Annotated[str, DisplayName("AdapterIDString")]
    overall_status: Annotated[OverallStatus | None, Status("OverallStatusString")]
    device_id: Annotated[int, Number("DeviceID")]
    channel_id: Annotated[int, Number("ChannelID")]
    adapter_id: Annotated[int, Number("AdapterID")]
    array_id: Annotated[int, Number("ArrayID")]
    logical_id: Annotated[int, Number("LogicalID")]
    enclosure_device_type: Annotated[str, Text("EnclosureDeviceType")]
    vendor: Annotated[str, Text("Vendor")]
    model: Annotated[str, Text("Model")]
    serial_number: Annotated[str, Text("SerialNumber")]
    fru_number: Annotated[str, Text("FruNumber")]
    firmware_level: Annotated[str, Text("FirmwareLevel")]
    state: Annotated[int, Number("State")]
    type: Annotated[int, Number("Type")]


@dataclass(frozen=True, slots=True, kw_only=True)
class EnclosurePart(InventoryRecord):
    """What the parts of enclosures have. The service names no parents, so the three IDs are 0."""

    status_name: Annotated[str, DisplayName("StatusString")]
    channel_name: Annotated[str, DisplayName("ChannelIDString")]
    adapter_name: Annotated[str, DisplayName("AdapterIDString")]
    status: Annotated[int, Number("Status")]
    enclosure_id: Annotated[int, Number("EnclosureID")]
    channel_id: Annotated[int, Number("ChannelID")]
    adapter_id: Annotated[int, Number("AdapterID")]


@dataclass(frozen=True, slots=True, kw_only=True)
class Fan(EnclosurePart):
    """A fan of an enclosure."""

    PREFIX: ClassVar[str] = "getRAIDFan"

    fan_name: Annotated[str, DisplayName("FanIDString")]


@dataclass(frozen=True, slots=True, kw_only=True)
class PowerSupply(EnclosurePart):
    """A power supply of an enclosure."""

    PREFIX: ClassVar[str] = "getRAIDPowerSupply"

    power_supply_name: Annotated[str, DisplayName("PowerSupplyIDString")]


@dataclass(frozen=True, slots=True, kw_only=True)
class TemperatureSensor(EnclosurePart):
    """A temperature sensor of an enclosure."""

    PREFIX: ClassVar[str] = "getRAIDTempSensor"

    temp_sensor_name: Annotated[str, DisplayName("TempSensorIDString")]


@dataclass(frozen=True, slots=True, kw_only=True)
class Event(Record):
    """Something that happened to a controller or to what belongs to it.

    The numbers after event_code say to what: the adapter's ID, the channel's, and so on. Of those
    that do not apply the service sends none, which reads as 0.
    """

    PREFIX: ClassVar[str] = "getRAIDEvent"

    sequence_number: Annotated[int, Number("SequenceNumber")]
    date: Annotated[str, Text("Date")]
    type: Annotated[str, Text("Type")]
    message_string: Annotated[str, Text("MessageString")]
    event_code: Annotated[int, Number("EventCode")]
    adapter: Annotated[int, Number("Adapter")]
    channel: Annotated[int, Number("Channel")]
    device_id: Annotated[int, Number("DeviceID")]
    enclosure_id: Annotated[int, Number("EnclosureID")]
    logical_drive: Annotated[int, Number("LogicalDrive")]
    server_name: Annotated[str, Text("ServerName")]
    server_address: Annotated[str, Text("ServerAddress")]
