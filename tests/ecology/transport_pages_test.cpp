// The pages of the transported state variables, and of what is written of them.

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "ecology/boundary.h"
#include "ecology/deposition.h"
#include "ecology/dispersion.h"
#include "ecology/evaporation.h"
#include "ecology/infiltration.h"
#include "ecology/mass_budget.h"
#include "ecology/precipitation.h"
#include "ecology/results.h"
#include "ecology/source_sink.h"
#include "hydrodynamic/result.h"
#include "platform/units/units.h"
#include "tests/ecology/carried_model.h"
#include "tests/support/shapes.h"

namespace gridbay {
namespace ecology_transport_pages_test {

class WqsPages : public test::ShapeTest {
 protected:
  WqsPages() {
    root().bathymetry->SetNoAreas(2);
    root().boundary->SetNoBoundaries(2);
    root().boundary->GetItem(2)->Set(0, 5, 0, 9);
    root().sourceSink->SetNoSources(2);
    root().sourceSink->GetItem(1)->source = {1, 2};
    test::define(root(), folder, test::kCarriedModel);
    host.chosenFile = folder.write("chosen", "");
  }
  void openPage(std::string_view pageClass, std::int32_t templateId, PageId id) {
    PageTest::open(pageClass);
    EXPECT_EQ(page->templateId(), templateId);
    EXPECT_EQ(page->pageId(), id);
  }
  static Labels headersOf(CV27SetupGridWnd& grid) {
    Labels all;
    for (int col = 0; col <= grid.GetColCount(); ++col) all.push_back(grid.GetColHeader(col));
    return all;
  }
  static Labels rowHeadersOf(CV27SetupGridWnd& grid) {
    Labels all;
    for (int row = 1; row <= grid.GetRowCount(); ++row) all.push_back(grid.GetRowHeader(row));
    return all;
  }
  using test::ShapeTest::grid;

