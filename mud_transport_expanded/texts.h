#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// What is carried, and the bed.
inline constexpr Text salinityEntry{"Salinity"};
inline constexpr Text fractionEntry{"Fraction no. %d"};
inline constexpr Text layerEntry{"Layer no. %d"};

// Initial conditions.
inline constexpr Text expInitialRequest{"Initial Concentration"};
inline constexpr Text bedThicknessNegative{"Constant value for initial bed thickness must be highr than 0"};
inline constexpr Text expConcentrationNegative{
    "Constant value for initial concentration must be highr than 0"};
inline constexpr Text bedDistributionNot100{"Total Bed Distribution different from 100"};

// Sections that a file lacks. Those of boundaries and of sources have one text.
inline constexpr Text expPlaceSectionMissing{
    "Error in the KVS-FILE\nThe number of AD Source Sink sections does not correspond to the number of "
    "Boundaries"};
inline constexpr Text expDispersionSectionMissing{
    "Error in the KVS-FILE\nThe number of AD Dispertion coefficient sections does not correspond to the "
    "number of sub domaines"};

// Waves.
inline constexpr Text expWaveHeightRequest{"Wave height"};
inline constexpr Text expWaveDirectionRequest{"Wave direction"};
inline constexpr Text expWavePeriodRequest{"Wave period"};
inline constexpr Text tooManyWaveMaps{"Maximum number of Wavemaps exceeded"};
inline constexpr Text waveIncrementZero{"Increments must be different from 0"};
inline constexpr Text waveMapsOnPage{"Number of wavemaps should be less or equal to 120"};

// Outputs.
inline constexpr Text noOutputComponents{"Number of output components should be different from 0"};

}  // namespace gridbay::texts
