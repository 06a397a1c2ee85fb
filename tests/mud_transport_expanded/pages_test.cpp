// The pages of counts, start, concentrations, forcings and outputs.

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/dispersion_coef.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/initial_conditions.h"
#include "mud_transport_expanded/line_discharge.h"
#include "mud_transport_expanded/mass_budget.h"
#include "mud_transport_expanded/result.h"
#include "mud_transport_expanded/sources.h"
#include "mud_transport_expanded/starting_conditions.h"
#include "mud_transport_expanded/task_selection.h"
#include "mud_transport_expanded/wave_database.h"
#include "mud_transport_expanded/waves.h"
#include "setup/dlg_enumerator.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_expanded_pages_test {

class ExpandedMudPages : public test::ShapeTest {
 protected:
  using PageTest::open;
  using ShapeTest::grid;

  CNmtExpTaskSelectionKvs& task = *root().nmtExpTaskSelection;
  CNmtExpForcingsKvs& forcings = *root().nmtExpForcings;
  CNmtExpWavesKvs& waves = *root().nmtExpWaves;
  CNmtExpWaveDatabaseKvs& database = *root().nmtExpWaveDatabase;
  CNmtExpInitialConditionsKvs& initial = *root().nmtExpInitialConditions;
  test::TemporaryFolder folder;
};

TEST_F(ExpandedMudPages, HaveTheirNumbers) {
  CDlgEnumerator enumerator;
  for (const int id : {63, 64, 68, 73, 74, 75, 76, 79, 84, 85, 86, 88, 91, 92}) {
    std::string topic;
    std::string local;
    open(enumerator.GetPageClass(id, &topic, &local));
    ASSERT_NE(page, nullptr) << id;
    EXPECT_EQ(static_cast<int>(page->pageId()), id);
    EXPECT_EQ(page->templateId() + 131072, enumerator.GetHelpTopicNumber(id)) << id;
  }
}

TEST_F(ExpandedMudPages, Counts) {
  open("CNmtExpTaskSelectionDlg");
  EXPECT_EQ(labels(), (Labels{"Number of grain size fractions:", "Number of bed layers:",
                              "Include salinity component", "Include xenobiotics parameters"}));
  edit("Number of grain size fractions:", "3");
  edit("Number of bed layers:", "2");
  choose("Include salinity component", 1);
  choose("Include xenobiotics parameters", 1);
  EXPECT_EQ(task.fractions, 3);
  EXPECT_EQ(task.layers, 2);
  EXPECT_TRUE(task.includeSalinity && task.includeXenobiotics);
  EXPECT_EQ(initial.components.GetCount(), 4);
  // 1 to 8 each.
  for (const char* label : {"Number of grain size fractions:", "Number of bed layers:"}) {
    edit(label, "9");
    edit(label, "0");
    EXPECT_NE(text(label), "9");
    edit(label, "8");
    spin(label, 1);
    EXPECT_EQ(text(label), "8");
    edit(label, "1");
    spin(label, -1);
    EXPECT_EQ(text(label), "1");
  }
  choose("Include salinity component", 0);
  EXPECT_EQ(initial.components.GetCount(), 1);
}

TEST_F(ExpandedMudPages, StartingConditions) {
  open("CNmtExpStartingConditionsDlg");
  EXPECT_EQ(labels(),
            (Labels{"Simulation Period", "Time step range:", "First:", "Last:", "Type", "Calculation Method",
                    "Integration period:", "First:", "Last:", "Hot start files"}));
  CNmtExpStartingConditionsKvs& start = *root().nmtExpStartingConditions;
  edit("First:", "1");
  edit("Last:", "90");
  edit("First:", "2", 2);
  edit("Last:", "80", 2);
  EXPECT_EQ(start.firstStep, 1);
  EXPECT_EQ(start.lastStep, 90);
  EXPECT_EQ(start.integrationStart, 2);
  EXPECT_EQ(start.integrationEnd, 80);
  EXPECT_EQ(usableOf(grid("Hot start files"), 1), "x..");
  choose("Type", 1);
  EXPECT_TRUE(start.hotStart);
  EXPECT_EQ(usableOf(grid("Hot start files"), 1), "xx.");
}

