"""The package as pip installs it, and its types."""

import json
import re
import shutil
import subprocess
import sys
import venv
from pathlib import Path

import pytest
from support import build

MYPY = (sys.executable, "-m", "mypy", "--strict")

USER = """
from raidinstrumentation import OverallStatus, RAIDInstrumentation

with RAIDInstrumentation() as raid:
    status: OverallStatus | None = raid.inventory().disk_drives[0].overall_status
    reveal_type([event.sequence_number for event in raid.events()])
    raid.inventory().disk_drives[0].colour
"""


def run(*command: str | Path) -> str:
    """What a command writes; on failure the test shows it."""
    result = subprocess.run(command, stdout=subprocess.PIPE, stderr=subprocess.STDOUT, text=True)
    assert result.returncode == 0, result.stdout
    return result.stdout


@pytest.fixture
def environment(tmp_path: Path) -> Path:
    """A virtual environment in which the package was installed from a copy of its sources."""
    copy = tmp_path / "python"
    leftovers = shutil.ignore_patterns("__pycache__", "build", "*.egg-info", ".mypy_cache")
    shutil.copytree(build.PACKAGE, copy, ignore=leftovers)
    created = tmp_path / "environment"
    venv.create(created)
    (target,) = created.glob("lib/python*/site-packages")
    pip = (sys.executable, "-m", "pip", "--disable-pip-version-check", "install")
    offline = ("--no-index", "--no-build-isolation", "--no-cache-dir")
    run(*pip, *offline, "--target", target, copy)
    return created


def test_an_installed_package_is_imported_and_works(environment: Path) -> None:
    program = (
        "import raidinstrumentation\n"
        "raidinstrumentation.RAIDInstrumentation()\n"
        "print(raidinstrumentation.__file__)"
    )
    imported = run(environment / "bin" / "python", "-I", "-c", program).strip()
    assert Path(imported).is_relative_to(environment)


def test_users_of_an_installed_package_have_its_types(environment: Path, tmp_path: Path) -> None:
    user = tmp_path / "user.py"
    user.write_text(USER)
    checked = subprocess.run(
        [*MYPY, "--python-executable", environment / "bin" / "python", user],
        capture_output=True,
        text=True,
    ).stdout
    assert 'Revealed type is "builtins.list[builtins.int]"' in checked
    assert '"DiskDrive" has no attribute "colour"' in checked
    assert "Found 1 error in 1 file" in checked


def test_package_and_examples_are_typed_strictly() -> None:
    sources = [build.PACKAGE / folder for folder in ("raidinstrumentation", "examples")]
    run(*MYPY, "--config-file", build.PACKAGE / "pyproject.toml", *sources)


def test_everything_public_is_described() -> None:
    program = (
        "import json, raidinstrumentation as package\n"
        "print(json.dumps({name: getattr(package, name).__doc__ for name in package.__all__}))"
    )
    descriptions = json.loads(run(sys.executable, "-c", program))
    assert descriptions
    for name, text in descriptions.items():
        # A dataclass without a text would be described by its fields.
        assert text and not text.startswith(f"{name}("), name


def test_the_version_is_that_of_the_project() -> None:
    project = re.search(r"^    VERSION (.*)$", (build.SOURCES / "CMakeLists.txt").read_text(), re.M)
    package = re.search(r'^version = "(.*)"$', (build.PACKAGE / "pyproject.toml").read_text(), re.M)
    assert project and package and project[1] == package[1]
