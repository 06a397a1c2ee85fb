"""Setups by path and by attribute, in both editions."""

import copy
import datetime
import os
import pathlib
import pickle

import pytest

import gridbay_setup
from gridbay_setup import FileError, PathError, RangeError, Severity, WrongType, WrongValue

RESISTANCE = "HYDRODYNAMIC_MODULE/RESISTANCE/AREA_1/Constant_Value"
PERIOD = "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD"


def test_attributes_and_paths_are_the_same_keywords(kind):
    setup = gridbay_setup.new(kind)
    assert setup.kind == kind
    area = setup.hydrodynamic.resistance.areas[1]
    assert area.constant_value == 32.0 == setup[RESISTANCE]
    area.constant_value = 25
    assert setup[RESISTANCE] == 25.0
    setup["VANE27_NESTED_MODEL/" + RESISTANCE] = 12.5
    assert area.constant_value == 12.5
    assert setup["hydrodynamic_module/Resistance/area_1/CONSTANT_VALUE"] == 12.5
    assert area["Constant_Value"] == 12.5
    area["Constant_Value"] = 13
    assert area.path == "HYDRODYNAMIC_MODULE/RESISTANCE/AREA_1"
    assert "Constant_Value 13.0" in area.text()


def test_values_have_the_types_of_python(setup):
    assert setup["NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Overland_Solver"] is False
    assert setup[PERIOD + "/Start_Time"] == datetime.datetime(2020, 1, 1)
    period = setup.nested_model_globals.simulation_period
    period.start_time = datetime.datetime(2021, 2, 3, 4, 5, 6)
    assert "Start_Time 2021 2 3 4 5 6" in period.text()
    area = setup.nested_model_globals.bathymetry_selection.areas[1]
    area.origin = (3, 4)
    assert area.origin == (3, 4)
    assert area.data_file.file_name.name == "bay.tsb2"
    area.data_file.file_name = None
    assert area.data_file.file_name is None
    area.data_file.file_name = pathlib.Path("other.tsb2")
    assert area.data_file.file_name == pathlib.Path("other.tsb2")
    wind = setup.hydrodynamic.wind_conditions
    assert wind.item_numbers == []
    wind.item_numbers = range(1, 4)
    assert wind.item_numbers == [1, 2, 3]
    flooding = setup.nested_model_globals.flood_and_dry
    flooding.enable_flood_and_dry_checking = 0
    assert flooding.enable_flood_and_dry_checking == 0
    dikes = setup.hydrodynamic.structures.dikes
    dikes.dikes.append().name = 'Dike "ü" \\ 1'
    assert dikes.dikes[1].name == 'Dike "ü" \\ 1'


@pytest.mark.parametrize("path, value, error, allowed", [
    (RESISTANCE, "25", WrongType, "a number"),
    (RESISTANCE, True, WrongType, "a number"),
    (RESISTANCE, None, WrongType, "a number"),
    (RESISTANCE, 10**400, WrongValue, "a number"),
    (PERIOD + "/Number_Of_Timesteps", 1.0, WrongType, "a whole number of 32 bits"),
    (PERIOD + "/Number_Of_Timesteps", 2**31, WrongValue, "a whole number of 32 bits"),
    (PERIOD + "/Start_Time", "2020-01-01", WrongType, "a datetime"),
    (PERIOD + "/Start_Time", datetime.datetime(2020, 1, 1, tzinfo=datetime.timezone.utc), WrongValue, "a datetime"),
    (PERIOD + "/Start_Time", datetime.datetime(2020, 1, 1, microsecond=5), WrongValue, "whole seconds"),
    ("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Overland_Solver", 1, WrongType, "True or False"),
    ("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Projection", 3, WrongType, "a text"),
    ("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Projection", "a\0b", WrongValue, "zero bytes"),
    ("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_1/DATA_FILE/FILE_NAME", 3, WrongType, "the name of a file"),
    ("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_1/Origin", (1, 2, 3), WrongValue, "2 values"),
    ("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_1/Origin", 1, WrongType, "2 values"),
    ("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_1/Origin", (1, "2"), WrongType, "a whole number"),
    ("HYDRODYNAMIC_MODULE/WIND_CONDITIONS/Item_Numbers", "123", WrongType, "a list"),
])  # fmt: skip
def test_what_is_no_value_is_refused_and_changes_nothing(setup, path, value, error, allowed):
    before = setup.text()
    with pytest.raises(error) as caught:
        setup[path] = value
    fault = caught.value
    assert path in str(fault) and fault.path == path
    assert allowed in fault.allowed and fault.allowed in str(fault)
    assert fault.given and fault.given in str(fault)
    assert setup.text() == before


