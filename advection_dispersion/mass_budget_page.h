#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/mass_budget.h"
#include "families/mass_budget_page.h"

namespace gridbay {

using CNadMassBudgetGrid = MassFileGrid;

// The files of the masses in polygons.
class CNadMassBudgetDlg final
    : public MassFilesDlg<18733, PageId::adMassBudget, &AdvectionDispersionParts::nadMassBudget> {
 public:
  using MassFilesDlg::MassFilesDlg;
};

}  // namespace gridbay
