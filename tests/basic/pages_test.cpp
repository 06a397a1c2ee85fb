// The pages of the basic parameters, driven by their labels and cells.

#include "tests/support/pages.h"

#include <gmock/gmock.h>

#include <cmath>

#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "hydrodynamic/boundary.h"
#include "tests/support/grids.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace basic_pages_test {

using test::PageTest;

class ModuleSelectionPage : public PageTest {
 protected:
  ModuleSelectionPage() { open("CModuleSelectionDlg"); }
  CModuleSelectionKvs& selection() { return *root().moduleSelection; }
};

TEST_F(ModuleSelectionPage, Controls) {
  EXPECT_EQ(labels(), (Labels{"Module", "AD Scheme", "Select scheme:", "HD Calculations",
                              "High precision calculations", "Inland Flooding"}));
  EXPECT_EQ(control("Module").choices,
            (Labels{"Hydrodynamic only", "Hydrodynamic and Advection-Dispersion",
                    "Hydrodynamic and Mud Transport", "Hydrodynamic and BIO Rig"}));
  EXPECT_EQ(control("Select scheme:").choices,
            (Labels{"QUICKEST", "ULTIMATE", "simple UPWIND", "2D UPWIND"}));
  EXPECT_FALSE(control("HD Calculations").visible);
  EXPECT_FALSE(control("High precision calculations").visible);
  EXPECT_EQ(page->templateId(), 18716);
  EXPECT_EQ(page->pageId(), PageId::moduleSelection);
}

TEST_F(ModuleSelectionPage, EachRadioIsACode) {
  for (const auto& [radio, code] : {std::pair{1, 2}, {2, 8}, {3, 9}, {0, 0}}) {
    choose("Module", radio);
    EXPECT_EQ(selection().simulationType, code);
    page->SetData();
    EXPECT_EQ(control("Module").index, radio);
  }
  selection().simulationType = 11;
  page->SetData();
  EXPECT_EQ(control("Module").index, 4);
  page->UpdateDoc();
  EXPECT_EQ(selection().simulationType, 11);
}

TEST_F(ModuleSelectionPage, Code3BecomesHydrodynamicOnTheFirstStore) {
  selection().simulationType = 3;
  page->SetData();
  EXPECT_EQ(control("Module").index, 0);
  page->UpdateDoc();
  EXPECT_EQ(selection().simulationType, 0);
}

TEST_F(ModuleSelectionPage, TheTwoFramesStretchAndNothingElse) {
  for (Control& it : page->form().controls()) {
    EXPECT_EQ(it.alignRight, it.kind == ControlKind::group) << it.label;
    EXPECT_FALSE(it.alignBottom) << it.label;
  }
}

TEST_F(ModuleSelectionPage, EachSchemeIsAValue) {
  choose("Module", 1);
  for (const auto& [place, scheme] : {std::pair{1, 5}, {2, -5}, {3, -1}, {0, 1}}) {
    choose("Select scheme:", place);
    EXPECT_EQ(selection().adScheme, scheme);
    page->SetData();
    EXPECT_EQ(control("Select scheme:").index, place);
  }
  selection().adScheme = 77;
  page->SetData();
  EXPECT_EQ(control("Select scheme:").index, 0);
}

TEST_F(ModuleSelectionPage, MudTransportAndInlandFloodingExcludeEachOther) {
  EXPECT_FALSE(control("Select scheme:").enabled);
  choose("Module", 2);
  EXPECT_TRUE(control("Select scheme:").enabled);
  EXPECT_FALSE(control("Inland Flooding").enabled);
  choose("Module", 1);
  EXPECT_TRUE(control("Inland Flooding").enabled);
  choose("Inland Flooding", 1);
  EXPECT_EQ(selection().hydrodynamicFeatures, 0);
  EXPECT_FALSE(control("Module").choiceEnabled[2]);
  EXPECT_TRUE(control("Module").choiceEnabled[3]);
}

class AreaDescriptionPage : public PageTest {
 protected:
  AreaDescriptionPage() { open("CAreaDescriptionDlg"); }
};

