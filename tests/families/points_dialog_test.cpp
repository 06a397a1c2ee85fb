// The choice of points and time steps, over copies.

#include "families/points_dialog.h"

#include <gmock/gmock.h>

#include "tests/support/pages.h"

namespace gridbay {
namespace families_points_dialog_test {

using Points = std::vector<double>;
using ::testing::IsEmpty;

class PointsDialog : public ::testing::Test {
 protected:
  using Labels = std::vector<std::string>;

  CPoints4Dlg dialog(const Points& j, const Points& k) {
    return {document, j, k, {.lastJ = 11, .lastK = 9, .lastStep = 100, .hasArea = true}, {0, 100, 1}};
  }
  static std::string cell(Form& form, int row, int col) {
    CellStyle style;
    EXPECT_EQ(form.find("Points")->grid->GetStyleRowCol(row, col, style), 1);
    return style.value;
  }
  static int store(Form& form, int row, int col, std::string_view text) {
    return form.find("Points")->grid->StoreStyleRowCol(row, col, text);
  }

  test::TestHost host;
  CV27SetupDoc document{host};
};

TEST_F(PointsDialog, ShowsPointsRangesAndSteps) {
  CPoints4Dlg points = dialog({1, 2.75}, {3, 4});
  host.fillForm = [](Form& form) {
    CV27SetupGridWnd& grid = *form.find("Points")->grid;
    EXPECT_EQ(form.find("Number of points")->text, "2");
    EXPECT_EQ(form.find("X-Range")->text, "0 - 11");
    EXPECT_EQ(form.find("Y-Range")->text, "0 - 9");
    EXPECT_EQ(form.find("Time Range")->text, "0 - 100");
    EXPECT_EQ(form.find("First:")->text, "0");
    EXPECT_EQ(form.find("Last:")->text, "100");
    EXPECT_EQ(form.find("Interval:")->text, "1");
    EXPECT_EQ(grid.GetColHeader(1), "j");
    EXPECT_EQ(grid.GetColHeader(2), "k");
    EXPECT_EQ(cell(form, 2, 1), "2");
    EXPECT_EQ(cell(form, 2, 2), "4");
    return true;
  };
  EXPECT_EQ(points.DoModal(), 1);
  EXPECT_EQ(host.titles, Labels{"Point Selection"});
  EXPECT_EQ(points.j(), (Points{1, 2}));
  EXPECT_EQ(points.k(), (Points{3, 4}));
}

TEST_F(PointsDialog, TheCountTakesFromTheTail) {
  CPoints4Dlg points = dialog({1, 2}, {3, 4});
  host.fillForm = [](Form& form) {
    Control& count = *form.find("Number of points");
    count.text = "4";
    form.act(count);
    EXPECT_EQ(cell(form, 4, 1), "0");
    form.spin(count, -1);
    for (const char* refused : {"101", "-1"}) {
      count.text = refused;
      form.act(count);
      EXPECT_EQ(form.find("Points")->grid->GetRowCount(), 3) << refused;
    }
    count.text = "100";
    form.act(count);
    form.spin(count, 1);
    EXPECT_EQ(form.find("Points")->grid->GetRowCount(), 100);
    count.text = "1";
    form.act(count);
    return true;
  };
  EXPECT_EQ(points.DoModal(), 1);
  EXPECT_EQ(points.j(), Points{1});
  EXPECT_EQ(points.k(), Points{3});
}

TEST_F(PointsDialog, CellsAreWholeNumbers) {
  CPoints4Dlg points = dialog({1}, {3});
  host.fillForm = [this](Form& form) {
    EXPECT_EQ(store(form, 1, 1, "7.9"), 1);
    EXPECT_EQ(cell(form, 1, 1), "7");
    EXPECT_EQ(store(form, 1, 1, "-2.5e0"), 1);
    EXPECT_EQ(cell(form, 1, 1), "-2");
    EXPECT_EQ(store(form, 1, 2, "1e99"), 1);
    EXPECT_EQ(cell(form, 1, 2), "2147483647");
    EXPECT_THAT(host.texts, IsEmpty());
    return true;
  };
  EXPECT_EQ(points.DoModal(), 1);
  EXPECT_EQ(points.j(), Points{-2});
}

TEST_F(PointsDialog, ATextThatIsNoNumberStaysInItsCell) {
  for (const char* bad : {"x", "3x", "1 2", "nan", "inf", "1,5"}) {
    host.texts.clear();
    CPoints4Dlg points = dialog({1}, {3});
    host.fillForm = [&](Form& form) {
      EXPECT_EQ(store(form, 1, 1, bad), 0);
      EXPECT_EQ(cell(form, 1, 1), bad);
      return true;
    };
    EXPECT_EQ(points.DoModal(), 0);
    EXPECT_EQ(host.texts, Labels{"Error: the value is not numeric"});
    EXPECT_EQ(host.formFault, "Point Selection:\n\n    Invalid coordinate");
    EXPECT_EQ(points.j(), Points{1});
  }
}

TEST_F(PointsDialog, AnEmptyCellIsAMissingCoordinate) {
  CPoints4Dlg points = dialog({1, 2}, {3, 4});
  host.fillForm = [](Form& form) {
    store(form, 1, 2, "");
    store(form, 2, 1, "x");  // reading does not come this far
    return true;
  };
  EXPECT_EQ(points.DoModal(), 0);
  EXPECT_EQ(host.formFault, "Point Selection:\n\n    Missing coordinate");
  EXPECT_EQ(points.k(), (Points{3, 4}));
}

TEST_F(PointsDialog, StepsAreReadBackOnOK) {
  CPoints4Dlg points = dialog({}, {});
  host.fillForm = [](Form& form) {
    form.find("First:")->text = "5";
    form.find("Last:")->text = "50";
    form.find("Interval:")->text = "3";
    return true;
  };
  EXPECT_EQ(points.DoModal(), 1);
  EXPECT_EQ(points.steps(), (USubLine{5, 50, 3}));
  EXPECT_THAT(points.j(), IsEmpty());
  host.fillForm = [](Form& form) {
    form.find("First:")->text = "9";
    return false;
  };
  EXPECT_EQ(points.DoModal(), 0);
  EXPECT_EQ(points.steps().first, 5);
  host.fillForm = [](Form& form) {
    form.find("First:")->text = "soon";
    return true;
  };
  EXPECT_EQ(points.DoModal(), 0);
  EXPECT_EQ(host.formFault, "First: \"soon\" is not a number");
}

TEST_F(PointsDialog, CoordinatesWithFractions) {
  CPoints4Dlg points = dialog({1.5}, {3});
  points.SetIntegerMode(false);
  points.SetDataRange(false);
  host.fillForm = [](Form& form) {
    EXPECT_EQ(form.find("Time Range"), nullptr);
    EXPECT_EQ(form.find("First:"), nullptr);
    EXPECT_EQ(form.find("Points")->grid->GetColHeader(1), "x");
    EXPECT_EQ(form.find("Points")->grid->GetColHeader(2), "y");
    EXPECT_EQ(cell(form, 1, 1), "1.5000");
    form.spin(*form.find("Number of points"), 1);
    EXPECT_EQ(cell(form, 2, 1), "0.0000");
    EXPECT_EQ(store(form, 2, 2, "2.25"), 1);
    EXPECT_EQ(cell(form, 2, 2), "2.25");
    return true;
  };
  EXPECT_EQ(points.DoModal(), 1);
  EXPECT_EQ(points.j(), (Points{1.5, 0}));
  EXPECT_EQ(points.k(), (Points{3, 2.25}));
}

TEST_F(PointsDialog, ListsOfUnequalLengthHaveThePointsOfTheShorter) {
  CPoints4Dlg points = dialog({1, 2, 3}, {3});
  host.fillForm = [](Form& form) { return form.find("Points")->grid->GetRowCount() == 1; };
  EXPECT_EQ(points.DoModal(), 1);
  EXPECT_EQ(points.j(), Points{1});
}

}  // namespace families_points_dialog_test
}  // namespace gridbay
