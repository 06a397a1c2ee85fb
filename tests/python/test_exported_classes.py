"""The scripting classes under their names, with their edge cases. What their classes pass over is an exception here."""

import datetime
import itertools
import pathlib
import re
import threading
import time

import pytest

import gridbay_setup
from gridbay_setup import (CClimateChange_V27, FileError, Flooding_V27FlowModel, RangeError, UrbanFlooding_V27Flowmodel,
                           WrongType, WrongValue, wetland_sweep_kit)  # fmt: skip

START = datetime.datetime(2020, 1, 1)
END = datetime.datetime(2020, 1, 2)
HD = "HYDRODYNAMIC_MODULE/"
FRESH = pathlib.Path(__file__).parents[1] / "scripting" / "fresh.v27"


def saved(model, tmp_path):
    """The setup that the model saves, and what was shown."""
    shown = []
    model.ShowMessagesWith(shown.append)
    path = tmp_path / "saved.v27"
    model.SaveFile(path)
    return gridbay_setup.open(path), shown


def refused(error, path, given, allowed, call, *arguments):
    """The call is refused, with all that an error has to say."""
    with pytest.raises(error) as caught:
        call(*arguments)
    fault = caught.value
    assert (fault.path, fault.given, fault.allowed) == (path, given, allowed)
    assert str(fault) == f"{path}: {given} was given; allowed is {allowed}"


def there(count):
    return f"1 to {count}" if count else "none: there is none in the model"


@pytest.fixture(autouse=True)
def in_a_folder_of_its_own(tmp_path, monkeypatch):
    monkeypatch.chdir(tmp_path)


@pytest.fixture(params=["Flooding_V27FlowModel", "UrbanFlooding_V27Flowmodel"])
def model(request):
    made = getattr(gridbay_setup, request.param)()
    made.SetSimulationPeriod(START, END, 30)
    return made


@pytest.fixture
def flood():
    made = Flooding_V27FlowModel()
    made.SetSimulationPeriod(START, END, 30)
    return made


@pytest.fixture
def urban():
    made = UrbanFlooding_V27Flowmodel()
    made.SetSimulationPeriod(START, END, 30)
    return made


@pytest.mark.parametrize("name", ["Flooding_V27FlowModel", "UrbanFlooding_V27Flowmodel"])
@pytest.mark.parametrize("edition", [gridbay_setup, wetland_sweep_kit])
def test_a_fresh_object_writes_the_whole_tree_and_shows_what_is_wrong(edition, name, tmp_path):
    shown = []
    model = getattr(edition, name)()
    model.ShowMessagesWith(shown.append)
    model.SaveFile(tmp_path / "saved.v27")
    assert (tmp_path / "saved.v27").read_text() == FRESH.read_text()
    assert shown == ['VANE 27: Data file  " "  is not valid']
def test_what_is_common_to_both_interfaces(model, grid, tmp_path):
    assert model.GetFileExtension() == ".v27"
    model.setCoarseBathymetryFile(str(grid))
    assert model.getCoarseBathymetryFile() == str(grid)
    model.setFineBathymetryFile("fine.tsb2")
    model.setOverlandSolverOption(1)
    model.setOverlandSolverOption(2)
    model.setDryingFloodingDepth(0.01, 0.02)
    model.setResistance_Value(20)
    model.setInitialCondition_Value(0.5)
    model.setEddyViscosity_IncludedWithDefaultValue()
    model.setRain_Value(30)
    model.setNoOfBndCondition(-1)
    model.setOutput_MaximumFloodDepthAndExtend("deepest.tsb2", 10)
    setup, shown = saved(model, tmp_path)
    assert all(line.startswith("VANE 27: ") for text in shown for line in text.splitlines())
    bathymetry = setup.nested_model_globals.bathymetry_selection
    assert bathymetry.overland_solver is False and bathymetry.coriolis_force is False
    assert bathymetry.overland_filename.name == "fine.tsb2"
    assert setup.nested_model_globals.open_boundary.default_position == 0
    assert setup.hydrodynamic.resistance.areas[1].constant_value == 20
    assert setup.hydrodynamic.source_and_sink.precipitation == 30
    assert setup.hydrodynamic.eddy_viscosity.areas[1].constant_value == pytest.approx(0.02 * 50 * 50 / 30)
    assert setup.nested_model_globals.simulation_period.number_of_timesteps == 24 * 120


def test_the_overland_solver_is_on_for_1_alone(model, tmp_path):
    for option, is_on in [(1, True), (2, False), (True, True), (0, False), (1, True), (-1, False)]:
        model.setOverlandSolverOption(option)
        setup, _ = saved(model, tmp_path)
        assert setup.nested_model_globals.bathymetry_selection.overland_solver is is_on


