#pragma once

#include "pages/cell_grid.h"

namespace gridbay {

// One column for each polygon: its area, its number of corners, and the corners below.
class CMassBudgetGrid final : public CellGrid {
 public:
  int GetRowCount() override;
  int GetColCount() override;
  std::string GetColHeader(int col) override { return col == 0 ? "Polygon" : std::to_string(col); }
  std::string GetRowHeader(int row) override;
  int GetColWidth(int col) override { return col == 0 ? 130 : 70; }

 private:
  void LayOut() override;
  Place placeOf(int row, int col) override;
  std::string editName(int row, int col) override;
};

// The polygons of the mass budget, for a transport module with one of two schemes.
class CMassBudgetDlg final : public Page<18715, PageId::massBudget> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CMassBudgetGrid grid_;
};

}  // namespace gridbay
