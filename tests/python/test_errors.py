"""Each error names the path, what was given and what is allowed, in its text and beside it."""

import pytest

import gridbay_setup
from gridbay_setup import (CClimateChange_V27, FileError, Flooding_V27FlowModel, Flooding_V27WSKFlowModel, PathError,
                           RangeError, UrbanFlooding_V27Flowmodel, WrongType, WrongValue)  # fmt: skip

RESISTANCE = "HYDRODYNAMIC_MODULE/RESISTANCE"
FOLLOWS = "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/SOURCE_SINK_n"


@pytest.fixture
def there(tmp_path):
    """A folder with a setup, a grid, and a text that is neither."""
    (tmp_path / "text.v27").write_text("no setup\n")
    (tmp_path / "broken.v27").write_text("target {\n")
    (tmp_path / "text.tsb2").write_text("no data\n")
    (tmp_path / "text.asc").write_text("no raster\n")
    gridbay_setup.new_grid(points=(2, 2), spacing=(1, 1), item_type="Manning number").save(tmp_path / "map.tsb2")
    return tmp_path


def new():
    return gridbay_setup.new()


def new_map():
    return gridbay_setup.new_grid(points=(2, 2), spacing=(1, 1), item_type="Manning number")


WRITABLE = "a file that can be written"
READABLE = "a setup that can be read"
CASES = {
    "open gone": (FileError, "gone.v27", READABLE, lambda at: gridbay_setup.open(at / "gone.v27")),
    "open text": (FileError, "text.v27", READABLE, lambda at: gridbay_setup.open(at / "text.v27")),
    "open broken": (FileError, "broken.v27", READABLE, lambda at: gridbay_setup.open(at / "broken.v27")),
    "open another kind": (WrongValue, "map.tsb2", "*.v27", lambda at: gridbay_setup.open(at / "map.tsb2")),
    "open a number": (WrongType, "open(path)", "the name of a file", lambda at: gridbay_setup.open(3)),
    "new of a grid gone": (FileError, "gone.tsb2", "a grid that can be read",
                           lambda at: gridbay_setup.new(areas=[at / "gone.tsb2"])),
    "new of a text": (FileError, "text.tsb2", "a grid that can be read", lambda at: gridbay_setup.new(areas=[at / "text.tsb2"])),
    "new of a number": (WrongType, "new(areas)", "the name of a file", lambda at: gridbay_setup.new(areas=[3])),
    "new of nothing": (WrongType, "new(areas)", "a grid file", lambda at: gridbay_setup.new(areas=[None])),
    "new of too much": (WrongValue, "new(areas)", "a grid file",
                        lambda at: gridbay_setup.new(areas=[(at / "map.tsb2", (0, 0), 1, 1)])),
    "a first area that is nested": (WrongValue, "new(areas)", "lies in no other",
                                    lambda at: gridbay_setup.new(areas=[(at / "map.tsb2", (0, 0))])),
    "a place beyond the grid": (WrongValue, "new(areas)", "Area 2 cannot lie at 2,0: area 1 has 2 x 2 points",
                                lambda at: gridbay_setup.new(areas=[at / "map.tsb2", (at / "map.tsb2", (2, 0))])),
    "too many areas": (WrongValue, "new(areas)", "The Wetland Sweep Kit has at most 1 area",
                       lambda at: gridbay_setup.new("v27wsk", [at / "map.tsb2", at / "map.tsb2"])),
    "save nowhere": (FileError, "no/a.v27", WRITABLE, lambda at: new().save(at / "no" / "a.v27")),
    "save no name": (WrongValue, "path", "*.v27", lambda at: new().save()),
    "save another kind": (WrongValue, "a.txt", "*.v27", lambda at: new().save(at / "a.txt")),
    "read nowhere": (PathError, "NO/WHERE", "a keyword that the setup has", lambda at: new()["NO/WHERE"]),
    "read a section": (PathError, RESISTANCE, "a keyword in it", lambda at: new()[RESISTANCE]),
    "set nowhere": (PathError, "NO/WHERE", "a keyword", lambda at: new().__setitem__("NO/WHERE", 1)),
    "set a section": (PathError, RESISTANCE, "a keyword in it", lambda at: new().__setitem__(RESISTANCE, 1)),
    "set a section by attribute": (PathError, "HYDRODYNAMIC_MODULE", "to set a keyword in it",
                                   lambda at: setattr(new(), "hydrodynamic", 1)),
    "set a list": (PathError, f"{RESISTANCE}/AREA_n", "to resize it",
                   lambda at: setattr(new().hydrodynamic.resistance, "areas", [])),
    "set an option that is not there": (PathError, "NESTED_MODEL_GLOBALS/OPTION_PARAMETERS/a", "a keyword",
                                        lambda at: new().__setitem__("NESTED_MODEL_GLOBALS/OPTION_PARAMETERS/a", 1)),
    "a list that follows": (PathError, FOLLOWS, "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources",
                            lambda at: new().hydrodynamic.source_and_sink.source_sinks.resize(2)),
    "a list too long": (WrongValue, "SOURCE_AND_SINK/Number_Of_Sources", "0 to 65535",
                        lambda at: new().nested_model_globals.source_and_sink.source_sinks.resize(65536)),
    "a list too short": (WrongValue, "SOURCE_AND_SINK/Number_Of_Sources", "0 to 65535",
                         lambda at: new().nested_model_globals.source_and_sink.source_sinks.resize(-1)),
    "an item that is not there": (RangeError, "OPEN_BOUNDARY/BOUNDARY_n", "none: the list is empty",
                                  lambda at: new().nested_model_globals.open_boundary.boundaries[1]),
    "data gone": (FileError, "gone.tsb2", "a data file that can be read", lambda at: gridbay_setup.open_data(at / "gone.tsb2")),
    "data of text": (FileError, "text.tsb2", "a data file that can be read", lambda at: gridbay_setup.open_data(at / "text.tsb2")),
    "an item of data": (RangeError, "map.tsb2", "1 to 1", lambda at: gridbay_setup.open_data(at / "map.tsb2").read(2)),
    "a step of data": (RangeError, "map.tsb2", "0 to 0", lambda at: gridbay_setup.open_data(at / "map.tsb2").read(1, 1)),
    "a map that is there": (FileError, "map.tsb2", "force=True", lambda at: new_map().save(at / "map.tsb2")),
    "a map nowhere": (FileError, "no/a.tsb2", WRITABLE, lambda at: new_map().save(at / "no" / "a.tsb2")),
    "a map of no quantity": (WrongValue, "item_type", "a quantity", lambda at: gridbay_setup.new_grid(
        points=(2, 2), spacing=(1, 1), item_type="nonsense")),
    "a raster gone": (FileError, "gone.asc", "a file that is there",
                      lambda at: gridbay_setup.convert_raster(at / "gone.asc", at / "a.tsb2")),
    "a raster of text": (WrongValue, "text.asc", "options", lambda at: gridbay_setup.convert_raster(at / "text.asc", at / "a.tsb2")),
    "a map in the way": (FileError, "map.tsb2", "force=True",
                         lambda at: gridbay_setup.convert_raster(at / "text.asc", at / "map.tsb2")),
    "a series of text": (WrongValue, "text.asc", "options", lambda at: gridbay_setup.convert_series(at / "text.asc", at / "a.tsb0")),
}  # fmt: skip
for kind in (Flooding_V27FlowModel, UrbanFlooding_V27Flowmodel, CClimateChange_V27):
    load = "OpenFile" if kind is CClimateChange_V27 else "LoadFile"
    CASES |= {
        f"{kind.__name__} gone": (FileError, "gone.v27", READABLE,
                                  lambda at, kind=kind, load=load: getattr(kind(), load)(at / "gone.v27")),
        f"{kind.__name__} text": (FileError, "text.v27", READABLE,
                                  lambda at, kind=kind, load=load: getattr(kind(), load)(at / "text.v27")),
        f"{kind.__name__} nowhere": (FileError, "no/a.v27", WRITABLE,
                                     lambda at, kind=kind: kind().SaveFile(at / "no" / "a.v27")),
    }  # fmt: skip
    if kind is not CClimateChange_V27:
        CASES |= {
            f"{kind.__name__} grid gone": (FileError, "gone.tsb2", "a grid that can be read",
                                           lambda at, kind=kind: kind().setCoarseBathymetryFile(at / "gone.tsb2")),
            f"{kind.__name__} boundaries": (WrongValue, f"{kind.__name__}.setNoOfBndCondition(count)", "65535 or less",
                                            lambda at, kind=kind: kind().setNoOfBndCondition(65536)),
        }  # fmt: skip
for kind in (Flooding_V27FlowModel, UrbanFlooding_V27Flowmodel, CClimateChange_V27, Flooding_V27WSKFlowModel):
    CASES[f"{kind.__name__} of something"] = (WrongType, kind.__name__, "no argument", lambda at, kind=kind: kind("a.v27"))


@pytest.mark.parametrize("case", CASES)
def test_says_the_path_what_was_given_and_what_is_allowed(case, there, capfd):
    error, path, allowed, call = CASES[case]
    with pytest.raises(error) as caught:
        call(there)
    fault = caught.value
    assert path in fault.path and fault.path in str(fault)
    assert allowed in fault.allowed and fault.allowed in str(fault)
    assert fault.given and fault.given.strip('"') in str(fault)
    assert not [each.name for each in there.iterdir() if each.name in ("a.tsb2", "a.tsb0", "a.v27", "no")]