TEST_F(ExpandedMudPages, InitialConditions) {
  root().bathymetry->SetNoAreas(2);
  task.SetCounts(2, 3, true);
  open("CNmtExpInitialConditionsDlg");
  EXPECT_EQ(labels(), (Labels{"Initial concentrations", "Initial bed thickness", "Bed distribution"}));
  CV27SetupGridWnd& concentrations = grid("Initial concentrations");
  ASSERT_EQ(concentrations.GetRowCount(), 4 * 3);
  EXPECT_EQ(styleIn(concentrations, 1, 1).value, "Component :   Salinity");
  EXPECT_EQ(styleIn(concentrations, 4, 1).value, "Component :   Fraction no. 1");
  EXPECT_EQ(textIn(concentrations, 2, 2), "40.000000");
  EXPECT_EQ(usableOf(concentrations, 2), "xx...");
  EXPECT_EQ(concentrations.StoreStyleRowCol(3, 2, "35"), 1);
  EXPECT_EQ(initial.components.at(1).at(2).value, 35);
  EXPECT_EQ(concentrations.StoreStyleRowCol(5, 1, "Type 2 data file"), 1);
  EXPECT_EQ(initial.components.at(2).at(1).format, 1);
  EXPECT_EQ(usableOf(concentrations, 5), "x.xx.");
  EXPECT_EQ(usableOf(concentrations, 6), "xx...");
}

