#pragma once

#include "pages/choices.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

// The kinds of structures and of their parts by the names that they have on their pages.

namespace gridbay {

inline Choices crestVariations() {
  return Choices::lines("Constant\r\nIn space\r\nIn space and time", CNhdDikeObjectKvs::kConstant);
}

// In the order of the grid.
inline Choices weirTypes() {
  using Weir = CNhdWeirObjectKvs;
  return Choices::lines("Broad crested weir\r\nWeir formula 1\r\nWeir formula 2 (Honma)",
                        {Weir::kBroadCrested, Weir::kFormula1, Weir::kFormula2})
      .Otherwise(0);
}

inline Choices culvertGeometries() {
  return Choices::lines("Rectangular\r\nCircular\r\nIrregular, level-width");
}

// Of weirs and culverts.
inline Choices valves() {
  return Choices::lines("None\r\nOnly negative flow\r\nOnly positive flow\r\nNo flow");
}

}  // namespace gridbay
