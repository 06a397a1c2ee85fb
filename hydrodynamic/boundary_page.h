#pragma once

#include <string>
#include <vector>

#include "hydrodynamic/boundary.h"
#include "pages/cell_grid.h"

namespace gridbay {

// Six rows for each boundary.
class CNhdBoundaryGrid final : public BlockGrid {
 public:
  static constexpr int kRowsPerBoundary = 6;

  // The boundary and the row in its block (both from 1) of a row from 1.
  static int boundaryOf(int row) { return (row - 1) / kRowsPerBoundary + 1; }
  static int subRowOf(int row) { return (row - 1) % kRowsPerBoundary + 1; }

 private:
  std::vector<int> Widths() const override { return {160, 240, 30, 30}; }
  void LayOut() override;
  std::string editName(int row, int col) override;

  Column::Pick tiltingPick();
  void layOutData();
  std::string dataText(const CNhdBoundaryObjectKvs& object);
  Stored storeData(CNhdBoundaryObjectKvs& object, std::string_view text);
};

// The conditions at the open boundaries.
class CNhdBoundaryDlg final : public Page<18705, PageId::hdBoundary> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Boundary conditions", grid_); }

  CNhdBoundaryGrid grid_;
};

}  // namespace gridbay
