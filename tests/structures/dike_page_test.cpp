#include "structures/dike_page.h"

#include <gmock/gmock.h>

#include "basic/simulation_period.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace structures_dike_page_test {

using ::testing::HasSubstr;

class DikePage : public test::ShapeTest {
 protected:
  DikePage() {
    list().SetCount(3);
    keep();
    PageTest::open("CNHdDikeDlg");
  }
  CNhdDikeKvs& list() { return *root().nhdDike; }
  CNhdDikeObjectKvs& dike(int number) { return list().at(number); }
  CV27SetupGridWnd& dikes() { return grid("Dikes"); }
  CV27SetupGridWnd& points() { return grid("Points"); }
  // What is off or on, of the controls of the selected dike.
  bool isOn(std::string_view label) { return control(label).enabled; }
  void select(int row, double specification = 1) {
    dike(row).crestLevelSpecification = specification;
    keep();
    dikes().OnCurrentRow(row);
    page->SetData();
  }
  // What the test has done in the model is no part of the next edit.
  void keep() { document.RecordEdit(PageId::none, "Test"); }

  test::TemporaryFolder folder;
};

TEST_F(DikePage, ControlsInTheirOrder) {
  EXPECT_EQ(labels(),
            (Labels{"Number of dikes", "Dikes", "Crest level variation in space and time", "File",
                    "Select...", "View..", "", "Number of points", "Import from file...", "Points"}));
  EXPECT_EQ(page->templateId(), 18710);
  EXPECT_EQ(page->pageId(), PageId::dikes);
  EXPECT_EQ(control("Number of dikes").spinHighest, 1000);
  EXPECT_EQ(control("Number of points").spinHighest, 1000);
}

TEST_F(DikePage, TheColumnsOfDikes) {
  Labels headers;
  std::vector<int> widths;
  for (int col = 0; col <= dikes().GetColCount(); ++col) {
    headers.push_back(dikes().GetColHeader(col));
    widths.push_back(dikes().GetColWidth(col));
  }
  EXPECT_EQ(headers, (Labels{"No", "Name", "Include", "Projection", "Discharge Coef", "Delta level",
                             "Crest variation", "Crest level"}));
  EXPECT_EQ(widths, (std::vector<int>{40, 90, 60, 100, 120, 120, 100, 120}));
  EXPECT_EQ(rowOf(dikes(), 2),
            (Labels{"Dike 2", "1", "UTM-32", "1.838000", "0.010000", "Constant", "0.000000"}));
  EXPECT_EQ(dikes().GetRowHeader(2), "2");
  EXPECT_EQ(dikes().GetRowCount(), 3);
  EXPECT_EQ(styleIn(dikes(), 1, 2).kind, CellKind::checkBox);
  EXPECT_EQ(styleIn(dikes(), 1, 3).kind, CellKind::mapProjection);
  EXPECT_EQ(styleIn(dikes(), 1, 4).toolTip, "Chezy number [m^½/s]");
  EXPECT_EQ(styleIn(dikes(), 1, 5).toolTip, "Level difference [m]");
  EXPECT_EQ(styleIn(dikes(), 1, 6).kind, CellKind::dropDown);
  EXPECT_EQ(styleIn(dikes(), 1, 6).choices, (Labels{"Constant", "In space", "In space and time"}));
  EXPECT_EQ(styleIn(dikes(), 1, 7).toolTip, "Crest level [m]");
  EXPECT_EQ(usableOf(dikes(), 1), "xxxxxxx");
}

TEST_F(DikePage, CellsAreStored) {
  const Labels texts{"Gate", "0", "UTM-33", "1.5", "0.25", "In space and time", "2.5"};
  for (int col = 1; col <= 7; ++col)
    EXPECT_EQ(dikes().StoreStyleRowCol(2, col, texts[static_cast<std::size_t>(col) - 1]), 1) << col;
  EXPECT_EQ(dike(2).name, "Gate");
  EXPECT_EQ(dike(2).include, 0);
  EXPECT_EQ(dike(2).coordinateType, "UTM-33");
  EXPECT_EQ(dike(2).dischargeCoefficient, 1.5);
  EXPECT_EQ(dike(2).deltaLevel, 0.25);
  EXPECT_EQ(dike(2).crestLevelSpecification, 3);
  EXPECT_EQ(dike(2).crestLevel, 2.5);
  EXPECT_EQ(dike(1).name, "Dike 1");
  EXPECT_TRUE(document.IsModified());
  for (const int col : {2, 4, 5, 6, 7}) EXPECT_EQ(dikes().StoreStyleRowCol(2, col, "x"), 0) << col;
  EXPECT_EQ(rowOf(dikes(), 2),
            (Labels{"Gate", "0", "UTM-33", "1.500000", "0.250000", "In space and time", "2.500000"}));
}

