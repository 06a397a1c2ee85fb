#pragma once

#include "families/boundary_values_page.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/transported.h"

namespace gridbay {

// How the concentrations at each boundary are given.
class CNmtExpBoundaryGrid final
    : public BoundaryValuesGrid<&MudTransportExpandedParts::nmtExpBoundary, ExpandedMudEntries> {};

// What is carried by boundary.
class CNmtExpBoundaryExtGrid final
    : public BoundaryConstantsGrid<&MudTransportExpandedParts::nmtExpBoundary, ExpandedMudEntries> {};

// The concentrations at the open boundaries.
class CNmtExpBoundaryDlg final
    : public BoundaryValuesDlg<18840, PageId::mtExpBoundary, CNmtExpBoundaryGrid, CNmtExpBoundaryExtGrid> {
 public:
  explicit CNmtExpBoundaryDlg(CVdDoc& document);
  ~CNmtExpBoundaryDlg() override;
};

}  // namespace gridbay
