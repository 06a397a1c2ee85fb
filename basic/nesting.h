#pragma once

#include "basic/bathymetry.h"

namespace gridbay {

// The ratio between the spacing of an area and that of the area inside it: the inner point (3a, 3b) is the
// outer point (origin J + a, origin K + b).
inline constexpr int kNestingRatio = 3;

// Whether the inner area can lie in the outer one as far as spacing, extent and position tell, so that no
// grid need be in memory; 1 with a message for the first rule that it breaks.
unsigned CheckNestingGeometry(const CBathymetryObjectKvs& inner, const CBathymetryObjectKvs& outer,
                              ValidationList& messages);

// Whether the inner area can lie in the outer one; 1 with a message for the first rule that it breaks.
unsigned CheckNesting(const CBathymetryObjectKvs& inner, const CBathymetryObjectKvs& outer,
                      ValidationList& messages);

// Whether two areas of one enclosing area overlap: 1 with a message when a corner of either lies in the
// other. Areas that cross without that, as a plus sign does, do not overlap.
unsigned CheckOverlap(const CBathymetryObjectKvs& a, const CBathymetryObjectKvs& b, ValidationList& messages);

}  // namespace gridbay