def test_a_refusal_tells_the_choices(setup):
    with pytest.raises(WrongValue, match=r"PrecipitationType cannot be 1 .*allowed may be .*\(.+\)"):
        setup.hydrodynamic.source_and_sink.precipitation_type = 1


def test_paths_that_lead_nowhere(setup):
    for path, near in [("HYDRODYNAMIC_MODULE/RESISTANCE/AREA_1/Constant_Valve", RESISTANCE), ("Nowhere/At/All", "")]:
        with pytest.raises(PathError) as caught:
            setup[path]
        assert path in str(caught.value) and near in str(caught.value)
        with pytest.raises(KeyError) as caught:
            setup[path] = 4
        assert path in str(caught.value) and "4" in str(caught.value)
    with pytest.raises(PathError, match="is a section.*; allowed is a keyword in it"):
        setup["HYDRODYNAMIC_MODULE/RESISTANCE"]
    with pytest.raises(PathError, match=r"is a section \(1 \(int\) was given\); allowed is a keyword in it"):
        setup["HYDRODYNAMIC_MODULE/RESISTANCE"] = 1
    with pytest.raises(WrongType, match="A path is a text"):
        setup[1]
    with pytest.raises(PathError, match="there is no attribute 'constant_valve'.*did you mean constant_value"):
        setup.hydrodynamic.resistance.areas[1].constant_valve
    with pytest.raises(AttributeError, match="there is no attribute 'constant_valve' to be 3"):
        setup.hydrodynamic.resistance.areas[1].constant_valve = 3
    with pytest.raises(PathError, match="HYDRODYNAMIC_MODULE is a section"):
        setup.hydrodynamic = 3
    with pytest.raises(PathError, match="is a list"):
        setup.hydrodynamic.resistance.areas = []
    assert not hasattr(setup.hydrodynamic, "nowhere")


def test_a_value_that_takes_away_what_it_is_for(setup, tmp_path):
    boundaries = setup.nested_model_globals.open_boundary.boundaries

    class Sly:
        def __iter__(self):
            boundaries.resize(0)
            return iter((1, 2))

    boundaries.resize(1)
    with pytest.raises(PathError, match="BOUNDARY_1/First_Point"):
        boundaries[1].first_point = Sly()
    assert len(boundaries) == 0 and setup.validate() is not None


def test_what_is_in_a_setup(setup):
    assert "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY" in setup
    assert "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth" in setup
    assert "FLOOD_AND_DRY/Nothing" not in setup.nested_model_globals
    for wrong in (lambda: 3 in setup, lambda: setup.same_as(3)):
        with pytest.raises(WrongType, match="3.* was given"):
            wrong()
    with pytest.raises(TypeError):
        iter(setup)
    areas = setup.nested_model_globals.bathymetry_selection.areas
    with pytest.raises(WrongType, match=r"AREA_1: 3 \(int\) was given; allowed is to set what the item has"):
        areas[1] = 3
    with pytest.raises(WrongValue, match=r"new\(kind\): 'n.v27' was given; allowed is 'v27' or 'v27wsk'"):
        gridbay_setup.new("n.v27")


def test_lists_are_counted_resized_and_walked(setup):
    outputs = setup.hydrodynamic.output_specification.output_areas
    outputs.resize(3)
    assert len(outputs) == 3
    for number, output in enumerate(outputs, 1):
        output.title = f"Output {number}"
    assert [output.title for output in reversed(outputs)] == ["Output 3", "Output 2", "Output 1"]
    assert outputs[2] in outputs and outputs[2] == outputs[2]
    for number in (0, 4, -1):
        with pytest.raises(RangeError, match=f"item {number} was given; allowed is 1 to 3"):
            outputs[number]
    for number in ("1", 1.0, True, slice(1, 2)):
        with pytest.raises(WrongType, match="allowed is the number of an item, from 1"):
            outputs[number]
    assert outputs.append().path.endswith("OUTPUT_AREA_4")
    outputs.resize(1)
    assert [output.title for output in outputs] == ["Output 1"]
    with pytest.raises(WrongValue):
        outputs.resize(-1)
    with pytest.raises(WrongType):
        outputs.resize("two")
    with pytest.raises(WrongValue):
        outputs.resize(10**6)
    outputs.resize(0)
    with pytest.raises(RangeError, match="none: the list is empty"):
        outputs[1]
    # A list that follows another one says which.
    with pytest.raises(PathError, match="No_Of_Areas"):
        setup.hydrodynamic.resistance.areas.resize(2)
    setup.nested_model_globals.bathymetry_selection.areas.resize(2)
    assert len(setup.hydrodynamic.resistance.areas) == 2
    # Sections of one name.
    weirs = setup.hydrodynamic.structure_module.weir.weir_data
    setup.hydrodynamic.structure_module.weir.weir_data.resize(2)
    assert [weir.path for weir in weirs][1].endswith("weir_data[2]")


