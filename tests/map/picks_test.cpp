// Cells that hold points, and what is pointed at on the map for them.

#include <algorithm>
#include <array>
#include <set>
#include <tuple>

#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/source_sink.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/result.h"
#include "map/document_map.h"
#include "map/module_outputs.h"
#include "setup/dlg_enumerator.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"
#include "tests/map/map_fixture.h"

namespace gridbay {
namespace map_picks_test {

using ::testing::ElementsAre;
using ::testing::ElementsAreArray;

class MapPicks : public test::MapFixture {
 protected:
  // Something in each list that holds points.
  void fill() {
    makeTwoAreas();
    root().boundary->defaultPosition = 0;
    root().boundary->SetNoBoundaries(1);
    root().boundary->at(1).Set(0, 2, 0, 9);
    root().nhdBoundary->at(1).tiltType = 1;
    root().sourceSink->SetNoSources(1);
    root().sourceSink->at(1).type = CSourceSinkObjectKvs::kPair;
    root().massBudget->SetNoPolygons(1);
    root().massBudget->at(1).associatedArea = 2;
    root().massBudget->at(1).corners = {{1, 1}, {5, 1}, {5, 7}};
    root().nhdDike->SetCount(1);
    root().nhdDike->at(1).SetNoPoints(2);
    root().nhdDike->at(1).coordinateType = "UTM-33";
    root().nhdWeir->SetCount(1);
    root().nhdWeir->at(1).x = {400000, 400100};
    root().nhdWeir->at(1).y = {6000000, 6000050};
    root().nhdWeir->at(1).coordinateType = "UTM-33";
    root().nhdCulvert->SetCount(1);
    root().nhdResult->outputs.SetCount(3);
    root().nhdResult->outputs.at(1).part = {{1, 4, 2}, {2, 6, 1}};
    root().nhdResult->outputs.at(2).type = CNhdResultObjectKvs::kLine;
    root().nhdResult->outputs.at(3).type = CNhdResultObjectKvs::kPoints;
    root().nhdResult->outputs.at(3).pointsJ = {3, 5};
    root().nhdResult->outputs.at(3).pointsK = {9, 3};
  }
  void choose(std::int32_t simulationType) {
    root().moduleSelection->simulationType = simulationType;
    if (const ModuleOutputs outputs = moduleOutputs(root()); outputs.setCount) outputs.setCount(1);
    for (LineOrBoxList* list : linesAndBoxes(root())) list->SetCount(1);
  }
  CV27SetupGridWnd& open(std::string_view pageClass, int n = 1) {
    page = makePage(pageClass, document);
    for (Control& control : page->form().controls()) {
      if (control.grid != nullptr && --n == 0) return *control.grid;
    }
    throw std::runtime_error("no such grid");
  }
  static std::string cell(CV27SetupGridWnd& grid, int row, int col) {
    CellStyle style;
    grid.GetStyleRowCol(row, col, style);
    return style.value;
  }
  std::string lastStep() { return document.UndoStep() == nullptr ? "" : document.UndoStep()->name; }
  static PickedPlace point(int j, int k, int area = 1) { return {.area = area, .point = {j, k}}; }

