#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/starting_conditions.h"
#include "families/starting_conditions_page.h"

namespace gridbay {

using CNadHotStartGrid = HotStartGrid<&AdvectionDispersionParts::nadStartingConditions>;

// When the transport runs, and what it begins from.
class CNadStartingConditionsDlg final
    : public StartingConditionsPage<&AdvectionDispersionParts::nadStartingConditions, 18737,
                                    PageId::adStartingConditions> {
 public:
  using StartingConditionsPage::StartingConditionsPage;
};

}  // namespace gridbay
