"""Data files: conversions from rasters and text, and grids as arrays."""

from __future__ import annotations

import dataclasses
import datetime
import os
from typing import TYPE_CHECKING, Any, Callable, NamedTuple, Optional, Sequence, Union

from . import _flow_model as _native
from ._sections import file_name

if TYPE_CHECKING:
    import numpy
    import numpy.typing

PathLike = Union[str, "os.PathLike[str]"]
#: Called with what is done and the whole, in rows or values; False stops the work, and so does an exception.
Progress = Callable[[int, int], Optional[bool]]


class ItemType(NamedTuple):
    """A quantity that the values of a data file can be, with the symbol of its base unit."""

    code: int
    name: str
    unit: str


class Item(NamedTuple):
    """An item of a data file; missing stands for a missing value."""

    name: str
    type: int
    unit: str
    missing: float


@dataclasses.dataclass(frozen=True)
class ConvertedRaster:
    """The map that was written. points, spacing (m) and first (easting and northing of the first point, m) are
    along J and K; rotation is in degrees clockwise; missing is how many values were missing."""

    points: tuple[int, int]
    spacing: tuple[float, float]
    first: tuple[float, float]
    rotation: float
    missing: int
    summary: str
    notes: list[str]


@dataclasses.dataclass(frozen=True)
class ConvertedSeries:
    """The series that was written: its items, how many time steps, whether they are even, the moments of the
    first and the last as text."""

    items: list[str]
    steps: int
    equidistant: bool
    first: str
    last: str
    summary: str
    notes: list[str]


def item_types() -> list[ItemType]:
    """All quantities, by rising code."""
    return [ItemType(*each) for each in _native.item_types()]


def convert_raster(
    source: PathLike,
    target: PathLike,
    *,
    land: Optional[float] = None,
    item_type: Union[str, int, None] = None,
    band: Optional[int] = None,
    subdataset: Optional[int] = None,
    nodata_as: Optional[float] = None,
    crs: str = "",
    reproject: str = "",
    resample: Optional[float] = None,
    resampling: str = "bilinear",
    gridding: Optional[str] = None,
    origin_x: Optional[float] = None,
    origin_y: Optional[float] = None,
    coarsen: int = 1,
    window: Optional[tuple[int, int, int, int]] = None,
    extent: Optional[tuple[float, float, float, float]] = None,
    force: bool = False,
    progress: Optional[Progress] = None,
) -> ConvertedRaster:
    """Makes a map (*.tsb2) from a raster of any kind, rows turned so that K runs north.

    land: points at or above it are land (unit of the values, at least 0); a bathymetry needs it. item_type: code,
    name or beginning of a name; else as the file says, or Bathymetry. band, subdataset: which raster to take, from
    1. nodata_as: what stands for missing values, else the land value. crs: as EPSG:28356, UTM-32 or a full text,
    else the raster's own. reproject: the projection to bring it to. resample: the spacing to bring it to (m),
    which a text of points needs. resampling: bilinear, nearest, cubic, mean, least or greatest. gridding: how points
    become a grid: linear, nearest or idw, else linear for what is no raster.
    origin_x, origin_y: easting and northing of the first point (m), else as it lies.
    coarsen: every so many points. window: j0, k0, j1, k1, from 0, both ends counted, K from the south. extent:
    west, south, east, north, in the projection of the map (m): only points within. force: replaces a file that is there.
    """
    name = file_name(source, "convert_raster(source)")
    converted = _native.convert_raster(
        name, file_name(target, "convert_raster(target)"), land=land, item_type=item_type, band=band,
        subdataset=subdataset, nodata_as=nodata_as, crs=crs, reproject=reproject, resample=resample,
        resampling=resampling, gridding=gridding, origin_x=origin_x, origin_y=origin_y, coarsen=coarsen, window=window,
        extent=extent, force=force, progress=progress,
        history=f"gridbay_setup.convert_raster({name!r})",
    )  # fmt: skip
    return ConvertedRaster(**converted)


