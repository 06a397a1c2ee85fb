#pragma once

#include "pages/form_view.h"

namespace gridbay {

// The consolidation of the mud within its layers.
class CNmtConsolidationDlg final : public Page<18811, PageId::mtConsolidation> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
