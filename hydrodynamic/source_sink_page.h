#pragma once

#include <string>

#include "pages/cell_grid.h"

namespace gridbay {

// One row for each source or sink.
class CNhdSourceSinkGrid final : public ColumnGrid {
  std::string CornerHeader() override { return "Source Sink"; }
  int RowHeaderWidth() override { return 130; }
  std::string RowHeader(GridRow row) override;
  void LayOut() override;
};

// Evaporation and precipitation side by side, and below them what flows at each source and sink.
class CNhdSourceSinkDlg final : public Page<18930, PageId::hdSourceAndSink> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNhdSourceSinkGrid grid_;
};

}  // namespace gridbay