TEST_F(AreaDescriptionPage, EditsReachTheModelAtOnce) {
  EXPECT_EQ(labels(), (Labels{"Enable flooding and drying", "Drying depth:", "Flooding depth:"}));
  EXPECT_EQ(text("Drying depth:"), "0.02");
  edit("Drying depth:", " 0.01 ");
  edit("Flooding depth:", "0.25");
  EXPECT_EQ(root().areaDescription->dryingDepth, 0.01F);
  EXPECT_EQ(root().areaDescription->floodingDepth, 0.25F);
  EXPECT_TRUE(document.IsModified());
  EXPECT_TRUE(document.HasBeenTouched(PageId::floodAndDry));
  document.UnTouch(PageId::floodAndDry);
  EXPECT_FALSE(document.HasBeenTouched(PageId::floodAndDry));
}

TEST_F(AreaDescriptionPage, ATextThatIsNoNumberIsRefused) {
  edit("Drying depth:", "deep");
  EXPECT_EQ(root().areaDescription->dryingDepth, 0.02F);
  EXPECT_EQ(host.texts, Labels{"Drying depth: \"deep\" is not a number"});
  EXPECT_FALSE(document.IsModified());
}

TEST_F(AreaDescriptionPage, TheFlagIsHiddenAndKeptAndDecides) {
  EXPECT_FALSE(control("Enable flooding and drying").visible);
  root().areaDescription->enableFloodAndDryChecking = 0;
  page->SetData();
  EXPECT_FALSE(control("Drying depth:").enabled);
  EXPECT_FALSE(control("Flooding depth:").enabled);
  page->UpdateDoc();
  EXPECT_EQ(root().areaDescription->enableFloodAndDryChecking, 0);
}

TEST_F(AreaDescriptionPage, ValuesAreShownInTheUsersUnitAndHeldInTheBaseUnit) {
  document.units().setSystem(UnitSystem::us);
  page->SetData();
  EXPECT_EQ(text("Drying depth:"), "0.0656168");
  EXPECT_EQ(control("Drying depth:").unit, "ft");
  page->UpdateDoc();  // an edit of nothing changes nothing
  EXPECT_EQ(root().areaDescription->dryingDepth, 0.02F);
  edit("Flooding depth:", "1");
  EXPECT_EQ(root().areaDescription->floodingDepth, 0.3048F);
  EXPECT_EQ(root().areaDescription->dryingDepth, 0.02F);
}

class SimulationPeriodPage : public PageTest {
 protected:
  SimulationPeriodPage() { open("CSimulationPeriodDlg"); }
  CSimulationPeriodKvs& period() { return *root().simulationPeriod; }
};

TEST_F(SimulationPeriodPage, ControlsAndTheEnd) {
  EXPECT_EQ(labels(),
            (Labels{"Simulation", "Time step range:", "First:", "Last:", "Time step interval:",
                    "Simulation start date:", "Simulation end date:", "Warm-up Period",
                    "Time step range:", "First:", "Last:", "Courant Number", "Max Courant No:", "Area:"}));
  EXPECT_EQ(text("First:"), "0");
  EXPECT_EQ(text("First:", 2), "0");
  EXPECT_EQ(text("Last:"), "100");
  EXPECT_EQ(text("Simulation end date:"), "1990-01-01 12:50:00");
  EXPECT_FALSE(control("Simulation end date:").enabled);
  edit("Last:", "200");
  EXPECT_EQ(period().noPointsInTime, 201);
  EXPECT_EQ(text("Simulation end date:"), "1990-01-01 13:40:00");
  edit("Time step interval:", "60");
  EXPECT_EQ(text("Simulation end date:"), "1990-01-01 15:20:00");
  edit("Simulation start date:", "2007-06-08 00:00:00");
  EXPECT_EQ(text("Simulation end date:"), "2007-06-08 03:20:00");
  edit("Last:", "7", 2);
  EXPECT_EQ(period().warmUpPeriod, 7);
}

TEST_F(SimulationPeriodPage, ADateThatIsNoneIsRefused) {
  edit("Simulation start date:", "2007-02-30");
  EXPECT_EQ(dateTimeText(period().start), "1990-01-01 12:00:00");
  EXPECT_EQ(host.texts.size(), 1U);
}

TEST_F(SimulationPeriodPage, AHotStartsPeriodIsOnlyShown) {
  root().bathymetry->hotStart = 1;
  page->SetData();
  EXPECT_TRUE(control("Time step interval:").readOnly);
  EXPECT_FALSE(control("Simulation start date:").enabled);
  EXPECT_FALSE(control("Last:", 2).enabled);
  EXPECT_TRUE(control("Last:").enabled);
  root().bathymetry->hotStart = 0;
  page->SetData();
  EXPECT_FALSE(control("Time step interval:").readOnly);
  EXPECT_TRUE(control("Last:", 2).enabled);
}

