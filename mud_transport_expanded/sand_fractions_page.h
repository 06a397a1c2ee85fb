#pragma once

#include "mud_transport_expanded/numbered_grid.h"

namespace gridbay {

// A row for each fraction, with the velocity of one that is sand.
class CNmtExpSandFractionValueGrid final : public FractionGrid {
  void LayOut() override;
};

// How fast sand settles.
class CNmtExpSandFractionsDlg final : public Page<18857, PageId::mtExpSandFractions> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpSandFractionValueGrid grid_;
};

}  // namespace gridbay
