#pragma once

#include <string>

#include "pages/cell_grid.h"

namespace gridbay {

// A row for each dredger, with a column for the weight of each fraction.
class CNmtExpDredgingGrid final : public ColumnGrid {
  std::string CornerHeader() override { return "Dredger"; }
  int RowHeaderWidth() override { return 60; }
  int LayoutKey() override;
  void LayOut() override;
};

// The dredgers.
class CNmtExpDredgingsDlg final : public Page<18846, PageId::mtExpDredgings> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpDredgingGrid grid_;
};

}  // namespace gridbay
