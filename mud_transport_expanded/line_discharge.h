#pragma once

#include "families/line_box.h"
#include "mud_transport_expanded/transported.h"

namespace gridbay {

struct NmtExpLineDischarge {
  static constexpr LineOrBoxKind kKind{.isLine = true,
                                       .loadsPeriod = false,
                                       .section = "MT_LINE_DISCHARGE_CALCULATIONS",
                                       .count = "No_Of_MT_Discharge_Lines",
                                       .item = "MT_DISCHARGE_LINE_%d",
                                       .page = PageId::mtExpLineDischarge,
                                       .areaPage = PageId::mtExpLineDischarge,
                                       .countPage = PageId::mtExpResult};
  static std::vector<std::string> entryNames(CKvsBase& object) { return expandedEntryNames(object); }
};

// The transport of what is carried through a line, and all such lines.
using CNmtExpLineDischargeObjectKvs = LineOrBoxObjectKvs<NmtExpLineDischarge>;
class CNmtExpLineDischargeKvs final : public LineOrBoxKvs<NmtExpLineDischarge> {
  using LineOrBoxKvs::LineOrBoxKvs;
};

}  // namespace gridbay
