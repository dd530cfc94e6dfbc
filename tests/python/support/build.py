"""What the build made, and where the sources are; CTest tells."""

import os
from pathlib import Path

SOURCES = Path(os.environ["RAID_SOURCES"])
EXAMPLES = SOURCES / "examples"
FAULTS = SOURCES / "faults"
PACKAGE = SOURCES / "python"

LIBRARY = Path(os.environ["RAID_LIBRARY"])
UNFIT_LIBRARY = Path(os.environ["RAID_UNFIT_LIBRARY"])
RAIDSIM = Path(os.environ["RAIDSIM_PROGRAM"])
RAIDINFO = Path(os.environ["RAIDINFO_PROGRAM"])
