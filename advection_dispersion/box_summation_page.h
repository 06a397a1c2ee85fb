#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/box_summation.h"
#include "families/line_box_page.h"

namespace gridbay {

// The place and the period of a box.
class CNadBoxSummationBoxSelDlg final : public PlaceDlg {
 public:
  CNadBoxSummationBoxSelDlg(CVdDoc& document, const LineOrBox& box)
      : PlaceDlg(document, {"Box for Summation Calculations", "Lower-left point:", "Upper-right point:"},
                 box) {}
};

using CNadBoxSummationGrid = LineOrBoxGrid;

// The boxes in which the mass is written.
class CNadBoxSummationDlg final
    : public LineOrBoxDlg<18719, PageId::adBoxSummation, &AdvectionDispersionParts::nadBoxSummation,
                          CNadBoxSummationBoxSelDlg> {
 public:
  using LineOrBoxDlg::LineOrBoxDlg;
};

}  // namespace gridbay
