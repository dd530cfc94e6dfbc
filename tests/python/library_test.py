"""Where the library is looked for, and what it must have."""

import os
import subprocess
import sys
from pathlib import Path

import pytest
from raidinstrumentation import (
    LibraryNotFound,
    LibraryUnusable,
    RAIDError,
    RAIDInstrumentation,
)
from support import build

VARIABLE = "RAIDINSTRUMENTATION_LIBRARY"


def test_the_argument_goes_before_the_environment(monkeypatch: pytest.MonkeyPatch) -> None:
    monkeypatch.setenv(VARIABLE, "/nowhere.so")
    RAIDInstrumentation(build.LIBRARY)
    RAIDInstrumentation(str(build.LIBRARY))
    with pytest.raises(LibraryNotFound, match="/nowhere.so"):
        RAIDInstrumentation()


# The loader looks at its path when a program starts.
def started(**environment: str) -> subprocess.CompletedProcess[str]:
    program = "import raidinstrumentation; raidinstrumentation.RAIDInstrumentation()"
    return subprocess.run(
        [sys.executable, "-c", program],
        env=os.environ | environment,
        capture_output=True,
        text=True,
    )


def test_the_loader_finds_what_nobody_names() -> None:
    library_path = str(build.LIBRARY.parent)
    assert started(**{VARIABLE: "", "LD_LIBRARY_PATH": library_path}).returncode == 0


def test_a_library_that_is_not_installed_is_not_found() -> None:
    failed = started(**{VARIABLE: ""})
    assert failed.returncode == 1
    assert "LibraryNotFound: cannot load the library: libRAID" in failed.stderr


def test_a_name_without_a_slash_is_one_of_the_working_directory() -> None:
    with pytest.raises(LibraryNotFound, match=str(Path.cwd() / "libc.so.6")):
        RAIDInstrumentation("libc.so.6")


def test_a_file_that_is_no_library_is_unusable(tmp_path: Path) -> None:
    text = tmp_path / "text.so"
    text.write_text("Not a library.")
    with pytest.raises(LibraryUnusable, match="text.so") as told:
        RAIDInstrumentation(text)
    assert not isinstance(told.value, LibraryNotFound)


def test_a_library_that_lacks_the_functions_is_unusable() -> None:
    with pytest.raises(LibraryUnusable, match="unfit.*RAIDinit"):
        RAIDInstrumentation(build.UNFIT_LIBRARY)


def test_every_failure_is_a_raid_error() -> None:
    with pytest.raises(RAIDError):
        RAIDInstrumentation("nowhere.so")
