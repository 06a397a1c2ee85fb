#include "hydrodynamic/boundary_page.h"

#include <gmock/gmock.h>

#include "basic/boundary.h"
#include "tests/support/grids.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_boundary_page_test {

using ::testing::HasSubstr;

class HdBoundaryPage : public test::PageTest {
 protected:
  HdBoundaryPage() {
    root().boundary->SetNoBoundaries(2);
    root().boundary->GetItem(2)->Set(0, 5, 0, 9);
    open("CNhdBoundaryDlg");
  }
  // Rows of the second boundary's block.
  static int row(int subRow) { return 6 + subRow; }
  CNhdBoundaryObjectKvs& object() { return *root().nhdBoundary->GetItem(2); }
  test::TemporaryFolder folder;
};

TEST_F(HdBoundaryPage, ABlockOfSixRowsForEachBoundary) {
  EXPECT_EQ(grid().GetRowCount(), 12);
  EXPECT_EQ(widths(), (std::vector<int>{0, 160, 240, 30, 30}));
  EXPECT_FALSE(grid().ShowsHeaders());
  EXPECT_EQ(CNhdBoundaryGrid::boundaryOf(6), 1);
  EXPECT_EQ(CNhdBoundaryGrid::boundaryOf(7), 2);
  EXPECT_EQ(CNhdBoundaryGrid::subRowOf(12), 6);
  EXPECT_EQ(cell(1, 1), "Boundary  1 : (0,0) - (0,0)");
  EXPECT_EQ(cell(row(1), 1), "Boundary  2 : (0,5) - (0,9)");
  EXPECT_EQ(cell(row(2), 1), "Formulation:");
  EXPECT_EQ(cell(row(2), 2), "Level");
  EXPECT_EQ(style(row(2), 2).choices, (Labels{"Level", "Flux"}));
  EXPECT_EQ(cell(row(3), 1), "Constant:");
  EXPECT_EQ(cell(row(3), 2), "0.000000");
  EXPECT_EQ(style(row(3), 2).align, CellAlign::right);
  EXPECT_EQ(cell(row(4), 1), "FAB type:");
  EXPECT_EQ(cell(row(4), 2), "12");
  EXPECT_EQ(style(row(4), 2).choices, (Labels{"0", "1", "2", "12"}));
  EXPECT_EQ(cell(row(5), 1), "No tilting");
  EXPECT_EQ(cell(row(5), 2), "0");
  EXPECT_FALSE(style(row(5), 2).enabled);
  EXPECT_EQ(cell(row(6), 1), "No user defined flow direction");
  EXPECT_TRUE(style(row(6), 2).enabled);
  EXPECT_FALSE(style(row(6), 3).enabled);
  EXPECT_FALSE(style(row(6), 4).enabled);
  CellStyle none;
  EXPECT_EQ(grid().GetStyleRowCol(13, 1, none), 0);
}

TEST_F(HdBoundaryPage, DataFormatsOfAFormulation) {
  const Labels level{
      "Constant:", "Sine Series:", "Type 0 data file:", "Type 1 Data file:", "Transfer Data File:"};
  Labels flux = level;
  flux.push_back("Rating curve");
  EXPECT_EQ(style(row(3), 1).choices, level);
  EXPECT_EQ(store(row(3), 1, "Rating curve"), 0);
  EXPECT_EQ(store(row(2), 2, "Flux"), 1);
  EXPECT_EQ(style(row(3), 1).choices, flux);
  EXPECT_EQ(store(row(3), 1, "Rating curve"), 1);
  EXPECT_EQ(object().dataFormat, 7);
  EXPECT_EQ(store(row(2), 2, "Level"), 1);
  EXPECT_EQ(object().dataFormat, 7);  // stays
  EXPECT_EQ(store(row(3), 1, "Transfer Data File:"), 1);
  EXPECT_EQ(object().fabType, 2);
  EXPECT_EQ(store(row(3), 1, "Constant:"), 1);
  EXPECT_EQ(object().fabType, 12);
}

