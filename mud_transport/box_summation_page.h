#pragma once

#include "families/line_box_page.h"
#include "mud_transport/box_summation.h"
#include "mud_transport/mud_transport_parts.h"

namespace gridbay {

// The place and the period of a box.
class CNmtBoxSummationBoxSelDlg final : public PlaceDlg {
 public:
  CNmtBoxSummationBoxSelDlg(CVdDoc& document, const LineOrBox& box)
      : PlaceDlg(document, {"Box for Summation Calculations", "Lower-left point:", "Upper-right point:"},
                 box) {}
};

using CNmtBoxSummationGrid = LineOrBoxGrid;

// The boxes in which the mass is written.
class CNmtBoxSummationDlg final
    : public LineOrBoxDlg<18810, PageId::mtBoxSummation, &MudTransportParts::nmtBoxSummation,
                          CNmtBoxSummationBoxSelDlg> {
 public:
  using LineOrBoxDlg::LineOrBoxDlg;
};

}  // namespace gridbay
