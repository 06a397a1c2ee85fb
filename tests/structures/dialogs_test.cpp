// The dialogs of a structure's table and polyline.

#include <gmock/gmock.h>

#include "structures/level_width_dialog.h"
#include "structures/point_import_dialog.h"
#include "structures/weir.h"
#include "structures/weir_formula3_dialog.h"
#include "tests/support/shapes.h"

namespace gridbay {
namespace structures_dialogs_test {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class StructureDialogs : public test::ShapeTest {
 protected:
  int editTable() {
    CLWStructureDlg dialog(document, level, width);
    if (dialog.DoModal() != 1) return 0;
    dialog.OnOK(level, width);
    return 1;
  }
  int editPoints() {
    CPointImportDlg dialog(document, "UTM-32", x, y);
    if (dialog.DoModal() != 1) return 0;
    dialog.OnOK(x, y);
    return 1;
  }
  std::vector<float> level{1, 2};
  std::vector<float> width{10, 20};
  std::vector<double> x{400000.5, 400100};
  std::vector<double> y{6000000, 6000100};
};

TEST_F(StructureDialogs, ATableOfLevelsAndWidths) {
  host.fillForm = [](Form& form) {
    EXPECT_EQ(form.controls().size(), 2U);
    EXPECT_EQ(form.find("Number of measures")->text, "2");
    CV27SetupGridWnd& grid = *form.find("Measures")->grid;
    EXPECT_EQ(grid.GetRowCount(), 2);
    EXPECT_EQ(grid.GetColCount(), 2);
    EXPECT_EQ(grid.GetColHeader(1), "Level");
    EXPECT_EQ(grid.GetColHeader(2), "Width");
    EXPECT_EQ(grid.GetColWidth(1), 90);
    EXPECT_EQ(grid.GetColWidth(2), 90);
    for (const int col : {1, 2}) EXPECT_EQ(styleIn(grid, 1, col).toolTip, "Level [m]");
    EXPECT_EQ(rowOf(grid, 2), (Labels{"2.000000", "20.000000"}));
    form.spin(*form.find("Number of measures"), 1);
    EXPECT_EQ(rowOf(grid, 3), (Labels{"0.000000", "0.000000"}));
    EXPECT_EQ(grid.StoreStyleRowCol(3, 1, "3.5"), 1);
    EXPECT_EQ(grid.StoreStyleRowCol(3, 2, "wide"), 0);
    EXPECT_EQ(grid.StoreStyleRowCol(1, 2, "12.5"), 1);
    return true;
  };
  EXPECT_EQ(editTable(), 1);
  EXPECT_EQ(host.titles, Labels{"Level-width"});
  EXPECT_THAT(level, ElementsAre(1, 2, 3.5F));
  EXPECT_THAT(width, ElementsAre(12.5F, 20, 0));
}

TEST_F(StructureDialogs, CancelLeavesTheTableAlone) {
  host.fillForm = [](Form& form) {
    form.spin(*form.find("Number of measures"), -1);
    form.find("Measures")->grid->StoreStyleRowCol(1, 1, "7");
    return false;
  };
  EXPECT_EQ(editTable(), 0);
  EXPECT_THAT(level, ElementsAre(1, 2));
  EXPECT_THAT(width, ElementsAre(10, 20));
}

TEST_F(StructureDialogs, ACountHasItsLimits) {
  host.fillForm = [](Form& form) {
    Control& count = *form.find("Number of measures");
    for (const char* text : {"1001", "-1"}) {
      count.text = text;
      form.act(count);
      EXPECT_EQ(form.find("Measures")->grid->GetRowCount(), 2) << text;
    }
    count.text = "1000";
    form.act(count);
    form.spin(count, 1);
    EXPECT_EQ(form.find("Measures")->grid->GetRowCount(), 1000);
    count.text = "0";
    form.act(count);
    form.spin(count, -1);
    EXPECT_EQ(form.find("Measures")->grid->GetRowCount(), 0);
    return true;
  };
  EXPECT_EQ(editTable(), 1);
  EXPECT_THAT(level, IsEmpty());
  EXPECT_THAT(width, IsEmpty());
}

TEST_F(StructureDialogs, PointsOfAPolyline) {
  host.fillForm = [](Form& form) {
    EXPECT_EQ(form.find("Number of points")->text, "2");
    CV27SetupGridWnd& grid = *form.find("Points")->grid;
    EXPECT_EQ(grid.GetColHeader(1), "X");
    EXPECT_EQ(grid.GetColHeader(2), "Y");
    EXPECT_EQ(grid.GetColWidth(1), 90);
    EXPECT_EQ(grid.GetColWidth(2), 90);
    for (const int col : {1, 2}) EXPECT_EQ(styleIn(grid, 1, col).toolTip, "Geographical coordinate [m]");
    EXPECT_EQ(rowOf(grid, 1), (Labels{"400000.500000", "6000000.000000"}));
    form.spin(*form.find("Number of points"), 1);
    EXPECT_EQ(rowOf(grid, 3), (Labels{"0.000000", "0.000000"}));
    EXPECT_EQ(grid.StoreStyleRowCol(3, 2, "6000200.25"), 1);
    return true;
  };
  EXPECT_EQ(editPoints(), 1);
  EXPECT_EQ(host.titles, Labels{"Point Selection"});
  EXPECT_THAT(x, ElementsAre(400000.5, 400100, 0));
  EXPECT_THAT(y, ElementsAre(6000000, 6000100, 6000200.25));
  host.fillForm = [](Form& form) {
    form.spin(*form.find("Number of points"), -1);
    return false;
  };
  EXPECT_EQ(editPoints(), 0);
  EXPECT_EQ(x.size(), 3U);
}

TEST_F(StructureDialogs, ACoordinateThatIsMissingIsShownAsZero) {
  y.pop_back();
  host.fillForm = [](Form& form) {
    EXPECT_EQ(rowOf(*form.find("Points")->grid, 2), (Labels{"400100.000000", "0.000000"}));
    return true;
  };
  EXPECT_EQ(editPoints(), 1);
  EXPECT_THAT(y, ElementsAre(6000000, 0));
}

TEST_F(StructureDialogs, AreInTheUsersUnit) {
  document.units().setSystem(UnitSystem::us);
  host.fillForm = [](Form& form) {
    CV27SetupGridWnd& grid = *form.find("Points")->grid;
    EXPECT_EQ(styleIn(grid, 1, 1).toolTip, "Geographical coordinate [ft]");
    EXPECT_EQ(grid.StoreStyleRowCol(1, 1, "10"), 1);
    return true;
  };
  EXPECT_EQ(editPoints(), 1);
  EXPECT_DOUBLE_EQ(x[0], 3.048);
  EXPECT_EQ(x[1], 400100);  // what is not edited keeps its digits
}

TEST_F(StructureDialogs, TheParametersOfWeirFormula3) {
  CNhdWeirObjectKvs weir(nullptr);
  host.fillForm = [](Form& form) {
    Labels labels;
    Labels texts;
    for (const Control& control : form.controls()) {
      labels.push_back(control.label);
      texts.push_back(control.text);
    }
    EXPECT_EQ(labels, (Labels{"Width", "Height", "Crest level", "(hd/hu)i", "a", "b", "p", "Alpha", "Beta",
                              "q", "Gamma", "Delta", "r", "(hd/hu)s", "", "", ""}));
    EXPECT_EQ(texts[4], "1.02");
    EXPECT_EQ(texts[14], "C0 = a(h1/W)^p + b");
    EXPECT_EQ(texts[15], "C = C0 ( Al (h2/h1)^q + Be)");
    EXPECT_EQ(texts[16], "C = C0 ( Ga (h2/h1)^r + De)");
    Control& edited = *form.find("Width");
    edited.text = "12.5";
    form.act(edited);
    return true;
  };
  WeirFormula3Dialog dialog(document, weir.formula3);
  ASSERT_EQ(dialog.DoModal(), 1);
  EXPECT_EQ(weir.formula3[0], 0);
  dialog.OnOK(weir.formula3);
  EXPECT_EQ(host.titles, Labels{"Weir Formula 3 (Extended Honma) Parameters"});
  EXPECT_THAT(weir.formula3, ElementsAre(12.5, 0, 0, 0.6, 1.02, 1.37, 1, 0.03, 1.018, 1, 0, 2.6, 1, 0.7));
}

}  // namespace structures_dialogs_test
}  // namespace gridbay
