#pragma once

#include "families/line_box_page.h"
#include "mud_transport_expanded/line_discharge.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"

namespace gridbay {

// The place and the period of a line.
class CNmtExpLineDischargeSelLineDlg final : public PlaceDlg {
 public:
  CNmtExpLineDischargeSelLineDlg(CVdDoc& document, const LineOrBox& line)
      : PlaceDlg(document, {"Line for Discharge Calculations", "First point:", "Last point:"}, line) {}
};

using CNmtExpLineDischargeGrid = LineOrBoxGrid;

// The lines through which the transport is written.
class CNmtExpLineDischargeDlg final
    : public LineOrBoxDlg<18851, PageId::mtExpLineDischarge, &MudTransportExpandedParts::nmtExpLineDischarge,
                          CNmtExpLineDischargeSelLineDlg> {
 public:
  using LineOrBoxDlg::LineOrBoxDlg;
};

}  // namespace gridbay
