// A dialog of fields and a grid over a copy, which is given back on OK.

#include "pages/dialog.h"

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_dialog_test {

using Points = std::vector<GridPoint>;

class PointGrid final : public ColumnGrid {
 public:
  explicit PointGrid(Points& points) : points_(points) {}

 private:
  void LayOut() override {
    Rows([this] { return static_cast<int>(points_.size()); });
    const auto point = [this](GridRow row) { return &points_[static_cast<std::size_t>(row.item) - 1]; };
    Integer("j", 60, point, &GridPoint::j);
    Integer("k", 60, point, &GridPoint::k);
  }
  Points& points_;
};

class PointDialog : public test::ShapeTest {
 protected:
  int show() {
    Points copy = points;
    PointGrid grid(copy);
    CV27SetupDialog dialog(document, "Point Selection");
    dialog.form().Count("Number of points",
                        {.get = [&copy] { return static_cast<std::int32_t>(copy.size()); },
                         .set = [&copy](std::int32_t n) { copy.resize(static_cast<std::size_t>(n)); }},
                        100);
    dialog.form().Grid("Points", grid);
    dialog.SetCheck([&copy] { return copy.empty() ? "There is no point" : ""; });
    if (dialog.DoModal() != 1) return 0;
    points = copy;
    return 1;
  }
  Points points{{1, 2}};
};

TEST_F(PointDialog, OKGivesTheCopyBack) {
  host.fillForm = [](Form& form) {
    Control& count = *form.find("Number of points");
    count.text = "2";
    form.act(count);
    form.spin(count, 1);
    CV27SetupGridWnd& grid = *form.find("Points")->grid;
    EXPECT_EQ(grid.GetRowCount(), 3);
    EXPECT_EQ(grid.StoreStyleRowCol(3, 2, "9"), 1);
    EXPECT_EQ(grid.StoreStyleRowCol(3, 1, "x"), 0);
    return true;
  };
  EXPECT_EQ(show(), 1);
  EXPECT_EQ(host.titles, Labels{"Point Selection"});
  EXPECT_EQ(points, (Points{{1, 2}, {0, 0}, {0, 9}}));
  EXPECT_FALSE(document.IsModified());  // that is for the page, which asked
}

TEST_F(PointDialog, CancelLeavesAllAsItWas) {
  host.fillForm = [](Form& form) {
    form.find("Points")->grid->StoreStyleRowCol(1, 1, "7");
    return false;
  };
  EXPECT_EQ(show(), 0);
  EXPECT_EQ(points, (Points{{1, 2}}));
}

TEST_F(PointDialog, WhatIsWrongIsToldOnOK) {
  host.fillForm = [](Form& form) {
    form.find("Number of points")->text = "many";
    return true;
  };
  EXPECT_EQ(show(), 0);
  EXPECT_EQ(host.formFault, "Number of points: \"many\" is not a number");
  host.fillForm = [](Form& form) {
    form.find("Number of points")->text = "0";
    return true;
  };
  EXPECT_EQ(show(), 0);
  EXPECT_EQ(host.formFault, "There is no point");
  EXPECT_EQ(points.size(), 1U);
}

}  // namespace pages_dialog_test
}  // namespace gridbay
