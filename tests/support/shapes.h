#pragma once

#include <functional>
#include <memory>
#include <string>
#include <utility>

#include "pages/cell_grid.h"
#include "tests/support/pages.h"

namespace gridbay::test {

// A page whose controls a test lists itself, on an object of its own.
class OwnPage final : public CV27SetupFormView {
 public:
  using List = std::function<void(OwnPage&, Form&)>;

  OwnPage(CVdDoc& document, List list)
      : CV27SetupFormView(document, 1, PageId::bathymetry), list_(std::move(list)) {}
  using CV27SetupFormView::AddFile;

  int left = 0;
  void OnLeave() override { ++left; }

 private:
  void DoDataExchange(Form& form) override { list_(*this, form); }

  List list_;
};

// A test with one such page.
class ShapeTest : public PageTest {
 protected:
  void open(OwnPage::List list) {
    page = std::make_unique<OwnPage>(document, std::move(list));
    page->OnInitialUpdate();
  }
  CV27SetupGridWnd& grid(std::string_view label) { return *control(label).grid; }
  static CellStyle styleIn(CV27SetupGridWnd& grid, int row, int col) {
    CellStyle it;
    EXPECT_EQ(grid.GetStyleRowCol(row, col, it), 1) << row << ", " << col;
    return it;
  }
  static std::string textIn(CV27SetupGridWnd& grid, int row, int col) {
    return styleIn(grid, row, col).value;
  }
  // The texts of a row.
  static std::vector<std::string> rowOf(CV27SetupGridWnd& grid, int row) {
    std::vector<std::string> texts;
    for (int col = 1; col <= grid.GetColCount(); ++col) texts.push_back(textIn(grid, row, col));
    return texts;
  }
  // Which cells of a row take a value or a press, as "x.x".
  static std::string usableOf(CV27SetupGridWnd& grid, int row) {
    std::string usable;
    for (int col = 1; col <= grid.GetColCount(); ++col) {
      const CellStyle it = styleIn(grid, row, col);
      usable += it.editable() || (it.kind == CellKind::button && it.enabled) ? 'x' : '.';
    }
    return usable;
  }
};

}  // namespace gridbay::test
