"""The RAID configuration and events of this machine, through libRAIDInstrumentation.

RAIDInstrumentation is the entrance; Inventory and Event are what comes out; RAIDError is what goes
wrong.
"""

from .errors import (
    EventLogRestarted,
    LibraryNotFound,
    LibraryUnusable,
    MalformedAnswer,
    RAIDError,
    ServiceUnavailable,
)
from .events import EventStream
from .instrumentation import RAIDInstrumentation
from .inventory import Inventory
from .output import discarded_c_output
from .records import (
    Adapter,
    BasicArray,
    Channel,
    DiskDrive,
    DriveArray,
    Enclosure,
    EnclosurePart,
    Event,
    Fan,
    InventoryRecord,
    LogicalDrive,
    LSIAdapter,
    PellionAdapter,
    PowerSupply,
    Record,
    SpannedArray,
    TemperatureSensor,
    VantryAdapter,
)
from .shapes import OverallStatus

__all__ = [
    "Adapter",
    "BasicArray",
    "Channel",
    "DiskDrive",
    "DriveArray",
    "Enclosure",
    "EnclosurePart",
    "Event",
    "EventLogRestarted",
    "EventStream",
    "Fan",
    "Inventory",
    "InventoryRecord",
    "LSIAdapter",
    "LibraryNotFound",
    "LibraryUnusable",
    "LogicalDrive",
    "MalformedAnswer",
    "OverallStatus",
    "PellionAdapter",
    "PowerSupply",
    "RAIDError",
    "RAIDInstrumentation",
    "Record",
    "ServiceUnavailable",
    "SpannedArray",
    "TemperatureSensor",
    "VantryAdapter",
    "discarded_c_output",
]
