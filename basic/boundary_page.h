#pragma once

#include "pages/cell_grid.h"

namespace gridbay {

// One row for each boundary with its first and last point.
class CBoundaryGrid final : public ColumnGrid {
  void LayOut() override;
};

// The open boundaries: found along the border of Area 1, or given by the user. With "Program detected" each
// hand-over finds the boundaries anew, and resets the conditions at all of them.
class CBoundaryDlg final : public Page<18704, PageId::boundary> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CBoundaryGrid grid_;
};

}  // namespace gridbay
