"""The scripting classes over models of the Wetland Sweep Kit."""

from ._wetland_sweep_kit import (
    CClimateChange_V27,
    Flooding_V27FlowModel,
    Flooding_V27WSKFlowModel,
    OutputPosition,
    UrbanFlooding_V27Flowmodel,
)

__all__ = ["CClimateChange_V27", "Flooding_V27FlowModel", "Flooding_V27WSKFlowModel", "OutputPosition",
           "UrbanFlooding_V27Flowmodel"]  # fmt: skip
