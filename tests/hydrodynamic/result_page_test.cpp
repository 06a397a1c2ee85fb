#include "hydrodynamic/result_page.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/resistance.h"
#include "tests/support/grids.h"
#include "tests/support/pages.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_result_page_test {

using Points = std::vector<double>;
using Items = std::vector<std::int32_t>;

class ResultPage : public test::ShapeTest {
 protected:
  using PageTest::grid;
  using ShapeTest::grid;
  enum Column { kType = 1, kArea, kJ, kK, kTime, kPart, kFile, kBrowse, kTitle, kItems, kView };

  ResultPage() {
    root().bathymetry->GetArea(1)->noJ = 12;
    root().bathymetry->GetArea(1)->noK = 10;
    results().outputs.SetCount(1);
    document.RecordEdit(PageId::hdResult, "before");
    PageTest::open("CResultDlg");
  }
  CNhdResultKvs& results() { return *root().nhdResult; }
  CNhdResultObjectKvs& output(int number = 1) { return results().outputs.at(number); }
  CV27SetupGridWnd& hotStarts() { return ShapeTest::grid("Hot start files"); }
  std::string undoName() { return document.UndoStep() == nullptr ? "" : document.UndoStep()->name; }

  test::TemporaryFolder folder;
};

TEST_F(ResultPage, Controls) {
  EXPECT_EQ(page->templateId(), 18921);
  EXPECT_EQ(page->pageId(), PageId::hdResult);
  EXPECT_EQ(labels(),
            (Labels{"Number of Output Areas", "Size of HD output", "Size of total output", "Output areas",
                    "Generate hot start", "Hot start files", "Calculation of inundation statistics",
                    "Inundation file", "...", "View...", "Update frequency",
                    "Include duration above threshold depth item", "Threshold depth"}));
}

TEST_F(ResultPage, TheCountResizesTheList) {
  edit("Number of Output Areas", "3");
  EXPECT_EQ(results().outputs.GetCount(), 3);
  EXPECT_EQ(grid().GetRowCount(), 3);
  EXPECT_EQ(output(3).part.x.last, 11);
  output(2).title = "two";
  spin("Number of Output Areas", -1);
  EXPECT_EQ(results().outputs.GetCount(), 2);
  EXPECT_EQ(text("Number of Output Areas"), "2");
  EXPECT_EQ(output(2).title, "two");
  for (const char* refused : {"-1", "19", "x"}) {
    edit("Number of Output Areas", refused);
    EXPECT_EQ(results().outputs.GetCount(), 2) << refused;
  }
  edit("Number of Output Areas", "18");
  spin("Number of Output Areas", 1);
  EXPECT_EQ(results().outputs.GetCount(), 18);
  edit("Number of Output Areas", "0");
  spin("Number of Output Areas", -1);
  EXPECT_EQ(results().outputs.GetCount(), 0);
}

TEST_F(ResultPage, MoreOutputsThanThePageOffersMayGo) {
  results().outputs.SetCount(25);
  page->SetData();
  EXPECT_EQ(text("Number of Output Areas"), "25");
  edit("Number of Output Areas", "20");
  EXPECT_EQ(results().outputs.GetCount(), 20);
  edit("Number of Output Areas", "21");
  EXPECT_EQ(results().outputs.GetCount(), 20);
}

TEST_F(ResultPage, SizesFollowEachEdit) {
  EXPECT_EQ(text("Size of HD output"), "0.14 MB");
  EXPECT_EQ(text("Size of total output"), "0.14 MB");
  store(1, kTime, "0-1000,1");
  EXPECT_EQ(text("Size of HD output"), "1.38 MB");
  spin("Number of Output Areas", -1);
  EXPECT_EQ(text("Size of HD output"), "0.00 MB");
}

TEST_F(ResultPage, TheCaptionOfHotStartsHasTheirSize) {
  root().bathymetry->GetArea(1)->grid = CVdArray2D<float>(199, 99);
  Control& box = control("Generate hot start");
  choose("Generate hot start", 1);
  EXPECT_TRUE(results().generateHotStart);
  EXPECT_EQ(box.label, "Generate hot start (size of output: 0.61 MB)");
  EXPECT_EQ(text("Size of total output"), "0.75 MB");
  box.index = 0;
  page->form().act(box);
  EXPECT_FALSE(results().generateHotStart);
  EXPECT_EQ(box.label, "Generate hot start");
}

