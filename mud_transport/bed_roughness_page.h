#pragma once

#include "families/layer_values_page.h"

namespace gridbay {

class CNmtBedRoughnessGrid final : public AreaMapsGrid {
  void LayOut() override;
};

// The roughness of the bed.
class CNmtBedRoughnessDlg final : public Page<18807, PageId::mtBedRoughness> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtBedRoughnessGrid grid_;
};

}  // namespace gridbay
