"""The scripting classes under their names, with their edge cases."""

import datetime
import threading
import time

import pytest

import gridbay_setup
from gridbay_setup import CClimateChange_V27, Flooding_V27FlowModel, UrbanFlooding_V27Flowmodel, wetland_sweep_kit

START = datetime.datetime(2020, 1, 1)
END = datetime.datetime(2020, 1, 2)
HD = "HYDRODYNAMIC_MODULE/"


def saved(model, tmp_path):
    """The setup that the model saves, and what was shown."""
    shown = []
    model.ShowMessagesWith(shown.append)
    path = tmp_path / "saved.v27"
    model.SaveFile(str(path))
    return gridbay_setup.open(path), shown


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


def test_a_fresh_object_is_saved_and_its_messages_are_shown(tmp_path):
    setup, shown = saved(Flooding_V27FlowModel(), tmp_path)
    assert len(setup.nested_model_globals.bathymetry_selection.areas) == 1
    assert shown and all(line.startswith("VANE 27: ") for line in shown[0].splitlines() if line)


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


def test_boundaries(flood, tmp_path):
    flood.setNoOfBndCondition(2)
    assert flood.getNoOfBndConditions() == 2
    flood.setHDBndCondition_Value(1, 0, 1, 0, 5, 2, 7.5)
    for index in (0, 3):
        flood.setHDBndCondition_Value(index, 9, 9, 9, 9, 1, 1)
        assert flood.getHDBndCondition(index) is None
    assert flood.getHDBndCondition(1)[:7] == (0, 1, 0, 5, 2, 1, 7.5)
    flood.setHDBndCondition_File(2, 1, 2, 3, 4, 1, 3, "tide.tsb0", 2)
    assert flood.getHDBndCondition(2)[:6] == (1, 2, 3, 4, 1, 3) and flood.getHDBndCondition(2)[7:] == ("tide.tsb0", 2)
    with pytest.raises(ValueError):
        flood.setHDBndCondition_File(1, 5, 6, 7, 8, 1, 5, "x.tsb0", 1)
    assert flood.getHDBndCondition(1)[:5] == (5, 6, 7, 8, 1)
    flood.setNoOfBndCondition(-4)
    assert flood.getNoOfBndConditions() == 2


def test_sources(flood, tmp_path):
    flood.setNoOfSourceSink(1)
    flood.setNoOfSourceSink(-1)
    assert flood.getNoOfSourceSink() == 1 and flood.getHDSourceSink(2) is None
    flood.setHDSourceSink_Value(1, 0, 3, 4, 0, 0, 1.5, 0.5, 90)
    assert flood.getHDSourceSink(1)[:9] == (0, 0, 3, 4, 0, 0, 1.5, 0.5, 90)
    flood.setHDSourceSink_File(1, 0, 3, 4, 0, 0, "source.tsb0", 90, 1, 2)
    assert flood.getHDSourceSink(1)[9] == ""
    setup, _ = saved(flood, tmp_path)
    assert setup[HD + "SOURCE_AND_SINK/SOURCE_SINK_1/File_Name"] is None


def test_outputs(flood, tmp_path):
    flood.AddOutput_MapsAndTimeSeriesJK(0, 1, 1, 2, 3, 4, [], [], 1, START, END, 0, "map.tsb2", "Map", [1, 4])
    flood.AddOutput_MapsAndTimeSeriesJK(1, 0, 0, 0, 0, 0, [1.0], [], 0, None, None, 5, "p.tsb0", "Points", [1])
    position = flood.GetOutputsListHeadPos()
    assert position
    position, *first = flood.GetNextOutputs_MapsJKAndTS(position)
    assert first[:6] == [0, 1, 1, 2, 3, 4] and first[-3:] == ["map.tsb2", "Map", [1, 4]]
    position, *second = flood.GetNextOutputs_MapsJKAndTS(position)
    assert second[0] == 1 and second[6] == [0.0] and second[7] == [0.0] and not position
    with pytest.raises(ValueError):
        flood.GetNextOutputs_MapsJKAndTS(position)
    setup, _ = saved(flood, tmp_path)
    outputs = setup.hydrodynamic.output_specification.output_areas
    assert outputs[1].time_step_interval == 1 and outputs[2].time_step_interval == 5
    flood.ClearHDResultOutputs()
    assert not flood.GetOutputsListHeadPos()


