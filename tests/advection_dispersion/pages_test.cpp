// The pages of the concentrations, coefficients and deposition of the components.

#include <gmock/gmock.h>

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/decay_specification.h"
#include "advection_dispersion/deposition_concentration.h"
#include "advection_dispersion/dispersion_coef.h"
#include "advection_dispersion/evaporation.h"
#include "advection_dispersion/heat_dissipation.h"
#include "advection_dispersion/infiltration.h"
#include "advection_dispersion/initial_concentration.h"
#include "advection_dispersion/precipitation.h"
#include "advection_dispersion/source_sink.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "platform/units/units.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_pages_test {

class AdPages : public test::ShapeTest {
 protected:
  // Salt, bacteria that decay, heat that dissipates and heat that is exchanged; two areas, boundaries,
  // sources.
  AdPages() {
    root().bathymetry->SetNoAreas(2);
    root().nadComponent->SetCount(4);
    const std::array names{"Salt", "Bacteria", "Warmth", "Sun"};
    const std::array types{0, 1, 2, -2};
    for (std::size_t i = 0; i < names.size(); ++i) {
      root().nadComponent->at(static_cast<int>(i) + 1).name = names[i];
      root().nadComponent->at(static_cast<int>(i) + 1).type = types[i];
    }
    root().boundary->SetNoBoundaries(2);
    root().boundary->GetItem(2)->Set(0, 5, 0, 9);
    root().sourceSink->SetNoSources(2);
    root().sourceSink->GetItem(1)->source = {1, 2};
    host.chosenFile = folder.write("chosen", "");
  }
  void openPage(std::string_view pageClass) { PageTest::open(pageClass); }
  static Labels headersOf(CV27SetupGridWnd& grid) {
    Labels all;
    for (int col = 0; col <= grid.GetColCount(); ++col) all.push_back(grid.GetColHeader(col));
    return all;
  }
  static std::vector<int> widthsOf(CV27SetupGridWnd& grid) {
    std::vector<int> all;
    for (int col = 0; col <= grid.GetColCount(); ++col) all.push_back(grid.GetColWidth(col));
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

TEST_F(AdPages, InitialConcentrations) {
  openPage("CNadInitialConcentrationDlg");
  EXPECT_EQ(page->templateId(), 18729);
  EXPECT_EQ(headers(), (Labels{"Area", "Type", "Value", "File Name", "", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{50, 100, 60, 210, 30, 45}));
  EXPECT_EQ(PageTest::grid().GetRowCount(), 12);
  EXPECT_EQ(cell(1, 1), "Component :   Salt");
  EXPECT_EQ(style(1, 1).span, 5);
  EXPECT_EQ(style(1, 1).align, CellAlign::left);
  EXPECT_EQ(cell(10, 1), "Component :   Sun");
  EXPECT_EQ(PageTest::grid().GetRowLook(1).height, 1.5);
  EXPECT_EQ(PageTest::grid().GetRowLook(2).height, 1);
  EXPECT_FALSE(PageTest::grid().GetRowLook(2).lineBelow);
  EXPECT_TRUE(PageTest::grid().GetRowLook(3).lineBelow);
  EXPECT_EQ(style(2, 1).choices, (Labels{"Constant value", "Type 2 data file"}));
  EXPECT_EQ(usableOf(PageTest::grid(), 5), "xx...");
  EXPECT_EQ(store(6, 2, "2.5"), 1);  // bacteria in area 2
  EXPECT_EQ(root().nadInitialConcentration->at(2).at(2).value, 2.5F);
  EXPECT_EQ(store(6, 1, "Type 2 data file"), 1);
  EXPECT_EQ(usableOf(PageTest::grid(), 6), "x.xx.");
  PageTest::grid().OnClickedButtonRowCol(6, 4);
  EXPECT_EQ(host.filters, Labels{"Initial Condition Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(root().nadInitialConcentration->at(2).at(2).file.fileName.text(), *host.chosenFile);
  EXPECT_EQ(usableOf(PageTest::grid(), 6), "x.xxx");
  PageTest::grid().OnClickedButtonRowCol(6, 5);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
  EXPECT_THAT(style(5, 2).toolTip, ::testing::StartsWith("Concentration"));
  EXPECT_THAT(style(8, 2).toolTip, ::testing::StartsWith("Temperature"));
  EXPECT_THAT(style(11, 2).toolTip, ::testing::StartsWith("Temperature"));
  root().nadComponent->SetCount(5);
  EXPECT_EQ(PageTest::grid().GetRowCount(), 15);
}

TEST_F(AdPages, Deposition) {
  openPage("CNadDepositionConcentrationDlg");
  EXPECT_EQ(labels(), (Labels{"Include surface deposition", "Surface deposition", "Include soil deposition",
                              "Soil deposition"}));
  CV27SetupGridWnd& surface = grid("Surface deposition");
  CV27SetupGridWnd& soil = grid("Soil deposition");
  for (CV27SetupGridWnd* it : {&surface, &soil}) {
    EXPECT_EQ(it->GetRowCount(), 12);
    EXPECT_FALSE(it->IsEnabled());
    EXPECT_EQ(headersOf(*it), (Labels{"Area", "Type", "Value", "File Name", "", ""}));
    EXPECT_EQ(textIn(*it, 4, 1), "Component :   Bacteria");
  }
  control("Include surface deposition").index = 1;
  page->form().act(control("Include surface deposition"));
  EXPECT_TRUE(root().nadDepositionConcentration->includeSurface);
  EXPECT_TRUE(surface.IsEnabled());
  EXPECT_FALSE(soil.IsEnabled());
  root().nadDepositionConcentration->includeSoil = true;
  EXPECT_TRUE(soil.IsEnabled());
  EXPECT_EQ(styleIn(soil, 2, 1).choices, (Labels{"Constant value", "Type 0 data file", "Type 2 data file"}));
  for (const char* format : {"Type 0 data file", "Type 2 data file"}) {
    for (CV27SetupGridWnd* it : {&surface, &soil}) {
      EXPECT_EQ(it->StoreStyleRowCol(3, 1, format), 1);
      it->OnClickedButtonRowCol(3, 4);
    }
  }
  EXPECT_EQ(host.filters, (Labels{"Surface Deposition (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                                  "Soil Deposition (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                                  "Surface Deposition (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||",
                                  "Soil Deposition (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"}));
  EXPECT_EQ(root().nadDepositionConcentration->soil.at(1).at(2).format, 2);
  EXPECT_EQ(usableOf(soil, 3), "x.xxx");
  EXPECT_THAT(styleIn(soil, 8, 2).toolTip, ::testing::StartsWith("Deposition rate"));
}

TEST_F(AdPages, Dispersion) {
  openPage("CNadDispersionCoefDlg");
  CNadDispersionCoefKvs& coefs = *root().nadDispersionCoef;
  CV27SetupGridWnd& x = grid("X-direction");
  CV27SetupGridWnd& y = grid("Y-direction");
  // Factors and limits, the two lists, the two constants, the two grids.
  const auto usable = [&] {
    std::string all;
    for (const char* label :
         {"Proportionality factor in x- direction:", "Proportionality factor in y- direction:", "Min. value:",
          "Max. value:", "X-dir. given as:", "Y-dir. given as:"})
      all += control(label).usable() ? 'x' : '.';
    for (const int n : {1, 2}) all += control("Constant:", n).usable() ? 'x' : '.';
    for (CV27SetupGridWnd* it : {&x, &y}) all += it->IsEnabled() ? 'x' : '.';
    return all;
  };
  EXPECT_EQ(control("Dispersion").choices,
            (Labels{"Independent of the current", "Proportional to the current"}));
  EXPECT_EQ(control("X-dir. given as:").choices, (Labels{"Constant", "From file"}));
  EXPECT_EQ(usable(), "....xxxx..");
  choose("X-dir. given as:", 1);
  EXPECT_EQ(coefs.formatX, 1);
  EXPECT_EQ(usable(), "....xx.xx.");
  edit("Constant:", "2.5", 2);
  EXPECT_EQ(coefs.constantY, 2.5F);
  choose("Dispersion", 1);
  EXPECT_EQ(coefs.proportional, 1);
  EXPECT_EQ(usable(), "xxxx......");
  edit("Proportionality factor in y- direction:", "3");
  edit("Max. value:", "4");
  EXPECT_EQ(coefs.factorY, 3.0F);
  EXPECT_EQ(coefs.maximum, 4.0F);
  for (const char* label : {"Proportionality factor in x- direction:", "Min. value:", "Constant:"})
    EXPECT_EQ(control(label).itemCode, item::kDispersionCoefficient);
  choose("Dispersion", 0);
  EXPECT_EQ(usable(), "....xx.xx.");

  EXPECT_EQ(headersOf(x), (Labels{"", "FileName", "", ""}));
  EXPECT_EQ(widthsOf(x), (std::vector<int>{35, 180, 30, 45}));
  EXPECT_EQ(x.GetRowCount(), 2);
  EXPECT_EQ(rowOf(x, 1), (Labels{"", "...", "View..."}));
  x.OnClickedButtonRowCol(2, 2);
  EXPECT_EQ(host.filters,
            Labels{"Dispersion Coefficient Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(coefs.filesX.at(2).file.fileName.text(), *host.chosenFile);
  EXPECT_TRUE(coefs.filesY.at(2).file.fileName.text().empty());
  coefs.filesY.SetCount(1);
  EXPECT_EQ(x.GetRowCount(), 1);
  EXPECT_EQ(y.GetRowCount(), 1);
}

TEST_F(AdPages, DecayAndHeatDissipation) {
  openPage("CNadDecaySpecificationDlg");
  EXPECT_EQ(headers(), (Labels{"", "Given as", "Value", "FileName", "", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{100, 95, 75, 160, 20, 45}));
  EXPECT_EQ(rowHeadersOf(PageTest::grid()), Labels{"Bacteria"});
  EXPECT_EQ(style(1, 1).choices, (Labels{"Constant value", "Type 0 data file"}));
  EXPECT_EQ(usableOf(PageTest::grid(), 1), "xx...");
  EXPECT_EQ(store(1, 2, "0.5"), 1);
  EXPECT_GT(root().nadDecaySpecification->at(2).value, 0);
  EXPECT_THAT(style(1, 2).toolTip, ::testing::StartsWith("Decay coefficient"));
  EXPECT_EQ(store(1, 1, "Type 0 data file"), 1);
  EXPECT_EQ(usableOf(PageTest::grid(), 1), "x.xx.");
  PageTest::grid().OnClickedButtonRowCol(1, 4);
  EXPECT_EQ(usableOf(PageTest::grid(), 1), "x.xxx");
  root().nadComponent->at(1).type = 1;
  EXPECT_EQ(rowHeadersOf(PageTest::grid()), (Labels{"Salt", "Bacteria"}));
  EXPECT_EQ(cell(2, 1), "Type 0 data file");
  EXPECT_EQ(cell(1, 1), "Constant value");

  openPage("CNadHeatDissipationDlg");
  EXPECT_EQ(rowHeadersOf(PageTest::grid()), Labels{"Warmth"});
  EXPECT_EQ(store(1, 1, "Type 0 data file"), 1);
  EXPECT_EQ(root().nadHeatDissipation->at(3).format, 1);
  PageTest::grid().OnClickedButtonRowCol(1, 4);
  EXPECT_EQ(host.filters,
            (Labels{"Decay Time Series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                    "Heat Dissipation Time Series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"}));
  root().nadComponent->SetCount(2);
  EXPECT_EQ(PageTest::grid().GetRowCount(), 0);
}

TEST_F(AdPages, Boundaries) {
  openPage("CNadBoundaryDlg");
  CV27SetupGridWnd& upper = grid("Boundary concentrations");
  CV27SetupGridWnd& lower = grid("Constant concentrations");
  EXPECT_EQ(headersOf(upper), (Labels{"Boundary", "Given as", "File name", "", ""}));
  EXPECT_EQ(widthsOf(upper), (std::vector<int>{120, 90, 190, 30, 45}));
  EXPECT_EQ(rowHeadersOf(upper), (Labels{"1: (0,0) - (0,0)", "2: (0,5) - (0,9)"}));
  EXPECT_EQ(rowOf(upper, 1), (Labels{"Constant value", "", "  ...  ", "View"}));
  EXPECT_EQ(styleIn(upper, 1, 1).choices, (Labels{"Constant value", "Type 0 data file", "Type 1 data file"}));
  EXPECT_EQ(usableOf(upper, 1), "x...");
  EXPECT_EQ(headersOf(lower), (Labels{"", "Boundary 1", "Boundary 2"}));
  EXPECT_EQ(widthsOf(lower), (std::vector<int>{120, 90, 90}));
  EXPECT_EQ(rowHeadersOf(lower), (Labels{"Salt", "Bacteria", "Warmth", "Sun"}));
  EXPECT_EQ(usableOf(lower, 1), "xx");
  EXPECT_EQ(lower.StoreStyleRowCol(1, 2, "35"), 1);
  EXPECT_EQ(root().nadBoundary->at(2).constants[0], 35.0F);
  EXPECT_THAT(styleIn(lower, 2, 1).toolTip, ::testing::StartsWith("Concentration"));
  EXPECT_THAT(styleIn(lower, 3, 1).toolTip, ::testing::StartsWith("Temperature"));
  for (const char* format : {"Type 0 data file", "Type 1 data file"}) {
    EXPECT_EQ(upper.StoreStyleRowCol(2, 1, format), 1);
    upper.OnClickedButtonRowCol(2, 3);
    EXPECT_EQ(usableOf(upper, 2), "xxxx");
    EXPECT_EQ(usableOf(lower, 1), "x.");
  }
  EXPECT_EQ(host.filters, (Labels{"Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                                  "Profile (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"}));
  EXPECT_EQ(lower.StoreStyleRowCol(1, 2, "3"), 0);
  root().nadComponent->SetCount(5);
  root().boundary->SetNoBoundaries(3);
  EXPECT_EQ(lower.GetRowCount(), 5);
  EXPECT_EQ(lower.GetColCount(), 3);
  EXPECT_EQ(rowOf(lower, 5), (Labels{"0.000000", "0.000000", "0.000000"}));
  root().boundary->SetNoBoundaries(0);
  EXPECT_EQ(lower.GetRowCount(), 0);
}

TEST_F(AdPages, Sources) {
  openPage("CNadSourceSinkDlg");
  EXPECT_EQ(headers(),
            (Labels{"Source Sink", "Given as", "Salt", "Bacteria", "Warmth", "Sun", "File name", "", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{110, 100, 80, 80, 80, 80, 200, 30, 45}));
  CV27SetupGridWnd& sources = PageTest::grid();
  EXPECT_EQ(sources.GetRowHeader(1), "1: (1,2)->");
  EXPECT_EQ(usableOf(sources, 1), "xxxxx...");
  EXPECT_EQ(store(1, 3, "7"), 1);
  EXPECT_EQ(root().nadSourceSink->at(1).constants[1], 7.0F);
  EXPECT_THAT(style(1, 4).toolTip, ::testing::StartsWith("Temperature ["));
  root().sourceSink->GetItem(1)->type = CSourceSinkObjectKvs::kPair;
  EXPECT_THAT(style(1, 4).toolTip, ::testing::StartsWith("Temperature difference"));
  EXPECT_THAT(style(1, 2).toolTip, ::testing::StartsWith("Concentration"));
  EXPECT_EQ(store(1, 1, "Type 0 data file"), 1);
  EXPECT_EQ(usableOf(sources, 1), "x....xx.");
  sources.OnClickedButtonRowCol(1, 7);
  EXPECT_EQ(host.filters, Labels{"Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"});
  EXPECT_EQ(usableOf(sources, 1), "x....xxx");
  root().sourceSink->GetItem(1)->type = CSourceSinkObjectKvs::kIsolatedSink;
  EXPECT_EQ(usableOf(sources, 1), "........");
  EXPECT_EQ(root().nadSourceSink->at(1).constants[1], 7.0F);
  root().nadComponent->SetCount(1);
  EXPECT_EQ(headers(), (Labels{"Source Sink", "Given as", "Salt", "File name", "", ""}));
  root().nadComponent->SetCount(2);
  EXPECT_EQ(usableOf(sources, 2), "xxx...");
}

TEST_F(AdPages, RainEvaporationAndInfiltration) {
  const auto check = [this](std::string_view pageClass, auto& values, int format) {
    openPage(pageClass);
    CV27SetupGridWnd& constants = grid("Constant concentrations");
    EXPECT_EQ(control("Given as").choices,
              (Labels{"From Ambient Water", "Constant Value", "Type 0 data file", "Type 2 data file"}));
    EXPECT_EQ(values.format, format);
    EXPECT_EQ(control("Given as").index, format == -3 ? 0 : 1);
    choose("Given as", 1);
    EXPECT_EQ(headersOf(constants), (Labels{"", "Value"}));
    EXPECT_EQ(widthsOf(constants), (std::vector<int>{140, 120}));
    EXPECT_EQ(rowHeadersOf(constants), (Labels{"Salt", "Bacteria", "Warmth", "Sun"}));
    EXPECT_EQ(constants.StoreStyleRowCol(2, 1, "4"), 1);
    EXPECT_EQ(values.constants[1], 4.0F);
    EXPECT_THAT(styleIn(constants, 4, 1).toolTip, ::testing::StartsWith("Temperature"));
    EXPECT_FALSE(control("Data File").usable());
    EXPECT_FALSE(control("...").usable());
    choose("Given as", 0);
    EXPECT_EQ(values.format, -3);
    EXPECT_EQ(textIn(constants, 2, 1), "");
    EXPECT_EQ(usableOf(constants, 2), ".");
    EXPECT_FALSE(control("Data File").usable());
    host.filters.clear();
    choose("Given as", 2);
    EXPECT_EQ(values.format, 0);
    press("...");
    choose("Given as", 3);
    EXPECT_EQ(values.format, 2);
    press("...");
    EXPECT_EQ(host.filters, (Labels{"Time Series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                                    "Grid Series (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"}));
    EXPECT_EQ(values.file.text(), *host.chosenFile);
    EXPECT_TRUE(control("View...").usable());
    values.format = 1;
    document.UpdateAllViews(nullptr);
    EXPECT_EQ(control("Given as").index, 1);
  };
  check("CNadPrecipitationDlg", *root().nadPrecipitation, -1);
  EXPECT_EQ(page->templateId(), 18734);
  check("CNadEvaporationDlg", *root().nadEvaporation, -1);
  EXPECT_EQ(page->pageId(), PageId::adEvaporation);
  check("CNadInfiltrationDlg", *root().nadInfiltration, -3);
  EXPECT_EQ(page->pageId(), PageId::adInfiltration);
}

}  // namespace advection_dispersion_pages_test
}  // namespace gridbay
