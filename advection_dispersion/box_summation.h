#pragma once

#include "advection_dispersion/entries.h"
#include "families/line_box.h"

namespace gridbay {

struct NadBoxSummation {
  static constexpr LineOrBoxKind kKind{.isLine = false,
                                       .loadsPeriod = true,
                                       .section = "BOXES_FOR_MASS_SUMMATION",
                                       .count = "No_Of_AD_Mass_Boxes",
                                       .item = "AD_MASS_BOX_%d",
                                       .page = PageId::adBoxSummation,
                                       .areaPage = PageId::adLineDischarge,
                                       .countPage = PageId::adResult};
  static std::vector<std::string> entryNames(CKvsBase& object) { return componentNames(object); }
};

// The mass of components in a box, and all such boxes.
using CNadBoxSummationObjectKvs = LineOrBoxObjectKvs<NadBoxSummation>;
class CNadBoxSummationKvs final : public LineOrBoxKvs<NadBoxSummation> {
  using LineOrBoxKvs::LineOrBoxKvs;
};

}  // namespace gridbay