def test_boundaries(flood, tmp_path):
    flood.setNoOfBndCondition(2)
    assert flood.getNoOfBndConditions() == 2
    flood.setHDBndCondition_Value(1, 0, 1, 0, 5, 2, 7.5)
    before = saved(flood, tmp_path)[0].text()
    for index in (0, 3, -1):
        at = f"{index}"
        path = "Flooding_V27FlowModel.{}(index)".format
        refused(RangeError, path("setHDBndCondition_Value"), at, there(2), flood.setHDBndCondition_Value, index, 9, 9, 9,
                9, 1, 1)  # fmt: skip
        refused(RangeError, path("setHDBndCondition_File"), at, there(2), flood.setHDBndCondition_File, index, 9, 9, 9, 9,
                1, 3, "x.tsb0", 1)  # fmt: skip
        refused(RangeError, path("getHDBndCondition"), at, there(2), flood.getHDBndCondition, index)
    assert saved(flood, tmp_path)[0].text() == before
    assert flood.getHDBndCondition(1) == (0, 1, 0, 5, 2, 1, 7.5, "", 0)
    flood.setHDBndCondition_File(2, 1, 2, 3, 4, 1, 3, "tide.tsb0", 2)
    assert flood.getHDBndCondition(2) == (1, 2, 3, 4, 1, 3, 0.0, "tide.tsb0", 2)
    with pytest.raises(WrongValue, match=r"allowed is a data format that has an item. Boundary 1 has data format 5"):
        flood.setHDBndCondition_File(1, 5, 6, 7, 8, 1, 5, "x.tsb0", 1)
    assert flood.getHDBndCondition(1)[:6] == (5, 6, 7, 8, 1, 5)


def test_a_count_of_boundaries_below_0_only_makes_them_user_specified(flood, tmp_path):
    flood.setNoOfBndCondition(2)
    setup, _ = saved(flood, tmp_path)
    setup.nested_model_globals.open_boundary.default_position = 1
    setup.save()
    before = setup.text()
    flood.LoadFile(setup.file)
    flood.setNoOfBndCondition(-4)
    assert flood.getNoOfBndConditions() == 2
    assert saved(flood, tmp_path)[0].text() == before.replace("Default_Position 1", "Default_Position 0")


def test_counts_that_cannot_be(flood):
    flood.setNoOfSourceSink(1)
    path = "Flooding_V27FlowModel.{}(count)".format
    refused(WrongValue, path("setNoOfSourceSink"), "-1", "0 to 65535", flood.setNoOfSourceSink, -1)
    refused(WrongValue, path("setNoOfSourceSink"), "65536", "0 to 65535", flood.setNoOfSourceSink, 65536)
    refused(WrongValue, path("setNoOfBndCondition"), "65536", "65535 or less", flood.setNoOfBndCondition, 65536)
    assert flood.getNoOfSourceSink() == 1 and flood.getNoOfBndConditions() == 0


def test_sources(flood, tmp_path):
    flood.setNoOfSourceSink(1)
    for index, name in itertools.product((0, 2), ("Value", "File", "FileEx")):
        with pytest.raises(RangeError, match=rf"setHDSourceSink_{name}\(index\): {index} was given; allowed is 1 to 1"):
            numbers = [9] * 5 + [1, 1, 1] if name == "Value" else [9] * 5 + ["x.tsb0", 1, 1, 1]
            getattr(flood, f"setHDSourceSink_{name}")(index, *numbers)
    with pytest.raises(RangeError, match=r"getHDSourceSink\(index\): 2 was given"):
        flood.getHDSourceSink(2)
    flood.setHDSourceSink_Value(1, 0, 3, 4, 0, 0, 1.5, 0.5, 90)
    assert flood.getHDSourceSink(1) == (0, 0, 3, 4, 0, 0, 1.5, 0.5, 90, "", 1, 2, 0)
    flood.setHDSourceSink_File(1, 0, 3, 4, 0, 0, "source.tsb0", 90, 5, 6)
    assert flood.getHDSourceSink(1)[9:] == ("", 5, 6, 0)
    flood.setHDSourceSink_FileEx(1, 2, 3, 4, 0, 0, "source.tsb0", 7, 8, 9)
    assert flood.getHDSourceSink(1)[:2] == (2, 2) and flood.getHDSourceSink(1)[9:] == ("", 7, 8, 9)
    setup, _ = saved(flood, tmp_path)
    assert setup[HD + "SOURCE_AND_SINK/SOURCE_SINK_1/File_Name"] is None


