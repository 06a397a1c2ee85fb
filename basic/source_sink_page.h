#pragma once

#include "pages/cell_grid.h"

namespace gridbay {

// One row for each source or sink, below a second row of headers.
class CSourceSinkGrid final : public ColumnGrid {
  void LayOut() override;
};

// Where water enters or leaves the model.
class CSourceSinkDlg final : public Page<18929, PageId::sourceAndSink> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CSourceSinkGrid grid_;
};

}  // namespace gridbay
