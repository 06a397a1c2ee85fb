#pragma once

#include "pages/form_view.h"

namespace gridbay {

// How many fractions and layers there are, and what is carried beside them.
class CNmtExpTaskSelectionDlg final : public Page<18863, PageId::mtExpTaskSelection> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
