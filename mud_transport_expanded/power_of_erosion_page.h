#pragma once

#include "mud_transport_expanded/numbered_grid.h"

namespace gridbay {

// A row for each layer.
class CNmtExpPowerOfErosionGrid final : public LayerGrid {
  void LayOut() override;
};

// By which power the layers of the bed erode.
class CNmtExpPowerOfErosionDlg final : public Page<18855, PageId::mtExpPowerOfErosion> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpPowerOfErosionGrid grid_;
};

}  // namespace gridbay
