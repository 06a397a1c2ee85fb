// The pages of the bed, the water column and dredging of expanded mud transport.

#include <gmock/gmock.h>

#include <ostream>

#include "platform/units/units.h"
#include "tests/mud_transport_expanded/bed_fixture.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_expanded_bed_pages_test {

class ExpandedBedPages : public test::ShapeTest {
 protected:
  // Two areas, two fractions, three layers.
  ExpandedBedPages() {
    root().bathymetry->SetNoAreas(2);
    test::setFractionsAndLayers(root(), 2, 3);
    host.chosenFile = folder.write("chosen", "");
  }
  void openPage(std::string_view pageClass) { PageTest::open(pageClass); }
  using PageTest::grid;
  using test::ShapeTest::grid;
  static Labels rowHeadersOf(CV27SetupGridWnd& grid) {
    Labels all;
    for (int row = 1; row <= grid.GetRowCount(); ++row) all.push_back(grid.GetRowHeader(row));
    return all;
  }

  test::TemporaryFolder folder;
};

// What the pages with a band for each layer or fraction differ in.
struct BandCase {
  const char* pageClass;
  int dialogTemplate;
  PageId page;
  const char* grid;
  std::vector<std::string> bands;
  const char* file;
  const char* tip;  // of the value: its quantity; empty for a plain number
  float& (*value)(CGlobalKvs& root, int entry, int area);
};
void PrintTo(const BandCase& it, std::ostream* out) {
  *out << it.pageClass;
}

template <auto member>
float& valueOf(CGlobalKvs& root, int entry, int area) {
  return (root.*member)->at(entry).at(area).value;
}

class ExpandedBands : public ExpandedBedPages, public ::testing::WithParamInterface<BandCase> {};

