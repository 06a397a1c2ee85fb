#pragma once

#include <string>
#include <vector>

#include "pages/cell_grid.h"

namespace gridbay {

// One row for each area: its grid file and where it lies.
class CBathymetryGrid final : public ColumnGrid {
  void LayOut() override;
  void OnArea1FileChanged();
  void ResetDispersion();
};

// The areas, the start, the projection and the overland solver.
class CBathymetryDlg final : public Page<18703, PageId::bathymetry> {
 public:
  using Page::Page;
  void SetData() override;

 private:
  void DoDataExchange(Form& form) override;
  FileChoice overlandFile();

  std::vector<std::string> projections_;  // the one that holds, and those that can be picked in its place
  bool hasProjection_ = false;
  CBathymetryGrid grid_;
};

}  // namespace gridbay