TEST_F(DikePage, LevelsAreShownInTheUserUnit) {
  document.units().setSystem(UnitSystem::us);
  select(1, 2);
  dike(1).SetNoPoints(1);
  EXPECT_EQ(dikes().StoreStyleRowCol(1, 7, "10"), 1);
  EXPECT_DOUBLE_EQ(dike(1).crestLevel, 3.048);
  EXPECT_EQ(points().StoreStyleRowCol(1, 3, "100"), 1);
  EXPECT_DOUBLE_EQ(dike(1).points[0].z, 30.48);
}

TEST_F(DikePage, AValueThatIsTheSameIsNoEdit) {
  for (int col = 1; col <= 7; ++col) EXPECT_EQ(dikes().StoreStyleRowCol(1, col, textIn(dikes(), 1, col)), 1);
  EXPECT_EQ(dikes().StoreStyleRowCol(1, 4, "1.838"), 1);
  dike(1).SetNoPoints(1);
  select(1);
  EXPECT_EQ(points().StoreStyleRowCol(1, 1, "0"), 1);
  EXPECT_FALSE(document.IsModified());
  EXPECT_EQ(dikes().StoreStyleRowCol(1, 4, "1.839"), 1);
  EXPECT_TRUE(document.IsModified());
}

TEST_F(DikePage, AFractionOfTheSpecificationIsKept) {
  dike(1).crestLevelSpecification = 3.7;
  dike(2).crestLevelSpecification = 9;
  EXPECT_EQ(textIn(dikes(), 1, 6), "In space and time");
  EXPECT_EQ(textIn(dikes(), 2, 6), "");
  EXPECT_EQ(dikes().StoreStyleRowCol(1, 6, "In space and time"), 1);
  EXPECT_EQ(dike(1).crestLevelSpecification, 3.7);
  EXPECT_EQ(dikes().StoreStyleRowCol(2, 6, "In space"), 1);
  EXPECT_EQ(dike(2).crestLevelSpecification, 2);
}

TEST_F(DikePage, WithNoDikeSelectedAllOfItIsOff) {
  for (const char* label : {"Crest level variation in space and time", "File", "Select...", "View..", "",
                            "Number of points", "Import from file..."})
    EXPECT_FALSE(isOn(label)) << label;
  EXPECT_EQ(text("File"), "");
  EXPECT_EQ(text(""), "");
  EXPECT_EQ(text("Number of points"), "");
  spin("Number of points", 1);
  EXPECT_TRUE(dike(1).points.empty());
  EXPECT_EQ(points().GetRowCount(), 0);
  EXPECT_EQ(points().GetColWidth(3), 0);
}

TEST_F(DikePage, WhatIsOnFollowsTheSelectedDike) {
  const Labels ofFile{"Crest level variation in space and time", "File", "Select...", "View..", ""};
  for (const double specification : {1.0, 2.0, 3.0, 3.7, 4.0}) {
    select(2, specification);
    const bool isFile = specification == 3.0 || specification == 3.7;
    for (const std::string& label : ofFile) EXPECT_EQ(isOn(label), isFile) << label << specification;
    EXPECT_TRUE(isOn("Number of points"));
    EXPECT_TRUE(isOn("Import from file..."));
    EXPECT_EQ(points().GetColWidth(3) > 0, specification == 2.0);
    dikes().OnCurrentRow(0);
    EXPECT_FALSE(isOn("Number of points"));
  }
}

