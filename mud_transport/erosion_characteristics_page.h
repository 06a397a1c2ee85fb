#pragma once

#include "pages/cell_grid.h"

namespace gridbay {

// What erodes in the multi fraction task.
class CNmtMfErosionCharacteristicsDlg final : public Page<18824, PageId::mtMfErosionCharacteristics> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

// How the layers erode in the multi layer task.
class CNmtMlErosionCharacteristicsDlg final : public Page<18828, PageId::mtMlErosionCharacteristics> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

class CNmtErosionLayerGrid final : public ColumnGrid {
  void LayOut() override;
  std::string CornerHeader() override { return "Layer"; }
  int RowHeaderWidth() override { return 40; }
};
// Which layers erode as a dense bed, and which as a soft one.
class CNmtErosionLayerDlg final : public Page<18819, PageId::mtErosionLayer> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Erosion of layers", grid_); }

  CNmtErosionLayerGrid grid_;
};

}  // namespace gridbay