TEST_F(SimulationPeriodPage, TheCourantNumberFollowsTheTimeStep) {
  EXPECT_EQ(text("Max Courant No:"), "");  // not known yet
  CBathymetryObjectKvs& area = *root().bathymetry->GetArea(1);
  area.dx = 10;
  area.grid = CVdArray2D<float>(1, 1);
  area.grid.values()[0] = -10;
  edit("Time step interval:", "2");
  EXPECT_EQ(text("Max Courant No:"), fmt::format("{:.6g}", 2 * std::sqrt(10 * 9.82 / 100)));
  EXPECT_EQ(text("Area:"), "1");
}

TEST_F(SimulationPeriodPage, TheCourantNumberIsKnownOnceTheGridsAre) {
  EXPECT_EQ(text("Max Courant No:"), "");
  EXPECT_EQ(text("Area:"), "");
  EXPECT_EQ(control("Max Courant No:").toolTip, "Not known before a validation: area 1");
  CBathymetryObjectKvs& area = *root().bathymetry->GetArea(1);
  area.dx = 10;
  area.grid = CVdArray2D<float>(1, 1);
  area.grid.values()[0] = -10;
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(text("Max Courant No:"), fmt::format("{:.6g}", 30 * std::sqrt(10 * 9.82 / 100)));
  EXPECT_EQ(control("Max Courant No:").toolTip, "");
}

TEST_F(SimulationPeriodPage, MoreStepsThanCanBeCountedAreRefused) {
  edit("Last:", "2147483646");
  EXPECT_EQ(period().noPointsInTime, 2147483647);
  edit("Last:", "2147483647");
  EXPECT_EQ(period().noPointsInTime, 2147483647);
  EXPECT_NE(control("Last:").fault, "");
}

TEST_F(SimulationPeriodPage, FramesHoldTheirControls) {
  EXPECT_EQ(control("Last:").group, &control("Time step range:"));
  EXPECT_EQ(control("Time step range:").group, &control("Simulation"));
  EXPECT_EQ(control("Last:", 2).group->group, &control("Warm-up Period"));
  EXPECT_EQ(control("Simulation start date:").kind, ControlKind::dateTime);
}

TEST_F(SimulationPeriodPage, AStartThatIsNoDateIsKeptUntilThereIsOne) {
  period().start = DateTime::invalid();
  page->SetData();
  EXPECT_EQ(text("Simulation start date:"), "no date");
  edit("Last:", "50");
  EXPECT_EQ(period().noPointsInTime, 51);
  EXPECT_FALSE(period().start.valid());
  edit("Simulation start date:", "2001-02-03 04:05:06");
  EXPECT_EQ(dateTimeText(period().start), "2001-02-03 04:05:06");
}

class BathymetryPage : public PageTest {
 protected:
  void SetUp() override {
    path = folder.file("grid.tsb2");
    test::writeGrid(path, {.noJ = 4, .noK = 3}, [](int j, int) { return j == 0 ? -1.0F : 10.0F; });
    open("CBathymetryDlg");
  }
  CBathymetryKvs& areas() { return *root().bathymetry; }
  static constexpr const char* kOverland = "Multi-cell overland solver for inland applications:            ";
  test::TemporaryFolder folder;
  std::string path;
};

TEST_F(BathymetryPage, ControlsOfTheEditions) {
  const bool sweep = theEdition.wetlandSweepKit;
  EXPECT_EQ(control("Type").choices, (Labels{"Cold start", "Hot start"}));
  EXPECT_EQ(control("Number of areas").visible, !sweep);
  EXPECT_EQ(control("Apply Coriolis forcing:").visible, !sweep);
  EXPECT_EQ(control("Landslides:").visible, !sweep);
  EXPECT_EQ(headers(), (Labels{"", "Bathymetry", "", "Origin", "Enclosing Area", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{30, 210, 30, 60, 100, 45}));
  choose("Type", 1);
  EXPECT_EQ(areas().hotStart, 1);
}

TEST_F(BathymetryPage, TheNumberOfAreas) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition has one area";
  spin("Number of areas", 2);
  EXPECT_EQ(areas().GetCount(), 3);
  EXPECT_EQ(grid().GetRowCount(), 3);
  spin("Number of areas", 7);
  EXPECT_EQ(areas().GetCount(), 3);
  spin("Number of areas", -3);
  EXPECT_EQ(areas().GetCount(), 0);
  EXPECT_EQ(grid().GetRowCount(), 0);
  EXPECT_EQ(store(1, 1, "x"), 0);
  edit("Number of areas", "12");
  EXPECT_EQ(areas().GetCount(), 0);
}