  std::unique_ptr<MapEditor> map = makeMapEditor(document);
  std::unique_ptr<CV27SetupFormView> page;
};

bool isNameOfPlace(std::string_view name) {
  static const std::set<std::string_view> kNames{"J", "K", "X",       "Y",        "j",         "k",
                                                 "x", "y", "Easting", "Northing", "Longitude", "Latitude"};
  return kNames.contains(name);
}

TEST_F(MapPicks, EachCellOfAPointOnEachPageIsPicked) {
  fill();
  std::set<std::string> found;
  for (const std::int32_t simulation :
       {root().moduleSelection->simulationType, module::kAdvectionDispersion, module::kMudTransport,
        module::kMudTransportExpanded, module::kEcological}) {
    choose(simulation);
    for (const PageEntry& entry : CDlgEnumerator().pages()) {
      page = entry.pageClass.empty() ? nullptr : makePage(entry.pageClass, document);
      if (page == nullptr) continue;
      SCOPED_TRACE(std::string(entry.pageClass));
      for (Control& control : page->form().controls()) {
        // A point in fields would need a way of its own to be picked.
        EXPECT_FALSE(control.isEdit() && (isNameOfPlace(control.name()) || pointOfText(control.text)))
            << control.label;
        if (control.grid == nullptr) continue;
        CV27SetupGridWnd& grid = *control.grid;
        grid.OnCurrentRow(1);  // what hangs on it is listed
        for (int row = 1; row <= grid.GetRowCount(); ++row) {
          for (int col = 1; col <= grid.GetColCount(); ++col) {
            CellStyle style;
            if (grid.GetStyleRowCol(row, col, style) == 0) continue;
            const std::string header = grid.GetColHeader(col);
            const bool holdsPoint = style.kind == CellKind::plain && style.editable() &&
                                    (pointOfText(style.value) || isNameOfPlace(header));
            const std::optional<CellPick> pick = grid.PickRowCol(row, col);
            const bool leadsToPoints = header == "Location" && style.kind == CellKind::button;
            const bool isOnLine = entry.pageClass == "CNhdBoundaryDlg" && row == 5 && col == 2;
            EXPECT_EQ(pick.has_value(), holdsPoint || leadsToPoints || isOnLine) << header << ", row " << row;
            if (!pick) continue;
            EXPECT_FALSE(pick->held.empty() && header != "Location") << header;
            const std::string name = isOnLine         ? "Tilting point"
                                     : header.empty() ? grid.GetRowHeader(row)
                                                      : header;
            found.insert(std::to_string(entry.id) + " " + name + ": " + pick->name);
          }
        }
      }
    }
  }
  EXPECT_THAT(found, ElementsAreArray({"10 First: First, row 1",
                                       "10 Last: Last, row 1",
                                       "121 J: J and K, row 1",
                                       "121 K: J and K, row 1",
                                       "20 First: First, row 1",
                                       "20 Last: Last, row 1",
                                       "23 J: J and K, row 1",
                                       "23 K: J and K, row 1",
                                       "27 Origin: Origin, row 2",
                                       "28 First point: First point, row 1",
                                       "28 Last point: Last point, row 1",
                                       "29 Tilting point: Boundary 1, tilting",
                                       "30 Location: Location, row 1",
                                       "31 Easting: Point, row 1",
                                       "31 Easting: Point, row 2",
                                       "31 Northing: Point, row 1",
                                       "31 Northing: Point, row 2",
                                       "34 1: Polygon 1, Corner point 1",
                                       "34 1: Polygon 1, Corner point 2",
                                       "34 1: Polygon 1, Corner point 3",
                                       "38 J: J and K, row 1",
                                       "38 J: J and K, row 2",
                                       "38 J: J and K, row 3",
                                       "38 K: J and K, row 1",
                                       "38 K: J and K, row 2",
                                       "38 K: J and K, row 3",
                                       "40 Sink: Sink, row 1",
                                       "40 Source: Source, row 1",
                                       "45 Location: Location, row 1",
                                       "49 First: First, row 1",
                                       "49 Last: Last, row 1",
                                       "75 First: First, row 1",
                                       "75 Last: Last, row 1",
                                       "79 J: J and K, row 1",
                                       "79 K: J and K, row 1",
                                       "94 First: First, row 1",
                                       "94 Last: Last, row 1",
                                       "99 J: J and K, row 1",
                                       "99 K: J and K, row 1"}));
}

// What a form has cells and fields of points of, each with the name of its pick.
std::set<std::string> pointsOf(Form& form, const std::vector<FieldPick>& picks) {
  std::set<std::string> found;
  for (Control& control : form.controls()) {
    const auto pick = std::ranges::find_if(picks, [&](const FieldPick& each) {
      return std::ranges::find(each.fields, &control) != each.fields.end();
    });
    const std::string frame = control.group == nullptr ? "" : control.group->name() + " ";
    const bool isOfPart = frame.starts_with("X direction") || frame.starts_with("Y direction");
    const bool holdsPlace = isNameOfPlace(control.name()) || (isOfPart && control.name() != "Interval");
    EXPECT_EQ(pick != picks.end(), control.isEdit() && holdsPlace) << frame << control.name();
    if (pick != picks.end()) found.insert(frame + control.name() + ": " + pick->wanted().name);
    if (control.grid == nullptr) continue;
    CV27SetupGridWnd& grid = *control.grid;
    for (int row = 1; row <= grid.GetRowCount(); ++row) {
      for (int col = 1; col <= grid.GetColCount(); ++col) {
        const std::optional<CellPick> cell = grid.PickRowCol(row, col);
        EXPECT_EQ(cell.has_value(), isNameOfPlace(grid.GetColHeader(col))) << grid.GetColHeader(col);
        if (cell) found.insert(grid.GetColHeader(col) + ": " + cell->name);
      }
    }
  }
  return found;
}

TEST_F(MapPicks, EachPointInEachDialogIsPicked) {
  fill();
  std::set<std::string> found;
  host.fillForm = [&](Form& form) {
    for (const std::string& each : pointsOf(form, host.picks)) found.insert(host.titles.back() + ": " + each);
    return false;
  };
  for (const std::int32_t simulation : {module::kAdvectionDispersion, module::kEcological}) {
    choose(simulation);
    for (const PageEntry& entry : CDlgEnumerator().pages()) {
      page = entry.pageClass.empty() ? nullptr : makePage(entry.pageClass, document);
      if (page == nullptr) continue;
      for (Control& control : page->form().controls()) {
        if (control.kind == ControlKind::button && control.usable()) page->form().act(control);
        if (control.grid == nullptr) continue;
        CV27SetupGridWnd& grid = *control.grid;
        for (int row = 1; row <= grid.GetRowCount(); ++row) {
          for (int col = 1; col <= grid.GetColCount(); ++col) grid.OnClickedButtonRowCol(row, col);
        }
      }
    }
  }
  EXPECT_THAT(found,
              ElementsAreArray({"Box for Summation Calculations: Lower-left point J: Lower-left point",
                                "Box for Summation Calculations: Lower-left point K: Lower-left point",
                                "Box for Summation Calculations: Upper-right point J: Upper-right point",
                                "Box for Summation Calculations: Upper-right point K: Upper-right point",
                                "Line for Discharge Calculations: First point J: First point",
                                "Line for Discharge Calculations: First point K: First point",
                                "Line for Discharge Calculations: Last point J: Last point",
                                "Line for Discharge Calculations: Last point K: Last point",
                                "Point Selection: X: Point, row 1",
                                "Point Selection: X: Point, row 2",
                                "Point Selection: Y: Point, row 1",
                                "Point Selection: Y: Point, row 2",
                                "Point Selection: j: Point, row 1",
                                "Point Selection: j: Point, row 2",
                                "Point Selection: k: Point, row 1",
                                "Point Selection: k: Point, row 2",
                                "Subset of results: X direction First: J and K",
                                "Subset of results: X direction Last: J and K",
                                "Subset of results: Y direction First: J and K",
                                "Subset of results: Y direction Last: J and K"}));
}

TEST_F(MapPicks, WhatIsPickedInADialogIsOneStepOfTheDialog) {
  fill();
  choose(module::kAdvectionDispersion);
  document.RecordEdit(PageId::hdResult, "filled");
  struct Case {
    std::string_view page;
    int row;
    std::function<void(Form&)> pick;
    std::string step;
    std::vector<std::pair<int, std::string>> cells;  // by their columns
  };
  const auto fields = [this](std::size_t n, std::vector<PickedPlace> places) {
    return [this, n, places = std::move(places)](Form&) {
      EXPECT_FALSE(storePick(host.picks.at(n), {}));
      for (Control* field : host.picks[n].fields) field->fault = "what was typed";
      EXPECT_TRUE(storePick(host.picks[n], places));
      for (const Control* field : host.picks[n].fields) EXPECT_EQ(field->fault, "");
    };
  };
  const auto cellOf = [](int row, int col, PickedPlace place) {
    return [=](Form& form) {
      CV27SetupGridWnd& grid = *form.find("Points")->grid;
      EXPECT_FALSE(grid.PickRowCol(row, col)->held.empty());
      EXPECT_EQ(grid.StorePickRowCol(row, col, std::array{place}), 1);
    };
  };
  const std::vector<Case> cases{
      {"CResultDlg", 1, fields(0, {point(8, 4), point(3, 9)}), "Output areas", {{3, "3-8,2"}, {4, "4-9,1"}}},
      {"CResultDlg", 2, fields(0, {point(8, 4), point(3, 5)}), "Output areas", {{3, "3-8,1"}, {4, "4-4,1"}}},
      {"CResultDlg", 3, cellOf(2, 1, point(7, 8)), "Output areas", {{3, "3,7"}, {4, "9,8"}}},
      {"CNadResultDlg", 1, fields(0, {point(2, 3), point(4, 5)}), "Output areas", {}},
      {"CNadLineDischargeDlg", 1, fields(1, {point(6, 2)}), "Lines", {{4, "(6,2)"}}},
      {"CNHdWeirDlg", 1, cellOf(2, 2, {.x = 7, .y = 8}), "Location, row 1", {}},
  };
  for (const Case& each : cases) {
    SCOPED_TRACE(std::string(each.page) + " " + each.step);
    for (const bool isTaken : {false, true}) {
      CV27SetupGridWnd& grid = open(each.page);
      // The first button of the row, below headers that are rows too.
      CellStyle style;
      const auto isButton = [&](int row, int col) {
        return grid.GetStyleRowCol(row, col, style) != 0 && style.kind == CellKind::button;
      };
      int row = 1;
      int col = 1;
      while (!isButton(row, col))
        std::tie(row, col) = col < grid.GetColCount() ? std::pair(row, col + 1) : std::pair(row + 1, 1);
      row += each.row - 1;
      host.fillForm = [&](Form& form) {
        each.pick(form);
        return isTaken;
      };
      host.formFault = "not asked";
      grid.OnClickedButtonRowCol(row, col);
      EXPECT_EQ(lastStep(), isTaken ? each.step : "filled") << host.formFault;
      for (const auto& [column, text] : each.cells)
        EXPECT_EQ(cell(grid, row, column) == text, isTaken) << cell(grid, row, column);
    }
    document.Undo();
    EXPECT_EQ(lastStep(), "filled");
  }
}

TEST_F(MapPicks, ATiltingPointIsOneOfItsBoundary) {
  fill();
  document.RecordEdit(PageId::hdBoundary, "filled");
  const auto tilting = [this]() -> CV27SetupGridWnd& { return open("CNhdBoundaryDlg"); };
  EXPECT_EQ(tilting().StorePickRowCol(5, 2, std::array{point(0, 6)}), 1);
  EXPECT_EQ(root().nhdBoundary->at(1).tiltingPoint, 6);
  EXPECT_EQ(lastStep(), "Boundary 1, tilting");
  EXPECT_EQ(tilting().PickRowCol(5, 2)->held.front().point, (GridPoint{0, 6}));
  // Beyond its ends the nearest end.
  EXPECT_EQ(tilting().StorePickRowCol(5, 2, std::array{point(4, 15)}), 1);
  EXPECT_EQ(root().nhdBoundary->at(1).tiltingPoint, 9);
  root().boundary->at(1).Set(12, 0, 3, 0);
  EXPECT_EQ(tilting().StorePickRowCol(5, 2, std::array{point(1, 0)}), 1);
  EXPECT_EQ(root().nhdBoundary->at(1).tiltingPoint, 3);
  root().boundary->at(1).Set(0, 2, 5, 9);
  EXPECT_FALSE(tilting().PickRowCol(5, 2).has_value());
  root().boundary->at(1).Set(0, 2, 0, 9);
  root().nhdBoundary->at(1).tiltType = -1;
  EXPECT_FALSE(tilting().PickRowCol(5, 2).has_value());
}

TEST_F(MapPicks, BothCellsOfAPointAreOneStep) {
  fill();
  document.RecordEdit(PageId::hdResult, "filled");
  struct Case {
    std::string_view page;
    int grid;
    int row;
    int col;
    std::vector<PickedPlace> places;
    std::string step;
    std::vector<std::pair<int, std::string>> cells;  // by their columns
  };
  const auto at = [](double x, double y) { return PickedPlace{.x = x, .y = y}; };
  const std::vector<Case> cases{
      {"CResultDlg", 1, 1, 3, {point(8, 4), point(3, 9)}, "J and K, row 1", {{3, "3-8,2"}, {4, "4-9,1"}}},
      {"CResultDlg", 1, 1, 4, {point(7, 4)}, "J and K, row 1", {{3, "7-7,2"}, {4, "4-4,1"}}},
      {"CResultDlg", 1, 2, 4, {point(3, 9), point(4, 2)}, "J and K, row 2", {{3, "3-3,1"}, {4, "2-9,1"}}},
      {"CResultDlg", 1, 3, 3, {point(3, 9), point(4, 2)}, "J and K, row 3", {{3, "3,4"}, {4, "9,2"}}},
      {"CBathymetryDlg", 1, 2, 3, {point(6, 5)}, "Origin, row 2", {{3, "(6,5)"}}},
      {"CBoundaryDlg", 1, 1, 2, {point(0, 7)}, "Last point, row 1", {{1, "(0,2)"}, {2, "(0,7)"}}},
      {"CSourceSinkDlg", 1, 2, 4, {point(9, 8, 2)}, "Sink, row 1", {{3, "1"}, {4, "(9,8)"}, {5, "2"}}},
      {"CNHdDikeDlg",
       2,
       2,
       2,
       {at(400100, 6000100)},
       "Point, row 2",
       {{1, "400100.000000"}, {2, "6000100.000000"}}},
  };
  for (const Case& each : cases) {
    SCOPED_TRACE(each.step);
    CV27SetupGridWnd& grid = open(each.page, each.grid);
    if (each.page == "CNHdDikeDlg") {
      for (Control& control : page->form().controls()) {
        if (control.grid != nullptr) control.grid->OnCurrentRow(1);
      }
    }
    EXPECT_EQ(grid.StorePickRowCol(each.row, each.col, each.places), 1);
    EXPECT_EQ(lastStep(), each.step);
    for (const auto& [col, text] : each.cells) EXPECT_EQ(cell(grid, each.row, col), text) << col;
    document.Undo();
    EXPECT_EQ(lastStep(), "filled");
  }
  // A whole line.
  CV27SetupGridWnd& weirs = open("CNHdWeirDlg");
  EXPECT_EQ(weirs.StorePickRowCol(2, 2, std::array{at(1, 2)}), 0);
  EXPECT_EQ(weirs.StorePickRowCol(2, 2, std::array{at(1, 2), at(3, 4)}), 1);
  EXPECT_THAT(root().nhdWeir->at(1).x, ElementsAre(1, 3));
  EXPECT_THAT(root().nhdWeir->at(1).y, ElementsAre(2, 4));
  EXPECT_EQ(lastStep(), "Location, row 1");
  // An output of a module counts in its area.
  choose(module::kAdvectionDispersion);
  moduleOutputs(root()).item(1)->areaNumber = 2;
  CV27SetupGridWnd& outputs = open("CNadResultDlg");
  int col = 1;
  while (outputs.GetColHeader(col) != "K") ++col;
  EXPECT_EQ(outputs.PickRowCol(1, col)->area, 2);
  EXPECT_EQ(outputs.StorePickRowCol(1, col, std::array{point(3, 4), point(5, 4)}), 1);
  EXPECT_EQ(cell(outputs, 1, col - 1), "3-5,1");
  EXPECT_EQ(cell(outputs, 1, col), "4-4,1");
}

TEST_F(MapPicks, WhatIsNotEditedIsNotPicked) {
  fill();
  root().boundary->defaultPosition = 1;
  EXPECT_FALSE(open("CBoundaryDlg").PickRowCol(1, 1).has_value());
  EXPECT_EQ(page->form().controls().empty(), false);
  EXPECT_EQ(open("CBoundaryDlg").StorePickRowCol(1, 1, std::array{point(0, 5)}), 0);
  EXPECT_EQ(root().boundary->at(1).first, (GridPoint{0, 2}));
  EXPECT_FALSE(open("CBathymetryDlg").PickRowCol(1, 3).has_value());  // Area 1 lies in none
  EXPECT_TRUE(open("CBathymetryDlg").PickRowCol(2, 3).has_value());
  root().bathymetry->hotStart = 1;
  EXPECT_FALSE(open("CBathymetryDlg").PickRowCol(2, 3).has_value());
  root().sourceSink->at(1).type = CSourceSinkObjectKvs::kIsolatedSource;
  EXPECT_TRUE(open("CSourceSinkDlg").PickRowCol(2, 2).has_value());
  EXPECT_FALSE(open("CSourceSinkDlg").PickRowCol(2, 4).has_value());
  EXPECT_FALSE(open("CSourceSinkDlg").PickRowCol(1, 2).has_value());  // headers
  EXPECT_FALSE(open("CSourceSinkDlg").PickRowCol(9, 9).has_value());
}

TEST_F(MapPicks, APlaceOnTheMapIsThatOfACell) {
  fill();
  map->scene();
  const MapPoint place{500000 + 30 * 6.1, 6000000 + 30 * 5};
  using Of = CellPick::Of;
  EXPECT_EQ(map->placeFor({.of = Of::area, .area = 1}, place)->point, (GridPoint{6, 5}));
  const PickedPlace finest = *map->placeFor({.of = Of::finest}, place);
  EXPECT_EQ(finest.area, 2);
  EXPECT_EQ(finest.point, (GridPoint{3, 3}));
  EXPECT_EQ(text(*map->placeOf({.of = Of::finest}, finest)), "500180,6000150");
  EXPECT_EQ(map->placeFor({.of = Of::border}, {500020, 6000200})->point, (GridPoint{0, 7}));
  EXPECT_FALSE(map->placeFor({.of = Of::area, .area = 2}, {500020, 6000200}).has_value());
  EXPECT_FALSE(map->placeFor({.of = Of::area, .area = 7}, place).has_value());
  EXPECT_FALSE(map->placeOf({.of = Of::area, .area = 7}, {}).has_value());
  // Of another zone, and back.
  const CellPick other{.of = Of::coordinates, .projection = "UTM-33"};
  const PickedPlace there = *map->placeFor(other, place);
  EXPECT_NEAR(there.x, 108000, 3000);
  EXPECT_EQ(text(*map->placeOf(other, there)), text(place));
  EXPECT_FALSE(map->placeFor({.of = Of::coordinates, .projection = "no such"}, place).has_value());
}

}  // namespace map_picks_test
}  // namespace gridbay
