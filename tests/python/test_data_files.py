"""Conversions, and grids as arrays."""

import datetime
import gc

import numpy
import pytest

import gridbay_setup
from gridbay_setup import FileError, RangeError, Stopped, WrongType, WrongValue

START = datetime.datetime(2020, 1, 1)


@pytest.fixture
def raster(tmp_path):
    """3 columns, 2 rows, the north one first, one value missing."""
    path = tmp_path / "r.asc"
    path.write_text("ncols 3\nnrows 2\nxllcorner 100\nyllcorner 200\ncellsize 10\nNODATA_value -9999\n"
                    "1 2 3\n4 5 -9999\n")  # fmt: skip
    return path


def test_a_raster_becomes_a_map(raster, tmp_path):
    calls = []
    made = gridbay_setup.convert_raster(raster, tmp_path / "r.tsb2", land=7, progress=lambda *at: calls.append(at))
    assert made.points == (3, 2) and made.spacing == (10, 10) and made.first == (105, 205) and made.missing == 1
    assert calls == [(1, 2), (2, 2)]
    assert "3 x 2 points" in made.summary and made.notes == []
    data = gridbay_setup.open_data(tmp_path / "r.tsb2")
    assert data.points == (3, 2) and data.first == (105, 205) and data.spacing == (10, 10) and data.land == 7
    assert data.items[0].name == "Bathymetry" and data.start is None
    assert data.read().tolist() == [[4, 5, 7], [1, 2, 3]]
    assert "convert_raster" in data.history


def test_options_of_a_raster(raster, tmp_path):
    made = gridbay_setup.convert_raster(raster, tmp_path / "r.tsb2", item_type="Manning", nodata_as=1.5, origin_x=1,
                                        origin_y=2, crs="UTM-32", window=(1, 0, 2, 1), coarsen=1)  # fmt: skip
    assert made.points == (2, 2) and made.first == (1, 2)
    data = gridbay_setup.open_data(tmp_path / "r.tsb2")
    assert data.read().tolist() == [[5, 1.5], [2, 3]]
    assert data.projection and data.longitude is not None


@pytest.mark.parametrize("options, what", [
    ({}, "land=VALUE"),
    ({"land": -1}, "land cannot be -1"),
    ({"land": float("nan")}, r"convert_raster\(land\): nan .*a finite number"),
    ({"land": 7, "band": 2}, "has no band 2"),
    ({"land": 7, "band": 0}, "bands count from 1"),
    ({"land": 7, "subdataset": 2}, "leave subdataset out"),
    ({"land": 7, "subdataset": -1}, "subdataset cannot be -1"),
    ({"land": 7, "coarsen": 0}, "coarsen cannot be 0"),
    ({"land": 7, "origin_x": float("inf")}, r"convert_raster\(origin_x\): inf .*a finite number"),
    ({"land": 7, "window": (0, 0, 9, 9)}, "does not lie in the raster"),
    ({"item_type": "Mannig number"}, "item_types"),
    ({"item_type": "Manning number"}, "nodata_as"),
    ({"land": 7, "crs": "nonsense"}, "no projection"),
])  # fmt: skip
def test_rasters_that_cannot_be_converted(raster, tmp_path, options, what):
    with pytest.raises(WrongValue, match=what):
        gridbay_setup.convert_raster(raster, tmp_path / "r.tsb2", **options)
    assert not (tmp_path / "r.tsb2").exists()


def test_files_in_the_way(raster, tmp_path):
    target = tmp_path / "r.tsb2"
    target.write_text("mine")
    with pytest.raises(FileError, match="force=True replaces it"):
        gridbay_setup.convert_raster(raster, target, land=7)
    assert target.read_text() == "mine"
    gridbay_setup.convert_raster(raster, target, land=7, force=True)
    with pytest.raises(FileError, match="gone.asc"):
        gridbay_setup.convert_raster(tmp_path / "gone.asc", tmp_path / "g.tsb2", land=7)