TEST_F(BathymetryPage, TheRowsOfTheGrid) {
  areas().SetNoAreas(2);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(cell(1, 3), "");
  EXPECT_EQ(cell(1, 4), "");
  EXPECT_TRUE(style(1, 3).readOnly);
  EXPECT_TRUE(style(1, 4).readOnly);
  EXPECT_EQ(cell(2, 3), "(3,3)");
  EXPECT_EQ(cell(2, 4), "1");
  EXPECT_EQ(store(2, 3, " (4,5) "), 1);
  EXPECT_EQ(store(2, 3, "6,7"), 1);
  EXPECT_EQ(areas().GetArea(2)->origin, (GridPoint{6, 7}));
  for (const char* bad : {"6", "1;2", "x", ""}) EXPECT_EQ(store(2, 3, bad), 0) << bad;
  EXPECT_EQ(cell(2, 3), "(6,7)");
  EXPECT_EQ(store(2, 4, "x"), 1);
  EXPECT_EQ(areas().GetArea(2)->enclosingArea, 0);
  EXPECT_EQ(cell(1, 5), "View...");
  EXPECT_FALSE(style(1, 5).enabled);
  areas().hotStart = 1;
  EXPECT_TRUE(style(2, 3).readOnly);
  EXPECT_EQ(store(2, 3, "1,1"), 0);
}

TEST_F(BathymetryPage, ACellOfAnAreaThatIsGoneShowsAndTakesNothing) {
  areas().SetNoAreas(2);
  EXPECT_EQ(store(2, 3, "4,5"), 1);
  areas().SetNoAreas(1);
  CellStyle shown;
  for (int col = 1; col <= grid().GetColCount(); ++col) {
    EXPECT_EQ(grid().GetStyleRowCol(2, col, shown), 0) << col;
    EXPECT_EQ(shown.value, "") << col;
    EXPECT_EQ(store(2, col, "1,1"), 0) << col;
    grid().OnClickedButtonRowCol(2, col);
  }
  EXPECT_TRUE(host.filters.empty());
  EXPECT_EQ(areas().GetCount(), 1);
}

TEST_F(BathymetryPage, AFileForArea1DetectsBoundaries) {
  EXPECT_EQ(store(1, 1, path), 1);
  EXPECT_EQ(root().boundary->GetCount(), 3);
  EXPECT_TRUE(host.questions.empty());
  EXPECT_FALSE(areas().projectionStale);
  host.answer = false;
  root().boundary->GetItem(1)->Set(7, 7, 7, 7);
  store(1, 1, path);
  EXPECT_EQ(host.questions,
            Labels{"Recalculate Boundaries?\r\nNote: Recalculating boundaries will cause all boundary "
                   "information to be reset to default."});
  EXPECT_EQ(root().boundary->GetItem(1)->Text(), "(7,7) - (7,7)");
  host.answer = true;
  store(1, 1, path);
  EXPECT_EQ(root().boundary->GetItem(1)->Text(), "(0,0) - (0,2)");
  root().boundary->defaultPosition = 0;
  store(1, 1, "none");
  EXPECT_EQ(host.questions.size(), 2U);
  EXPECT_EQ(root().boundary->GetCount(), 3);
}