def test_a_walk_gives_every_keyword_that_a_save_writes(setup, kind):
    setup = gridbay_setup.new(kind)
    walked = dict(setup.walk())
    assert walked[RESISTANCE] == 32.0
    keywords = [line.split()[0] for line in setup.text().splitlines() if line.strip() not in "}" and "{" not in line]
    assert len(walked) == len(keywords)
    area = dict(setup.hydrodynamic.resistance.areas[1].walk())
    assert area["Constant_Value"] == 32.0 and area["PIER/Item_Numbers"] == [1]


def test_messages_are_objects(setup):
    setup.nested_model_globals.bathymetry_selection.areas[1].data_file.file_name = "gone.tsb2"
    messages = setup.validate()
    assert messages and "gone.tsb2" in messages[0].text
    assert messages[0].page == 27 and messages[0].page_name == "Bathymetry"
    assert messages[0].severity in Severity and str(messages[0]).startswith("Bathymetry: ")


def test_save_and_open(setup, tmp_path, kind):
    setup = gridbay_setup.new(kind)
    with pytest.raises(WrongValue, match="None was given, and the setup has no file yet"):
        setup.save()
    with pytest.raises(WrongValue, match=r"allowed is \*\." + kind):
        setup.save(tmp_path / "x.txt")
    target = tmp_path / f"ü x.{kind}"
    setup.hydrodynamic.resistance.areas[1].constant_value = 19
    setup.save(target)
    assert setup.file == str(target)
    again = gridbay_setup.open(target)
    assert again.kind == kind and again[RESISTANCE] == 19 and again.text() == setup.text()
    assert again.notes == [] and again.unknown_sections() == []
    again.save()
    with pytest.raises(FileError, match="nowhere"):
        again.save(tmp_path / "nowhere" / f"x.{kind}")
    assert again.file == str(target)


def test_files_that_are_no_setups(tmp_path, kind):
    for name, text, what in [("gone", None, "gone"), ("empty", "", "is not a setup"), ("broken", "A {", "broken")]:
        path = tmp_path / f"{name}.{kind}"
        if text is not None:
            path.write_text(text)
        with pytest.raises(FileError, match=what) as caught:
            gridbay_setup.open(path)
        assert caught.value.path == str(path) and isinstance(caught.value, OSError)
    for name in ("x.txt", "x"):
        with pytest.raises(WrongValue, match=r"allowed is \*\.v27 or \*\.v27wsk"):
            gridbay_setup.open(name)
    with pytest.raises(WrongValue):
        gridbay_setup.new("v28")
    with pytest.raises(WrongType, match=r"open\(path\): 3 "):
        gridbay_setup.open(3)
    for areas in (3, "grid.tsb2", [3]):
        with pytest.raises(WrongType, match=r"new\(areas\)"):
            gridbay_setup.new(areas=areas)


def test_copies_and_options(setup, tmp_path):
    other = setup.copy()
    assert other.same_as(setup)
    other.hydrodynamic.resistance.areas[1].constant_value = 9
    assert not other.same_as(setup) and setup[RESISTANCE] == 32.0
    path = tmp_path / "options.v27"
    text = setup.text().replace("OPTION_PARAMETERS {}", "OPTION_PARAMETERS {\n Flux_Limit 3\n}", 1)
    path.write_text(text)
    opened = gridbay_setup.open(path)
    option = "NESTED_MODEL_GLOBALS/OPTION_PARAMETERS/Flux_Limit"
    assert opened[option] == 3
    opened[option] = 4
    assert opened.copy()[option] == 4 and "Flux_Limit 4" in opened.text()
    with pytest.raises(WrongType):
        opened[option] = "four"


def test_a_grid_is_found_from_another_folder(grid, tmp_path, monkeypatch):
    monkeypatch.chdir(os.path.dirname(grid))
    setup = gridbay_setup.new(areas=[os.path.basename(grid)])
    monkeypatch.chdir("/")
    setup.save(tmp_path / "moved.v27")
    named = setup["NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_1/DATA_FILE/FILE_NAME"]
    assert os.path.samefile(tmp_path / named, grid)


def test_new_with_nested_areas(grid, tmp_path):
    with pytest.raises(WrongValue, match="Area 2 lies in another: say where"):
        gridbay_setup.new(areas=[grid, grid])
    setup = gridbay_setup.new(areas=[grid, (grid, (3, 4)), (grid, (5, 5), 1)])
    areas = setup.nested_model_globals.bathymetry_selection.areas
    assert [(area.origin, area.enclosing_area) for area in areas][1:] == [((3, 4), 1), ((5, 5), 1)]
    assert len(setup.nested_model_globals.open_boundary.boundaries) == 1


