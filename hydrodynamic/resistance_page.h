#pragma once

#include "families/area_grid.h"

namespace gridbay {

class CNhdResistanceGrid final : public AreaGrid {
  void LayOut() override;
};

// Bed resistance by area. What is asked of sediment and waves shows only for a setup whose file says that
// waves induce the resistance.
class CNhdResistanceDlg final : public Page<18923, PageId::resistance> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
  FileChoice grainSizeMap();

  CNhdResistanceGrid grid_;
};

// The waves that induce the resistance.
class CNhdResistanceWaveDlg final : public Page<19655, PageId::waves> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
  FileChoice waveFile();
};

}  // namespace gridbay
