#pragma once

#include "families/mass_budget_page.h"
#include "mud_transport_expanded/mass_budget.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"

namespace gridbay {

using CNmtExpMassBudgetGrid = MassFileGrid;

// The files of the masses in polygons.
class CNmtExpMassBudgetDlg final
    : public MassFilesDlg<18853, PageId::mtExpMassBudget, &MudTransportExpandedParts::nmtExpMassBudget> {
 public:
  using MassFilesDlg::MassFilesDlg;
};

}  // namespace gridbay
