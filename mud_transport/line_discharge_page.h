#pragma once

#include "families/line_box_page.h"
#include "mud_transport/line_discharge.h"
#include "mud_transport/mud_transport_parts.h"

namespace gridbay {

// The place and the period of a line.
class CNmtLineDischargeSelLineDlg final : public PlaceDlg {
 public:
  CNmtLineDischargeSelLineDlg(CVdDoc& document, const LineOrBox& line)
      : PlaceDlg(document, {"Line for Discharge Calculations", "First point:", "Last point:"}, line) {}
};

using CNmtLineDischargeGrid = LineOrBoxGrid;

// The lines through which the transport is written.
class CNmtLineDischargeDlg final
    : public LineOrBoxDlg<18822, PageId::mtLineDischarge, &MudTransportParts::nmtLineDischarge,
                          CNmtLineDischargeSelLineDlg> {
 public:
  using LineOrBoxDlg::LineOrBoxDlg;
};

}  // namespace gridbay
