#pragma once

#include "core/string_table.h"
#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr FileKind timeSeriesFile{"tsb0",
                                         "Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind profileFile{"tsb1", "Profile (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"};

// What falls on, or leaves, the whole surface.
inline constexpr FileKind surfaceSeriesFile{"tsb0",
                                            "Time Series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind surfaceMapFile{"tsb2",
                                         "Grid Series (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};

inline constexpr FileKind dispersionFile{
    "tsb2", "Dispersion Coefficient Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};

inline constexpr FileKind initialConditionFile{
    "tsb2", "Initial Condition Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};

// The title of what is given of an entry in each area.
inline constexpr Text componentBand{"Component :   %s"};
// A place of a list, with what it is called.
inline constexpr Text placeHeader{"%d: %s"};
inline constexpr Text boundaryHeader{"Boundary %d"};

}  // namespace gridbay::texts
