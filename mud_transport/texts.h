#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// What the task has, by its place.
inline constexpr Text mtFraction{"Fraction no. %d"};
inline constexpr Text mtSalinity{"Salinity"};
inline constexpr Text mtOnlyFraction{"Fraction"};
inline constexpr Text mtThickness{"Thickness layer no. %d"};

// What is asked of files.
inline constexpr Text mtInitialConditionRequest{"Initial Conditions"};
inline constexpr Text mtWaveHeightRequest{"Wave height"};
inline constexpr Text mtWavePeriodRequest{"Wave period"};
inline constexpr Text mtWaveDirectionRequest{"Wave direction"};

// Layers of the bed.
inline constexpr Text layerFormatsDiffer{"Format must be the same for all layers"};

// Sections that a file lacks.
inline constexpr Text mtDispersionSectionMissing{
    "Error in the KVS-FILE\nThe number of MT Dispertion coefficient sections does not correspond to the "
    "number of sub domaines"};
inline constexpr Text mtBoundarySectionMissing{
    "Error in the KVS-FILE\nThe number of MT Boundary sections does not correspond to the number of "
    "Boundaries"};
inline constexpr Text mtSourceSectionMissing{
    "Error in the KVS-FILE\nThe number of MT Source Sink sections does not correspond to the number of "
    "Boundaries"};

}  // namespace gridbay::texts
