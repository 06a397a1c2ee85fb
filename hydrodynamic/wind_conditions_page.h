#pragma once

#include "pages/form_view.h"

namespace gridbay {

// The wind and its friction on the water.
class CWindConditionsDlg final : public Page<18934, PageId::windConditions> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
  FileChoice windFile();
};

}  // namespace gridbay
