"""Setups of a two-dimensional free-surface flow model, from Python.

    import gridbay_setup
    setup = gridbay_setup.open("flood.v27")
    setup.hydrodynamic.resistance.areas[1].constant_value = 25
    setup["NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth"] = 0.002
    for message in setup.validate():
        print(message)
    setup.save("rough.v27")

All keywords of all parts are attributes, in small letters with underscores, and can be reached by their paths in
the file; lists count from 1. `help(type(setup.hydrodynamic.resistance))` tells what a section has, with units and
defaults. Values are in the base units of the file. Errors are exceptions of `gridbay_setup.errors`.

Different setups may be used from different threads; what comes of one that several use is told by `help(Setup)`.
"""

from __future__ import annotations

from ._data_files import (
    ConvertedRaster,
    ConvertedSeries,
    DataFile,
    Item,
    ItemType,
    NewGrid,
    convert_raster,
    convert_series,
    item_types,
    new_grid,
    open_data,
)
from ._flow_model import (
    CClimateChange_V27,
    Flooding_V27FlowModel,
    OutputPosition,
    UrbanFlooding_V27Flowmodel,
)
from ._setups import Message, Setup, Severity, new, open
from ._wetland_sweep_kit import Flooding_V27WSKFlowModel
from .errors import FileError, PathError, RangeError, SetupError, Stopped, WrongType, WrongValue

__all__ = [
    "CClimateChange_V27", "ConvertedRaster", "ConvertedSeries", "DataFile", "FileError", "Flooding_V27FlowModel",
    "Flooding_V27WSKFlowModel", "Item", "ItemType", "Message", "NewGrid", "OutputPosition", "PathError", "RangeError",
    "Setup", "SetupError", "Severity", "Stopped", "UrbanFlooding_V27Flowmodel", "WrongType", "WrongValue",
    "convert_raster", "convert_series", "item_types", "new", "new_grid", "open", "open_data",
]  # fmt: skip
