#pragma once

#include "pages/form_view.h"

namespace gridbay {

// How water leaves the surface into the ground.
class CHDInfiltrationDlg final : public Page<19656, PageId::infiltration> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