def test_outputs(flood, tmp_path):
    flood.AddOutput_MapsAndTimeSeriesJK(0, 1, 1, 2, 3, 4, [], [], 1, START, END, 0, "map.tsb2", "Map", [1, 4])
    for points in (([1.0], []), ([], [1.0])):
        flood.AddOutput_MapsAndTimeSeriesJK(1, 0, 0, 0, 0, 0, *points, 0, None, None, -5, "p.tsb0", "Points", [1])
    position = flood.GetOutputsListHeadPos()
    assert position
    position, *first = flood.GetNextOutputs_MapsJKAndTS(position)
    assert first[:6] == [0, 1, 1, 2, 3, 4] and first[-3:] == ["map.tsb2", "Map", [1, 4]]
    while position:
        position, *points = flood.GetNextOutputs_MapsJKAndTS(position)
        assert points[0] == 1 and points[6] == [0.0] and points[7] == [0.0]
    refused(RangeError, "Flooding_V27FlowModel.GetNextOutputs_MapsJKAndTS(position)", "0", there(3),
            flood.GetNextOutputs_MapsJKAndTS, position)  # fmt: skip
    setup, _ = saved(flood, tmp_path)
    outputs = setup.hydrodynamic.output_specification.output_areas
    assert [output.time_step_interval for output in outputs] == [1, 1, 1]
    stale = flood.GetOutputsListHeadPos()
    flood.ClearHDResultOutputs()
    assert not flood.GetOutputsListHeadPos()
    with pytest.raises(RangeError, match=r"\(position\): 1 was given; allowed is none"):
        flood.GetNextOutputs_MapsJKAndTS(stale)


def test_an_output_that_cannot_be_saved(flood, tmp_path):
    flood.AddOutput_MapsAndTimeSeriesJK(0, 0, 0, 0, 0, 0, [], [], 0, None, None, 1, "out.tsb2", "", [1, 15])
    flood.ShowMessagesWith(lambda text: None)
    with pytest.raises(WrongValue, match=r"SaveFile: \(.*a.v27.*allowed is outputs whose items can be saved"):
        flood.SaveFile(tmp_path / "a.v27")
    assert not (tmp_path / "a.v27").exists()


@pytest.mark.parametrize("name, text, what", [
    ("broken.v27", "A {", "Syntax error"),
    ("gone.v27", None, "gone.v27"),
    ("other.v27", "OTHER { Key 1; }\n", "is not a setup"),
    ("", None, ""),
])  # fmt: skip
def test_files_that_are_no_setups(flood, tmp_path, name, text, what):
    shown = []
    flood.ShowMessagesWith(shown.append)
    flood.setResistance_Value(11)
    before = saved(flood, tmp_path)[0].text()
    file = str(tmp_path / name)
    if text is not None:
        pathlib.Path(file).write_text(text)
    flood.ShowMessagesWith(shown.append)
    climate = CClimateChange_V27()
    climate.ShowMessagesWith(shown.append)
    for load in (flood.LoadFile, climate.OpenFile):
        with pytest.raises(FileError, match=what) as caught:
            load(file)
        assert caught.value.path == file and file in str(caught.value)
    assert len(shown) == (2 if what == "Syntax error" else 0)  # as the classes do
    assert saved(flood, tmp_path)[0].text() == before


def test_files_that_cannot_be_written_or_read(model, tmp_path):
    model.ShowMessagesWith(lambda text: None)
    for save in (model.SaveFile, CClimateChange_V27().SaveFile):
        with pytest.raises(FileError, match="nowhere/a.v27") as caught:
            save(tmp_path / "nowhere" / "a.v27")
        assert caught.value.path == str(tmp_path / "nowhere" / "a.v27")
    before = saved(model, tmp_path)[0].text()
    for name in ("gone.tsb2", "saved.v27"):
        with pytest.raises(FileError, match=name) as caught:
            model.setCoarseBathymetryFile(tmp_path / name)
        assert caught.value.path == str(tmp_path / name)
    assert saved(model, tmp_path)[0].text() == before


def test_a_series_is_no_grid_and_a_model_without_areas_takes_none(flood, grid, rain, tmp_path):
    with pytest.raises(FileError, match="a file of 0 axes was given; allowed is a grid"):
        flood.setCoarseBathymetryFile(rain)
    setup, _ = saved(flood, tmp_path)
    pathlib.Path(setup.file).write_text(setup.text().replace("No_Of_Areas 1", "No_Of_Areas 0"))
    flood.LoadFile(setup.file)
    # A name that is not absolute starts from the folder of the setup.
    for call in (lambda: flood.setCoarseBathymetryFile(grid.name), flood.getCoarseBathymetryFile):
        with pytest.raises(WrongValue, match=r"was given; allowed is a model with an area\."):
            call()
    with pytest.raises(FileError, match=re.escape(str(tmp_path / "none.tsb2"))):
        flood.setCoarseBathymetryFile("none.tsb2")


