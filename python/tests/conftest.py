import os
from pathlib import Path

import pytest

DATA = Path(os.environ.get("BRINDLE_SOURCE", Path(__file__).parents[2]))


@pytest.fixture(scope="session")
def source_folder() -> Path:
    """The folder of the whole project, whose test data are used here, too."""
    return DATA