TEST_F(DikePage, TheColumnsOfPoints) {
  select(1, 2);
  EXPECT_EQ(points().GetColCount(), 3);
  EXPECT_EQ(points().GetColHeader(0), "No");
  EXPECT_EQ(points().GetColHeader(1), "Easting");
  EXPECT_EQ(points().GetColHeader(2), "Northing");
  EXPECT_EQ(points().GetColHeader(3), "Z");
  edit("Number of points", "2");
  EXPECT_EQ(points().GetRowCount(), 2);
  EXPECT_EQ(points().GetRowHeader(2), "2");
  EXPECT_EQ(rowOf(points(), 2), (Labels{"0.000000", "0.000000", "0.000000"}));
  EXPECT_EQ(styleIn(points(), 1, 1).toolTip, "Geographical coordinate [m]");
  EXPECT_EQ(styleIn(points(), 1, 3).toolTip, "Elevation [m]");
  EXPECT_EQ(points().StoreStyleRowCol(2, 1, "480000.125"), 1);
  EXPECT_EQ(points().StoreStyleRowCol(2, 2, "6e6"), 1);
  EXPECT_EQ(points().StoreStyleRowCol(2, 3, "-1.5"), 1);
  EXPECT_EQ(points().StoreStyleRowCol(2, 3, "low"), 0);
  EXPECT_EQ(points().StoreStyleRowCol(2, 3, "1e999"), 0);
  EXPECT_EQ(points().StoreStyleRowCol(3, 3, "1"), 0);
  EXPECT_EQ(rowOf(points(), 2), (Labels{"480000.125000", "6000000.000000", "-1.500000"}));
  EXPECT_EQ(dike(1).points[1].y, 6e6);
  EXPECT_TRUE(dike(2).points.empty());
}

TEST_F(DikePage, TheCountOfPointsIsThatOfTheSelectedDike) {
  dike(2).SetNoPoints(5);
  dike(2).points.edit(4).x = 7;
  select(2);
  EXPECT_EQ(text("Number of points"), "5");
  EXPECT_EQ(points().GetRowCount(), 5);
  spin("Number of points", 1);
  EXPECT_EQ(dike(2).points.size(), 6U);
  EXPECT_EQ(dike(2).points[5].x, 0);
  edit("Number of points", "4");
  edit("Number of points", "5");
  EXPECT_EQ(dike(2).points[4].x, 0);
  edit("Number of points", "1001");
  EXPECT_EQ(dike(2).points.size(), 5U);
  edit("Number of points", "-1");
  EXPECT_EQ(dike(2).points.size(), 5U);
  edit("Number of points", "1000");
  EXPECT_EQ(points().GetRowCount(), 1000);
  select(1);
  EXPECT_EQ(text("Number of points"), "0");
  EXPECT_EQ(points().GetRowCount(), 0);
}

TEST_F(DikePage, AnotherCountOfDikesSelectsNone) {
  dike(3).name = "Mine";
  dike(3).SetNoPoints(2);
  select(1, 2);
  edit("Number of dikes", "2");
  EXPECT_EQ(list().GetCount(), 2);
  EXPECT_EQ(dikes().CurrentRow(), 0);
  EXPECT_EQ(points().GetRowCount(), 0);
  EXPECT_EQ(points().GetColWidth(3), 0);
  EXPECT_FALSE(isOn("Number of points"));
  spin("Number of dikes", 1);
  EXPECT_EQ(dike(3).name, "Dike 3");
  EXPECT_TRUE(dike(3).points.empty());
  edit("Number of dikes", "1001");
  EXPECT_EQ(list().GetCount(), 3);
  edit("Number of dikes", "1000");
  EXPECT_EQ(dike(1000).name, "Dike 1000");
  EXPECT_EQ(dikes().GetRowCount(), 1000);
  edit("Number of dikes", "0");
  EXPECT_EQ(dikes().GetRowCount(), 0);
}

// The whole page is stored on an edit of the count, that of points too.
TEST_F(DikePage, FewerDikesLeaveThePointsOfTheOthers) {
  select(2);
  edit("Number of points", "4");
  edit("Number of dikes", "2");
  EXPECT_EQ(dikes().CurrentRow(), 0);
  EXPECT_EQ(dike(2).points.size(), 4U);
  EXPECT_TRUE(dike(1).points.empty());
}

TEST_F(DikePage, ADikeThatIsGoneIsNotSelected) {
  select(3);
  list().SetCount(2);
  page->SetData();
  EXPECT_FALSE(isOn("Number of points"));
  EXPECT_EQ(points().GetRowCount(), 0);
}