def test_urban_boundaries_go_by_the_extension(urban):
    urban.setNoOfBndCondition(4)
    look = urban.as_flow_model()
    for index, name, expected in [(1, "a.tsb0", (3, "a.tsb0", 2)), (2, "b.tb1", (4, "b.tb1", 2))]:
        urban.setBndCondition_File(index, 0, 0, 0, 9, 1, name, 2)
        held = look.getHDBndCondition(index)
        assert (held[5], held[7], held[8]) == expected
    for name in ("c.TSB0", "c.tsb2", "c"):
        urban.setBndCondition_File(3, 1, 2, 3, 4, 2, name, 2)
        held = look.getHDBndCondition(3)
        assert held[:6] == (1, 2, 3, 4, 2, 1) and held[7] == ""
    urban.setBndCondition_Value(4, 0, 0, 0, 9, 2, 3.5)
    assert look.getHDBndCondition(4)[6] == 3.5


def test_urban_outputs(urban, tmp_path):
    flags = dict(water_depth=False, surface_elevation=False, velocities=False, fluxes=False)
    add = lambda kind, steps, name, **which: urban.AddOutput_MapsAndTimeSeries(  # noqa: E731
        kind, 1, -1.5, 2.9, 30.2, 40.7, 0, None, None, steps, name, "", **{**flags, **which})  # fmt: skip
    add(0, 10.0, "map.tsb2")
    add(0, 1e9, "all.tsb2", water_depth=True, fluxes=True, surface_elevation=True, velocities=True)
    add(1, 10.0, "point.tsb0", water_depth=True)
    setup, _ = saved(urban, tmp_path)
    first, second, point = setup.hydrodynamic.output_specification.output_areas
    assert first.x_range_and_interval == (-1, 30, 1) and first.y_range_and_interval == (2, 40, 1)
    assert first.output_item == 0 and first.time_step_interval == 24 * 120 // 10
    assert second.item_numbers == [1, 2, 3, 4, 5, 6] and second.time_step_interval == 1
    assert point.type == 0
    look = urban.as_flow_model()
    position = look.GetOutputsListHeadPos()
    while position:
        position, *last = look.GetNextOutputs_MapsJKAndTS(position)
    assert last[0] == 1 and last[6:8] == [[0.0], [0.0]]
    position = urban.GetOutputsListHeadPos()
    results = [urban.GetNextOutputs_MapsJKAndTS(position, ignored)[1:] for ignored in (0, 7, -3)]
    assert results[0] == results[1] == results[2]


def test_urban_boundaries_that_are_not_there(urban, tmp_path):
    urban.setNoOfBndCondition(2)
    before = saved(urban, tmp_path)[0].text()
    for index in (0, 3):
        path = "UrbanFlooding_V27Flowmodel.{}(index)".format
        refused(RangeError, path("setBndCondition_Value"), f"{index}", there(2), urban.setBndCondition_Value, index, 9, 9,
                9, 9, 1, 1)  # fmt: skip
        refused(RangeError, path("setBndCondition_File"), f"{index}", there(2), urban.setBndCondition_File, index, 9, 9, 9,
                9, 1, "x.tsb0", 1)  # fmt: skip
    assert saved(urban, tmp_path)[0].text() == before


def test_urban_coordinates_left_of_the_origin_are_reported(urban, grid, tmp_path):
    urban.setCoarseBathymetryFile(grid)
    urban.AddOutput_MapsAndTimeSeries(0, True, 479900, 6100049, 480101, 6100101, 0, None, None, 1, "m.tsb2", "", True,
                                      False, False, False)  # fmt: skip
    setup, shown = saved(urban, tmp_path)
    (output,) = setup.hydrodynamic.output_specification.output_areas
    assert output.x_range_and_interval == (-2, 2, 1) and output.y_range_and_interval == (0, 2, 1)
    assert shown and shown[0].startswith("VANE 27: ")


#: section, keywords of kind and value, section of the file, the kinds constant, series and grids on file
FAMILIES = {
    "Prec": (HD + "SOURCE_AND_SINK", "PrecipitationType", "Precipitation", "Precipitation", (-1, 0, 2)),
    "Evap": (HD + "SOURCE_AND_SINK", "EvaporationType", "Evaporation", "Evaporation", (-1, 0, 2)),
    "Temp": ("ADVECTION_DISPERSION_MODULE/HEAT_EXCHANGE", "AirFormat", "AirConstantValue", "AIR_FILE", (-1, 0, 2)),
}


