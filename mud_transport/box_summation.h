#pragma once

#include "families/line_box.h"
#include "mud_transport/transported.h"

namespace gridbay {

struct NmtBoxSummation {
  static constexpr LineOrBoxKind kKind{.isLine = false,
                                       .loadsPeriod = false,
                                       .section = "BOXES_FOR_MASS_SUMMATION",
                                       .count = "No_Of_MT_Mass_Boxes",
                                       .item = "MT_MASS_BOX_%d",
                                       .page = PageId::mtBoxSummation,
                                       .areaPage = PageId::mtLineDischarge,
                                       .countPage = PageId::mtResult};
  static std::vector<std::string> entryNames(CKvsBase& object) { return mudFractionNames(object); }
};

// The mass of fractions in a box, and all such boxes.
using CNmtBoxSummationObjectKvs = LineOrBoxObjectKvs<NmtBoxSummation>;
class CNmtBoxSummationKvs final : public LineOrBoxKvs<NmtBoxSummation> {
  using LineOrBoxKvs::LineOrBoxKvs;
};

}  // namespace gridbay
