"""A hundred variants of a flood: other resistances, other rain, each checked.

    variants.py DATA OUT [--count N]

DATA is a folder with the terrain of a street (merewether_terrain.asc), from which a setup is made, or one with the
shipped estuary (estuary.v27 and its data files), whose setup is varied. OUT gets a setup for each variant with what
they share, and variants.csv, which tells what is what and how many messages the check had.
"""

import argparse
import csv
import datetime
import itertools
import shutil
import sys
import time
from pathlib import Path

import gridbay_setup
from gridbay_setup import Setup

START = datetime.datetime(2007, 6, 8, 12)
TERRAIN = "merewether_terrain.asc"
ESTUARY = "estuary.v27"

# %% What is varied

# Manning numbers (m^(1/3)/s) from very rough to smooth, and the peak of the rain (mm/day).
RESISTANCES = [12.0 + 4.0 * n for n in range(10)]
RAINS = [300.0 * n for n in range(1, 11)]


def rain_series(peak: float, start: datetime.datetime, hours: float, target: Path) -> None:
    """A storm that rises in a sixth of the time and falls in as long, as a time series."""
    table = target.with_suffix(".csv")
    sixth = hours * 10  # minutes
    rows = [(0.0, 0.0), (sixth, peak), (2 * sixth, 0.0), (6 * sixth, 0.0)]
    table.write_text("minutes,Rain\n" + "".join(f"{minutes},{value}\n" for minutes, value in rows))
    gridbay_setup.convert_series(
        table, target, item_type="Rainfall rate", start=start, time_unit="min", skip_lines=1, force=True
    )


# %% The setup that all variants start from


def street_flood(data: Path, out: Path) -> Setup:
    """Rain on a catchment: the terrain as a grid, wet and dry at millimetres, maps of the flood."""
    grid = out / "terrain.tsb2"
    gridbay_setup.convert_raster(data / TERRAIN, grid, land=60, nodata_as=60, crs="EPSG:28356", force=True)
    setup = gridbay_setup.new(areas=[grid], start=START, time_step=0.5, time_steps=21600)
    flooding = setup.nested_model_globals.flood_and_dry
    flooding.drying_depth = 0.002
    flooding.flooding_depth = 0.003
    results = setup.hydrodynamic.output_specification
    results.output_areas.resize(1)
    flood = results.output_areas[1]
    flood.file_name = "flood.tsb2"
    columns, rows = gridbay_setup.open_data(grid).points
    flood.x_range_and_interval = (0, columns - 1, 1)
    flood.y_range_and_interval = (0, rows - 1, 1)
    flood.last_time_step = 21600
    flood.time_step_interval = 600
    return setup


def estuary_flood(data: Path, out: Path) -> Setup:
    """The shipped estuary, with its data files beside it."""
    for file in data.glob("*.tsb*"):
        shutil.copy(file, out)
    shutil.copy(data / ESTUARY, out / "base.v27")
    setup = gridbay_setup.open(out / "base.v27")
    for area in setup.hydrodynamic.resistance.areas:
        area.data_format = 1  # a constant in place of the map
    return setup


# %% The variants


def vary(base: Setup, resistance: float, rain: Path, target: Path) -> int:
    """Saves a variant; how many messages its check has."""
    setup = base.copy()
    for area in setup.hydrodynamic.resistance.areas:
        area.constant_value = resistance
    water = setup.hydrodynamic.source_and_sink
    water.precipitation_type = 0  # a time series
    water.precipitation_section.file_name = rain.name
    setup.save(target)
    return len(gridbay_setup.open(target).validate())


def main() -> int:
    parser = argparse.ArgumentParser(description="Makes variants of a flood, and checks each.")
    parser.add_argument("data", type=Path, help=f"a folder with {TERRAIN}, or with {ESTUARY}")
    parser.add_argument("out", type=Path, help="a folder for the variants")
    parser.add_argument("--count", type=int, default=100, help="how many (default: 100)")
    given = parser.parse_args()
    started = time.monotonic()
    given.out.mkdir(parents=True, exist_ok=True)
    if (given.data / TERRAIN).exists():
        base = street_flood(given.data, given.out)
    elif (given.data / ESTUARY).exists():
        base = estuary_flood(given.data, given.out)
    else:
        print(f"{given.data} has neither {TERRAIN} nor {ESTUARY}", file=sys.stderr)
        return 2
    base.save(given.out / "base.v27")  # so that names start from this folder
    period = base.nested_model_globals.simulation_period
    hours = period.number_of_timesteps * period.time_step_interval / 3600
    start = period.start_time
    if start is None:
        print("the setup has no start", file=sys.stderr)
        return 2
    rains = []
    for number, peak in enumerate(RAINS, 1):
        rains.append((peak, given.out / f"rain_{number}.tsb0"))
        rain_series(peak, start, hours, rains[-1][1])
    faulty = 0
    with open(given.out / "variants.csv", "w", newline="") as file:
        table = csv.writer(file)
        table.writerow(["setup", "resistance (m^(1/3)/s)", "peak of rain (mm/day)", "messages"])
        pairs = itertools.cycle(itertools.product(RESISTANCES, rains))
        for number, (resistance, (peak, rain)) in enumerate(itertools.islice(pairs, given.count), 1):
            target = given.out / f"variant_{number:03}.v27"
            messages = vary(base, resistance, rain, target)
            faulty += messages > 0
            table.writerow([target.name, resistance, peak, messages])
    print(f"{given.count} variants, {faulty} with messages, in {time.monotonic() - started:.1f} s")
    return 1 if faulty else 0


if __name__ == "__main__":
    sys.exit(main())
