#pragma once

#include "pages/form_view.h"

namespace gridbay {

// Whether grains flocculate, and what hinders their settling.
class CNmtExpSettlingsDlg final : public Page<18858, PageId::mtExpSettlings> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