def test_docstrings_have_units_and_defaults_from_the_tables():
    area = type(gridbay_setup.new().hydrodynamic.resistance.areas[1])
    value = area.constant_value
    assert value.name == "Constant_Value" and value.default == "32.0"
    assert "32.0 in a new setup" in value.__doc__
    drying = type(gridbay_setup.new().nested_model_globals.flood_and_dry).drying_depth
    assert drying.unit == "m" and drying.label == "Drying depth" and drying.page == "Flood and Dry"
    assert "(m)" in drying.__doc__
    formulation = type(gridbay_setup.new().hydrodynamic.resistance).formulation
    assert set(formulation.choices) >= {"0", "1"}
    assert isinstance(type(gridbay_setup.new()).fields()["hydrodynamic"].kind, type)


def test_the_tasks_of_a_module_are_known(setup):
    setup["NESTED_MODEL_GLOBALS/MODULE_SELECTION/Simulation_Type"] = 3
    task = setup.mud_transport.task_selection
    settling = setup.mud_transport.mt_parameters.erosion_characteristics_for_each_layer
    task.multifraction = False
    task.number_of_layers = 3
    layers = settling.density_of_bed_material.layers
    assert len(layers) == 3 and "Number_of_layers" in type(settling.density_of_bed_material).layers.follows
    assert layers[3].areas[1].path.endswith("LAYER_3/AREA_1")


FILLED = sorted((pathlib.Path(__file__).parents[1] / "main_job" / "setups").glob("*.v27*"))


@pytest.mark.parametrize("source", ["v27", "v27wsk", *FILLED], ids=lambda source: getattr(source, "name", source))
def test_every_keyword_has_an_attribute(source):
    setup = gridbay_setup.new(source) if isinstance(source, str) else gridbay_setup.open(source)

    def names(section):
        held = {path.split("/")[0] for path in section.paths()} - {"OPTION_PARAMETERS"}
        known = section.fields()
        for name in sorted(held):
            step = name.split("[")[0].rstrip("0123456789")
            meant = (name.lower(), step.lower() + "{}", step.lower() + "[{}]", step.lower() + "1")
            is_known = any(field.name.lower() in meant for field in known.values())
            assert is_known or hasattr(section, name.lower()), f"{section.path}/{name}"
        for attribute, field in known.items():
            value = getattr(section, attribute) if not hasattr(field, "default") else None
            if hasattr(value, "fields") and field.name in held:
                names(value)
            elif hasattr(value, "resize"):
                for item in value:
                    if item.path.split("/")[-1] in held:
                        names(item)

    names(setup)


@pytest.mark.parametrize("source", [each for each in FILLED if each.stem == "oxygen"], ids=str)
def test_lists_of_the_ecological_model_end_where_it_does(source):
    ecology = gridbay_setup.open(source).bio_rig
    variables = ecology.state_variables.state_variables
    assert len(variables) == ecology["STATE_VARIABLES/NoOfComponents"] < 100
    with pytest.raises(RangeError, match=f"allowed is 1 to {len(variables)}"):
        variables[len(variables) + 1]
    assert len(ecology.output_specification.additional_optional_output.additional_items) < 100


def test_keywords_numbered_higher_than_those_of_a_new_setup(setup):
    setup["NESTED_MODEL_GLOBALS/MODULE_SELECTION/Simulation_Type"] = 2
    setup.advection_dispersion.component_specifications.no_of_components = 7
    values = setup.advection_dispersion.boundary_concentrations.boundaries[1]
    values.constant_value_7 = 2.5
    assert values["Constant_Value_7"] == values.constant_value_7 == 2.5
    with pytest.raises(PathError, match="constant_value_8"):
        values.constant_value_8 = 1
    with pytest.raises(PathError):
        values.constant_value_8


def test_errors_go_through_pickle_and_copy():
    error = PathError("text", "path", "given", "allowed")
    for again in (pickle.loads(pickle.dumps(error)), copy.copy(error)):
        assert (str(again), again.path, again.given, again.allowed) == ("text", "path", "given", "allowed")


def test_both_editions_side_by_side(tmp_path):
    flow, kit = gridbay_setup.new("v27"), gridbay_setup.new("v27wsk")
    assert not flow.same_as(kit)
    path = "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/No_Of_Areas"
    flow[path] = 2
    with pytest.raises(WrongValue, match="cannot be 2"):
        kit[path] = 2
    assert len(kit.hydrodynamic.resistance.areas) == 1