def test_load_of_broken_files_leaves_the_model(flood, tmp_path):
    shown = []
    flood.ShowMessagesWith(shown.append)
    flood.setResistance_Value(11)
    (tmp_path / "broken.v27").write_text("A {")
    flood.LoadFile(str(tmp_path / "broken.v27"))
    assert len(shown) == 1
    flood.LoadFile(str(tmp_path / "gone.v27"))
    assert len(shown) == 1
    assert saved(flood, tmp_path)[0].hydrodynamic.resistance.areas[1].constant_value == 11


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


def test_climate_change(grid, rain, tmp_path):
    setup = gridbay_setup.new(areas=[grid], start=START, time_step=10, time_steps=360)
    water = setup.hydrodynamic.source_and_sink
    water.precipitation_type, water.precipitation = 2, 0.0
    path = tmp_path / "c.v27"

    def opened():
        setup.save(path)
        climate = CClimateChange_V27()
        assert climate.OpenFile(str(path)) == 1
        return climate

    found = {}
    for kind in (-1, 0, 2):  # as they stand on file
        water.precipitation_type = kind
        water.precipitation = 5.0
        climate = opened()
        found[kind] = (climate.GetNoPrecValues(), climate.GetNoPrecTimeSeries(), climate.GetNoPrecGridSeries())
        assert climate.GetPrecValues(2) == (0, None) and climate.GetPrecValues(0) == (0, None)
        assert all(sum(counts) <= 1 for counts in found.values())
    assert sorted(found.values()).count((1, 0, 0)) == 1 and sorted(found.values()).count((0, 1, 0)) == 1
    constant = next(kind for kind, counts in found.items() if counts == (1, 0, 0))
    water.precipitation_type = constant
    climate = opened()
    assert climate.GetPrecValues(1) == (1, 5.0) and climate.SetPrecValues(1, 6.5) == 1
    assert climate.GetPrecValues(1) == (1, 6.5)
    water.precipitation = 0.0
    climate = opened()
    assert (climate.GetNoPrecValues(), climate.GetPrecValues(1), climate.SetPrecValues(1, 3)) == (0, (0, None), 0)
    assert climate.GetSimulationPeriod() == (0, START, START + datetime.timedelta(hours=1))
    result, longitude, latitude = climate.GetLongLat()
    assert result == 1 and 8 < longitude < 9.1 and 54 < latitude < 56
    assert climate.GetNoTempValues() == 0 and climate.SetTempValues(1, 3) == 0
    count = climate.GetNoWLValue()
    assert count == len(setup.nested_model_globals.open_boundary.boundaries) == 1
    assert climate.GetWLvalueIDLocation(1)[:2] == (1, 1) and climate.GetWLvalueIDLocation(1)[2].startswith("(0,")
    assert climate.SetWLValue(1, 0.75) == 1 and climate.GetWLValue(1) == (1, 0.75)
    assert climate.GetWLValue(2) == (0, None) and climate.GetWLFileItem(1) == (0, None, None)
    assert climate.SetWLLineFile(1, "x.tsb1", 0) == 0
    assert climate.ResultOutputsHasAbsolutePath() == 0
    assert climate.SaveFile(str(path)) == 1
    assert gridbay_setup.open(path).hydrodynamic.open_boundary.boundaries[1].value == 0.75
    assert climate.OpenFile(str(tmp_path / "gone.v27")) == 0


def test_wrong_arguments_are_exceptions(flood):
    with pytest.raises(TypeError):
        flood.setResistance_Value("rough")
    with pytest.raises(TypeError):
        flood.SetSimulationPeriod("soon", END, 30)
    with pytest.raises(TypeError):
        flood.setNoOfBndCondition(2**40)
    with pytest.raises(AttributeError):
        flood.setNothing(1)


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