TEST_F(DikePage, AnEditOfAPointIsTakenBack) {
  select(1);
  edit("Number of points", "1000");
  ASSERT_EQ(points().StoreStyleRowCol(700, 1, "5"), 1);
  EXPECT_EQ(document.UndoStep()->name, "Easting, row 700");
  document.Undo();
  EXPECT_EQ(dike(1).points[699].x, 0);
  EXPECT_EQ(dikes().CurrentRow(), 1);
  document.Redo();
  EXPECT_EQ(dike(1).points[699].x, 5);
}

class DikeFile : public DikePage {
 protected:
  DikeFile() {
    TsbDefinition levels;
    levels.time.step = 86400;
    levels.time.count = 2;
    levels.axes = {{.points = 5, .spacing = 10}};
    levels.items = {{"low", item::kElevation, "m"}, {"high", item::kCrestLevel, "m"}};
    Result<TsbWriter> writer = TsbWriter::create(path, levels);
    EXPECT_TRUE(writer && writer->commit());
    select(1, 3);
  }
  const std::string path = folder.file("crest.tsb1");
};

TEST_F(DikeFile, IsChosenWithItsItem) {
  host.chosenFile = path;
  host.chosenItems = {2};
  press("Select...");
  EXPECT_EQ(host.filters, Labels{"Tsb1 Files (*.tsb1)|*.tsb1|"});
  EXPECT_EQ(dike(1).crestLevelFile.text(), path);
  EXPECT_EQ(dike(1).itemNumber, 2);
  EXPECT_EQ(text("File"), path);
  EXPECT_EQ(text(""), "Item: high");
  EXPECT_TRUE(document.IsModified());
  EXPECT_EQ(document.UndoStep()->name, "File");
  document.Undo();
  EXPECT_EQ(text("File"), "");
  EXPECT_EQ(text(""), "Item: ");
  EXPECT_EQ(dike(1).itemNumber, 1);
}

TEST_F(DikeFile, AChoiceWithNoItemLeavesTheNumber) {
  dike(1).itemNumber = 2;
  host.chosenFile = path;
  press("Select...");
  EXPECT_EQ(dike(1).itemNumber, 2);
  host.chosenFile = {};
  press("Select...");
  EXPECT_EQ(dike(1).crestLevelFile.text(), path);
}

TEST_F(DikeFile, IsAskedForAsTheEngineWantsIt) {
  class Host : public test::TestHost {
   public:
    bool choose(CVdFileSelectorDlg& selector) override {
      given = selector.GetSelectedItems();
      kind = selector.kind();
      const std::vector<std::uint32_t> first{1};
      valid = selector.IsTsbFileValid(file, first, &why);
      return false;
    }
    std::string file;
    std::vector<std::uint32_t> given;
    std::string kind;
    bool valid = false;
    std::string why;
  };
  Host asked;
  CV27SetupDoc other(asked);
  other.root().nhdDike->SetCount(1);
  other.root().nhdDike->GetItem(1)->crestLevelSpecification = 3;
  const auto view = makePage("CNHdDikeDlg", other);
  view->form().find("Dikes")->grid->OnCurrentRow(1);
  const auto check = [&](const TsbDefinition& definition) {
    asked.file = folder.file("asked.tsb1");
    Result<TsbWriter> writer = TsbWriter::create(asked.file, definition);
    EXPECT_TRUE(writer && writer->commit());
    view->form().act(*view->form().find("Select..."));
    return asked.valid;
  };
  TsbDefinition levels;
  levels.time.step = 86400;
  levels.time.count = 2;
  levels.axes = {{.points = 5, .spacing = 10}};
  levels.items = {{"level", item::kElevation, "m"}};
  EXPECT_TRUE(check(levels)) << asked.why;
  EXPECT_EQ(asked.given, std::vector<std::uint32_t>{1});
  EXPECT_EQ(asked.kind, "tsb1");
  TsbDefinition crest = levels;
  crest.items[0].type = item::kCrestLevel;
  EXPECT_TRUE(check(crest)) << asked.why;
  TsbDefinition discharge = levels;
  discharge.items = {{"flow", item::kDischarge, "m3 s-1"}};
  EXPECT_FALSE(check(discharge));
  TsbDefinition series = levels;
  series.axes.clear();
  EXPECT_FALSE(check(series));
  TsbDefinition brief = levels;
  brief.time.step = 60;
  EXPECT_FALSE(check(brief));
  TsbDefinition calendar = levels;
  calendar.time.type = TsbTimeAxisType::calendar;
  calendar.time.values = {0, 86400};
  EXPECT_FALSE(check(calendar));
}

