#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// Whose value it is that lies outside of its range.
inline constexpr Text boundaryValue{"Boundary %d: %s"};
inline constexpr Text sourceValue{"Source/Sink %d: %s"};
inline constexpr Text surfaceDepositionValue{"Surface: %s"};
inline constexpr Text soilDepositionValue{"Soil: %s"};

// Outputs.
inline constexpr Text outputLimits{"Invalid output area limits"};
inline constexpr Text outputStep{"Invalid output area step"};
inline constexpr Text outputTimeSteps{"Invalid output time steps"};
inline constexpr Text averageOfOneStep{"Time averaged output not possible with frequency = 1"};
inline constexpr Text noOutputItem{"Please choose at least one output item"};

}  // namespace gridbay::texts
