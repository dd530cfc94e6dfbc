"""The inventory: what the service told of the machine at one moment."""

import dataclasses
from collections.abc import Mapping
from dataclasses import dataclass
from types import MappingProxyType
from typing import get_args, get_type_hints

from .records import (
    Adapter,
    BasicArray,
    Channel,
    DiskDrive,
    Enclosure,
    Fan,
    InventoryRecord,
    LogicalDrive,
    LSIAdapter,
    PellionAdapter,
    PowerSupply,
    SpannedArray,
    TemperatureSensor,
    VantryAdapter,
)


@dataclass(frozen=True, slots=True, kw_only=True)
class Inventory:
    """The records of each kind, in the order in which the service reports them.

    That is adapter by adapter; in each channel by channel, then logical drives, then arrays.
    """

    pellion_adapters: tuple[PellionAdapter, ...]
    lsi_adapters: tuple[LSIAdapter, ...]
    vantry_adapters: tuple[VantryAdapter, ...]
    channels: tuple[Channel, ...]
    arrays: tuple[BasicArray, ...]
    spanned_arrays: tuple[SpannedArray, ...]
    logical_drives: tuple[LogicalDrive, ...]
    disk_drives: tuple[DiskDrive, ...]
    enclosures: tuple[Enclosure, ...]
    fans: tuple[Fan, ...]
    power_supplies: tuple[PowerSupply, ...]
    temperature_sensors: tuple[TemperatureSensor, ...]

    @property
    def adapters(self) -> tuple[Adapter, ...]:
        """The adapters of all families."""
        return (*self.pellion_adapters, *self.lsi_adapters, *self.vantry_adapters)


def _kinds() -> dict[str, type[InventoryRecord]]:
    hints = get_type_hints(Inventory)
    return {field.name: get_args(hints[field.name])[0] for field in dataclasses.fields(Inventory)}


KINDS: Mapping[str, type[InventoryRecord]] = MappingProxyType(_kinds())
"""The kind of record in each list of the inventory."""