def test_work_can_be_stopped(raster, tmp_path):
    target = tmp_path / "r.tsb2"
    with pytest.raises(Stopped, match="nothing is written"):
        gridbay_setup.convert_raster(raster, target, land=7, progress=lambda done, total: False)
    with pytest.raises(ZeroDivisionError):
        gridbay_setup.convert_raster(raster, target, land=7, progress=lambda done, total: 1 / 0)
    table = tmp_path / "t.csv"
    table.write_text("0,1\n1,2\n")
    with pytest.raises(Stopped):
        gridbay_setup.convert_series(table, target, item_type=999, start=START, progress=lambda *at: False)
    assert list(tmp_path.glob("*.tsb*")) == []


def test_text_becomes_a_series(rain):
    data = gridbay_setup.open_data(rain)
    assert [item.name for item in data.items] == ["Rain", "Wind"]
    assert data.start == START and data.time_unit == "h" and data.times.tolist() == [0, 1, 2, 3]
    assert data.read_all(1).tolist() == [0, 50, 20.5, 0] and data.read_all(2).dtype == numpy.float64
    assert data.read(1, 1) == 50 and data.read(1, 1).shape == ()


@pytest.mark.parametrize("options, what", [
    ({"item_type": []}, "item_type is missing"),
    ({"item_type": ["Wind speed", "Wind speed", "Wind speed"]}, "3 item types for 2 columns"),
    ({"time_unit": "m"}, "no unit of time"),
    ({"skip_lines": 0}, "skip_lines=N"),
    ({"skip_lines": -1}, "skip_lines cannot be -1"),
    ({"start": "soon"}, "no moment"),
])  # fmt: skip
def test_text_that_is_no_series(rain, tmp_path, options, what):
    with pytest.raises(WrongValue, match=what):
        gridbay_setup.convert_series(rain.with_suffix(".csv"), tmp_path / "x.tsb0",
                                     **{"item_type": 999, "start": START, "skip_lines": 1, **options})  # fmt: skip


def test_item_types():
    types = {kind.name: kind for kind in gridbay_setup.item_types()}
    assert types["Bathymetry"] == (100079, "Bathymetry", "m")


def test_arrays_look_at_memory_that_lives_as_long_as_they_do(grid):
    data = gridbay_setup.open_data(grid)
    values = data.read()
    assert values.shape == (15, 20) and values.dtype == numpy.float32 and not values.flags.owndata
    part = values[3:5, :2]
    del data, values
    gc.collect()
    assert part.tolist() == [[-4, -4], [-4, -4]]


def test_a_map_is_made_from_an_array(tmp_path):
    made = gridbay_setup.new_grid(points=(3, 2), spacing=(1, 2), item_type="Water level", steps=2, time_step=60)
    first = made.values
    assert first.shape == (2, 3) and not first.flags.owndata
    first[:] = [[1, 2, 3], [4, 5, 6]]
    made.all_values[1] = 9
    assert made.all_values[0].tolist() == first.tolist()
    path = tmp_path / "level.tsb2"
    made.save(path, title="Levels")
    with pytest.raises(FileError, match="force=True"):
        made.save(path)
    made.save(path, force=True)
    del made
    gc.collect()
    assert first[1, 2] == 6
    data = gridbay_setup.open_data(path)
    assert data.read(1, 0).tolist() == [[1, 2, 3], [4, 5, 6]] and (data.read(1, 1) == 9).all()
    assert data.read_all().shape == (2, 2, 3) and data.times.tolist() == [0, 60]


@pytest.mark.parametrize("options, what", [
    ({"points": (0, 2)}, "points: 0 x 2 points"),
    ({"points": (2**20, 2**20)}, "no more than"),
    ({"steps": 0}, "at least 1"),
    ({"spacing": (0, 1)}, "spacing"),
    ({"time_step": 0}, "time_step"),
    ({"land": None}, "land: None was given"),
    ({"item_type": "Bath"}, "item_type"),
    ({"projection": "nonsense"}, "projection"),
    ({"rotation": 5}, "rotation"),
])  # fmt: skip
def test_maps_that_cannot_be_made(options, what):
    if options.get("item_type") == "Bath":
        options = {"item_type": "Nothing like it"}
    with pytest.raises(WrongValue, match=what):
        gridbay_setup.new_grid(**{"points": (3, 2), "spacing": (1, 1), "land": 1, **options})