TEST_F(HdBoundaryPage, ToolTipsNameTheUnit) {
  const auto tip = [this] { return style(row(3), 2).toolTip; };
  EXPECT_EQ(tip(), "Water level [m]");
  object().dataFormat = 5;
  EXPECT_EQ(tip(), "Flow flux [m²/s]");
  object().formulation = 2;
  EXPECT_EQ(tip(), "Flow flux [m²/s]");
  object().dataFormat = 3;
  EXPECT_EQ(tip(), "Discharge [m³/s]");
  object().dataFormat = 7;
  EXPECT_EQ(tip(), "Undefined [-]");
}

TEST_F(HdBoundaryPage, AConstantIsConverted) {
  EXPECT_EQ(store(row(3), 2, "1.5"), 1);
  EXPECT_EQ(object().value, 1.5F);
  document.units().setSystem(UnitSystem::us);
  EXPECT_EQ(store(row(3), 2, "10"), 1);
  EXPECT_EQ(object().value, 3.048F);
  EXPECT_EQ(cell(row(3), 2), "10.000000");
  EXPECT_EQ(store(row(3), 2, "deep"), 0);
  EXPECT_EQ(object().value, 3.048F);
}

TEST_F(HdBoundaryPage, ASineSeriesIsAText) {
  store(row(3), 1, "Sine Series:");
  EXPECT_EQ(cell(row(3), 2), "0.5000 sin( 2 pi (t - 0.0000)/43200 )  + 0.0000");
  EXPECT_EQ(store(row(3), 2, "0.75 sin( 2 pi (t - 60)/44700 )  + 0.25"), 1);
  EXPECT_EQ(object().range, 1.5F);
  EXPECT_EQ(object().phase, 60.0F);
  EXPECT_EQ(object().period, 44700.0F);
  EXPECT_EQ(object().referenceLevel, 0.25F);
  // Fewer fields refuse the edit, but those that were read are stored.
  EXPECT_EQ(store(row(3), 2, "1 sin( 2 pi (t - 30)"), 0);
  EXPECT_EQ(object().range, 2.0F);
  EXPECT_EQ(object().phase, 30.0F);
  EXPECT_EQ(object().period, 44700.0F);
  EXPECT_EQ(object().referenceLevel, 0.0F);
  EXPECT_EQ(store(row(3), 2, "abc"), 0);
  EXPECT_EQ(object().range, 0.0F);
}

TEST_F(HdBoundaryPage, TheSineDialog) {
  store(row(3), 1, "Sine Series:");
  host.fillForm = [](Form& form) {
    form.find("Reference level:")->text = "1";
    form.find("Range")->text = "2";
    form.find("Period")->text = "3";
    form.find("Phase")->text = "4";
    return true;
  };
  grid().OnClickedButtonRowCol(row(3), 3);
  EXPECT_EQ(host.titles, Labels{"Edit Sine Series Boundary Parameters"});
  EXPECT_EQ(object().referenceLevel, 1.0F);
  EXPECT_EQ(object().range, 2.0F);
  EXPECT_EQ(object().period, 3.0F);
  EXPECT_EQ(object().phase, 4.0F);
  host.fillForm = [](Form& form) {
    form.find("Range")->text = "9";
    return false;
  };
  grid().OnClickedButtonRowCol(row(3), 3);
  EXPECT_EQ(object().range, 2.0F);
}

