#pragma once

#include "ecology/ecology_parts.h"
#include "ecology/starting_conditions.h"
#include "families/starting_conditions_page.h"

namespace gridbay {

using CWQSStartingConditionsGridDlg = HotStartGrid<&EcologyParts::wqsStartingConditions>;

// Whether the ecological model begins cold, or from files.
class CWQSStartingConditionsDlg final
    : public HotStartPage<&EcologyParts::wqsStartingConditions, 18949, PageId::ecoStartingConditions> {
 public:
  using HotStartPage::HotStartPage;
};

}  // namespace gridbay
