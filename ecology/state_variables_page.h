#pragma once

#include <memory>

#include "ecology/model_definition_file.h"
#include "pages/cell_grid.h"

namespace gridbay {

// The state variables as the definition declares them; they are only read.
class CWQSStateVariablesGrid final : public ColumnGrid {
  std::string CornerHeader() override { return "ID"; }
  int RowHeaderWidth() override { return 40; }
  std::string RowHeader(GridRow row) override;
  void LayOut() override;

  const CSolverItem* variable(int number);
};

class CWQSStateVariablesDlg final : public Page<18950, PageId::ecoStateVariables> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("State variables", grid_); }

  CWQSStateVariablesGrid grid_;
};

}  // namespace gridbay
