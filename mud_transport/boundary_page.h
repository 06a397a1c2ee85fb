#pragma once

#include "families/boundary_values_page.h"
#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/transported.h"

namespace gridbay {

// How the concentrations at each boundary are given.
class CNmtBoundaryGrid final : public BoundaryValuesGrid<&MudTransportParts::nmtBoundary, MudFractions> {};

// Salinity and fractions by boundary.
class CNmtBoundaryConstantsGrid final
    : public BoundaryConstantsGrid<&MudTransportParts::nmtBoundary, MudFractions> {};

// The concentrations at the open boundaries.
class CNmtBoundaryDlg final
    : public BoundaryValuesDlg<18808, PageId::mtBoundary, CNmtBoundaryGrid, CNmtBoundaryConstantsGrid> {
 public:
  explicit CNmtBoundaryDlg(CVdDoc& document);
  ~CNmtBoundaryDlg() override;
};

}  // namespace gridbay
