"""Fixtures of all tests."""

from collections.abc import Iterator
from pathlib import Path

import pytest
from raidinstrumentation import RAIDInstrumentation
from support import build


@pytest.fixture(autouse=True)
def logs(tmp_path: Path, monkeypatch: pytest.MonkeyPatch) -> Path:
    """The folder beside the working directory that the library logs to; it is empty."""
    for name in ("run", "logs"):
        (tmp_path / name).mkdir()
    monkeypatch.chdir(tmp_path / "run")
    monkeypatch.setenv("RAIDINSTRUMENTATION_LIBRARY", str(build.LIBRARY))
    return tmp_path / "logs"


@pytest.fixture
def raid() -> Iterator[RAIDInstrumentation]:
    """The library as built."""
    with RAIDInstrumentation() as instrumentation:
        yield instrumentation
