#pragma once

#include "pages/cell_grid.h"

namespace gridbay {

// One row for each component: its name and type.
class CNadComponentGrid final : public ColumnGrid {
  void LayOut() override;
};

// The components. With a hot start its file tells them, and they are only shown.
class CNadComponentDlg final : public Page<18720, PageId::adComponent> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNadComponentGrid grid_;
};

}  // namespace gridbay
