#pragma once

#include "pages/form_view.h"

namespace gridbay {

// The thresholds of flooding and drying. Their check box is never shown, so the flag stays as the file has
// it.
class CAreaDescriptionDlg final : public Page<18702, PageId::floodAndDry> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