class Family:
    """The members of a forcing, on a setup with it."""

    def __init__(self, name, folder, module=gridbay_setup):
        self.name = name
        self.section, self.kind, self.value, self.file, self.kinds = FAMILIES[name]
        self.path = folder / "forcing.v27"
        self.setup = gridbay_setup.new()
        self.setup.nested_model_globals.module_selection.simulation_type = 2
        self.components = self.setup.advection_dispersion.component_specifications.components
        self.components[1].component_description = -2
        self.module = module

    def open(self, which, value=2.5):
        self.setup[f"{self.section}/{self.kind}"] = self.kinds[which]
        self.setup[f"{self.section}/{self.value}"] = value
        self.setup[f"{self.section}/{self.file}/File_Name"] = "old.tsb0"
        self.setup[f"{self.section}/{self.file}/Item_Numbers"] = [3]
        self.setup.save(self.path)
        self.climate = self.module.CClimateChange_V27()
        assert self.climate.OpenFile(self.path) == 1

    def member(self, before, after):
        return getattr(self.climate, before + self.name + after)

    def counts(self):
        return tuple(self.member("GetNo", kind)() for kind in ("Values", "TimeSeries", "GridSeries"))

    def refuses(self, count, before, after, *arguments):
        path = f"CClimateChange_V27.{before}{self.name}{after}(index)"
        refused(RangeError, path, f"{arguments[0]}", there(count), self.member(before, after), *arguments)

    def stored(self, keyword):
        assert self.climate.SaveFile(self.path) == 1
        return gridbay_setup.open(self.path)[f"{self.section}/{keyword}"]


@pytest.fixture(params=FAMILIES)
def family(request, tmp_path):
    return Family(request.param, tmp_path)


def test_a_constant_of_a_forcing(family):
    family.open(0)
    assert family.counts() == (1, 0, 0)
    for index in (0, 2, -1):
        family.refuses(1, "Get", "Values", index)
        family.refuses(1, "Set", "Values", index, 7.0)
    assert family.member("Get", "Values")(1) == (1, 2.5)
    assert family.member("Set", "Values")(1, 6.5) == 1
    assert family.member("Get", "Values")(1) == (1, 6.5) and family.stored(family.value) == 6.5


def test_a_constant_of_0_is_there_for_the_temperature_alone(family):
    family.open(0, 0.0)
    if family.name == "Temp":
        assert family.counts() == (1, 0, 0) and family.member("Get", "Values")(1) == (1, 0.0)
        return
    assert family.counts() == (0, 0, 0)
    family.refuses(0, "Get", "Values", 1)
    family.refuses(0, "Set", "Values", 1, 3.0)
    assert family.stored(family.value) == 0.0


@pytest.mark.parametrize("which, name, other", [(1, "File", "GridFile"), (2, "GridFile", "File")])
def test_a_file_of_a_forcing(family, which, name, other):
    family.open(which)
    assert family.counts() == tuple(int(kind == which) for kind in range(3))
    for index in (0, 2):
        family.refuses(1, "Get", name + "Item", index)
        family.refuses(1, "Set", name, index, "new.tsb0")
    family.refuses(0, "Get", other + "Item", 1)
    family.refuses(0, "Set", other, 1, "new.tsb0")
    family.refuses(0, "Get", "Values", 1)
    family.refuses(0, "Set", "Values", 1, 7.0)
    assert family.stored(f"{family.file}/File_Name").name == "old.tsb0"
    assert family.member("Get", name + "Item")(1) == (1, "old.tsb0", 1)
    assert family.member("Set", name)(1, "none/new.tsb0") == 1
    assert family.stored(f"{family.file}/File_Name") == pathlib.Path("none/new.tsb0")
    assert len(family.stored(f"{family.file}/Item_Numbers")) == 1


@pytest.mark.parametrize("descriptions, module", [((-2, -2), gridbay_setup), ((0, 0), gridbay_setup),
                                                  ((0, -2), wetland_sweep_kit)])  # fmt: skip
def test_air_temperature_is_that_of_just_one_component(tmp_path, descriptions, module):
    family = Family("Temp", tmp_path, module)
    family.components.resize(2)
    for component, description in zip(family.components, descriptions):
        component.component_description = description
    for which in range(3):
        family.open(which)
        assert family.counts() == (0, 0, 0)
        family.refuses(0, "Get", "Values", 1)
        family.refuses(0, "Set", "Values", 1, 7.0)
        for name in ("File", "GridFile"):
            family.refuses(0, "Get", name + "Item", 1)
            family.refuses(0, "Set", name, 1, "new.tsb0")


