#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/line_discharge.h"
#include "families/line_box_page.h"

namespace gridbay {

// The place and the period of a line.
class CNadLineDischargeSelLineDlg final : public PlaceDlg {
 public:
  CNadLineDischargeSelLineDlg(CVdDoc& document, const LineOrBox& line)
      : PlaceDlg(document, {"Line for Discharge Calculations", "First point:", "Last point:"}, line) {}
};

using CNadLineDischargeGrid = LineOrBoxGrid;

// The lines through which the transport is written.
class CNadLineDischargeDlg final
    : public LineOrBoxDlg<18731, PageId::adLineDischarge, &AdvectionDispersionParts::nadLineDischarge,
                          CNadLineDischargeSelLineDlg> {
 public:
  using LineOrBoxDlg::LineOrBoxDlg;
};

}  // namespace gridbay