TEST_F(BathymetryPage, TheButtonsOfARow) {
  grid().OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(host.filters, Labels{"Bathymetry (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(areas().GetArea(1)->fileName.text(), "");
  grid().OnClickedButtonRowCol(1, 5);
  EXPECT_TRUE(host.opened.empty());
  host.chosenFile = path;
  test::writeGrid(path, {.geography = TsbGeography{"UTM-32", 9, 55, 0}});
  areas().projection = "UTM-31";
  grid().OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(areas().GetArea(1)->fileName.text(), path);
  EXPECT_EQ(areas().projection, "UTM-32");  // the old one was stale
  grid().OnClickedButtonRowCol(1, 5);
  EXPECT_EQ(host.opened, Labels{path});
}

TEST_F(BathymetryPage, TheProjectionIsThatOfTheFileOrPicked) {
  EXPECT_FALSE(control("Map projection:").enabled);
  EXPECT_FALSE(control("Apply Coriolis forcing:").enabled);
  EXPECT_EQ(control("Apply Coriolis forcing:").index, 0);
  test::writeGrid(path, {.geography = TsbGeography{"UTM-32", 9, 55, 0}});
  areas().GetArea(1)->fileName = path;
  areas().projection = "";
  page->SetData();
  EXPECT_TRUE(control("Map projection:").enabled);
  EXPECT_EQ(control("Map projection:").choices[0], "UTM-32");
  EXPECT_EQ(control("Apply Coriolis forcing:").index, 1);
  const auto& choices = control("Map projection:").choices;
  choose("Map projection:", static_cast<int>(std::ranges::find(choices, "UTM-33") - choices.begin()));
  EXPECT_EQ(areas().projection, "UTM-33");
}

TEST_F(BathymetryPage, TheOverlandSolver) {
  EXPECT_FALSE(control("Fine bathymetry file").visible);
  EXPECT_FALSE(control("Edit").visible);
  choose(kOverland, 1);
  EXPECT_TRUE(areas().overlandSolver);
  EXPECT_TRUE(control("Fine bathymetry file").visible);
  EXPECT_FALSE(control("Number of areas").enabled);
  EXPECT_FALSE(control("Landslides:").enabled);
  press("...");
  EXPECT_EQ(host.texts, Labels{"The bathymetry of Area 1 must be defined first."});
  areas().GetArea(1)->fileName = path;
  host.chosenFile = path;
  press("...");
  EXPECT_EQ(host.filters, Labels{"Bathymetry Files (*.tsb2)|*.tsb2||"});
  EXPECT_EQ(areas().overlandFile.text(), path);
  press("Edit");
  EXPECT_EQ(host.opened, Labels{path});
  edit("Fine bathymetry file", "none");
  press("Edit");
  EXPECT_EQ(host.opened.size(), 1U);
  choose(kOverland, 0);
  EXPECT_FALSE(control("Fine bathymetry file").visible);
  EXPECT_TRUE(control("Number of areas").enabled);
}

TEST_F(BathymetryPage, APointIsReadFromTheFront) {
  areas().SetNoAreas(2);
  EXPECT_EQ(store(2, 3, "(1,2"), 1);
  EXPECT_EQ(cell(2, 3), "(1,2)");
  EXPECT_EQ(store(2, 3, "3,4x"), 1);
  EXPECT_EQ(areas().GetArea(2)->origin, (GridPoint{3, 4}));
}

TEST_F(BathymetryPage, WithNoProjectionThereIsNoCoriolisForce) {
  areas().coriolis = true;
  page->SetData();
  EXPECT_EQ(control("Apply Coriolis forcing:").index, 0);
  choose("Type", 1);
  EXPECT_FALSE(areas().coriolis);
}

TEST_F(BathymetryPage, TheCoriolisForceCanBeSwitchedOff) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition has none";
  test::writeGrid(path, {.geography = TsbGeography{"UTM-32", 9, 55, 0}});
  store(1, 1, path);
  EXPECT_EQ(control("Apply Coriolis forcing:").index, 1);
  choose("Apply Coriolis forcing:", 0);
  EXPECT_FALSE(areas().coriolis);
  EXPECT_EQ(control("Apply Coriolis forcing:").index, 0);
}

TEST_F(BathymetryPage, ATypedFileBringsItsProjection) {
  test::writeGrid(path, {.geography = TsbGeography{"UTM-32", 9, 55, 0}});
  areas().projection = "UTM-31";
  store(1, 1, path);
  EXPECT_EQ(areas().projection, "UTM-32");
  EXPECT_EQ(control("Map projection:").choices[0], "UTM-32");
  EXPECT_EQ(control("Map projection:").index, 0);
  EXPECT_TRUE(control("Map projection:").enabled);
  EXPECT_FALSE(areas().projectionStale);
}

// Keeps what it was asked for.
class SelectorHost final : public test::TestHost {
 public:
  bool choose(CVdFileSelectorDlg& selector) override {
    started = selector.GetSelectedItems();
    for (const std::vector<std::uint32_t>& items : {std::vector<std::uint32_t>{1}, {2}, {1, 2}}) {
      std::string why;
      selector.IsTsbFileValid(file, items, &why);
      faults.push_back(why);
    }
    return false;
  }
  std::string file;
  std::vector<std::uint32_t> started;
  std::vector<std::string> faults;
};

TEST_F(BathymetryPage, AFineBathymetryMayHaveSeveralItems) {
  SelectorHost selecting;
  CV27SetupDoc own(selecting);
  selecting.file = folder.file("fine.tsb2");
  test::writeGrid(selecting.file, {.noJ = 8, .noK = 6, .dx = 15, .dy = 15, .items = 2});
  own.root().bathymetry->GetArea(1)->fileName = path;
  own.root().bathymetry->overlandSolver = true;
  const auto opened = makePage("CBathymetryDlg", own);
  opened->form().act(*opened->form().find("..."));
  EXPECT_EQ(selecting.started, std::vector<std::uint32_t>{1});
  EXPECT_EQ(selecting.faults,
            (Labels{"", "Please select the first item only.", "Please select the first item only."}));
}

TEST_F(BathymetryPage, ALookAtArea1ChangesNothing) {
  const CBathymetryObjectKvs& area = *areas().GetArea(1);
  areas().GetArea(1)->fileName = path;
  choose(kOverland, 1);
  press("...");
  EXPECT_EQ(host.filters.size(), 1U);
  EXPECT_EQ(area.noJ, 0);
  EXPECT_EQ(area.dx, 0);
  EXPECT_FALSE(area.contains(0, 0));
  test::writeHotStart(path, {}, test::flat, 1, 2, 3);
  areas().hotStart = 1;
  page->SetData();
  press("...");
  EXPECT_EQ(host.filters.size(), 2U);
  EXPECT_EQ(area.origin, (GridPoint{3, 3}));
  EXPECT_EQ(area.enclosingArea, 0);
  EXPECT_EQ(dateTimeText(root().simulationPeriod->start), "1990-01-01 12:00:00");
}

TEST_F(BathymetryPage, AFileIsAnEditWithItsButtonsBesideIt) {
  EXPECT_TRUE(control("Fine bathymetry file").isFile);
  EXPECT_TRUE(control("...").beside);
  EXPECT_TRUE(control("Edit").beside);
}

class BoundaryPage : public PageTest {
 protected:
  BoundaryPage() { open("CBoundaryDlg"); }
  CBoundaryKvs& boundaries() { return *root().boundary; }
};

TEST_F(BoundaryPage, UserSpecified) {
  EXPECT_EQ(control("Default position").choices, (Labels{"User specified", "Program detected"}));
  EXPECT_EQ(control("Default position").index, 1);
  EXPECT_FALSE(control("Number of boundaries").enabled);
  spin("Number of boundaries", 1);
  EXPECT_EQ(boundaries().GetCount(), 0);
  choose("Default position", 0);
  edit("Number of boundaries", "2");
  spin("Number of boundaries", 1);
  EXPECT_EQ(boundaries().GetCount(), 3);
  EXPECT_EQ(root().nhdBoundary->GetCount(), 3);
  EXPECT_EQ(text("Number of boundaries"), "3");
  EXPECT_EQ(widths(), (std::vector<int>{30, 90, 90}));
  EXPECT_EQ(style(1, 1).align, CellAlign::right);
  EXPECT_EQ(store(3, 1, "0,5"), 1);
  EXPECT_EQ(store(3, 2, "(0,9)"), 1);
  EXPECT_EQ(cell(3, 1), "(0,5)");
  EXPECT_EQ(boundaries().GetItem(3)->Text(), "(0,5) - (0,9)");
  EXPECT_EQ(store(3, 2, "7"), 0);
  EXPECT_EQ(cell(3, 2), "(0,9)");
  spin("Number of boundaries", 12);
  EXPECT_EQ(boundaries().GetCount(), 3);
}

TEST_F(BoundaryPage, ProgramDetectedFindsThemAndResetsAllConditions) {
  const test::TemporaryFolder folder;
  test::writeGrid(folder.file("g.tsb2"), {.noJ = 4, .noK = 3},
                  [](int j, int) { return j == 0 ? -1.0F : 10.0F; });
  root().bathymetry->GetArea(1)->fileName = folder.file("g.tsb2");
  choose("Default position", 0);
  choose("Default position", 1);
  EXPECT_EQ(boundaries().GetCount(), 3);
  EXPECT_EQ(text("Number of boundaries"), "3");
  EXPECT_TRUE(style(1, 1).readOnly);
  EXPECT_EQ(store(1, 1, "0,1"), 0);
  root().nhdBoundary->GetItem(1)->value = 5;
  page->UpdateDoc();
  EXPECT_EQ(root().nhdBoundary->GetItem(1)->value, 0);
}

TEST_F(BoundaryPage, MoreThanThePageGivesCanBeChangedAndTakenAway) {
  boundaries().defaultPosition = 0;
  boundaries().SetNoBoundaries(20);
  page->SetData();
  EXPECT_EQ(text("Number of boundaries"), "20");
  EXPECT_EQ(store(20, 1, "1,2"), 1);
  EXPECT_EQ(boundaries().GetCount(), 20);
  EXPECT_EQ(boundaries().GetItem(20)->first, (GridPoint{1, 2}));
  spin("Number of boundaries", 1);
  EXPECT_EQ(boundaries().GetCount(), 20);
  spin("Number of boundaries", -1);
  EXPECT_EQ(boundaries().GetCount(), 19);
  edit("Number of boundaries", "15");
  EXPECT_EQ(boundaries().GetCount(), 15);
  edit("Number of boundaries", "16");
  EXPECT_EQ(boundaries().GetCount(), 15);
}

TEST_F(BoundaryPage, ItsGridStretchesAndNothingElse) {
  EXPECT_TRUE(control("Boundaries").alignRight);
  EXPECT_TRUE(control("Boundaries").alignBottom);
  EXPECT_FALSE(control("Default position").alignRight);
  EXPECT_FALSE(control("Number of boundaries").alignRight);
}

class SourceSinkPage : public PageTest {
 protected:
  SourceSinkPage() {
    open("CSourceSinkDlg");
    edit("Number of source sink pairs", "1");
  }
  CSourceSinkObjectKvs& entry() { return *root().sourceSink->GetItem(1); }
};

TEST_F(SourceSinkPage, TwoHeaderRowsAndARowForEachEntry) {
  EXPECT_EQ(headers(), (Labels{"", "Type", "Source", "", "Sink", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{30, 125, 75, 75, 75, 75}));
  EXPECT_EQ(grid().GetRowCount(), 2);
  EXPECT_EQ((Labels{cell(1, 1), cell(1, 2), cell(1, 3), cell(1, 4), cell(1, 5)}),
            (Labels{"", "Point", "Area", "Point", "Area"}));
  EXPECT_EQ(grid().GetRowHeader(2), "1");
  EXPECT_EQ(store(1, 2, "1,1"), 0);
  EXPECT_EQ((Labels{cell(2, 1), cell(2, 2), cell(2, 3)}), (Labels{"Isolated Source", "(0,0)", "1"}));
}

TEST_F(SourceSinkPage, TheTypeDecidesWhatCanBeEdited) {
  EXPECT_FALSE(style(2, 4).enabled);
  EXPECT_FALSE(style(2, 5).enabled);
  EXPECT_EQ(store(2, 4, "1,1"), 0);
  EXPECT_EQ(store(2, 1, "Isolated Sink"), 1);
  EXPECT_FALSE(style(2, 2).enabled);
  EXPECT_TRUE(style(2, 4).enabled);
  EXPECT_EQ(store(2, 1, "Source and Sink pair"), 1);
  EXPECT_EQ(entry().type, 2);
  EXPECT_EQ(store(2, 2, "(1,2)"), 1);
  EXPECT_EQ(store(2, 4, "3,4"), 1);
  EXPECT_EQ(entry().Text(), "(1,2)->(3,4) ");
  EXPECT_EQ(store(2, 4, "3;4"), 0);
  EXPECT_EQ(store(2, 1, "Another"), 0);
  EXPECT_FALSE(style(2, 3).editable());
  EXPECT_EQ(store(2, 3, "2x"), 1);
  EXPECT_EQ(entry().sourceArea, 2);
}

TEST_F(SourceSinkPage, AreasAreGreyAndHeadersCoverTwoColumns) {
  for (const int col : {3, 5}) {
    EXPECT_EQ(style(2, col).kind, CellKind::label);
    EXPECT_TRUE(style(2, col).isGrey);
  }
  EXPECT_TRUE(style(2, 3).enabled);
  EXPECT_TRUE(style(1, 2).isHeader);
  EXPECT_EQ(grid().GetHeaderSpan(2), 2);
  EXPECT_EQ(grid().GetHeaderSpan(3), 0);
  EXPECT_EQ(grid().GetHeaderSpan(4), 2);
}

TEST_F(SourceSinkPage, TheCount) {
  spin("Number of source sink pairs", 1);
  EXPECT_EQ(root().sourceSink->GetCount(), 2);
  edit("Number of source sink pairs", "70000");
  EXPECT_EQ(root().sourceSink->GetCount(), 2);
  edit("Number of source sink pairs", "0");
  EXPECT_EQ(grid().GetRowCount(), 1);
  CellStyle none;
  EXPECT_EQ(grid().GetStyleRowCol(2, 1, none), 0);
}

class MassBudgetPage : public PageTest {
 protected:
  MassBudgetPage() {
    root().moduleSelection->simulationType = 2;
    open("CMassBudgetDlg");
    edit("&Number of polygons:", "2");
  }
  CMassBudgetKvs& list() { return *root().massBudget; }
};

TEST_F(MassBudgetPage, OneColumnForEachPolygon) {
  list().GetItem(1)->corners = {{1, 2}};
  EXPECT_EQ(headers(), (Labels{"Polygon", "1", "2"}));
  EXPECT_EQ(grid().GetRowCount(), 6);
  EXPECT_EQ(grid().GetRowHeader(1), "Associated area");
  EXPECT_EQ(grid().GetRowHeader(2), "No. of corner points");
  EXPECT_EQ(grid().GetRowHeader(3), "Corner point 1");
  EXPECT_EQ((Labels{cell(1, 1), cell(2, 1), cell(3, 1), cell(4, 1)}), (Labels{"1", "1", "1,2", ""}));
  EXPECT_EQ(store(4, 1, "5,5"), 0);
}

TEST_F(MassBudgetPage, Edits) {
  EXPECT_EQ(store(1, 2, "3"), 1);
  EXPECT_EQ(list().GetItem(2)->associatedArea, 3);
  EXPECT_EQ(store(2, 2, "5"), 1);
  EXPECT_EQ(list().GetItem(2)->corners.back(), (GridPoint{1, 1}));
  EXPECT_EQ(store(7, 2, "8,9"), 1);
  EXPECT_EQ(list().GetItem(2)->corners.back(), (GridPoint{8, 9}));
  EXPECT_EQ(store(7, 2, "8"), 0);
  EXPECT_EQ(store(7, 2, "(3,4)"), 0);
  EXPECT_EQ(store(2, 2, "-1"), 0);
  EXPECT_EQ(store(2, 2, "x"), 0);
  EXPECT_EQ(list().GetItem(2)->corners.size(), 5U);
  grid().SetRebuilding(true);
  EXPECT_EQ(store(2, 2, "1"), 0);
}

TEST_F(MassBudgetPage, IsAvailableForTransportWithTwoSchemes) {
  const auto available = [this](std::int32_t code, std::int32_t scheme) {
    root().moduleSelection->simulationType = code;
    root().moduleSelection->adScheme = scheme;
    page->SetData();
    EXPECT_EQ(grid().GetColCount(), control("&Number of polygons:").enabled ? 2 : 0);
    return control("&Number of polygons:").enabled;
  };
  for (const std::int32_t code : {2, 8, 9}) {
    EXPECT_TRUE(available(code, 1));
    EXPECT_TRUE(available(code, -1));
    EXPECT_FALSE(available(code, 5));
  }
  EXPECT_FALSE(available(0, 1));
  EXPECT_FALSE(available(3, 1));
  spin("&Number of polygons:", 1);
  EXPECT_EQ(list().GetCount(), 2);
  available(2, 1);
  spin("&Number of polygons:", 299);
  EXPECT_EQ(list().GetCount(), 2);
  spin("&Number of polygons:", 298);
  EXPECT_EQ(list().GetCount(), 300);
}

}  // namespace basic_pages_test
}  // namespace gridbay