def test_data_files_that_cannot_be_read(grid, tmp_path):
    with pytest.raises(FileError, match="gone"):
        gridbay_setup.open_data(tmp_path / "gone.tsb2")
    (tmp_path / "bad.tsb2").write_bytes(grid.read_bytes()[:100])
    with pytest.raises(FileError, match="bad"):
        gridbay_setup.open_data(tmp_path / "bad.tsb2")
    data = gridbay_setup.open_data(grid)
    for item in (0, 2):
        with pytest.raises(RangeError, match=f"item {item} was given; allowed is 1 to 1"):
            data.read(item)
        with pytest.raises(RangeError):
            data.read_all(item)
    for step in (-1, 1):
        with pytest.raises(RangeError, match=f"time step {step} was given; allowed is 0 to 0"):
            data.read(1, step)


AWARE = datetime.datetime(2020, 1, 1, tzinfo=datetime.timezone.utc)
RASTER = {"source": "r.asc", "target": "r.tsb2", "land": 7}
SERIES = {"source": "r.csv", "target": "r.tsb0", "item_type": 999, "start": START}
GRID = {"points": (3, 2), "spacing": (1, 1), "land": 1}


@pytest.mark.parametrize("function, good, argument, value, error, allowed", [
    ("convert_raster", RASTER, "source", 3, WrongType, "the name of a file"),
    ("convert_raster", RASTER, "target", b"r.tsb2", WrongType, "the name of a file"),
    ("convert_raster", RASTER, "target", "r\0.tsb2", WrongValue, "a text without zero bytes"),
    ("convert_raster", RASTER, "land", "high", WrongType, "a number"),
    ("convert_raster", RASTER, "item_type", 3.5, WrongType, "the code or name of an item type"),
    ("convert_raster", RASTER, "band", 1.0, WrongType, "a whole number of 32 bits"),
    ("convert_raster", RASTER, "coarsen", 2**40, WrongValue, "a whole number of 32 bits"),
    ("convert_raster", RASTER, "crs", None, WrongType, "a text"),
    ("convert_raster", RASTER, "window", (1, 2, 3), WrongValue, "4 values, as a tuple"),
    ("convert_raster", RASTER, "window", "0123", WrongType, "a list"),
    ("convert_raster", RASTER, "resampling", "best", WrongValue, "bilinear, cubic, greatest, least, mean, nearest"),
    ("convert_raster", RASTER, "gridding", "spline", WrongValue, "idw, linear, nearest"),
    ("convert_raster", RASTER, "extent", (0, 1), WrongValue, "4 values, as a tuple"),
    ("convert_series", SERIES, "dates", "dd", WrongValue, "dmy, mdy, ymd"),
    ("convert_raster", RASTER, "force", "yes", WrongType, "True or False"),
    ("convert_raster", RASTER, "progress", 3, WrongType, "a function of two numbers, or None"),
    ("convert_series", SERIES, "item_type", [999, None], WrongType, "the code or name of an item type"),
    ("convert_series", SERIES, "missing", "-999", WrongType, "a list"),
    ("convert_series", SERIES, "missing", [-999, None], WrongType, "a number"),
    ("convert_series", SERIES, "missing", float("nan"), WrongValue, "a finite number"),
    ("convert_series", SERIES, "start", 5, WrongType, "a datetime of whole seconds without a time zone"),
    ("convert_series", SERIES, "start", AWARE, WrongValue, "a datetime of whole seconds without a time zone"),
    ("convert_series", SERIES, "start", START.replace(microsecond=1), WrongValue, "a datetime of whole seconds"),
    ("convert_series", SERIES, "skip_lines", True, WrongType, "a whole number of 32 bits"),
    ("new_grid", GRID, "points", (3, 2, 1), WrongValue, "2 values, as a tuple"),
    ("new_grid", GRID, "points", (3, 2.5), WrongType, "a whole number of 32 bits"),
    ("new_grid", GRID, "item_type", None, WrongType, "the code or name of an item type"),
    ("new_grid", GRID, "spacing", 1, WrongType, "a list"),
])  # fmt: skip
def test_arguments_that_cannot_be(function, good, argument, value, error, allowed):
    with pytest.raises(error) as caught:
        getattr(gridbay_setup, function)(**{**good, argument: value})
    fault = caught.value
    assert fault.path == f"{function}({argument})" and allowed in fault.allowed and fault.given
    assert all(part in str(fault) for part in (fault.path, fault.given, fault.allowed))