def convert_series(
    source: PathLike,
    target: PathLike,
    *,
    item_type: Union[str, int, Sequence[Union[str, int]], None] = None,
    start: Optional[datetime.datetime] = None,
    time_unit: str = "s",
    skip_lines: int = 0,
    missing: Union[float, Sequence[float], None] = None,
    dates: Optional[str] = None,
    force: bool = False,
    progress: Optional[Progress] = None,
) -> ConvertedSeries:
    """Makes a time series (*.tsb0) from lines of a time and values, between commas, semicolons, tabs or blanks.

    item_type: one for all columns or a list with one for each: code, name or beginning of a name; else as their names
    and units say. start: the moment of time 0, in whole seconds and no time zone; the first column has the times
    then, else dates, names and units are recognised. time_unit: s, min, h or d. skip_lines: heading lines, of which
    the last names the columns. missing: the number or numbers that stand for missing values; else -9999 and the like
    are recognised, and with a start no value may be missing. dates: the order of dates that do not tell it themselves,
    ymd, dmy or mdy. force: replaces a file that is there.
    """
    name = file_name(source, "convert_series(source)")
    converted = _native.convert_series(
        name, file_name(target, "convert_series(target)"), item_type=item_type, start=start, time_unit=time_unit,
        skip_lines=skip_lines, missing=missing, dates=dates, force=force, progress=progress,
        history=f"gridbay_setup.convert_series({name!r})",
    )  # fmt: skip
    return ConvertedSeries(**converted)


class DataFile:
    """A data file, open for reading. Items count from 1, time steps from 0.

    title, history: texts; items: what it holds; points, first, spacing (m) along J and K, of a map, or along one
    direction; times: of the time steps, an array in time_unit from start, which is None for times of no date;
    projection, longitude, latitude (degrees), rotation (degrees clockwise): where a map lies; land: points at or
    above it are land, None where the file does not say.
    """

    def __init__(self, path: PathLike) -> None:
        self.path = file_name(path, "open_data(path)")
        self._file = _native.open_data(self.path)
        held: dict[str, Any] = self._file.definition()
        self.title: str = held["title"]
        self.history: str = held["history"]
        self.items = [Item(*each) for each in held["items"]]
        self.points: tuple[int, ...] = tuple(axis[0] for axis in held["axes"])
        self.first: tuple[float, ...] = tuple(axis[1] for axis in held["axes"])
        self.spacing: tuple[float, ...] = tuple(axis[2] for axis in held["axes"])
        self.times: numpy.typing.NDArray[numpy.float64] = held["times"]
        self.time_unit: str = held["time_unit"]
        self.start: Optional[datetime.datetime] = held["start"]
        self.projection: str = held["projection"]
        self.longitude: Optional[float] = held["longitude"]
        self.latitude: Optional[float] = held["latitude"]
        self.rotation: float = held["rotation"]
        self.land: Optional[float] = held["land"]

    def read(self, item: int = 1, step: int = 0) -> numpy.typing.NDArray[Any]:
        """The values of one time step, values[k, j] of a map: read straight into the memory of the array."""
        return self._file.read(item, step)

    def read_all(self, item: int = 1) -> numpy.typing.NDArray[Any]:
        """The values of all time steps, values[step, k, j] of a map."""
        return self._file.read_all(item)

    def __repr__(self) -> str:
        return f"<DataFile {self.path}: {len(self.items)} items, {len(self.times)} time steps>"


class NewGrid:
    """A map in the making: `values[k, j]` is written to, and `save` makes the file of it."""

    def __init__(self, native: Any) -> None:
        self._grid = native

    @property
    def values(self) -> numpy.typing.NDArray[numpy.float32]:
        """The values of the first time step, values[k, j]; the array looks at the memory that is saved."""
        return self._grid.values[0]  # type: ignore[no-any-return]

    @property
    def all_values(self) -> numpy.typing.NDArray[numpy.float32]:
        """The values of all time steps, values[step, k, j]."""
        return self._grid.values  # type: ignore[no-any-return]

    def save(self, path: PathLike, *, title: str = "", force: bool = False) -> None:
        """Writes the map, whole or not at all. force: replaces a file that is there."""
        name = file_name(path, "NewGrid.save(path)")
        self._grid.save(name, title or os.path.splitext(os.path.basename(name))[0], "gridbay_setup.new_grid", force)


def open_data(path: PathLike) -> DataFile:
    """Opens a data file (*.tsb0, *.tsb1, *.tsb2)."""
    return DataFile(path)


def new_grid(
    *,
    points: tuple[int, int],
    spacing: tuple[float, float],
    first: tuple[float, float] = (0.0, 0.0),
    item_type: Union[str, int] = "Bathymetry",
    land: Optional[float] = None,
    projection: str = "",
    rotation: float = 0.0,
    steps: int = 1,
    time_step: float = 1.0,
) -> NewGrid:
    """Begins a map of 0 everywhere.

    points, spacing (m), first (easting and northing, m): along J and K. land: points at or above it are land; a
    bathymetry needs it. projection: as UTM-32 or EPSG:28356, empty for local coordinates. rotation: of K in degrees
    clockwise from the projection's north. steps, time_step (s): of a map in time.
    """
    return NewGrid(
        _native.new_grid(
            points=points, spacing=spacing, first=first, item_type=item_type, land=land, projection=projection,
            rotation=rotation, steps=steps, time_step=time_step,
        )
    )  # fmt: skip