def test_water_levels(flood, tmp_path):
    flood.setNoOfBndCondition(6)
    flood.setHDBndCondition_Value(1, 0, 1, 0, 2, 2, 7.5)  # a flux, which does not count
    flood.setHDBndCondition_File(2, 1, 2, 3, 4, 1, 3, "tide.tsb0", 4)
    flood.setHDBndCondition_File(3, 5, 6, 7, 8, 1, 4, "line.tsb1", 2)
    flood.setHDBndCondition_Value(4, 4, 0, 4, 9, 1, 1.5)
    flood.setHDBndCondition_Value(5, 5, 0, 5, 9, 1, 1.0)
    flood.setHDBndCondition_File(6, 6, 0, 6, 9, 2, 3, "flux.tsb0", 4)
    setup, _ = saved(flood, tmp_path)
    sine = setup.hydrodynamic.open_boundary.boundaries[5]
    sine.data_format = 2
    sine.sinusoidal_boundary.reference_level = 0.5
    setup.save()
    climate = CClimateChange_V27()
    assert climate.OpenFile(setup.file) == 1
    kinds = {"Value": ("GetNoWLValue", "GetWLvalueIDLocation", [(4, "(4,0) - (4,9)"), (5, "(5,0) - (5,9)")]),
             "FileItem": ("GetNoWLTimeSeries", "GetWLTSIDLocation", [(2, "(1,2) - (3,4)")]),
             "LineFileItem": ("GetNoWLLineSeries", "GetWLLineIDLocation", [(3, "(5,6) - (7,8)")])}  # fmt: skip
    for name, (count, locate, places) in kinds.items():
        assert getattr(climate, count)() == len(places)
        assert [getattr(climate, locate)(index) for index in range(1, len(places) + 1)] == [(1, *at) for at in places]
        setter = "Set" + f"WL{name}".replace("Item", "")
        arguments = {"Value": [1.0], "FileItem": ["x"], "LineFileItem": ["x", 1]}[name]
        for index in (0, len(places) + 1):
            for member, further in ((locate, []), ("GetWL" + name, []), (setter, arguments)):
                refused(RangeError, f"CClimateChange_V27.{member}(index)", f"{index}", there(len(places)),
                        getattr(climate, member), index, *further)  # fmt: skip
    assert [climate.GetWLValue(index) for index in (1, 2)] == [(1, 1.5), (1, 0.5)]
    assert climate.SetWLValue(1, 2.5) == 1 and climate.SetWLValue(2, 0.75) == 1
    assert climate.GetWLFileItem(1) == (1, "tide.tsb0", 4) and climate.SetWLFile(1, "new.tsb0") == 1
    assert climate.GetWLFileItem(1) == (1, "new.tsb0", 1)
    for item in (0, -1):
        refused(RangeError, "CClimateChange_V27.SetWLLineFile(item)", f"{item}", "1 or more", climate.SetWLLineFile, 1,
                "new.tsb1", item)  # fmt: skip
    assert climate.GetWLLineFileItem(1) == (1, "line.tsb1", 2)
    assert climate.SetWLLineFile(1, "new.tsb1", 5) == 1 and climate.GetWLLineFileItem(1) == (1, "new.tsb1", 5)
    assert climate.SaveFile(setup.file) == 1
    levels = gridbay_setup.open(setup.file).hydrodynamic.open_boundary.boundaries
    assert (levels[4].value, levels[5].sinusoidal_boundary.reference_level, levels[5].value) == (2.5, 0.75, 1.0)


def test_period_and_place_of_a_setup(grid, tmp_path):
    setup = gridbay_setup.new(areas=[grid], start=START, time_step=10, time_steps=360)
    setup.save(tmp_path / "c.v27")
    climate = CClimateChange_V27()
    assert climate.GetLongLat() == (0, 0.0, 0.0)
    assert climate.OpenFile(tmp_path / "c.v27") == 1
    assert climate.GetSimulationPeriod() == (0, START, START + datetime.timedelta(hours=1))
    result, longitude, latitude = climate.GetLongLat()
    assert result == 1 and 8 < longitude < 9.1 and 54 < latitude < 56
    assert climate.ResultOutputsHasAbsolutePath() == 0
    outputs = setup.hydrodynamic.output_specification.output_areas
    outputs.append().file_name = "map.tsb2"
    for name, result in (("map.tsb2", 0), ("out/map.tsb2", 1)):
        outputs[1].file_name = name
        setup.save()
        assert climate.OpenFile(setup.file) == 1 and climate.ResultOutputsHasAbsolutePath() == result


def arguments_of(member):
    """Names and types, as help tells them."""
    listed = re.match(r"\w+\((.*)\)", member.__doc__)[1]
    return [argument.split(": ") for argument in re.split(r", (?=\w+: )", listed) if argument]


def good(kind, model):
    if kind == "OutputPosition":
        return model.GetOutputsListHeadPos()
    values = {"int": 1, "float": 1.0, "str": "x.tsb0", "bool": False, "list": [1]}
    return values.get(kind)


def objects(tmp_path):
    """Objects of all classes; some index of each member is there in one of them."""
    for made in (Flooding_V27FlowModel(), UrbanFlooding_V27Flowmodel()):
        made.ShowMessagesWith(lambda text: None)
        made.setNoOfBndCondition(1)
        look = made.as_flow_model() if hasattr(made, "as_flow_model") else made
        look.setNoOfSourceSink(1)
        look.AddOutput_MapsAndTimeSeriesJK(0, 0, 0, 0, 0, 0, [], [], 0, None, None, 1, "m.tsb2", "", [1])
        yield made
    for name, which in itertools.product(FAMILIES, range(3)):
        family = Family(name, tmp_path)
        family.setup.nested_model_globals.open_boundary.number_of_boundaries = 1
        level = family.setup.hydrodynamic.open_boundary.boundaries[1]
        level.formulation, level.data_format = 1, (1, 3, 4)[which]
        family.open(which)
        yield family.climate


