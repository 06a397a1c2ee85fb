#pragma once

#include "pages/cell_grid.h"
#include "pages/form_view.h"

namespace gridbay {

// A row for each map, with the wind speed, water level and wind direction that it is for.
class CNmtExpWaveDatabaseGrid final : public ColumnGrid {
  void LayOut() override;
};

// The axes of the database, and its maps.
class CNmtExpWaveDatabaseDlg final : public Page<18869, PageId::mtExpWaveDatabase> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
  void tellZeroIncrement();

  CNmtExpWaveDatabaseGrid grid_;
};

}  // namespace gridbay
