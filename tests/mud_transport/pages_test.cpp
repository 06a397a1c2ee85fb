#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "mud_transport/boundary.h"
#include "mud_transport/box_summation.h"
#include "mud_transport/dispersion_coef.h"
#include "mud_transport/initial_concentration.h"
#include "mud_transport/line_discharge.h"
#include "mud_transport/result.h"
#include "mud_transport/source_sink.h"
#include "mud_transport/starting_conditions.h"
#include "mud_transport/task_selection.h"
#include "platform/units/units.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_pages_test {

class MudPages : public test::ShapeTest {
 protected:
  MudPages() {
    root().bathymetry->SetNoAreas(2);
    root().boundary->SetNoBoundaries(2);
    root().sourceSink->SetNoSources(2);
    root().sourceSink->GetItem(1)->source = {1, 2};
    host.chosenFile = folder.write("chosen", "");
  }
  void openPage(std::string_view pageClass, std::int32_t dialogTemplate, PageId id) {
    PageTest::open(pageClass);
    EXPECT_EQ(page->templateId(), dialogTemplate);
    EXPECT_EQ(page->pageId(), id);
  }
  static Labels rowHeadersOf(CV27SetupGridWnd& grid) {
    Labels all;
    for (int row = 1; row <= grid.GetRowCount(); ++row) all.push_back(grid.GetRowHeader(row));
    return all;
  }
  CNmtTaskSelectionKvs& task() { return *root().nmtTaskSelection; }
  using test::ShapeTest::grid;

  test::TemporaryFolder folder;
};

class MudTaskPage : public MudPages {
 protected:
  MudTaskPage() { openPage("CNmtTaskSelectionDlg", 18835, PageId::mtTaskSelection); }
  // The choice and the three values, with what can be used.
  std::string state() {
    std::string all = std::to_string(control("Task").index);
    for (const char* label : {"Number of fractions:", "Number of layers:"})
      all += " " + text(label) + (control(label).usable() ? "x" : ".");
    const Control& salinity = control("Include salinity component");
    return all + " " + std::to_string(salinity.index) + (salinity.usable() ? "x" : ".");
  }
};

TEST_F(MudTaskPage, Controls) {
  EXPECT_EQ(labels(), (Labels{"Select task", "Task", "Number of fractions:", "(Max 8)",
                              "Number of layers:", "(Max 12)", "Salinity", "Include salinity component"}));
  EXPECT_EQ(control("Task").choices, (Labels{"Multi fraction", "Multi layer"}));
  EXPECT_EQ(state(), "0 3x 1. 0.");
}

TEST_F(MudTaskPage, ATaskBeginsWithThree) {
  choose("Task", 1);
  EXPECT_EQ(state(), "1 1. 3x 0x");
  EXPECT_EQ(root().nmtInitialConcentration->GetCount(), 4);
  EXPECT_TRUE(document.IsModified());
  EXPECT_EQ(document.UndoStep()->name, "Task");
  edit("Number of layers:", "5");
  control("Include salinity component").index = 1;
  page->form().act(control("Include salinity component"));
  EXPECT_EQ(state(), "1 1. 5x 1x");
  EXPECT_EQ(root().nmtInitialConcentration->GetCount(), 7);
  EXPECT_EQ(root().nmtBoundary->at(1).constants.size(), 2U);
  EXPECT_EQ(root().nmtSourceSink->at(1).constants.size(), 3U);
  choose("Task", 0);
  EXPECT_EQ(state(), "0 3x 1. 0.");
  EXPECT_EQ(root().nmtInitialConcentration->GetCount(), 3);
  EXPECT_FALSE(task().includeSalinity);
  document.Undo();
  EXPECT_EQ(state(), "1 1. 5x 1x");
  EXPECT_EQ(root().nmtInitialConcentration->GetCount(), 7);
  document.Redo();
  EXPECT_EQ(state(), "0 3x 1. 0.");
}

