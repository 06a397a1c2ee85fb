#pragma once

#include "families/area_grid.h"

namespace gridbay {

class CNhdSurfaceElevationGrid final : public AreaGrid {
  void LayOut() override;
};

// The water level at the start of the simulation. A hot start takes it from the area files.
class CNhdSurfaceElevationDlg final : public Page<18931, PageId::surfaceElevation> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Surface elevation", grid_); }

  CNhdSurfaceElevationGrid grid_;
};

}  // namespace gridbay
