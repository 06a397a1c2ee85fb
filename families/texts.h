#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// The time steps that a module, or an output of it, runs over.
inline constexpr Text firstTimeStepNegative{"First time step can not be negative"};
inline constexpr Text firstTimeStepAfterLast{"The first time step is greater than the last"};
inline constexpr Text lastTimeStepOutOfRange{"Last timestep out of range"};

// Lines and boxes.
inline constexpr Text lineWithoutArea{"Line is not embedded in a valid area"};
inline constexpr Text boxWithoutArea{"Box is not embedded in a valid area"};
inline constexpr Text lineCount{"Illegal number of line discharge lines, should be between 0 and 10"};
inline constexpr Text boxCount{"Illegal number of box summation boxes, should be between 0 and 10"};

// Mass budgets.
inline constexpr Text massFileSectionMissing{
    "Error in the KVS-FILE\nThe number of Mass Budget Polygons does not correspond to the number specified"};
inline constexpr Text invalidPolygon{"Invalid polygon"};
inline constexpr Text timeRangeOutOfRange{"TRange is out of range"};
inline constexpr Text noItemSelected{"No item selected"};
inline constexpr Text noOutputFile{"No output file specified"};

// Outputs. The limit is 16, and the page takes 18.
inline constexpr Text outputCount{"Illegal number of output areas, should be between 0 and 18"};

}  // namespace gridbay::texts
