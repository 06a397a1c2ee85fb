#pragma once

#include <cstdint>
#include <vector>

#include "pages/cell_grid.h"
#include "structures/dike.h"

namespace gridbay {

// One row for each dike. The dike of the current row is the selected one.
class CDikeGrid final : public ColumnGrid {
 public:
  // Null where none is selected.
  CNhdDikeObjectKvs* selected();
  void Unselect() { current_ = 0; }

  void OnCurrentRow(int row) override;
  std::optional<int> CurrentRow() override { return current_; }

 private:
  void LayOut() override;
  std::string CornerHeader() override { return "No"; }
  int RowHeaderWidth() override { return 40; }
  Stored storeCell(int row, int col, std::string_view text) override;

  int current_ = 0;
};

// One row for each point of the selected dike.
class CPointGrid final : public ColumnGrid {
 public:
  explicit CPointGrid(CDikeGrid& dikes) : dikes_(dikes) {}

 private:
  void LayOut() override;
  std::string CornerHeader() override { return "No"; }
  int RowHeaderWidth() override { return 40; }
  Stored storeCell(int row, int col, std::string_view text) override;
  Column& coordinate(std::string_view header, int width, double DikePoint::*member, int quantity);

  CDikeGrid& dikes_;
};

// The dikes, and the crest level file and the points of the one that is selected.
class CNHdDikeDlg final : public Page<18710, PageId::dikes> {
 public:
  static constexpr int kMostDikes = 1000;
  static constexpr int kMostPoints = 1000;  // an import may bring more

  using Page::Page;

 private:
  void DoDataExchange(Form& form) override;

  FileChoice crestLevelFile();
  std::string itemText();
  void viewFile();
  void importPoints();

  CDikeGrid dikes_;
  CPointGrid points_{dikes_};
  std::vector<std::uint32_t> items_;  // of the crest level file, while it is being chosen
};

}  // namespace gridbay
