"""The inventory, as the service tells it and when it does not."""

import dataclasses
import json
import os
import signal
import subprocess
import sys
from collections.abc import Callable
from pathlib import Path

import pytest
from raidinstrumentation import (
    Inventory,
    MalformedAnswer,
    OverallStatus,
    RAIDInstrumentation,
    ServiceUnavailable,
)
from support import build
from support.documents import adapter, configuration, newest_event
from support.interruption import meanwhile
from support.scripted_service import Manner, Reply, ScriptedService
from support.simulator import Simulator

EMPTY = configuration("")
CUT_OFF = configuration(adapter("o:LSIAdapter", typeName="x"))[:500]


def one_lsi_adapter(**fields: object) -> str:
    return configuration(adapter("o:LSIAdapter", **fields))


def served(raid: RAIDInstrumentation, document: Reply) -> Inventory:
    with ScriptedService(config=(document,)):
        return raid.refresh()


@pytest.mark.parametrize("example", ["small-server.xml", "mixed.xml", "large-rack.xml"])
def test_an_example_reads_as_raidinfo_lists_it(raid: RAIDInstrumentation, example: str) -> None:
    with Simulator(example):
        listed = subprocess.run([build.RAIDINFO, "list", "--json"], capture_output=True, check=True)
        lists = json.loads(json.dumps(dataclasses.asdict(raid.inventory())))
    for key, records in json.loads(listed.stdout)["data"].items():
        # raidinfo knows more of some records than their list does.
        assert [record | mine for record, mine in zip(records, lists[key], strict=True)] == records


def test_values_have_the_types_of_their_fields(raid: RAIDInstrumentation) -> None:
    with Simulator("mixed.xml"):
        inventory = raid.inventory()
    pellion = inventory.pellion_adapters[0]
    assert pellion.hot_swap_rebuild is True
    assert pellion.cache_read_policy == 0
    assert pellion.overall_status is OverallStatus.NORMAL
    assert isinstance(pellion.initiator_ids, tuple)
    assert [drive.position for drive in inventory.disk_drives] == [
        *range(len(inventory.disk_drives))
    ]
    assert len(inventory.adapters) == 4


def test_an_inventory_cannot_be_changed(raid: RAIDInstrumentation) -> None:
    read = served(raid, one_lsi_adapter())
    with pytest.raises(dataclasses.FrozenInstanceError):
        read.lsi_adapters = ()  # type: ignore[misc]
    with pytest.raises(dataclasses.FrozenInstanceError):
        read.lsi_adapters[0].adapter_id = 1  # type: ignore[misc]


@pytest.mark.parametrize(
    ("sent", "status"),
    [
        ("0", OverallStatus.NORMAL),
        ("1", OverallStatus.WARNING),
        ("2", OverallStatus.CRITICAL),
        ("3", None),
        ("-1", None),
    ],
)
def test_a_status_without_a_word_is_none(
    raid: RAIDInstrumentation, sent: str, status: OverallStatus | None
) -> None:
    read = served(raid, one_lsi_adapter(overallStatus=sent))
    assert read.lsi_adapters[0].overall_status is status


def test_severity_rises_as_things_get_worse() -> None:
    assert [status.severity for status in OverallStatus] == [0, 1, 2]


def test_texts_are_decoded(raid: RAIDInstrumentation) -> None:
    document = one_lsi_adapter(typeName="caf@ &#xe9; &lt;").encode().replace(b"@", b"\xe9")
    assert served(raid, document).lsi_adapters[0].type_name == "caf\ufffd é <"


def test_a_text_may_have_any_length(raid: RAIDInstrumentation) -> None:
    text = "x" * 3_000_000
    read = served(raid, one_lsi_adapter(serialNumber=text, partNumber="p")).lsi_adapters[0]
    assert read.serial_number == text
    assert read.part_number == "p"


def printed_by(program: str) -> list[str]:
    command = [sys.executable, "-c", program]
    result = subprocess.run(command, stdout=subprocess.PIPE, check=True, text=True)
    return result.stdout.splitlines()


LIMITED = """
import resource
from raidinstrumentation import RAIDInstrumentation

resource.setrlimit(resource.RLIMIT_AS, (500_000_000, 500_000_000))
try:
    RAIDInstrumentation().refresh()
except OSError as error:
    print(error.strerror)
"""


def test_a_process_without_room_for_any_text_is_told() -> None:
    with ScriptedService(config=(EMPTY,)):
        assert "Cannot allocate memory" in printed_by(LIMITED)


def test_an_empty_system_is_no_error(raid: RAIDInstrumentation) -> None:
    assert not any(dataclasses.astuple(served(raid, EMPTY)))


def test_the_inventory_is_asked_for_once_until_it_is_refreshed(raid: RAIDInstrumentation) -> None:
    with ScriptedService(config=(EMPTY, one_lsi_adapter())) as service:
        first = raid.inventory()
        assert raid.inventory() is first
        assert len(service.requests("config")) == 1
        second = raid.refresh()
        assert len(second.lsi_adapters) == 1
        assert raid.inventory() is second
    assert first.lsi_adapters == ()