def test_each_argument_of_each_member_is_looked_at(tmp_path):
    class Nothing:
        pass

    missing, seen = {}, set()
    for model in objects(tmp_path):
        owner = type(model)
        for name in [each for each in vars(owner) if not each.startswith("_")]:
            member = getattr(model, name)
            arguments = arguments_of(getattr(owner, name))
            values = [good(kind, model) for _, kind in arguments]
            for place, (argument, _) in enumerate(arguments):
                path = f"{owner.__name__}.{name}({argument})"
                missing.setdefault(path)
                try:
                    member(*values[:place], Nothing(), *values[place + 1 :])
                except WrongType as fault:
                    assert fault.path == path and "Nothing" in fault.given and fault.allowed
                    assert str(fault) == f"{path}: {fault.given} was given; allowed is {fault.allowed}"
                    seen.add(path)
                except RangeError as fault:  # of another kind of forcing
                    assert fault.path.endswith("(index)")
            for given, words in ((values + [1], {}), (values, {"nonsense": 1}), (values[:-1], {})):
                if not values and given == values[:-1] and not words:
                    continue
                if (name, given, words) == ("GetNextOutputs_MapsJKAndTS", values[:-1], {}) and len(values) == 2:
                    continue  # its last argument may be left out
                with pytest.raises(WrongType) as caught:
                    member(*given, **words)
                assert caught.value.path == f"{owner.__name__}.{name}" and caught.value.allowed.startswith("(")
    assert len(missing) > 150 and set(missing) == seen


@pytest.mark.parametrize("name, arguments, argument, allowed, error", [
    ("setResistance_Value", ["rough"], "value", "a number", WrongType),
    ("setResistance_Value", [True], "value", "a number", WrongType),
    ("setResistance_Value", [float("nan")], "value", "a finite number of single precision", WrongValue),
    ("setResistance_Value", [1e39], "value", "a finite number of single precision", WrongValue),
    ("setNoOfBndCondition", [2**40], "count", "a whole number of 32 bits", WrongValue),
    ("setNoOfBndCondition", [1.0], "count", "a whole number of 32 bits", WrongType),
    ("setFineBathymetryFile", [b"a"], "file_name", "the name of a file (str or a path), or None", WrongType),
    ("setFineBathymetryFile", ["a\0b"], "file_name", "a text without zero bytes", WrongValue),
    ("setResistance_File", ["a.tsb2", 0], "item", "1 or more", RangeError),
    ("setRain_File", ["a.tsb2", 1, -3], "item", "1 or more", RangeError),
    ("SetSimulationPeriod", ["soon", END, 30], "start", "a datetime of whole seconds without a time zone", WrongType),
    ("SetSimulationPeriod", [START, END.replace(microsecond=1), 30], "end",
     "a datetime of whole seconds without a time zone", WrongValue),
    ("SetSimulationPeriod", [START.replace(tzinfo=datetime.timezone.utc), END, 30], "start",
     "a datetime of whole seconds without a time zone", WrongValue),
    ("ShowMessagesWith", ["print"], "show", "a function of a text, or None", WrongType),
])  # fmt: skip
def test_what_cannot_be_held_is_refused(model, name, arguments, argument, allowed, error, tmp_path):
    before = saved(model, tmp_path)[0].text()
    with pytest.raises(error) as caught:
        getattr(model, name)(*arguments)
    fault = caught.value
    assert fault.path == f"{type(model).__name__}.{name}({argument})" and fault.allowed == allowed
    assert all(part in str(fault) for part in (fault.path, fault.given, fault.allowed))
    assert saved(model, tmp_path)[0].text() == before
    with pytest.raises(AttributeError):
        model.setNothing(1)


def test_arguments_by_name(flood):
    flood.setNoOfBndCondition(count=1)
    flood.setHDBndCondition_Value(1, 0, last_k=9, value=2.5, first_k=1, last_j=0, formulation=1)
    assert flood.getHDBndCondition(index=1)[:7] == (0, 1, 0, 9, 1, 1, 2.5)
    with pytest.raises(WrongType, match=r"index twice was given; allowed is \(index: int\)"):
        flood.getHDBndCondition(1, index=1)
    with pytest.raises(WrongType, match="no index was given"):
        flood.getHDBndCondition()
    with pytest.raises(WrongType, match="an object of the class"):
        Flooding_V27FlowModel.getHDBndCondition(CClimateChange_V27(), 1)


