#pragma once

#include "pages/form_view.h"

namespace gridbay {

// The parameters of the heat exchange with the atmosphere.
class CNadHeatExchangeDlg final : public Page<18726, PageId::adHeatExchange> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
