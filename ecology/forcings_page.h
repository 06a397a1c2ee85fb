#pragma once

#include "ecology/forcings.h"
#include "ecology/given_values_page.h"

namespace gridbay {

// A row for each forcing.
class CWQSForcingsGridDlg final : public GivenGrid<ColumnGrid> {
  void LayOut() override;
};

class CWQSForcingsDlg final : public Page<18944, PageId::ecoForcings> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Forcings", grid_); }

  CWQSForcingsGridDlg grid_;
};

}  // namespace gridbay
