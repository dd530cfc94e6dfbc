#!/usr/bin/env python3
"""Watches the RAID controllers of this machine: an example to copy.

Prints what there is, then every event as it happens and what has changed in the health of the
drives since the one before. Goes on when the service comes back after it was gone, and when it
counts its events anew. Ctrl-C ends it.
"""

import argparse
import sys
import time
from collections.abc import Mapping

from raidinstrumentation import (
    EventLogRestarted,
    EventStream,
    Inventory,
    RAIDError,
    RAIDInstrumentation,
    ServiceUnavailable,
    discarded_c_output,
)

SECONDS_BETWEEN_ATTEMPTS = 5.0

# The health of each drive by a name for it.
Health = Mapping[str, str]


def show(line: str) -> None:
    """Prints a line so that whoever reads it through a pipe has it at once."""
    print(line, flush=True)


def show_summary(inventory: Inventory) -> None:
    """Prints what there is."""
    for adapter in inventory.adapters:
        show(f"{adapter.adapter_name}: {adapter.type_name}, {adapter.overall_status}")
    show(
        f"{len(inventory.disk_drives)} disk drives, {len(inventory.logical_drives)} logical drives,"
        f" {len(inventory.enclosures)} enclosures"
    )


def health_of(inventory: Inventory) -> Health:
    """The health of the physical and logical drives; "unknown" where the service names none."""
    health = {
        f"Drive {drive.serial_number}": str(drive.overall_status or "unknown")
        for drive in inventory.disk_drives
    }
    for logical in inventory.logical_drives:
        name = f"Logical drive {logical.logical_drive_id} of adapter {logical.adapter_id}"
        health[name] = str(logical.overall_status or "unknown")
    return health


def show_changes(before: Health, after: Health) -> None:
    """Prints the drives that are not as they were."""
    for name in {**before, **after}:
        was, is_now = before.get(name, "absent"), after.get(name, "absent")
        if was != is_now:
            show(f"  {name}: {was} -> {is_now}")


def watch(raid: RAIDInstrumentation, events: EventStream) -> None:
    """Prints events and changes until the stream is cancelled."""
    health = health_of(raid.inventory())
    for event in events:
        show(f"{event.sequence_number}  {event.date}  {event.type}  {event.message_string}")
        new_health = health_of(raid.refresh())
        show_changes(health, new_health)
        health = new_health


def main() -> None:
    """The program."""
    parser = argparse.ArgumentParser(description="Watches the RAID controllers of this machine.")
    parser.add_argument("--library", help="the file of the library; else the installed one")
    arguments = parser.parse_args()
    # The library prints a line whenever it asks the service.
    with discarded_c_output(), RAIDInstrumentation(arguments.library) as raid:
        # First the stream, so that no event is missed while the inventory is read.
        events = raid.events()
        show_summary(raid.inventory())
        while True:
            try:
                watch(raid, events)
            except ServiceUnavailable as problem:
                print(f"{problem}; trying again", file=sys.stderr)
                time.sleep(SECONDS_BETWEEN_ATTEMPTS)
            except EventLogRestarted as problem:
                print(f"{problem}; this is what it has", file=sys.stderr)


if __name__ == "__main__":
    try:
        main()
    except RAIDError as problem:
        sys.exit(f"watch_events: {problem}")
    except KeyboardInterrupt:
        pass
