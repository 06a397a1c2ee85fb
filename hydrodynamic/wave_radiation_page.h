#pragma once

#include "families/area_grid.h"

namespace gridbay {

class CNhdWaveRadiationGrid final : public AreaGrid {
  void LayOut() override;
};

// The wave radiation stresses of each area.
class CNhdWaveRadiationDlg final : public Page<18933, PageId::waveRadiation> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Wave radiation", grid_); }

  CNhdWaveRadiationGrid grid_;
};

}  // namespace gridbay
