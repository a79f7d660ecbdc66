"""What the tests share: the shipped documents and those of tests/data."""

from pathlib import Path

import pytest

import aldermoor

ROOT = Path(__file__).parents[2]
EXAMPLES = ROOT / "examples"
DATA = ROOT / "tests" / "data"


@pytest.fixture
def chart() -> aldermoor.Document:
    return aldermoor.load(EXAMPLES / "chart24.xml")
