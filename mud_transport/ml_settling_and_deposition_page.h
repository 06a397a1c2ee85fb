#pragma once

#include "families/layer_values_page.h"

namespace gridbay {

class CNmtMlShearStressGrid final : public AreaMapsGrid {
  void LayOut() override;
};

// How the mud of the multi layer task settles.
class CNmtMlSettlingAndDepositionDlg final : public Page<18829, PageId::mtMlSettlingAndDeposition> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtMlShearStressGrid grid_;
};

}  // namespace gridbay