def test_names_of_files_of_any_bytes(raster, tmp_path):
    name = (tmp_path / "r").as_posix() + "\udcff"
    gridbay_setup.convert_raster(raster, name + ".tsb2", land=7)
    assert gridbay_setup.open_data(name + ".tsb2").read().shape == (2, 3)
    gridbay_setup.new().save(name + ".v27")
    setup = gridbay_setup.open(name + ".v27")
    assert setup.file == name + ".v27"
    with pytest.raises(FileError, match="gone"):
        gridbay_setup.open(tmp_path / "gone\udcff.v27")
    with pytest.raises(WrongType, match=r"open_data\(path\): 3 "):
        gridbay_setup.open_data(3)
    with pytest.raises(WrongType, match=r"DataFile.read\(step\): 1.5 "):
        gridbay_setup.open_data(name + ".tsb2").read(1, 1.5)
    with pytest.raises(WrongType, match=r"NewGrid.save\(path\): None "):
        gridbay_setup.new_grid(points=(3, 2), spacing=(1, 1), land=1).save(None)


def test_points_and_tables_that_tell_what_they_hold(tmp_path):
    points = tmp_path / "points.xyz"
    points.write_text("x y z\n" + "".join(f"{10 * x} {10 * y} {x + y}\n" for x in range(4) for y in range(3)))
    made = gridbay_setup.convert_raster(points, tmp_path / "points.tsb2", land=99, resample=10, gridding="nearest",
                                        crs="UTM-32", extent=(10, 0, 30, 20))  # fmt: skip
    assert made.points == (3, 3) and made.first == (10, 0)
    assert gridbay_setup.open_data(tmp_path / "points.tsb2").read()[2, 1] == 4
    table = tmp_path / "table.csv"
    table.write_text("date;water level [m]\n01.02.2020 06:00;0,5\n01.02.2020 07:00;0,75\n")
    assert gridbay_setup.convert_series(table, tmp_path / "table.tsb0", dates="dmy").items == ["water level"]
    data = gridbay_setup.open_data(tmp_path / "table.tsb0")
    assert data.start == datetime.datetime(2020, 2, 1, 6) and data.items[0].name == "water level"


@pytest.mark.parametrize("missing, values", [
    (None, [1, None, -777, 3]),  # -9999 is recognised
    (-777, [1, -9999, None, 3]),
    ([-777, -9999.0], [1, None, None, 3]),
    (numpy.array([3.0, 1]), [None, -9999, -777, None]),
    ([], [1, None, -777, 3]),
])  # fmt: skip
def test_numbers_stand_for_missing_values(tmp_path, missing, values):
    table = tmp_path / "gauge.csv"
    table.write_text("date,water level [m]\n2020-02-01,1\n2020-02-02,-9999\n2020-02-03,-777\n2020-02-04,3\n")
    gridbay_setup.convert_series(table, tmp_path / "gauge.tsb0", missing=missing)
    data = gridbay_setup.open_data(tmp_path / "gauge.tsb0")
    read = data.read_all(1)
    assert [None if numpy.isnan(value) or value == data.items[0].missing else value for value in read] == values


def test_values_may_be_missing_with_a_start_when_it_is_said_which(tmp_path):
    table = tmp_path / "rain.csv"
    table.write_text("0,1\n1,-1\n2,3\n")
    with pytest.raises(WrongValue):
        gridbay_setup.convert_series(table, tmp_path / "a.tsb0", item_type=999, start=START, missing=float("inf"))
    gridbay_setup.convert_series(table, tmp_path / "a.tsb0", item_type=999, start=START, missing=-1)
    data = gridbay_setup.open_data(tmp_path / "a.tsb0")
    assert numpy.isnan(data.read_all(1)[1]) or data.read_all(1)[1] == data.items[0].missing
