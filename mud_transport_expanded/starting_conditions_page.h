#pragma once

#include "families/starting_conditions_page.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/starting_conditions.h"

namespace gridbay {

using CNmtExpHotStartGrid = HotStartGrid<&MudTransportExpandedParts::nmtExpStartingConditions>;

// When the transport runs, and what it begins from.
class CNmtExpStartingConditionsDlg final
    : public StartingConditionsPage<&MudTransportExpandedParts::nmtExpStartingConditions, 18862,
                                    PageId::mtExpStartingConditions> {
 public:
  using StartingConditionsPage::StartingConditionsPage;

 private:
  void AddBelow(Form& form) override;
};

}  // namespace gridbay
