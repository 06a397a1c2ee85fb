#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/transported.h"
#include "families/boundary_values_page.h"

namespace gridbay {

// How the concentrations at each boundary are given.
class CNadBoundaryGrid final
    : public BoundaryValuesGrid<&AdvectionDispersionParts::nadBoundary, AdComponents> {};

// Component by boundary.
class CNadBoundaryConstantsGrid final
    : public BoundaryConstantsGrid<&AdvectionDispersionParts::nadBoundary, AdComponents> {};

// The concentrations at the open boundaries.
class CNadBoundaryDlg final
    : public BoundaryValuesDlg<18717, PageId::adBoundary, CNadBoundaryGrid, CNadBoundaryConstantsGrid> {
 public:
  explicit CNadBoundaryDlg(CVdDoc& document);
  ~CNadBoundaryDlg() override;
};

}  // namespace gridbay