TEST_F(ExpandedMudPages, AThicknessIsCommonToAllAreasButForItsMaps) {
  root().bathymetry->SetNoAreas(2);
  task.SetCounts(2, 1, false);
  open("CNmtExpInitialConditionsDlg");
  CV27SetupGridWnd& thickness = grid("Initial bed thickness");
  ASSERT_EQ(thickness.GetRowCount(), 2 * 3);
  EXPECT_EQ(styleIn(thickness, 4, 1).value, "Layer no. 2");
  EXPECT_EQ(thickness.StoreStyleRowCol(6, 2, "1.5"), 1);
  EXPECT_EQ(initial.thicknesses.at(2).at(1).value, 1.5F);
  EXPECT_EQ(textIn(thickness, 5, 2), "1.500000");
  EXPECT_EQ(thickness.StoreStyleRowCol(5, 1, "Type 2 data file"), 1);
  EXPECT_EQ(usableOf(thickness, 6), "x.xx.");
  EXPECT_EQ(thickness.StoreStyleRowCol(6, 3, "t.tsb2"), 1);
  EXPECT_EQ(initial.thicknesses.at(2).at(2).file.fileName.text(), "t.tsb2");
  host.chosenFile = folder.write("map.tsb2", "");
  host.chosenItems = {2};
  thickness.OnClickedButtonRowCol(5, 4);
  EXPECT_EQ(initial.thicknesses.at(2).at(1).file.items, (std::vector<std::uint32_t>{2}));
  EXPECT_EQ(host.filters, Labels{"Initial Condition Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
}

TEST_F(ExpandedMudPages, TheDistributionOfTheFractionsInEachLayer) {
  task.SetCounts(2, 3, false);
  open("CNmtExpInitialConditionsDlg");
  CV27SetupGridWnd& distribution = grid("Bed distribution");
  Labels headers;
  for (int col = 0; col <= distribution.GetColCount(); ++col)
    headers.push_back(distribution.GetColHeader(col));
  EXPECT_EQ(headers, (Labels{"", "Fraction no. 1", "Fraction no. 2", "Fraction no. 3", "Total"}));
  EXPECT_EQ(distribution.GetRowHeader(2), "Layer no. 2");
  EXPECT_EQ(rowOf(distribution, 1), (Labels{"34", "33", "33", "100"}));
  EXPECT_EQ(usableOf(distribution, 1), "xxx.");
  EXPECT_EQ(distribution.StoreStyleRowCol(2, 3, "50"), 1);
  EXPECT_EQ(rowOf(distribution, 2), (Labels{"34", "33", "50", "117"}));
  EXPECT_EQ(distribution.StoreStyleRowCol(2, 3, "x"), 0);
  EXPECT_EQ(initial.distribution.at(2).percentages, (std::vector<std::int32_t>{34, 33, 50}));
}

TEST_F(ExpandedMudPages, Boundaries) {
  root().boundary->SetNoBoundaries(2);
  task.SetCounts(1, 1, true);
  open("CNmtExpBoundaryDlg");
  CV27SetupGridWnd& constants = grid("Constant concentrations");
  EXPECT_EQ(constants.GetRowHeader(1), "Salinity");
  EXPECT_EQ(constants.GetRowHeader(2), "Fraction no. 1");
  EXPECT_EQ(constants.StoreStyleRowCol(1, 2, "31"), 1);
  EXPECT_EQ(root().nmtExpBoundary->at(2).constants[0], 31);
  EXPECT_EQ(grid("Boundary concentrations").StoreStyleRowCol(1, 1, "Type 1 data file"), 1);
  EXPECT_EQ(root().nmtExpBoundary->at(1).format, 2);
  EXPECT_EQ(usableOf(constants, 1), ".x");
}

TEST_F(ExpandedMudPages, Sources) {
  root().sourceSink->SetNoSources(1);
  task.SetCounts(1, 1, true);
  open("CNmtExpSourcesDlg");
  EXPECT_EQ(headers(),
            (Labels{"Source Sink", "Given as", "Salinity", "Fraction no. 1", "File name", "", ""}));
  EXPECT_EQ(cell(1, 2), "20.000000");
  EXPECT_EQ(store(1, 3, "0.5"), 1);
  EXPECT_EQ(root().nmtExpSources->at(1).constants, (std::vector<float>{20, 0.5F}));
  EXPECT_EQ(usableOf(grid("Source concentrations"), 1), "xxx...");
}

TEST_F(ExpandedMudPages, Dispersion) {
  open("CNmtExpDispersionCoefDlg");
  edit("Constant:", "5");
  EXPECT_EQ(root().nmtExpDispersionCoef->constantX, 5);
  choose("Dispersion", 1);
  EXPECT_EQ(root().nmtExpDispersionCoef->proportional, 1);
  EXPECT_FALSE(control("Constant:").usable());
}

TEST_F(ExpandedMudPages, Forcings) {
  open("CNmtExpForcingsDlg");
  EXPECT_EQ(labels(), (Labels{"Include Waves", "Include Dredging"}));
  choose("Include Waves", 1);
  choose("Include Dredging", 1);
  EXPECT_EQ(forcings.includeWaves, 1);
  EXPECT_EQ(forcings.includeDredging, 1);
}

TEST_F(ExpandedMudPages, Waves) {
  open("CNmtExpWavesDlg");
  EXPECT_EQ(labels(), (Labels{"Type", "Include liquefaction", "Liquefaction factor",
                              "Minimum water depth for including waves"}));
  EXPECT_EQ(control("Type").choices,
            (Labels{"Use constant waves", "Use time and space varying waves", "Use wave database"}));
  choose("Type", 2);
  EXPECT_EQ(waves.typeOfWaveVariation, 3);
  EXPECT_FALSE(control("Liquefaction factor").usable());
  choose("Include liquefaction", 1);
  edit("Liquefaction factor", "2");
  edit("Minimum water depth for including waves", "0.5");
  EXPECT_EQ(waves.liquefactionFactor, 2);
  EXPECT_EQ(waves.minimumDepth, 0.5F);
}

TEST_F(ExpandedMudPages, ConstantWaves) {
  open("CNmtExpConstantWavesDlg");
  EXPECT_EQ(labels(), (Labels{"Wave height:", "Wave period:", "Wave direction:"}));
  edit("Wave height:", "1");
  edit("Wave period:", "7");
  edit("Wave direction:", "270");
  EXPECT_EQ(root().nmtExpConstantWaves->height, 1);
  EXPECT_EQ(root().nmtExpConstantWaves->period, 7);
  EXPECT_EQ(root().nmtExpConstantWaves->direction, 270);
}

TEST_F(ExpandedMudPages, WavesFromAFile) {
  open("CNmtExpTSVWaves");
  edit("Data file:", "w.tsb2");
  EXPECT_EQ(root().nmtExpTsvWaves->file.fileName.text(), "w.tsb2");
  host.chosenFile = folder.write("x.tsb2", "");
  host.chosenItems = {1, 2, 3};
  press("...");
  EXPECT_EQ(root().nmtExpTsvWaves->file.fileName.text(), *host.chosenFile);
  EXPECT_EQ(root().nmtExpTsvWaves->file.items, (std::vector<std::uint32_t>{1, 2, 3}));
}

TEST_F(ExpandedMudPages, TheWaveDatabase) {
  open("CNmtExpWaveDatabaseDlg");
  edit("Number:", "2");
  edit("Number:", "3", 2);
  EXPECT_EQ(database.maps.GetCount(), 6);
  EXPECT_EQ(headers(), (Labels{"", "Wind speed", "Water level", "Wind direction", "File Name", "", ""}));
  EXPECT_EQ(rowOf(grid("Wave maps"), 5),
            (Labels{"10.000000", "0.000000", "180.000000", "", "  ...  ", "View..."}));
  EXPECT_EQ(usableOf(grid("Wave maps"), 5), "...xx.");
  EXPECT_EQ(store(5, 4, "w.tsb2"), 1);
  EXPECT_EQ(database.maps.at(5).file.text(), "w.tsb2");
  edit("Start:", "2", 3);
  EXPECT_EQ(database.waterLevelStart, 2);
  edit("Number:", "0");
  EXPECT_EQ(database.windSpeeds, 2);
  EXPECT_THAT(host.texts, ::testing::IsEmpty());
}

TEST_F(ExpandedMudPages, TooManyWaveMapsAreToldAndTakenBack) {
  open("CNmtExpWaveDatabaseDlg");
  edit("Number:", "20");
  edit("Number:", "6", 2);
  EXPECT_EQ(database.maps.GetCount(), 120);
  edit("Number:", "2", 3);
  EXPECT_EQ(host.texts, Labels{"Number of wavemaps should be less or equal to 120"});
  EXPECT_EQ(text("Number:", 3), "1");
  EXPECT_EQ(database.waterLevels, 1);
  edit("Number:", "121");
  EXPECT_EQ(text("Number:"), "20");
  EXPECT_EQ(host.texts.size(), 2U);
}

TEST_F(ExpandedMudPages, AnAxisThatDoesNotGoOnIsTold) {
  open("CNmtExpWaveDatabaseDlg");
  edit("Increment:", "0", 2);
  EXPECT_THAT(host.texts, ::testing::IsEmpty());  // with one value it need not
  edit("Number:", "2", 2);
  EXPECT_EQ(host.texts, Labels{"Increments must be different from 0"});
  edit("Start:", "8");
  EXPECT_EQ(host.texts.size(), 2U);
  edit("Increment:", "30", 2);
  EXPECT_EQ(host.texts.size(), 2U);
  EXPECT_EQ(database.windDirections, 2);
}

TEST_F(ExpandedMudPages, LinesHaveWhatIsCarried) {
  task.SetCounts(1, 2, true);
  root().nmtExpLineDischarge->SetCount(1);
  open("CNmtExpLineDischargeDlg");
  host.fillForm = [](Form& form) {
    CV27SetupGridWnd& items = *form.find("Items")->grid;
    EXPECT_EQ(items.GetRowCount(), 3);
    EXPECT_EQ(textIn(items, 1, 1), "Salinity");
    return items.StoreStyleRowCol(2, 2, "0") == 1;
  };
  CV27SetupGridWnd& lines = grid("Lines");
  lines.OnClickedButtonRowCol(1, lines.GetColCount());
  EXPECT_EQ(root().nmtExpLineDischarge->at(1).entries, (EntryFlags{1, 0, 1}));
}

TEST_F(ExpandedMudPages, MassFilesHaveFurtherVariables) {
  root().nmtExpMassBudget->SetCount(1);
  open("CNmtExpMassBudgetDlg");
  host.fillForm = [](Form& form) {
    CV27SetupGridWnd& items = *form.find("Items")->grid;
    Labels names;
    for (int row = 1; row <= items.GetRowCount(); ++row) names.push_back(textIn(items, row, 1));
    EXPECT_EQ(names, (Labels{"Fraction no. 1", "Total suspended mass", "Total bed mass", "Total mass"}));
    return items.StoreStyleRowCol(1, 2, "0") == 1 && items.StoreStyleRowCol(3, 2, "1") == 1;
  };
  grid("Files").OnClickedButtonRowCol(1, 7);
  const MassFile& file = *root().nmtExpMassBudget->GetMassFile(1);
  EXPECT_EQ(file.entries, EntryFlags{0});
  EXPECT_EQ(file.variables, (EntryFlags{0, 1, 0}));
}

TEST_F(ExpandedMudPages, OutputsHaveADialogForTheirItems) {
  CNmtExpResultKvs& results = *root().nmtExpResult;
  results.outputs.SetCount(1);
  open("CNmtExpResultDlg");
  EXPECT_EQ(labels(), (Labels{"Number of Output Areas", "Size of MT output", "Output areas",
                              "Generate hot Start", "Generate hot start", "Hot start files"}));
  EXPECT_EQ(headers(), (Labels{"", "Area", "J", "K", "Time", "", "Data File", "...", "", "Title", ""}));
  host.fillForm = [](Form& form) {
    EXPECT_EQ(form.find("Items for:")->text, "Output 1");
    CV27SetupGridWnd& items = *form.find("Items")->grid;
    EXPECT_EQ(textIn(items, 3, 1), "Bed Mass Layer 1 Fraction 1");
    return items.StoreStyleRowCol(3, 2, "1") == 1;
  };
  grid("Output areas").OnClickedButtonRowCol(1, 10);
  EXPECT_EQ(results.outputs.at(1).WrittenItems(), 1);
  EXPECT_EQ(results.outputs.at(1).items[2], 1);
  edit("Number of Output Areas", "18");
  EXPECT_EQ(results.outputs.GetCount(), 18);
  choose("Generate hot Start", 1);
  EXPECT_TRUE(results.generateHotStart);
}

TEST_F(ExpandedMudPages, ThePeriodIsTakenOverWhenItsPageIsLeft) {
  CNmtExpStartingConditionsKvs& start = *root().nmtExpStartingConditions;
  start.firstStep = start.integrationStart = 7;
  open("CSimulationPeriodDlg");
  root().simulationPeriod->noPointsInTime = 501;
  page->OnLeave();
  EXPECT_EQ((std::vector{start.firstStep, start.lastStep, start.integrationStart, start.integrationEnd}),
            (std::vector{0, 500, 0, 500}));
}

TEST_F(ExpandedMudPages, AnotherGridResetsTheDispersionUntilThatIsTheUsers) {
  root().bathymetry->SetNoAreas(2);
  for (const int area : {1, 2}) {
    root().bathymetry->GetArea(area)->dx = area == 1 ? 90.0F : 30.0F;
    root().bathymetry->GetArea(area)->dy = 20;
  }
  root().simulationPeriod->timeStepInterval = 3;
  CNmtExpDispersionCoefKvs& dispersion = *root().nmtExpDispersionCoef;
  open("CBathymetryDlg");
  EXPECT_EQ(grid("Areas").StoreStyleRowCol(2, 1, "y.tsb2"), 1);
  EXPECT_FLOAT_EQ(dispersion.constantX, 18);
  EXPECT_FLOAT_EQ(dispersion.constantY, 8);
  dispersion.constantX = 5;
  host.chosenFile = folder.write("z.tsb2", "");
  grid("Areas").OnClickedButtonRowCol(2, 2);  // chosen for another area than the first
  EXPECT_EQ(dispersion.constantX, 5);
  root().boundary->defaultPosition = 0;  // boundaries that are the user's own change nothing in that
  host.chosenFile = folder.write("w.tsb2", "");
  grid("Areas").OnClickedButtonRowCol(1, 2);
  EXPECT_FLOAT_EQ(dispersion.constantX, 18);
  dispersion.constantX = 5;
  document.Touch(PageId::mtExpDispersionCoef);
  EXPECT_EQ(grid("Areas").StoreStyleRowCol(2, 1, "x.tsb2"), 1);
  EXPECT_EQ(dispersion.constantX, 5);
}

}  // namespace mud_transport_expanded_pages_test
}  // namespace gridbay