def test_the_other_edition(tmp_path):
    model = gridbay_setup.Flooding_V27WSKFlowModel()
    look = model.as_flow_model()
    assert isinstance(look, wetland_sweep_kit.Flooding_V27FlowModel) and not isinstance(look, Flooding_V27FlowModel)
    assert look.GetFileExtension() == ".v27"
    assert wetland_sweep_kit.CClimateChange_V27().GetNoTempValues() == 0


def test_one_object_in_two_threads_while_a_message_is_shown(tmp_path):
    model = Flooding_V27FlowModel()
    begun = threading.Event()

    def show(text):
        begun.set()
        time.sleep(0.05)

    model.ShowMessagesWith(show)
    saving = threading.Thread(target=model.SaveFile, args=(str(tmp_path / "a.v27"),), daemon=True)
    saving.start()
    assert begun.wait(20)
    model.setResistance_Value(17)
    saving.join(20)
    assert not saving.is_alive() and (tmp_path / "a.v27").exists()


def test_a_message_function_that_fails_does_not_keep_the_setup_from_being_saved(tmp_path):
    model = Flooding_V27FlowModel()

    def show(text):
        raise RuntimeError("no window")

    model.ShowMessagesWith(show)
    with pytest.raises(RuntimeError, match="no window"):
        model.SaveFile(str(tmp_path / "a.v27"))
    assert gridbay_setup.open(tmp_path / "a.v27").paths()


def in_two_threads(work):
    faults = []

    def guarded(number):
        try:
            work(number)
        except BaseException as fault:  # noqa: BLE001
            faults.append(fault)

    threads = [threading.Thread(target=guarded, args=(number,)) for number in (1, 2)]
    for thread in threads:
        thread.start()
    for thread in threads:
        thread.join()
    assert faults == []


@pytest.mark.parametrize("kind", [Flooding_V27FlowModel, UrbanFlooding_V27Flowmodel])
def test_objects_in_two_threads(kind, tmp_path, grid):
    def work(number):
        for turn in range(5):
            model = kind()
            model.ShowMessagesWith(lambda text: None)
            model.setCoarseBathymetryFile(grid)
            model.setResistance_Value(number * 10 + turn)
            path = tmp_path / f"t{number}.v27"
            model.SaveFile(path)
            model.LoadFile(path)
            assert gridbay_setup.open(path).hydrodynamic.resistance.areas[1].constant_value == number * 10 + turn

    in_two_threads(work)


def test_forcings_in_two_threads(tmp_path):
    Family("Prec", tmp_path).open(0)

    def work(number):
        for turn in range(1, 6):
            climate = CClimateChange_V27()
            assert climate.OpenFile(tmp_path / "forcing.v27") == 1
            assert climate.SetPrecValues(1, number * 10 + turn) == 1
            assert climate.SaveFile(tmp_path / f"f{number}.v27") == 1
            assert climate.OpenFile(tmp_path / f"f{number}.v27") == 1
            assert climate.GetPrecValues(1) == (1, number * 10 + turn)

    in_two_threads(work)


def test_members_on_one_object_in_two_threads_are_each_done_whole(flood):
    shown = []

    def show(text):
        time.sleep(0)  # lets the other thread go on
        shown.append(text)

    flood.ShowMessagesWith(show)
    # A type that is told, and taken for a map.
    in_two_threads(lambda item: [
        flood.AddOutput_MapsAndTimeSeriesJK(2, 0, 0, 0, 0, 0, [], [], 0, None, None, 1, "", "", [item] * 2)
        for _ in range(100)
    ])  # fmt: skip
    assert shown == ["Unsupported output type"] * 200
    items, position = [], flood.GetOutputsListHeadPos()
    while position:
        position, *output = flood.GetNextOutputs_MapsJKAndTS(position)
        items.append(output[-1])
    assert sorted(items) == [[1, 1]] * 100 + [[2, 2]] * 100


def test_a_boundary_that_has_a_series_keeps_its_fab_type(urban, tmp_path):
    urban.setNoOfBndCondition(2)
    urban.setBndCondition_File(1, 0, 0, 0, 9, 1, "a.tsb0", 1)
    setup, _ = saved(urban, tmp_path)
    boundary = setup.hydrodynamic.open_boundary.boundaries[1]
    assert (boundary.data_format, boundary.fab_type) == (3, 12)
    boundary.fab_type = 0
    setup.save()
    urban.LoadFile(setup.file)
    urban.setBndCondition_File(1, 0, 0, 0, 9, 1, "b.tsb0", 2)
    urban.setBndCondition_File(2, 0, 0, 0, 9, 1, "c.tsb1", 2)
    boundaries = saved(urban, tmp_path)[0].hydrodynamic.open_boundary.boundaries
    assert boundaries[1].fab_type == 0 and boundaries[1].item_numbers == [2]
    assert (boundaries[2].data_format, boundaries[2].fab_type) == (4, 12)