def test_a_refresh_shows_what_has_changed(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        before = raid.inventory()
        simulator.command("set adapter:1/channel:1/drive:3 state=4 overallStatus=2")
        after = raid.refresh()
    changed = [
        new for old, new in zip(before.disk_drives, after.disk_drives, strict=True) if old != new
    ]
    assert [(drive.serial_number, drive.overall_status) for drive in changed] == [
        ("QS0101003K", OverallStatus.CRITICAL)
    ]


def test_a_service_that_is_not_there_is_unavailable(raid: RAIDInstrumentation) -> None:
    with pytest.raises(ServiceUnavailable, match="port 34572 does not answer"):
        raid.inventory()


def test_a_service_that_closes_without_an_answer_is_unavailable(raid: RAIDInstrumentation) -> None:
    with ScriptedService(config=(Manner.CLOSE,), newest=(Manner.CLOSE,)):
        with pytest.raises(ServiceUnavailable):
            raid.inventory()


# The lists are those of before, and the configuration may lie where the one before lay.
def test_a_service_that_went_away_is_noticed_by_every_refresh(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml"):
        before = raid.inventory()
    for _ in range(3):
        with pytest.raises(ServiceUnavailable):
            raid.refresh()
        assert raid.inventory() is before
    with Simulator("mixed.xml"):
        assert raid.refresh() != before


def test_a_service_that_came_up_late_is_asked_once_more(raid: RAIDInstrumentation) -> None:
    with ScriptedService(config=(Manner.CLOSE, one_lsi_adapter()), newest=(newest_event(0),)):
        assert len(raid.inventory().lsi_adapters) == 1


def test_a_malformed_answer_is_told_from_none(raid: RAIDInstrumentation) -> None:
    with ScriptedService(config=(EMPTY, CUT_OFF), newest=(newest_event(0),)) as service:
        before = raid.inventory()
        with pytest.raises(MalformedAnswer, match="malformed"):
            raid.refresh()
        assert len(service.requests("config")) == 3
        assert raid.inventory() is before


def test_a_configuration_that_is_refused_by_an_answering_service_is_malformed(
    raid: RAIDInstrumentation,
) -> None:
    with ScriptedService(config=(EMPTY, Manner.CLOSE), newest=(newest_event(0),)):
        raid.inventory()
        with pytest.raises(MalformedAnswer):
            raid.refresh()


@pytest.mark.parametrize(
    "fault",
    ["connection/reset-in-body", "connection/closed-without-a-byte", "document/truncated"],
)
def test_one_bad_answer_is_made_good_by_the_next(raid: RAIDInstrumentation, fault: str) -> None:
    with Simulator("small-server.xml") as simulator:
        simulator.arm(f"{fault}.fault", 0)
        assert len(raid.refresh().disk_drives) == 6


REFRESHING = """
from raidinstrumentation import RAIDInstrumentation

with RAIDInstrumentation() as raid:
    raid.refresh()
    raid.refresh()
"""


# The library reads its settings once in the life of a process.
def test_refreshes_that_are_in_order_add_no_error_to_the_log(logs: Path) -> None:
    (logs / "RAIDInstrumentation.ini").write_text("LogLevel=1\n")
    with ScriptedService(config=(EMPTY,)):
        printed_by(REFRESHING)
    assert (logs / "RAIDInstrumentation.log").read_text() == "Data are available\n" * 2


def test_a_silent_service_is_given_up_after_the_timeout(raid: RAIDInstrumentation) -> None:
    with ScriptedService(config=(Manner.HOLD,)):
        with pytest.raises(ServiceUnavailable, match="no answer within 0.1 seconds"):
            raid.refresh(timeout=0.1)


def test_a_refresh_after_one_that_was_given_up_is_in_order(raid: RAIDInstrumentation) -> None:
    with ScriptedService(config=(Manner.HOLD, one_lsi_adapter())):
        with pytest.raises(ServiceUnavailable):
            raid.refresh(timeout=0.1)
        assert len(raid.refresh().lsi_adapters) == 1


def interrupt_this_process() -> None:
    os.kill(os.getpid(), signal.SIGINT)


def test_ctrl_c_ends_a_refresh(raid: RAIDInstrumentation) -> None:
    with ScriptedService(config=(Manner.HOLD,)) as service:
        with meanwhile(lambda: service.wait_for("config"), interrupt_this_process):
            with pytest.raises(KeyboardInterrupt):
                raid.refresh()


def test_nothing_is_answered_after_the_end_of_the_block() -> None:
    with Simulator("small-server.xml"), RAIDInstrumentation() as raid:
        raid.inventory()
    with pytest.raises(RuntimeError, match="closed"):
        raid.inventory()
    with pytest.raises(RuntimeError, match="closed"):
        raid.refresh()
    with pytest.raises(RuntimeError, match="closed"):
        raid.events()


@pytest.mark.parametrize("timeout", [0, -1, -0.5, float("-inf"), float("nan")])
def test_a_timeout_that_is_no_time_is_refused(raid: RAIDInstrumentation, timeout: float) -> None:
    asking: tuple[Callable[..., object], ...] = (raid.inventory, raid.refresh, raid.events)
    for ask in asking:
        with pytest.raises(ValueError, match="timeout"):
            ask(timeout=timeout)


def test_a_timeout_is_looked_at_though_there_is_an_inventory(raid: RAIDInstrumentation) -> None:
    served(raid, EMPTY)
    with pytest.raises(ValueError, match="timeout"):
        raid.inventory(timeout=0)
    assert raid.inventory(timeout=float("inf")) == raid.inventory(timeout=None)
