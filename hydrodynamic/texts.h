#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// HD boundary conditions.
inline constexpr Text hdBoundarySectionMissing{
    "Error in the KVS-FILE\nThe number of Hydrodynamic Boundary sections does not correspond to the number "
    "of Boundaries"};
inline constexpr Text noBoundaryDataItem{" No Boundary Data item "};
inline constexpr Text tiltingPointOutside{"Tilting point is outside of boundary line"};
inline constexpr Text boundaryRequest{"Boundary"};
inline constexpr Text flowDirectionRequest{"Flow direction"};

// Sources and sinks, rain and evaporation.
inline constexpr Text hdSourceSectionMissing{
    "Error in the KVS-FILE\nThe number of Hydrodynamic Source Sink sections does not correspond to the "
    "number of Boundaries"};
inline constexpr Text rainfallRequest{"Rainfall rate"};
inline constexpr Text magnitudeRequest{"Magnitude"};
inline constexpr Text velocityRequest{"Velocity"};

// Infiltration.
inline constexpr Text infiltrationFileNotValid{"File is not valid"};
inline constexpr Text infiltrationRequest{"Infiltration"};
inline constexpr Text porosityRequest{"Porosity"};
inline constexpr Text depthBelowGroundRequest{"Depth Below Ground"};
inline constexpr Text groundwaterElevationRequest{"Elevation"};
inline constexpr Text leakageRequest{"Leakage"};
inline constexpr Text percentageRequest{"Percentage"};
inline constexpr Text waterContentRequest{"Volumetric Water Content"};

// Outputs.
inline constexpr Text saturationLast{
    "Saturation is the last item of the output \"%s\", and there is no infiltration: such a list can't be "
    "saved. Without the item it can."};

}  // namespace gridbay::texts