TEST_F(MudTaskPage, TheTaskThatIsChosenAlreadyKeepsItsCount) {
  edit("Number of fractions:", "6");
  choose("Task", 0);
  EXPECT_EQ(state(), "0 6x 1. 0.");
}

TEST_F(MudTaskPage, TheCountsHaveLimitsThatTheModelLacks) {
  for (const char* good : {"0", "8"}) {
    edit("Number of fractions:", good);
    EXPECT_EQ(std::to_string(task().fractions), good);
  }
  for (const char* bad : {"9", "-1", "x", "2.5"}) {
    edit("Number of fractions:", bad);
    EXPECT_EQ(task().fractions, 8) << bad;
  }
  choose("Task", 1);
  edit("Number of layers:", "12");
  EXPECT_EQ(task().layers, 12);
  edit("Number of layers:", "13");
  EXPECT_EQ(task().layers, 12);
  task().SetFractions(20);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(text("Number of fractions:"), "20");
}

TEST_F(MudTaskPage, SalinityOfAFileWithFractionsIsKept) {
  task().SetSalinity(true);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(state(), "0 3x 1. 1.");
  edit("Number of fractions:", "4");
  EXPECT_EQ(state(), "0 4x 1. 1.");
  EXPECT_EQ(root().nmtInitialConcentration->GetCount(), 5);
}

