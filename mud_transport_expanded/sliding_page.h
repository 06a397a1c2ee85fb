#pragma once

#include "pages/form_view.h"

namespace gridbay {

// Whether and by which coefficients mud slides.
class CNmtExpSlidingDlg final : public Page<18860, PageId::mtExpSliding> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
