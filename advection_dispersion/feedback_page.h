#pragma once

#include "pages/form_view.h"

namespace gridbay {

// The feedback of the transport on the flow calculation.
class CNadFeedbackDlg final : public Page<18725, PageId::adFeedback> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
  Choices components();
};

}  // namespace gridbay