TEST_F(MudPages, StartingConditions) {
  openPage("CNmtStartingConditionsDlg", 18834, PageId::mtStartingConditions);
  CNmtStartingConditionsKvs& start = *root().nmtStartingConditions;
  EXPECT_EQ(labels(),
            (Labels{"Simulation Period", "Time step range:", "First:", "Last:", "Type", "Calculation Method",
                    "Integration period:", "First:", "Last:", "Max relative decrease:", "Hot start files"}));
  EXPECT_EQ(text("Last:", 1), "100");
  EXPECT_EQ(text("Last:", 2), "100");
  EXPECT_EQ(text("Max relative decrease:"), "0.1");
  edit("First:", "5");
  edit("Last:", "50");
  edit("First:", "6", 2);
  edit("Last:", "60", 2);
  edit("Max relative decrease:", "0.5");
  EXPECT_EQ(start.firstStep, 5);
  EXPECT_EQ(start.lastStep, 50);
  EXPECT_EQ(start.integrationStart, 6);
  EXPECT_EQ(start.integrationEnd, 60);
  EXPECT_EQ(start.maximumDecrease, 0.5F);
  EXPECT_EQ(headers(), (Labels{"", "Hot Start File", "", ""}));
  EXPECT_EQ(PageTest::grid().GetRowCount(), 2);
  EXPECT_EQ(control("Type").choices, (Labels{"Cold start", "Hot start"}));
  EXPECT_EQ(usableOf(PageTest::grid(), 1), "x..");
  choose("Type", 1);
  EXPECT_TRUE(start.hotStart);
  EXPECT_EQ(usableOf(PageTest::grid(), 1), "xx.");
  PageTest::grid().OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(host.filters, Labels{"HotStart files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(start.GetItem(1)->file.text(), *host.chosenFile);
}

TEST_F(MudPages, InitialConditions) {
  task().SetLayers(1);
  task().SetSalinity(true);
  openPage("CNmtInitialConcentrationDlg", 18820, PageId::mtInitialConcentration);
  CV27SetupGridWnd& bands = PageTest::grid();
  CNmtInitialConcentrationKvs& initial = *root().nmtInitialConcentration;
  EXPECT_EQ(headers(), (Labels{"Area", "Type", "Value", "File Name", "", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{50, 100, 60, 210, 30, 45}));
  EXPECT_EQ(bands.GetRowCount(), 9);
  EXPECT_EQ(cell(1, 1), "Component :   Salinity");
  EXPECT_EQ(cell(4, 1), "Component :   Fraction");
  EXPECT_EQ(cell(7, 1), "Component :   Thickness layer no. 1");
  EXPECT_THAT(style(2, 2).toolTip, ::testing::StartsWith("Salinity"));
  EXPECT_THAT(style(5, 2).toolTip, ::testing::StartsWith("Concentration"));
  EXPECT_THAT(style(8, 2).toolTip, ::testing::StartsWith("Layer thickness"));
  // A concentration has a format and a constant for each area, a layer one for all.
  EXPECT_EQ(store(6, 2, "2.5"), 1);
  EXPECT_EQ(cell(5, 2), "0.000000");
  EXPECT_EQ(initial.at(2).at(2).value, 2.5F);
  EXPECT_EQ(store(9, 2, "1.5"), 1);
  EXPECT_EQ(cell(8, 2), "1.500000");
  EXPECT_EQ(initial.at(3).at(1).value, 1.5F);
  EXPECT_EQ(store(9, 1, "Type 2 data file"), 1);
  EXPECT_EQ(usableOf(bands, 8), "x.xx.");
  EXPECT_EQ(usableOf(bands, 9), "x.xx.");
  EXPECT_EQ(usableOf(bands, 6), "xx...");
  bands.OnClickedButtonRowCol(9, 4);
  EXPECT_EQ(host.filters, Labels{"Initial Condition Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(initial.at(3).at(2).file.fileName.text(), *host.chosenFile);
  EXPECT_TRUE(initial.at(3).at(1).file.fileName.empty());
  EXPECT_EQ(usableOf(bands, 9), "x.xxx");
}

TEST_F(MudPages, Boundaries) {
  task().SetLayers(2);
  task().SetSalinity(true);
  openPage("CNmtBoundaryDlg", 18808, PageId::mtBoundary);
  CV27SetupGridWnd& upper = grid("Boundary concentrations");
  CV27SetupGridWnd& lower = grid("Constant concentrations");
  EXPECT_EQ(upper.GetRowCount(), 2);
  EXPECT_EQ(styleIn(upper, 1, 1).choices, (Labels{"Constant value", "Type 0 data file", "Type 1 data file"}));
  EXPECT_EQ(rowHeadersOf(lower), (Labels{"Salinity", "Fraction"}));
  EXPECT_EQ(lower.GetColCount(), 2);
  EXPECT_EQ(lower.StoreStyleRowCol(2, 1, "7"), 1);
  EXPECT_EQ(root().nmtBoundary->at(1).constants[1], 7.0F);
  EXPECT_THAT(styleIn(lower, 1, 1).toolTip, ::testing::StartsWith("Salinity"));
  EXPECT_THAT(styleIn(lower, 2, 1).toolTip, ::testing::StartsWith("Concentration"));
  EXPECT_EQ(upper.StoreStyleRowCol(2, 1, "Type 0 data file"), 1);
  EXPECT_EQ(usableOf(lower, 1), "x.");
  task().SetFractions(3);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(rowHeadersOf(lower),
            (Labels{"Fraction no. 1", "Fraction no. 2", "Fraction no. 3", "Fraction no. 4"}));
}

TEST_F(MudPages, Sources) {
  openPage("CNmtSourceSinkDlg", 18833, PageId::mtSourceSink);
  EXPECT_EQ(headers(), (Labels{"Source Sink", "Given as", "Fraction no. 1", "Fraction no. 2",
                               "Fraction no. 3", "File name", "", ""}));
  EXPECT_EQ(usableOf(PageTest::grid(), 1), "xxxx...");
  task().SetLayers(2);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(headers(), (Labels{"Source Sink", "Given as", "Fraction", "File name", "", ""}));
  task().SetSalinity(true);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(store(1, 2, "30"), 1);
  EXPECT_EQ(root().nmtSourceSink->at(1).constants[0], 30.0F);
  EXPECT_THAT(style(1, 2).toolTip, ::testing::StartsWith("Salinity"));
  EXPECT_EQ(store(1, 1, "Type 0 data file"), 1);
  EXPECT_EQ(usableOf(PageTest::grid(), 1), "x..xx.");
  // More entries than constants, as a file with salinity leaves them.
  task().SetFractions(2);
  root().nmtSourceSink->at(2).constants = {1};
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(usableOf(PageTest::grid(), 2), "xx.....");
}

TEST_F(MudPages, Dispersion) {
  openPage("CNmtDispersionCoefDlg", 18814, PageId::mtDispersionCoef);
  choose("Dispersion", 1);
  edit("Max. value:", "4");
  EXPECT_EQ(root().nmtDispersionCoef->maximum, 4.0F);
  EXPECT_EQ(control("Max. value:").itemCode, item::kDispersionCoefficient);
  EXPECT_EQ(grid("X-direction").GetRowCount(), 2);
}

TEST_F(MudPages, LinesAndBoxes) {
  for (const bool isLine : {true, false}) {
    if (isLine) {
      root().nmtLineDischarge->SetCount(1);
      openPage("CNmtLineDischargeDlg", 18822, PageId::mtLineDischarge);
    } else {
      root().nmtBoxSummation->SetCount(1);
      openPage("CNmtBoxSummationDlg", 18810, PageId::mtBoxSummation);
    }
    LineOrBox& item = isLine ? static_cast<LineOrBox&>(root().nmtLineDischarge->at(1))
                             : static_cast<LineOrBox&>(root().nmtBoxSummation->at(1));
    EXPECT_EQ(labels(), (isLine ? Labels{"Number of Lines", "Output Size", "Lines"}
                                : Labels{"Number of Boxes", "Output Size", "Boxes"}));
    EXPECT_EQ(store(1, 6, "l.tsb0"), 1);
    EXPECT_EQ(item.file.text(), "l.tsb0");
    host.titles.clear();
    Labels fields;
    host.fillForm = [&fields](Form& form) {
      for (const Control& it : form.controls()) fields.push_back(it.label);
      form.controls()[1].text = "7";
      return true;
    };
    PageTest::grid().OnClickedButtonRowCol(1, 2);
    EXPECT_EQ(host.titles,
              Labels{isLine ? "Line for Discharge Calculations" : "Box for Summation Calculations"});
    EXPECT_THAT(fields, ::testing::Contains(isLine ? "First point:" : "Lower-left point:"));
    EXPECT_EQ(item.first.j, 7);
  }
}

TEST_F(MudPages, Results) {
  CNmtResultKvs& results = *root().nmtResult;
  results.outputs.SetCount(1);
  openPage("CNmtResultDlg", 18830, PageId::mtResult);
  EXPECT_EQ(labels(),
            (Labels{"Number of Output Areas", "Size of MT output", "Output areas", "Include layers in output",
                    "Net sedimentation", "Generate hot Start", "Generate hot start", "Hot start files"}));
  EXPECT_EQ(control("Net sedimentation").choices,
            (Labels{"Net sedimentation in mm", "Net sedimentation in g/m^2"}));
  EXPECT_THAT(text("Size of MT output"), ::testing::EndsWith(" MB"));
  EXPECT_EQ(control("Include layers in output").index, 1);
  EXPECT_EQ(control("Net sedimentation").index, 0);
  choose("Net sedimentation", 1);
  choose("Include layers in output", 0);
  choose("Generate hot Start", 1);
  EXPECT_EQ(results.netSedimentationInMm, 0);
  EXPECT_EQ(results.includeLayers, 0);
  EXPECT_TRUE(results.generateHotStart);
  EXPECT_EQ(grid("Hot start files").GetRowCount(), 2);
  choose("Net sedimentation", 0);
  EXPECT_EQ(results.netSedimentationInMm, 1);
}

}  // namespace mud_transport_pages_test
}  // namespace gridbay