TEST_F(HdBoundaryPage, FilesAreChosenByFormat) {
  EXPECT_FALSE(style(row(3), 3).enabled);
  host.chosenFile = folder.write("f.tsb0", "");
  host.chosenItems = {4, 5};
  store(row(2), 2, "Flux");
  for (const char* format :
       {"Type 0 data file:", "Type 1 Data file:", "Transfer Data File:", "Rating curve"}) {
    store(row(3), 1, format);
    grid().OnClickedButtonRowCol(row(3), 3);
  }
  EXPECT_EQ(host.filters, (Labels{"Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                                  "Profile (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||",
                                  "Profile (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||",
                                  "Rating curve (*.tsb0)|*.tsb0|All Files (*.*)|*.*||"}));
  EXPECT_EQ(object().dataFile.fileName.text(), *host.chosenFile);
  EXPECT_EQ(object().dataFile.items, std::vector<std::uint32_t>{4});
  EXPECT_EQ(cell(row(3), 2), *host.chosenFile);
  EXPECT_EQ(style(row(3), 2).align, CellAlign::left);
  grid().OnClickedButtonRowCol(row(3), 4);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
  EXPECT_EQ(store(row(3), 2, "none.tsb0"), 1);
  EXPECT_FALSE(style(row(3), 4).enabled);
}

TEST_F(HdBoundaryPage, TiltingAndDirections) {
  EXPECT_EQ(store(row(5), 2, "7"), 0);
  EXPECT_EQ(store(row(5), 1, "Linear tilting about:"), 1);
  EXPECT_EQ(object().tiltType, 1);
  EXPECT_EQ(store(row(5), 2, "7"), 1);
  EXPECT_EQ(object().tiltingPoint, 7);
  EXPECT_EQ(store(row(5), 2, "x"), 0);
  EXPECT_EQ(store(row(5), 1, "Non-linear tilting about:"), 1);
  EXPECT_EQ(object().tiltType, 0);
  EXPECT_EQ(store(row(6), 1, "Flow direction from file:"), 1);
  EXPECT_TRUE(object().enableUserDirections);
  host.chosenFile = folder.write("d.tsb1", "");
  grid().OnClickedButtonRowCol(row(6), 3);
  EXPECT_EQ(host.filters, Labels{"Flow Direction (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"});
  EXPECT_EQ(cell(row(6), 2), *host.chosenFile);
  grid().OnClickedButtonRowCol(row(6), 4);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

TEST_F(HdBoundaryPage, AConstantThatIsNoFiniteNumberIsRefused) {
  for (const char* bad : {"1e60", "nan", "inf", ""}) EXPECT_EQ(store(row(3), 2, bad), 0) << bad;
  EXPECT_EQ(object().value, 0.0F);
}

TEST_F(HdBoundaryPage, BlocksAreMarkedOff) {
  for (int n = 1; n <= 12; ++n) EXPECT_EQ(grid().GetRowLook(n).lineBelow, n % 6 == 0) << n;
}

TEST_F(HdBoundaryPage, ASineTextThatIsRefusedIsAnEditAllTheSame) {
  object().SetDataFormat(CNhdBoundaryObjectKvs::kSineSeries);
  document.RecordEdit(PageId::hdBoundary, "before");
  document.SetModifiedFlag(false);
  EXPECT_EQ(store(row(3), 2, "abc"), 0);
  EXPECT_EQ(object().range, 0.0F);
  EXPECT_TRUE(document.IsModified());
  EXPECT_EQ(document.UndoStep()->name, "Boundary 2, data");
  document.Undo();
  EXPECT_EQ(object().range, 1.0F);
  store(row(2), 2, "Level");
  document.SetModifiedFlag(false);
  object().SetDataFormat(CNhdBoundaryObjectKvs::kConstant);
  EXPECT_EQ(store(row(3), 2, "abc"), 0);
  EXPECT_FALSE(document.IsModified());
}

TEST_F(HdBoundaryPage, ADirectionFileCanBeNamedBeforeItIsSwitchedOn) {
  EXPECT_EQ(store(row(6), 2, "d.tsb1"), 1);
  EXPECT_EQ(object().directionFile.fileName.text(), "d.tsb1");
  EXPECT_FALSE(style(row(6), 3).enabled);
}

TEST_F(HdBoundaryPage, AStoredFabType3ShowsAsTheFourthChoice) {
  object().fabType = 3;
  EXPECT_EQ(cell(row(4), 2), "12");
  EXPECT_EQ(store(row(4), 2, "1"), 1);
  EXPECT_EQ(object().fabType, 1);
}

}  // namespace hydrodynamic_boundary_page_test
}  // namespace gridbay
