#pragma once

#include "pages/form_view.h"

namespace gridbay {

// The waves that stir up the bed.
class CNmtWaveDataDlg final : public Page<18838, PageId::mtWaveData> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