def test_objects_in_two_threads(tmp_path, grid):
    faults = []

    def work(number):
        try:
            for turn in range(5):
                model = Flooding_V27FlowModel()
                model.ShowMessagesWith(lambda text: None)
                model.setCoarseBathymetryFile(str(grid))
                model.setResistance_Value(number * 10 + turn)
                path = tmp_path / f"t{number}.v27"
                model.SaveFile(str(path))
                assert gridbay_setup.open(path).hydrodynamic.resistance.areas[1].constant_value == number * 10 + turn
        except Exception as fault:  # noqa: BLE001
            faults.append(fault)

    threads = [threading.Thread(target=work, args=(number,)) for number in (1, 2)]
    for thread in threads:
        thread.start()
    for thread in threads:
        thread.join()
    assert faults == []


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


def test_air_temperature_has_one_component(grid, tmp_path):
    setup = gridbay_setup.new(areas=[grid], start=START)
    setup.nested_model_globals.module_selection.simulation_type = 2
    components = setup.advection_dispersion.component_specifications.components
    components.resize(2)
    components[2].component_description = -2
    path = tmp_path / "t.v27"

    def opened():
        setup.save(path)
        climate = CClimateChange_V27()
        assert climate.OpenFile(str(path)) == 1
        return climate

    climate = opened()
    assert climate.GetNoTempValues() == 1 and climate.GetTempValues(1) == (1, 20.0)
    assert climate.SetTempValues(2, 5) == 1 and climate.GetTempValues(1) == (1, 20.0)
    assert climate.SetTempValues(1, 5) == 1 and climate.GetTempValues(1) == (1, 5.0)
    assert climate.SetTempFile(1, "x.tsb0") == 0
    setup.advection_dispersion.heat_exchange.air_format = 0
    climate = opened()
    assert (climate.GetNoTempValues(), climate.GetNoTempTimeSeries(), climate.GetNoTempGridSeries()) == (0, 1, 0)
    assert climate.SetTempValues(1, 7) == 1 and climate.GetTempValues(1) == (0, None)
    assert climate.SetTempFile(1, "air.tsb0") == 1 and climate.GetTempFileItem(1)[0] == 1
    components[1].component_description = -2
    climate = opened()
    assert (climate.GetNoTempTimeSeries(), climate.SetTempValues(1, 7)) == (0, 0)


def test_water_levels_from_files(flood, tmp_path):
    flood.setNoOfBndCondition(3)
    flood.setHDBndCondition_Value(1, 0, 1, 0, 2, 2, 7.5)  # a flux, which does not count
    flood.setHDBndCondition_File(2, 1, 2, 3, 4, 1, 3, "tide.tsb0", 4)
    flood.setHDBndCondition_File(3, 5, 6, 7, 8, 1, 4, "line.tsb1", 2)
    setup, _ = saved(flood, tmp_path)
    climate = CClimateChange_V27()
    assert climate.OpenFile(setup.file) == 1
    counts = (climate.GetNoWLValue(), climate.GetNoWLTimeSeries(), climate.GetNoWLLineSeries())
    assert counts == (0, 1, 1)
    assert climate.GetWLTSIDLocation(1) == (1, 2, "(1,2) - (3,4)")
    assert climate.GetWLLineIDLocation(1) == (1, 3, "(5,6) - (7,8)")
    assert climate.GetWLTSIDLocation(2) == (0, None, None)
    assert climate.GetWLFileItem(1)[2] == 4
    assert climate.SetWLFile(1, "new.tsb0") == 1 and climate.GetWLFileItem(1)[2] == 1
    assert climate.SetWLLineFile(1, "new.tsb1", 0) == 0 and climate.GetWLLineFileItem(1)[2] == 2
    assert climate.SetWLLineFile(1, "new.tsb1", 5) == 1 and climate.GetWLLineFileItem(1)[2] == 5
