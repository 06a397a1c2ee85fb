#pragma once

#include "mud_transport_expanded/numbered_grid.h"

namespace gridbay {

// A row for each fraction: whether it is sand.
class CNmtExpSandFractionGrid final : public FractionGrid {
 public:
  bool IsEnabled() override;

 private:
  void LayOut() override;
};

// The viscosity of the water, and which fractions are sand.
class CNmtExpWaterColParametersDlg final : public Page<18867, PageId::mtExpWaterColParameters> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpSandFractionGrid grid_;
};

}  // namespace gridbay
