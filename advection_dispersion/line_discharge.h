#pragma once

#include "advection_dispersion/entries.h"
#include "families/line_box.h"

namespace gridbay {

struct NadLineDischarge {
  static constexpr LineOrBoxKind kKind{.isLine = true,
                                       .loadsPeriod = false,
                                       .section = "AD_LINE_DISCHARGE_CALCULATIONS",
                                       .count = "No_Of_AD_Discharge_Lines",
                                       .item = "AD_DISCHARGE_LINE_%d",
                                       .page = PageId::adLineDischarge,
                                       .areaPage = PageId::adLineDischarge,
                                       .countPage = PageId::adResult};
  static std::vector<std::string> entryNames(CKvsBase& object) { return componentNames(object); }
};

// The transport of components through a line, and all such lines.
using CNadLineDischargeObjectKvs = LineOrBoxObjectKvs<NadLineDischarge>;
class CNadLineDischargeKvs final : public LineOrBoxKvs<NadLineDischarge> {
  using LineOrBoxKvs::LineOrBoxKvs;
};

}  // namespace gridbay
