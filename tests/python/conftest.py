"""What the tests of the package share. Data files are made through the package."""

import datetime
import pathlib

import pytest

import gridbay_setup

START = datetime.datetime(2020, 1, 1)


@pytest.fixture
def grid(tmp_path):
    """A bay of 20 x 15 points, land around it but in the west, 50 m apart."""
    made = gridbay_setup.new_grid(points=(20, 15), spacing=(50, 50), first=(480000, 6100000), land=10,
                                  projection="UTM-32")  # fmt: skip
    made.values[:] = 20
    made.values[3:12, 0:15] = -4
    path = tmp_path / "bay.tsb2"
    made.save(path)
    return path


@pytest.fixture
def rain(tmp_path):
    """Two items, hourly for three hours."""
    table = tmp_path / "rain.csv"
    table.write_text("hours,Rain,Wind\n0,0,1\n1,50,2\n2,20.5,3\n3,0,4\n")
    path = tmp_path / "rain.tsb0"
    gridbay_setup.convert_series(table, path, item_type=["Rainfall rate", "Wind speed"], start=START, time_unit="h",
                                 skip_lines=1)  # fmt: skip
    return path


@pytest.fixture
def setup(grid):
    """A setup over the bay that has no faults, not saved yet."""
    made = gridbay_setup.new(areas=[grid], start=START, time_step=10, time_steps=360)
    assert made.validate() == []
    return made


@pytest.fixture(params=["v27", "v27wsk"])
def kind(request):
    return request.param


def shared_data() -> pathlib.Path:
    return pathlib.Path(__file__).resolve().parents[3] / "shared" / "data"