TEST_F(DikeFile, ATypedNameIsStored) {
  edit("File", path);
  EXPECT_EQ(dike(1).crestLevelFile.text(), path);
  EXPECT_EQ(text(""), "Item: low");
  dike(1).itemNumber = 9;
  page->SetData();
  EXPECT_EQ(text(""), "Item: ");
}

TEST_F(DikeFile, IsOpenedWithItsItem) {
  edit("File", path);
  dike(1).itemNumber = 2;
  press("View..");
  EXPECT_EQ(host.opened, Labels{path});
  EXPECT_EQ(host.openedItems, std::vector<int>{2});
  edit("File", "none.tsb1");
  press("View..");
  EXPECT_EQ(host.texts, Labels{"File 'none.tsb1' not found"});
  EXPECT_EQ(host.opened.size(), 1U);
}

class DikeImport : public DikePage {
 protected:
  DikeImport() { select(2); }
  void import(std::string_view text) {
    host.chosenFile = folder.write("a.xyz", text);
    press("Import from file...");
  }
};

TEST_F(DikeImport, PointsAreAppended) {
  dike(2).SetNoPoints(1);
  keep();
  import("1 2 3\n4 5 6 gate\n");
  ASSERT_EQ(dike(2).points.size(), 3U);
  EXPECT_EQ(dike(2).points[2].z, 6);
  EXPECT_EQ(text("Number of points"), "3");
  EXPECT_EQ(points().GetRowCount(), 3);
  EXPECT_TRUE(document.IsModified());
  EXPECT_EQ(host.titles, (Labels{"Select XYZ Import File", "Importing points"}));
  EXPECT_EQ(host.progress.back(), 1);
  EXPECT_EQ(host.lastFiles["xyz"], *host.chosenFile);
  import("1 2 3\n4 5 6 gate\n");
  EXPECT_EQ(dike(2).points.size(), 5U);
  document.Undo();
  EXPECT_EQ(dike(2).points.size(), 3U);
  document.Undo();
  EXPECT_EQ(dike(2).points.size(), 1U);
}

TEST_F(DikeImport, ValuesAreInTheUnitsThatWereChosen) {
  host.fillForm = [](Form& panel) {
    panel.find("Unit of X and Y:")->index = 1;  // kilometres
    panel.act(*panel.find("Unit of X and Y:"));
    return true;
  };
  import("1 2 3\n");
  EXPECT_EQ(dike(2).points[0].y, 2000);
  EXPECT_EQ(dike(2).points[0].z, 3);
}

TEST_F(DikeImport, AnIllegalFileChangesNothing) {
  dike(2).SetNoPoints(1);
  keep();
  import("1 2 3\n4\n");
  EXPECT_EQ(host.texts, Labels{"Illegal XYZ file format."});
  EXPECT_EQ(dike(2).points.size(), 1U);
  EXPECT_FALSE(document.IsModified());
}

TEST_F(DikeImport, AFileThatIsNotThereBringsNoPoints) {
  host.chosenFile = folder.file("none.xyz");
  press("Import from file...");
  EXPECT_EQ(host.texts, Labels{});
  EXPECT_TRUE(dike(2).points.empty());
}

TEST_F(DikeImport, OneThatIsStoppedChangesNothing) {
  host.stopAt = 0.5;
  import("1 2 3\n");
  EXPECT_EQ(host.texts, Labels{});
  EXPECT_TRUE(dike(2).points.empty());
  EXPECT_FALSE(document.IsModified());
  host.fillForm = [](Form&) { return false; };
  host.stopAt = 2;
  import("1 2 3\n");
  EXPECT_TRUE(dike(2).points.empty());
}

// The limit of the count is for typing; what a file has beyond it stays, and can be shortened.
TEST_F(DikeImport, MoreThanCanBeTyped) {
  std::string text;
  for (int n = 0; n < 1500; ++n) text += "1 2 3\n";
  import(text);
  EXPECT_EQ(this->text("Number of points"), "1500");
  EXPECT_EQ(points().GetRowCount(), 1500);
  edit("Number of points", "1400");
  EXPECT_EQ(dike(2).points.size(), 1400U);
  edit("Number of points", "1450");
  EXPECT_EQ(dike(2).points.size(), 1400U);
}

}  // namespace structures_dike_page_test
}  // namespace gridbay
