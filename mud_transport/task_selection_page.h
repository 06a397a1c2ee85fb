#pragma once

#include "pages/form_view.h"

namespace gridbay {

// The task of the module, with its counts.
class CNmtTaskSelectionDlg final : public Page<18835, PageId::mtTaskSelection> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  // Chooses the task with what it begins with.
  void begin(bool isMultiFraction);
};

}  // namespace gridbay