TEST_F(ResultPage, ARowForEachOutput) {
  EXPECT_EQ(headers(), (Labels{"", "Type", "Area", "J", "K", "Time", "", "Data File", "...", "Title",
                               "Output Items", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{30, 45, 45, 60, 60, 60, 20, 160, 20, 120, 140, 45}));
  EXPECT_EQ(rowOf(grid(), 1),
            (Labels{"2", "1", "0-11,1", "0-9,1", "0-100,1", "...", "", "...", "", "7", "View..."}));
  EXPECT_EQ(usableOf(grid(), 1), "x.xxxxxxxx.");
  EXPECT_TRUE(style(1, kArea).isGrey);
  EXPECT_EQ(store(1, kArea, "2"), 0);
  EXPECT_EQ(style(1, kType).choices, (Labels{"0", "1", "2"}));
  EXPECT_EQ(style(1, kItems).kind, CellKind::multiChoice);
  EXPECT_EQ(style(1, kItems).toolTip, "Output items\n");
}

TEST_F(ResultPage, TypeIsANumber) {
  EXPECT_EQ(store(1, kType, "1"), 1);
  EXPECT_EQ(output().type, 1);
  EXPECT_EQ(undoName(), "Type, row 1");
  for (const char* refused : {"3", "-1", "x"}) EXPECT_EQ(store(1, kType, refused), 0) << refused;
  output().type = -1;
  EXPECT_EQ(cell(1, kType), "-1");
  EXPECT_EQ(cell(1, kJ), "0-11,1");
}

TEST_F(ResultPage, RangesOfMapsAndLines) {
  EXPECT_EQ(store(1, kJ, "2-8,3"), 1);
  EXPECT_EQ(output().part.x, (USubLine{2, 8, 3}));
  EXPECT_EQ(store(1, kK, "4-4"), 1);
  EXPECT_EQ(output().part.y, (USubLine{4, 4, 1}));
  EXPECT_EQ(store(1, kTime, "10-90,20"), 1);
  EXPECT_EQ(output().steps, (USubLine{10, 90, 20}));
  for (const int col : {kJ, kK, kTime}) {
    for (const char* refused : {"", "7", "a-b", "7,8"}) EXPECT_EQ(store(1, col, refused), 0) << refused;
  }
  EXPECT_EQ(output().part, (USubArea{{2, 8, 3}, {4, 4, 1}}));
}

TEST_F(ResultPage, ListsOfPoints) {
  store(1, kType, "0");
  EXPECT_EQ(cell(1, kJ), "0");
  EXPECT_EQ(store(1, kJ, " 1, 2.6 ,3"), 1);
  EXPECT_EQ(output().pointsJ, (Points{1, 2.6, 3}));
  EXPECT_EQ(output().pointsK, (Points{0, 0, 0}));
  EXPECT_EQ(cell(1, kJ), "1,3,3");
  EXPECT_EQ(store(1, kJ, "1,3,3"), 1);
  EXPECT_EQ(output().pointsJ, (Points{1, 2.6, 3})) << "what is stored as it is shown keeps its digits";
  EXPECT_EQ(store(1, kK, "5,6,7,8"), 1);
  EXPECT_EQ(output().pointsJ, (Points{1, 2.6, 3, 0}));
  EXPECT_EQ(store(1, kJ, "4"), 1);
  EXPECT_EQ(output().pointsK, (Points{5, 6, 7, 8}));
  EXPECT_EQ(cell(1, kK), "5") << "as many as there are points";
  for (const char* refused : {"1,x", "1,,2", ",", "x"}) EXPECT_EQ(store(1, kJ, refused), 0) << refused;
  EXPECT_EQ(store(1, kJ, ""), 1);
  EXPECT_EQ(output().PointCount(), 0);
  EXPECT_EQ(cell(1, kJ), "");
}

TEST_F(ResultPage, ThePartOfAMapIsChosenInADialog) {
  host.fillForm = [](Form& form) {
    EXPECT_NE(form.find("X direction (0 to 11)"), nullptr);
    EXPECT_NE(form.find("Y direction (0 to 9)"), nullptr);
    EXPECT_NE(form.find("Time steps (0 to 100)"), nullptr);
    int place = 0;
    for (Control& control : form.controls()) {
      if (control.kind == ControlKind::text) control.text = std::to_string(1 + place++ % 3);
    }
    return true;
  };
  grid().OnClickedButtonRowCol(1, kPart);
  EXPECT_EQ(output().part, (USubArea{{1, 2, 3}, {1, 2, 3}}));
  EXPECT_EQ(output().steps, (USubLine{1, 2, 3}));
  EXPECT_EQ(undoName(), "Output areas");
  document.Undo();
  EXPECT_EQ(output().part.x, (USubLine{0, 11, 1}));
}

TEST_F(ResultPage, ThePointsOfASeriesAreChosenInADialog) {
  store(1, kType, "0");
  host.fillForm = [](Form& form) {
    EXPECT_EQ(form.find("X-Range")->text, "0 - 11");
    EXPECT_EQ(form.find("Y-Range")->text, "0 - 9");
    EXPECT_EQ(form.find("Time Range")->text, "0 - 100");
    form.spin(*form.find("Number of points"), 1);
    form.find("Points")->grid->StoreStyleRowCol(2, 1, "7");
    form.find("Points")->grid->StoreStyleRowCol(2, 2, "8");
    form.find("Last:")->text = "50";
    return true;
  };
  grid().OnClickedButtonRowCol(1, kPart);
  EXPECT_EQ(host.titles, Labels{"Point Selection"});
  EXPECT_EQ(output().pointsJ, (Points{0, 7}));
  EXPECT_EQ(output().pointsK, (Points{0, 8}));
  EXPECT_EQ(output().steps, (USubLine{0, 50, 1}));
  EXPECT_EQ(cell(1, kJ), "0,7");
  host.fillForm = [](Form& form) {
    form.find("Points")->grid->StoreStyleRowCol(2, 1, "1");
    form.find("Last:")->text = "70";
    return false;
  };
  grid().OnClickedButtonRowCol(1, kPart);
  EXPECT_EQ(output().pointsJ, (Points{0, 7}));
  EXPECT_EQ(output().steps.last, 50);
}

TEST_F(ResultPage, WithoutAnAreaThereIsNothingToChoose) {
  root().bathymetry->SetCount(0);
  grid().OnClickedButtonRowCol(1, kPart);
  store(1, kType, "0");
  grid().OnClickedButtonRowCol(1, kPart);
  const std::string told = "Error: Associated area is invalid!";
  EXPECT_EQ(host.texts, (Labels{told, told}));
  EXPECT_EQ(host.titles, Labels{});
}

TEST_F(ResultPage, OfAGridThatHasNotBeenReadAnyPartMayBeChosen) {
  root().bathymetry->GetArea(1)->noJ = 0;
  root().bathymetry->GetArea(1)->noK = 0;
  host.fillForm = [](Form& form) {
    EXPECT_NE(form.find("X direction"), nullptr);
    form.find("Last:")->text = "500";
    return true;
  };
  grid().OnClickedButtonRowCol(1, kPart);
  EXPECT_EQ(output().part.x.last, 500);
  host.fillForm = [](Form& form) {
    form.find("Interval:")->text = "0";
    return true;
  };
  grid().OnClickedButtonRowCol(1, kPart);
  EXPECT_EQ(host.formFault, "X direction: the interval 0 is below 1");
  EXPECT_EQ(output().part.x.interval, 1);
}

TEST_F(ResultPage, TheKindOfTheFileFollowsTypeAndSpans) {
  const std::string point = "Time series (*.tsb0)|*.tsb0|Time series (*.tb0)|*.tb0|All Files (*.*)|*.*||";
  const std::string line = "Profile (*.tsb1)|*.tsb1|Profile (*.tb1)|*.tb1|All Files (*.*)|*.*||";
  const std::string map = "Result files(*.tsb2)|*.tsb2|Result files (*.tb2)|*.tb2|All Files (*.*)|*.*||";
  struct Case {
    std::int32_t type;
    USubLine x;
    USubLine y;
    std::string extension;
    std::string filter;
  };
  const USubLine one{3, 3, 1};
  const USubLine all{0, 9, 1};
  for (const Case& it :
       {Case{2, one, one, "tsb0", point}, Case{0, all, all, "tsb0", point}, Case{1, one, one, "tsb0", point},
        Case{2, one, all, "tsb1", line}, Case{2, all, one, "tsb1", line}, Case{1, all, all, "tsb1", line},
        Case{-1, one, all, "tsb1", line}, Case{2, all, all, "tsb2", map}, Case{-1, all, all, "", ""},
        Case{3, all, all, "", ""}}) {
    output().type = it.type;
    output().part = {it.x, it.y};
    host.chosenFile.reset();
    host.extensions.clear();
    host.filters.clear();
    grid().OnClickedButtonRowCol(1, kBrowse);
    EXPECT_EQ(host.extensions, Labels{it.extension}) << it.type;
    EXPECT_EQ(host.filters, Labels{it.filter}) << it.type;
  }
  host.chosenFile = "out.tsb2";
  grid().OnClickedButtonRowCol(1, kBrowse);
  EXPECT_EQ(output().file.text(), "out.tsb2");
  EXPECT_EQ(undoName(), "Data File, row 1");
}

TEST_F(ResultPage, AFileThatIsThereCanBeViewed) {
  EXPECT_EQ(style(1, kFile).kind, CellKind::resultFile);
  EXPECT_EQ(store(1, kFile, "  out.tsb2 "), 1);
  EXPECT_EQ(output().file.text(), "out.tsb2");
  EXPECT_EQ(output().title, "");
  EXPECT_EQ(store(1, kTitle, "flood"), 1);
  EXPECT_EQ(output().title, "flood");
  EXPECT_FALSE(style(1, kView).enabled);
  const std::string there = folder.write("there.tsb2", "");
  store(1, kFile, there);
  EXPECT_TRUE(style(1, kView).enabled);
  grid().OnClickedButtonRowCol(1, kView);
  EXPECT_EQ(host.opened, Labels{there});
}

TEST_F(ResultPage, ItemsThatAlwaysAre) {
  EXPECT_EQ(style(1, kItems).choices,
            (Labels{" Water depth", " P flux", " Q flux", " Surface elevation", " U-velocity", " V-velocity",
                    " Still water depth", " Shear stress x-direction", " Shear stress y-direction",
                    " Shear stress size", " Current Speed", " Current Direction", " Froude No."}));
  EXPECT_EQ(store(1, kItems, "4105"), 1);
  EXPECT_EQ(output().items, (Items{1, 4, 13}));
  for (const char* refused : {"8192", "-1", "x", ""}) EXPECT_EQ(store(1, kItems, refused), 0) << refused;
  EXPECT_EQ(store(1, kItems, "0"), 1);
  EXPECT_EQ(output().items, Items{});
}

TEST_F(ResultPage, ItemsOfTheModelMoveThoseBehindThem) {
  output().items = {1, 16};
  EXPECT_EQ(cell(1, kItems), "1");
  root().nhdInfiltration->infiltrationType = 1;
  EXPECT_EQ(style(1, kItems).choices.back(), " Infiltrated Volume");
  EXPECT_EQ(style(1, kItems).choices.size(), 14U);
  EXPECT_EQ(cell(1, kItems), "8193");
  root().nhdInfiltration->infiltrationType = 2;
  EXPECT_EQ(cell(1, kItems), "16385");
  root().nhdResistance->formulation = 2;
  EXPECT_EQ(cell(1, kItems), "32769");
  EXPECT_EQ(style(1, kItems).choices[13], " Manning No.");
  EXPECT_EQ(style(1, kItems).choices[14], " Saturation");
  EXPECT_EQ(store(1, kItems, "57345"), 1);
  EXPECT_EQ(output().items, (Items{1, 14, 15, 16}));
}

TEST_F(ResultPage, ItemsThatAreStoredAsShownKeepTheirOrder) {
  output().items = {12, 14, 1};
  const std::string shown = cell(1, kItems);
  EXPECT_EQ(store(1, kItems, shown), 1);
  EXPECT_EQ(output().items, (Items{12, 14, 1}));
}

TEST_F(ResultPage, ARowForEachHotStartFile) {
  root().bathymetry->SetCount(2);
  page->SetData();
  ASSERT_EQ(hotStarts().GetRowCount(), 2);
  ASSERT_EQ(hotStarts().GetColCount(), 4);
  const Labels names{"", "Hot Start File", "...", "Title", ""};
  const std::vector<int> sizes{30, 230, 20, 140, 45};
  for (int col = 0; col <= 4; ++col) {
    EXPECT_EQ(hotStarts().GetColHeader(col), names[static_cast<std::size_t>(col)]);
    EXPECT_EQ(hotStarts().GetColWidth(col), sizes[static_cast<std::size_t>(col)]);
  }
  EXPECT_EQ(rowOf(hotStarts(), 2), (Labels{"", "...", "", "View..."}));
  EXPECT_EQ(usableOf(hotStarts(), 2), "....");
  EXPECT_EQ(hotStarts().StoreStyleRowCol(2, 1, "hot.tsb2"), 0);
  choose("Generate hot start", 1);
  EXPECT_EQ(usableOf(hotStarts(), 2), "xxx.");
  EXPECT_EQ(hotStarts().StoreStyleRowCol(2, 1, "hot.tsb2"), 1);
  EXPECT_EQ(hotStarts().StoreStyleRowCol(2, 3, "inner"), 1);
  EXPECT_EQ(results().hotStarts.at(2).file.text(), "hot.tsb2");
  EXPECT_EQ(results().hotStarts.at(2).title, "inner");
  host.chosenFile = folder.write("there.tsb2", "");
  hotStarts().OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(host.extensions, Labels{"tsb2"});
  EXPECT_EQ(host.filters, Labels{"HotStart files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(undoName(), "Hot Start File, row 1");
  EXPECT_EQ(usableOf(hotStarts(), 1), "xxxx");
  hotStarts().OnClickedButtonRowCol(1, 4);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
  results().generateHotStart = false;
  EXPECT_EQ(usableOf(hotStarts(), 1), "...x") << "a file that is there can be viewed all the same";
}

TEST_F(ResultPage, InundationStatistics) {
  const auto usable = [this] {
    std::string all;
    for (const char* label : {"Inundation file", "...", "View...", "Update frequency",
                              "Include duration above threshold depth item", "Threshold depth"})
      all += control(label).usable() ? 'x' : '.';
    return all;
  };
  EXPECT_EQ(usable(), "......");
  choose("Calculation of inundation statistics", 1);
  EXPECT_TRUE(results().includeInundationStatistics);
  EXPECT_EQ(usable(), "xx.xx.");
  choose("Include duration above threshold depth item", 1);
  EXPECT_EQ(usable(), "xx.xxx");
  edit("Update frequency", "12");
  edit("Threshold depth", "0.25");
  EXPECT_EQ(results().inundationStoreStep, 12);
  EXPECT_EQ(results().thresholdHeight, 0.25F);
  EXPECT_EQ(control("Threshold depth").unit, "m");
  host.chosenFile = folder.write("max.tsb2", "");
  press("...");
  EXPECT_EQ(host.extensions, Labels{"tsb2"});
  EXPECT_EQ(host.filters,
            Labels{"Result files(*.tsb2)|*.tsb2|Result files (*.tb2)|*.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(results().inundationFile.text(), *host.chosenFile);
  EXPECT_EQ(usable(), "xxxxxx");
  press("View...");
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
  choose("Calculation of inundation statistics", 0);
  EXPECT_EQ(usable(), "......");
}

}  // namespace hydrodynamic_result_page_test
}  // namespace gridbay
