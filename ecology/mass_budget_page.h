#pragma once

#include "ecology/ecology_parts.h"
#include "ecology/mass_budget.h"
#include "families/mass_budget_page.h"

namespace gridbay {

using CWQSMassBudgetGridDlg = MassFileGrid;

// The files of the masses in polygons.
class CWQSMassBudgetDlg final
    : public MassFilesDlg<18946, PageId::ecoMassBudget, &EcologyParts::wqsMassBudget> {
 public:
  using MassFilesDlg::MassFilesDlg;
};

}  // namespace gridbay
