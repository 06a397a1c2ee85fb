#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "families/dispersion_page.h"

namespace gridbay {

// A row for each area.
using CNadDispersionCoefGrid = DispersionCoefGrid<&AdvectionDispersionParts::nadDispersionCoef>;

// The dispersion of all components.
class CNadDispersionCoefDlg final : public DispersionCoefDlg<18723, PageId::adDispersionCoef,
                                                             &AdvectionDispersionParts::nadDispersionCoef> {
 public:
  explicit CNadDispersionCoefDlg(CVdDoc& document);
  ~CNadDispersionCoefDlg() override;
};

}  // namespace gridbay
