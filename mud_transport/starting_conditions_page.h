#pragma once

#include "families/starting_conditions_page.h"
#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/starting_conditions.h"

namespace gridbay {

using CNmtHotStartGrid = HotStartGrid<&MudTransportParts::nmtStartingConditions>;

// When the transport runs, what it begins from, and how it is calculated.
class CNmtStartingConditionsDlg final
    : public StartingConditionsPage<&MudTransportParts::nmtStartingConditions, 18834,
                                    PageId::mtStartingConditions> {
 public:
  using StartingConditionsPage::StartingConditionsPage;

 private:
  void AddBelow(Form& form) override;
};

}  // namespace gridbay
