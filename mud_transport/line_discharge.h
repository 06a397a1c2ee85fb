#pragma once

#include "families/line_box.h"
#include "mud_transport/transported.h"

namespace gridbay {

struct NmtLineDischarge {
  static constexpr LineOrBoxKind kKind{.isLine = true,
                                       .loadsPeriod = false,
                                       .section = "MT_LINE_DISCHARGE_CALCULATIONS",
                                       .count = "No_Of_MT_Discharge_Lines",
                                       .item = "MT_DISCHARGE_LINE_%d",
                                       .page = PageId::mtLineDischarge,
                                       .areaPage = PageId::mtLineDischarge,
                                       .countPage = PageId::mtResult};
  static std::vector<std::string> entryNames(CKvsBase& object) { return mudFractionNames(object); }
};

// The transport of fractions through a line, and all such lines.
using CNmtLineDischargeObjectKvs = LineOrBoxObjectKvs<NmtLineDischarge>;
class CNmtLineDischargeKvs final : public LineOrBoxKvs<NmtLineDischarge> {
  using LineOrBoxKvs::LineOrBoxKvs;
};

}  // namespace gridbay
