#pragma once

#include "mud_transport_expanded/numbered_grid.h"

namespace gridbay {

// A row for each layer, dense or soft.
class CNmtExpErosionDescriptionGrid final : public LayerGrid {
  void LayOut() override;
};

// How the layers of the bed erode.
class CNmtExpErosionLayer final : public Page<18847, PageId::mtExpErosionLayer> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpErosionDescriptionGrid grid_;
};

}  // namespace gridbay
