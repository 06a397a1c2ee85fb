#pragma once

#include "families/area_grid.h"

namespace gridbay {

class CNhdEddyViscosityConstGrid final : public AreaGrid {
  void LayOut() override;
};

class CNhdEddyViscosityFromFileGrid final : public AreaGrid {
  void LayOut() override;
};

class CNhdEddyViscositySmagorinskyGrid final : public AreaGrid {
  void LayOut() override;
};

// How turbulence is described, and below it the grid of that description.
class CNhdEddyViscosityDlg final : public Page<18706, PageId::eddyViscosity> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNhdEddyViscosityConstGrid constants_;
  CNhdEddyViscosityFromFileGrid files_;
  CNhdEddyViscositySmagorinskyGrid smagorinsky_;
};

}  // namespace gridbay