  test::TemporaryFolder folder;
};

TEST_F(WqsPages, Boundaries) {
  openPage("CWQSADBoundaryDlg", 18936, PageId::ecoBoundary);
  CV27SetupGridWnd& upper = grid("Boundary concentrations");
  CV27SetupGridWnd& lower = grid("Constant concentrations");
  EXPECT_EQ(headersOf(upper), (Labels{"Boundary", "Given as", "File name", "", ""}));
  EXPECT_EQ(rowHeadersOf(upper), (Labels{"1: (0,0) - (0,0)", "2: (0,5) - (0,9)"}));
  EXPECT_EQ(styleIn(upper, 1, 1).choices, (Labels{"Constant value", "Type 0 data file", "Type 1 data file"}));
  EXPECT_EQ(headersOf(lower), (Labels{"", "Boundary 1", "Boundary 2"}));
  EXPECT_EQ(rowHeadersOf(lower), (Labels{"1\r\nPHY", "2\r\nOXY"}));
  EXPECT_EQ(rowOf(lower, 2), (Labels{"8.000000", "8.000000"}));
  EXPECT_EQ(styleIn(lower, 1, 1).toolTip, "Range: 0 - 10");
  EXPECT_EQ(styleIn(lower, 2, 2).toolTip, "Range: 0 - 20");
  EXPECT_EQ(lower.StoreStyleRowCol(2, 1, "12"), 1);
  EXPECT_EQ(root().wqsAdBoundary->at(1).constants[1], 12);
  EXPECT_THAT(document.UndoStep()->name, ::testing::HasSubstr("Boundary 1, row 2 OXY"));
  for (const char* format : {"Type 0 data file", "Type 1 data file"}) {
    EXPECT_EQ(upper.StoreStyleRowCol(2, 1, format), 1);
    host.chosenItems = {2, 3};
    upper.OnClickedButtonRowCol(2, 3);
    EXPECT_EQ(usableOf(upper, 2), "xxxx");
    EXPECT_EQ(usableOf(lower, 1), "x.");
  }
  EXPECT_EQ(root().wqsAdBoundary->at(2).file.fileName.text(), *host.chosenFile);
  EXPECT_EQ(root().wqsAdBoundary->at(2).file.items, (std::vector<std::uint32_t>{2, 3}));
  EXPECT_EQ(host.filters, (Labels{"Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                                  "Profile (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"}));
}

// A value is shown, and its range told, in the user's unit.
TEST_F(WqsPages, InTheUsersUnit) {
  const auto* other = qunFindItem(item::kConcentration);
  ASSERT_GT(other->units.size(), 1U);
  document.units().choose(item::kConcentration, other->units[1]);
  const CVdUnitConverter convert(other->units[0], other->units[1]);
  PageTest::open("CWQSADBoundaryDlg");
  CV27SetupGridWnd& lower = grid("Constant concentrations");
  EXPECT_EQ(textIn(lower, 1, 1), formatted(Text{"%f"}, convert.Convert(1.5)));
  EXPECT_EQ(styleIn(lower, 1, 1).toolTip, formatted(Text{"Range: %g - %g"}, 0.0, convert.Convert(10)));
  EXPECT_EQ(textIn(lower, 2, 1), "8.000000");  // of no quantity
}

TEST_F(WqsPages, Sources) {
  openPage("CWQSADSourceSinkDlg", 18941, PageId::ecoSourceSink);
  CV27SetupGridWnd& sources = PageTest::grid();
  EXPECT_EQ(headers(), (Labels{"Source Sink", "Given as", "1\r\nPHY", "2\r\nOXY", "File name", "", ""}));
  EXPECT_EQ(sources.GetRowHeader(1), "1: (1,2)->");
  EXPECT_EQ(usableOf(sources, 1), "xxx...");
  EXPECT_EQ(store(1, 3, "7"), 1);
  EXPECT_EQ(root().wqsAdSourceSink->at(1).constants[1], 7);
  EXPECT_THAT(document.UndoStep()->name, ::testing::HasSubstr("2 OXY, row 1: (1,2)->"));
  EXPECT_EQ(style(1, 2).toolTip, "Range: 0 - 10");
  EXPECT_EQ(store(1, 1, "Type 0 data file"), 1);
  EXPECT_EQ(usableOf(sources, 1), "x..xx.");
  sources.OnClickedButtonRowCol(1, 5);
  EXPECT_EQ(usableOf(sources, 1), "x..xxx");
  test::define(root(), folder, test::kModelOfTheBed);
  EXPECT_EQ(headers(), (Labels{"Source Sink", "Given as", "File name", "", ""}));
}

TEST_F(WqsPages, RainEvaporationAndInfiltration) {
  const auto check = [this](std::string_view pageClass, std::int32_t templateId, PageId id, auto& values,
                            int shown) {
    openPage(pageClass, templateId, id);
    CV27SetupGridWnd& constants = grid("Constant concentrations");
    EXPECT_EQ(control("Given as").choices,
              (Labels{"From Ambient Water", "Constant Value", "Type 0 data file", "Type 2 data file"}));
    EXPECT_EQ(control("Given as").index, shown);
    choose("Given as", 1);
    EXPECT_EQ(rowHeadersOf(constants), (Labels{"PHY", "OXY"}));
    EXPECT_EQ(styleIn(constants, 2, 1).toolTip, "Range: 0 - 20");
    EXPECT_EQ(constants.StoreStyleRowCol(2, 1, "4"), 1);
    EXPECT_EQ(values.constants[1], 4);
    choose("Given as", 0);
    EXPECT_EQ(values.format, -3);
    EXPECT_EQ(usableOf(constants, 2), ".");
    EXPECT_FALSE(control("Data File").usable());
    choose("Given as", 2);
    EXPECT_EQ(values.format, 0);
    choose("Given as", 3);
    EXPECT_EQ(values.format, 2);
    press("...");
    EXPECT_EQ(values.file.fileName.text(), *host.chosenFile);
    test::define(root(), folder, test::kModelOfTheBed);
    EXPECT_EQ(constants.GetRowCount(), 0);
    test::define(root(), folder, test::kCarriedModel);
  };
  check("CWQSADPrecipitationDlg", 18940, PageId::ecoPrecipitation, *root().wqsAdPrecipitation, 1);
  check("CWQSADEvaporationDlg", 18939, PageId::ecoEvaporation, *root().wqsAdEvaporation, 1);
  check("CWQSADInfiltrationDlg", 18939, PageId::ecoInfiltration, *root().wqsAdInfiltration, 0);
}

TEST_F(WqsPages, Dispersion) {
  openPage("CWQSADDispersionDlg", 18938, PageId::ecoDispersion);
  CWQSADDispersionKvs& coefs = *root().wqsAdDispersion;
  choose("X-dir. given as:", 1);
  EXPECT_TRUE(grid("X-direction").IsEnabled());
  EXPECT_FALSE(grid("Y-direction").IsEnabled());
  grid("X-direction").OnClickedButtonRowCol(2, 2);
  EXPECT_EQ(coefs.filesX.at(2).file.fileName.text(), *host.chosenFile);
  edit("Constant:", "0.1", 2);
  EXPECT_EQ(coefs.constantY, 0.1);  // in full
  choose("Dispersion", 1);
  edit("Max. value:", "4");
  EXPECT_EQ(coefs.maximum, 4);
}

TEST_F(WqsPages, Deposition) {
  openPage("CWQSADDepositionDlg", 18937, PageId::ecoDeposition);
  EXPECT_EQ(labels(), (Labels{"Include Surface Deposition", "Surface deposition", "Include Soil Deposition",
                              "Soil deposition"}));
  CV27SetupGridWnd& surface = grid("Surface deposition");
  CV27SetupGridWnd& soil = grid("Soil deposition");
  EXPECT_FALSE(surface.IsEnabled());
  choose("Include Surface Deposition", 1);
  choose("Include Soil Deposition", 1);
  for (CV27SetupGridWnd* it : {&surface, &soil}) {
    EXPECT_TRUE(it->IsEnabled());
    EXPECT_EQ(it->GetRowCount(), 6);
    EXPECT_EQ(headersOf(*it), (Labels{"Area", "Type", "Value", "Unit", "File Name", "", ""}));
    EXPECT_EQ(textIn(*it, 4, 1), "State Variable :   OXY");
    EXPECT_EQ(styleIn(*it, 2, 1).choices, (Labels{"Constant value", "Type 2 data file"}));
    EXPECT_EQ(styleIn(*it, 5, 2).toolTip, "Range: 0 - 20");
    EXPECT_EQ(it->StoreStyleRowCol(6, 2, "2.5"), 1);
    EXPECT_EQ(it->StoreStyleRowCol(6, 1, "Type 2 data file"), 1);
    it->OnClickedButtonRowCol(6, 5);
    EXPECT_EQ(usableOf(*it, 6), "x..xxx");
  }
  EXPECT_EQ(host.filters, (Labels{"Surface Deposition (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||",
                                  "Soil Deposition (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"}));
  EXPECT_EQ(root().wqsAdDeposition->soil.at(2).at(2).format, 1);
  EXPECT_EQ(root().wqsAdDeposition->soil.at(2).at(2).value, 2.5);
}

TEST_F(WqsPages, NothingIsCarried) {
  test::define(root(), folder, test::kModelOfTheBed);
  for (const char* pageClass :
       {"CWQSADPrecipitationDlg", "CWQSADEvaporationDlg", "CWQSADInfiltrationDlg", "CWQSADDepositionDlg"}) {
    PageTest::open(pageClass);
    EXPECT_EQ(PageTest::grid().GetRowCount(), 0) << pageClass;
  }
  PageTest::open("CWQSADBoundaryDlg");
  EXPECT_EQ(grid("Constant concentrations").GetRowCount(), 0);
}

TEST_F(WqsPages, MassBudget) {
  openPage("CWQSMassBudgetDlg", 18946, PageId::ecoMassBudget);
  edit("&Number of files:", "1");
  EXPECT_EQ(headers(), (Labels{"File", "Associated polygon", "TRange", "Filename", "...", "", "Title", ""}));
  EXPECT_EQ(store(1, 2, "5-50,5"), 1);
  host.fillForm = [](Form& form) {
    CV27SetupGridWnd& items = *form.find("Items")->grid;
    EXPECT_EQ(items.GetRowCount(), 3);
    EXPECT_EQ(rowOf(items, 1), (Labels{"PHY", "1"}));
    EXPECT_EQ(rowOf(items, 2), (Labels{"BED", "0"}));
    return items.StoreStyleRowCol(3, 2, "1") == 1;
  };
  PageTest::grid().OnClickedButtonRowCol(1, 7);
  EXPECT_EQ(root().wqsMassBudget->GetItem(1)->entries, (EntryFlags{1, 0, 1}));
  EXPECT_EQ(host.titles, Labels{"Items Selection"});
}

class WqsResultsPage : public WqsPages {
 protected:
  WqsResultsPage() {
    root().bathymetry->GetArea(1)->noJ = 121;
    root().bathymetry->GetArea(1)->noK = 91;
    root().bathymetry->GetArea(1)->grid = CVdArray2D<float>(121, 91);
    results.outputs.SetCount(1);
    openPage("CWQSResultsDlg", 18948, PageId::ecoResults);
  }
  CWQSResultsKvs& results = *root().wqsResults;
};

TEST_F(WqsResultsPage, Outputs) {
  EXPECT_EQ(labels(), (Labels{"Number of Output Areas", "Size of BIO Rig Output", "Output areas",
                              "Create Hotstart Output", "Hot start files"}));
  CV27SetupGridWnd& outputs = grid("Output areas");
  EXPECT_EQ(headersOf(outputs),
            (Labels{"", "Area", "J", "K", "Time", "", "Data File", "...", "", "Title", "Averaged", ""}));
  EXPECT_EQ(rowOf(outputs, 1),
            (Labels{"1", "0-120,1", "0-90,1", "0-100,1", "...", "", "...", "View...", "", "0", "Items..."}));
  EXPECT_EQ(text("Size of BIO Rig Output"), "0.04 MB");
  EXPECT_EQ(store(1, 10, "1"), 1);
  EXPECT_TRUE(results.outputs.at(1).timeAveraged);
  EXPECT_EQ(store(1, 6, "r.tsb2"), 1);
  EXPECT_EQ(results.outputs.at(1).file.text(), "r.tsb2");
  outputs.OnClickedButtonRowCol(1, 7);
  EXPECT_EQ(host.filters,
            Labels{"Result files(*.tsb2)|*.tsb2|Result files (*.tb2)|*.tb2|All Files (*.*)|*.*||"});
  spin("Number of Output Areas", 1);
  EXPECT_EQ(results.outputs.GetCount(), 2);
}

TEST_F(WqsResultsPage, ItemsAreChosenInOneList) {
  results.outputs.at(1).stateVariables = {0, 1, 0};
  results.outputs.at(1).additionalItems = {0, 0, 1};
  host.fillForm = [](Form& form) {
    EXPECT_EQ(form.find("Items for:")->text, "Output area 1");
    CV27SetupGridWnd& items = *form.find("Items")->grid;
    Labels names;
    std::string chosen;
    for (int row = 1; row <= items.GetRowCount(); ++row) {
      names.push_back(textIn(items, row, 1));
      chosen += textIn(items, row, 2);
    }
    EXPECT_EQ(names, (Labels{"PHY", "BED", "OXY", "lux", "gro", "All"}));
    EXPECT_EQ(chosen, "010001");
    return items.StoreStyleRowCol(3, 2, "1") == 1 && items.StoreStyleRowCol(4, 2, "1") == 1 &&
           items.StoreStyleRowCol(6, 2, "0") == 1;
  };
  grid("Output areas").OnClickedButtonRowCol(1, 11);
  EXPECT_EQ(results.outputs.at(1).stateVariables, (EntryFlags{0, 1, 1}));
  EXPECT_EQ(results.outputs.at(1).additionalItems, (EntryFlags{1, 0, 0}));
  EXPECT_EQ(text("Size of BIO Rig Output"), "12.77 MB");
  host.fillForm = nullptr;
  grid("Output areas").OnClickedButtonRowCol(1, 11);
  EXPECT_EQ(results.outputs.at(1).stateVariables, (EntryFlags{0, 1, 1}));
}

TEST_F(WqsResultsPage, TheHotStartNeedsThatOfTheFlow) {
  CV27SetupGridWnd& hotStarts = grid("Hot start files");
  EXPECT_EQ(hotStarts.GetRowCount(), 2);
  EXPECT_EQ(usableOf(hotStarts, 1), "....");
  choose("Create Hotstart Output", 1);
  EXPECT_EQ(host.texts, Labels{"Hotstart Output not enabled in Hydrodynamic results"});
  EXPECT_FALSE(results.generateHotStart);
  EXPECT_EQ(control("Create Hotstart Output").index, 0);
  edit("Number of Output Areas", "2");  // tells nothing again
  EXPECT_EQ(host.texts.size(), 1U);
  root().nhdResult->generateHotStart = true;
  choose("Create Hotstart Output", 1);
  EXPECT_TRUE(results.generateHotStart);
  EXPECT_EQ(usableOf(hotStarts, 1), "xxx.");
  hotStarts.OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(host.filters,
            Labels{"HotStart files(*.tsb2)|*.tsb2|HotStart files (*.tb2)|*.tb2|All Files (*.*)|*.*||"});
  root().nhdResult->generateHotStart = false;  // one that is on stays on the page
  edit("Number of Output Areas", "3");
  EXPECT_TRUE(results.generateHotStart);
  EXPECT_EQ(host.texts.size(), 1U);
  choose("Create Hotstart Output", 0);
  EXPECT_FALSE(results.generateHotStart);
}

}  // namespace ecology_transport_pages_test
}  // namespace gridbay