TEST_P(ExpandedBands, HaveARowForEachAreaBelowTheirTitles) {
  const BandCase& it = GetParam();
  root().nmtExpTransition->isExcluded = 0;
  openPage(it.pageClass);
  EXPECT_EQ(page->templateId(), it.dialogTemplate);
  EXPECT_EQ(page->pageId(), it.page);
  CV27SetupGridWnd& values = grid(it.grid);
  Labels headers;
  for (int col = 0; col <= values.GetColCount(); ++col) headers.push_back(values.GetColHeader(col));
  EXPECT_EQ(headers, (Labels{"Area", "Type", "Value", "File Name", "", ""}));
  ASSERT_EQ(values.GetRowCount(), 3 * static_cast<int>(it.bands.size()));
  for (std::size_t band = 0; band < it.bands.size(); ++band) {
    const int row = 3 * static_cast<int>(band) + 1;
    EXPECT_EQ(textIn(values, row, 1), it.bands[band]);
    EXPECT_EQ(styleIn(values, row, 1).span, 5);
    EXPECT_EQ(values.GetRowHeader(row + 2), "2");
  }
  EXPECT_EQ(styleIn(values, 6, 1).choices, (Labels{"Constant value", "Type 2 data file"}));
  EXPECT_EQ(usableOf(values, 6), "xx...");
  EXPECT_THAT(styleIn(values, 6, 2).toolTip, ::testing::StartsWith(it.tip));
  EXPECT_EQ(values.StoreStyleRowCol(6, 2, "2.5"), 1);
  EXPECT_EQ(it.value(root(), 2, 2), 2.5F);
  EXPECT_EQ(values.StoreStyleRowCol(6, 1, "Type 2 data file"), 1);
  EXPECT_EQ(usableOf(values, 6), "x.xx.");
  values.OnClickedButtonRowCol(6, 4);
  EXPECT_EQ(host.filters,
            Labels{std::string(it.file) + " (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(textIn(values, 6, 3), *host.chosenFile);
  values.OnClickedButtonRowCol(6, 5);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

TEST_P(ExpandedBands, FollowTheModel) {
  const BandCase& it = GetParam();
  openPage(it.pageClass);
  test::setFractionsAndLayers(root(), 1, 2);
  root().bathymetry->SetNoAreas(1);
  page->OnUpdate();
  EXPECT_EQ(grid(it.grid).GetRowCount(),
            2 * (it.page == PageId::mtExpDeposition || it.page == PageId::mtExpSettlingPar ||
                         it.page == PageId::mtExpTransition
                     ? 1
                     : 2));
}

const std::vector<std::string> kFractions{"Fraction no. 1", "Fraction no. 2"};
const std::vector<std::string> kLayers{"Layer no. 1", "Layer no. 2", "Layer no. 3"};

INSTANTIATE_TEST_SUITE_P(
    All, ExpandedBands,
    ::testing::Values(
        BandCase{"CNmtExpBedDensityDlg", 18843, PageId::mtExpBedDensity, "Density of bed layer", kLayers,
                 "Density of Bed Layer", "Density of bed", valueOf<&CGlobalKvs::nmtExpBedDensity>},
        BandCase{"CNmtExpConstFrictionCoefDlg", 18841, PageId::mtExpConstFrictionCoef,
                 "Constant friction coefficient", kLayers, "Friction Coefficient", "",
                 valueOf<&CGlobalKvs::nmtExpConstFrictionCoef>},
        BandCase{"CNmtExpCriticalShearStressDlg", 18842, PageId::mtExpCriticalShearStress,
                 "Critical shear stress", kLayers, "Critical Shear Stress", "Shear stress",
                 valueOf<&CGlobalKvs::nmtExpCriticalShearStress>},
        BandCase{"CNmtExpDepositionDlg", 18844, PageId::mtExpDeposition, "Critical shear stress", kFractions,
                 "Critical Shear Stress", "Shear stress", valueOf<&CGlobalKvs::nmtExpDeposition>},
        BandCase{"CNmtExpErosionCoefficientDlg", 18848, PageId::mtExpErosionCoefficient,
                 "Erosion coefficient", kLayers, "Erosion Coefficient", "Erosion rate",
                 valueOf<&CGlobalKvs::nmtExpErosionCoefficient>},
        BandCase{"CNmtExpSettlingParDlg", 18859, PageId::mtExpSettlingPar, "Fall velocity", kFractions,
                 "Fall Velocity", "Settling velocity", valueOf<&CGlobalKvs::nmtExpSettlingPar>},
        BandCase{"CNmtExpTransitionDlg",
                 18864,
                 PageId::mtExpTransition,
                 "Transition between layers",
                 {"Between Layers 1 and 2", "Between Layers 2 and 3"},
                 "Transition Between Layers",
                 "",
                 valueOf<&CGlobalKvs::nmtExpTransition>}),
    [](const auto& it) { return it.param.pageClass; });

TEST_F(ExpandedBedPages, Transition) {
  openPage("CNmtExpTransitionDlg");
  EXPECT_EQ(control("Include transition of mud between layers").index, 0);
  EXPECT_FALSE(grid().IsEnabled());
  choose("Include transition of mud between layers", 1);
  EXPECT_EQ(root().nmtExpTransition->isExcluded, 0);
  EXPECT_TRUE(grid().IsEnabled());
}

TEST_F(ExpandedBedPages, Deposition) {
  openPage("CNmtExpDepositionDlg");
  EXPECT_EQ(labels(), (Labels{"Sediment profile", "Relative centroid height", "Critical shear stress"}));
  EXPECT_EQ(control("Sediment profile").choices, (Labels{"Apply Rouse Profile", "Apply Teeter Profile"}));
  EXPECT_EQ(control("Sediment profile").index, 1);
  choose("Sediment profile", 0);
  EXPECT_EQ(root().nmtExpDeposition->sedimentProfile, 0);
  edit("Relative centroid height", "0.5");
  EXPECT_EQ(root().nmtExpDeposition->centroidHeight, 0.5F);
}

TEST_F(ExpandedBedPages, Settling) {
  openPage("CNmtExpSettlingsDlg");
  EXPECT_EQ(page->templateId(), 18858);
  EXPECT_EQ(control("Settling velocity").choices,
            (Labels{"Include flocculation calculations", "Use constant settling velocity"}));
  EXPECT_EQ(control("Formulation").choices,
            (Labels{"Use Winterwerp formulation", "Use Richardson and Zaki formulation"}));
  const CNmtExpSettlingsKvs& settlings = *root().nmtExpSettlings;
  EXPECT_EQ(control("Settling velocity").index, 1);
  EXPECT_FALSE(control("Formulation").usable());
  choose("Settling velocity", 0);
  EXPECT_EQ(settlings.noFlocculation, 0);
  choose("Include hindered settling calculations", 1);
  EXPECT_EQ(settlings.hinderedSettling, 1);
  EXPECT_EQ(control("Formulation").index, 1);
  choose("Formulation", 0);
  EXPECT_EQ(settlings.formulation, CNmtExpSettlingsKvs::kWinterwerp);
}

TEST_F(ExpandedBedPages, SettlingParameters) {
  openPage("CNmtExpSettlingParDlg");
  CNmtExpSettlingParKvs& par = *root().nmtExpSettlingPar;
  CV27SetupGridWnd& exponents = grid("Exponents");
  const auto usable = [&] {
    std::string all;
    for (const char* label : {"RhoSed", "GelPoint", "CHinder", "C1Salt", "C2Salt", "Cfloc"})
      all += control(label).usable() ? 'x' : '.';
    return all + ' ' + usableOf(exponents, 1);
  };
  EXPECT_EQ(rowHeadersOf(exponents), (Labels{"Fraction no. 1", "Fraction no. 2"}));
  EXPECT_EQ(exponents.GetColHeader(0), "Fraction");
  EXPECT_EQ(exponents.GetColHeader(1), "Gamma");
  EXPECT_EQ(exponents.GetColHeader(2), "Wsn");
  EXPECT_EQ(usable(), "x..... ..");
  root().nmtExpSettlings->hinderedSettling = 1;
  page->OnUpdate();
  EXPECT_EQ(usable(), "xxx... .x");
  root().nmtExpSettlings->noFlocculation = 0;
  page->OnUpdate();
  EXPECT_EQ(usable(), "xxxxxx xx");
  EXPECT_EQ(styleIn(grid("Fall velocity"), 2, 2).toolTip, "");  // a coefficient now
  edit("RhoSed", "2600");
  edit("GelPoint", "60");
  edit("CHinder", "12");
  edit("C1Salt", "-0.5");
  edit("C2Salt", "0.25");
  edit("Cfloc", "0.5");
  EXPECT_EQ(par.rhoSed, 2600);
  EXPECT_EQ(par.gelPoint, 60);
  EXPECT_EQ(par.cHinder, 12);
  EXPECT_EQ(par.c1Salt, -0.5F);
  EXPECT_EQ(par.c2Salt, 0.25F);
  EXPECT_EQ(par.cFloc, 0.5F);
  EXPECT_EQ(exponents.StoreStyleRowCol(2, 1, "1.5"), 1);
  EXPECT_EQ(exponents.StoreStyleRowCol(2, 2, "4.5"), 1);
  EXPECT_EQ(par.at(2).gamma, 1.5F);
  EXPECT_EQ(par.at(2).wsn, 4.5F);
  EXPECT_EQ(control("GelPoint").itemCode, item::kSuspendedSediment);
}

TEST_F(ExpandedBedPages, WaterColumnAndSandFractions) {
  openPage("CNmtExpWaterColParametersDlg");
  EXPECT_EQ(page->templateId(), 18867);
  EXPECT_EQ(text("C1Visc"), "10");
  EXPECT_EQ(text("C2Visc"), "600");
  edit("C1Visc", "11");
  edit("C2Visc", "500");
  EXPECT_EQ(root().nmtExpWaterColParameters->c1Visc, 11);
  EXPECT_EQ(root().nmtExpWaterColParameters->c2Visc, 500);
  CNmtExpSandFractionsKvs& sand = *root().nmtExpSandFractions;
  EXPECT_FALSE(grid().IsEnabled());
  choose("Include sand fractions", 1);
  EXPECT_EQ(sand.sandFractionDescription, 1);
  EXPECT_TRUE(grid().IsEnabled());
  EXPECT_EQ(headers(), (Labels{"Fraction", "Sand"}));
  EXPECT_EQ(rowHeadersOf(grid()), (Labels{"Fraction no. 1", "Fraction no. 2"}));
  EXPECT_EQ(store(2, 1, "0"), 1);
  EXPECT_EQ(sand.at(2).isSand, 0);

  openPage("CNmtExpSandFractionsDlg");
  EXPECT_EQ(page->templateId(), 18857);
  EXPECT_EQ(headers(), (Labels{"Fraction", "Mean fall velocity"}));
  EXPECT_EQ(store(1, 1, "0.25"), 1);
  EXPECT_EQ(sand.at(1).meanFallVelocity, 0.25F);
  EXPECT_THAT(style(1, 1).toolTip, ::testing::StartsWith("Settling velocity"));
  EXPECT_EQ(usableOf(grid(), 1), "x");
  EXPECT_EQ(usableOf(grid(), 2), ".");
}

TEST_F(ExpandedBedPages, ErosionAndItsPower) {
  openPage("CNmtExpErosionLayer");
  EXPECT_EQ(page->templateId(), 18847);
  edit("Maximum concentration allowed due to erosion", "80");
  EXPECT_EQ(root().nmtExpErosionLayer->cMax, 80);
  EXPECT_EQ(control("Maximum concentration allowed due to erosion").itemCode, item::kSuspendedSediment);
  EXPECT_EQ(headers(), (Labels{"Layer", "Erosion"}));
  EXPECT_EQ(rowHeadersOf(grid()), (Labels{"Layer no. 1", "Layer no. 2", "Layer no. 3"}));
  EXPECT_EQ(cell(1, 1), "Soft bed");
  EXPECT_EQ(cell(2, 1), "Dense bed");
  EXPECT_EQ(store(2, 1, "Soft bed"), 1);
  EXPECT_EQ(root().nmtExpErosionLayer->at(2).description, CNmtExpErosionDescriptionObjectKvs::kSoft);

  openPage("CNmtExpPowerOfErosionDlg");
  EXPECT_EQ(page->templateId(), 18855);
  EXPECT_EQ(headers(), (Labels{"Layer", "Power"}));
  EXPECT_EQ(grid().GetRowCount(), 3);
  EXPECT_EQ(store(3, 1, "2.5"), 1);
  EXPECT_EQ(root().nmtExpPowerOfErosion->at(3).power, 2.5F);
}

TEST_F(ExpandedBedPages, Sliding) {
  openPage("CNmtExpSlidingDlg");
  EXPECT_EQ(page->templateId(), 18860);
  EXPECT_EQ(control("Coefficients").choices,
            (Labels{"Use constant sliding coefficients", "Use variable sliding coefficients"}));
  EXPECT_FALSE(control("Coefficients").usable());
  choose("Include sliding", 1);
  choose("Coefficients", 1);
  EXPECT_EQ(root().nmtExpSliding->includeSliding, 1);
  EXPECT_EQ(root().nmtExpSliding->includeVariableCoefficient, 1);
}

TEST_F(ExpandedBedPages, Morphology) {
  openPage("CNmtExpMorphologyDlg");
  EXPECT_EQ(page->templateId(), 18854);
  EXPECT_EQ(labels(), (Labels{"Do morphological calculations", "Apply speedup factor", "Speedup factor"}));
  EXPECT_FALSE(control("Apply speedup factor").usable());
  EXPECT_FALSE(control("Speedup factor").usable());
  choose("Do morphological calculations", 1);
  EXPECT_FALSE(control("Speedup factor").usable());
  choose("Apply speedup factor", 1);
  edit("Speedup factor", "12");
  const CNmtExpMorphologyKvs& morphology = *root().nmtExpMorphology;
  EXPECT_EQ(morphology.includeMorphology, 1);
  EXPECT_EQ(morphology.includeSpeedupFactor, 1);
  EXPECT_EQ(morphology.speedupFactor, 12);
}

TEST_F(ExpandedBedPages, RowsByArea) {
  const auto check = [this](const std::string& file, const std::string& tip) {
    EXPECT_EQ(headers(), (Labels{"Area", "Type", "Value", "File Name", "", ""}));
    EXPECT_EQ(rowHeadersOf(grid()), (Labels{"1", "2"}));
    EXPECT_EQ(usableOf(grid(), 2), "xx...");
    EXPECT_THAT(style(2, 2).toolTip, ::testing::StartsWith(tip));
    EXPECT_EQ(store(2, 2, "2.5"), 1);
    EXPECT_EQ(store(2, 1, "Type 2 data file"), 1);
    EXPECT_EQ(usableOf(grid(), 2), "x.xx.");
    grid().OnClickedButtonRowCol(2, 4);
    EXPECT_EQ(host.filters.back(), file + " (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||");
    EXPECT_EQ(cell(2, 3), *host.chosenFile);
  };
  openPage("CNmtExpBedRoughnessDlg");
  EXPECT_EQ(page->templateId(), 18839);
  check("Bed Roughness", "Roughness height");
  EXPECT_EQ(root().nmtExpBedRoughness->at(2).value, 2.5F);
  openPage("CNmtExpVarFrictionCoefDlg");
  EXPECT_EQ(page->templateId(), 18866);
  check("Friction Coefficient", "");
  EXPECT_EQ(root().nmtExpVarFrictionCoef->at(2).value, 2.5F);
  EXPECT_EQ(text("Solid density"), "2650");
  edit("Solid density", "2600");
  EXPECT_EQ(root().nmtExpVarFrictionCoef->solidDensity, 2600);
}

TEST_F(ExpandedBedPages, Dredging) {
  openPage("CNmtExpDredgingsDlg");
  EXPECT_EQ(page->templateId(), 18846);
  CNmtExpDredgingsKvs& dredgers = *root().nmtExpDredgings;
  edit("Number of dredgers", "2");
  EXPECT_EQ(dredgers.GetCount(), 2);
  choose("Update bed", 1);
  EXPECT_TRUE(dredgers.updateBed);
  EXPECT_EQ(headers(),
            (Labels{"Dredger", "Fraction 1", "Fraction 2", "Projection", "File Name", "", "", "Area"}));
  EXPECT_EQ(rowOf(grid(), 2), (Labels{"0.500000", "0.500000", "UTM-32", "", "  ...  ", "View...", "2"}));
  EXPECT_EQ(usableOf(grid(), 2), "xxxxx.x");
  EXPECT_EQ(store(2, 2, "0.75"), 1);
  EXPECT_EQ(dredgers.at(2).weights[1], 0.75F);
  EXPECT_EQ(store(2, 3, "UTM-33"), 1);
  EXPECT_EQ(dredgers.at(2).coordinateType, "UTM-33");
  EXPECT_EQ(style(2, 7).choices, (Labels{"1", "2"}));
  EXPECT_EQ(store(2, 7, "1"), 1);
  EXPECT_EQ(dredgers.at(2).nesting, 1);
  grid().OnClickedButtonRowCol(2, 5);
  EXPECT_EQ(host.filters, Labels{"Dredging (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"});
  EXPECT_EQ(dredgers.at(2).file.fileName.text(), *host.chosenFile);
  EXPECT_EQ(usableOf(grid(), 2), "xxxxxxx");
  test::setFractionsAndLayers(root(), 9, 1);
  page->OnUpdate();
  EXPECT_EQ(grid().GetColCount(), 8 + 5);  // eight weights at most
}

}  // namespace mud_transport_expanded_bed_pages_test
}  // namespace gridbay
