// The pages of the bed.

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "mud_transport/bed_roughness.h"
#include "mud_transport/consolidation.h"
#include "mud_transport/erosion_characteristics.h"
#include "mud_transport/erosion_for_each_layer.h"
#include "mud_transport/ml_settling_and_deposition.h"
#include "mud_transport/settling_and_desposition.h"
#include "mud_transport/sliding.h"
#include "mud_transport/transition_between_layers.h"
#include "mud_transport/wave_data.h"
#include "platform/units/units.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_bed_pages_test {

using ::testing::StartsWith;

constexpr const char* kMaps = "Maps (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||";

// Two areas; three layers in all lists; two components that settle.
class BedPages : public test::ShapeTest {
 protected:
  BedPages() {
    root().bathymetry->SetNoAreas(2);
    root().nmtErosionLayer->SetCount(3);
    root().nmtErosionForEachLayerCritical->SetCount(3);
    root().nmtErosionForEachLayerFactor->SetCount(3);
    root().nmtErosionForEachLayerFactor1->SetCount(3);
    root().nmtErosionForEachLayerFactor2->SetCount(3);
    root().nmtErosionForEachLayerPower->SetCount(3);
    root().nmtErosionForEachLayerDensity->SetCount(3);
    root().nmtSliding->SetCount(3);
    root().nmtTransitionBetweenLayers->SetCount(3);
    root().nmtSettlingAndDesposition->SetCount(2);
    host.chosenFile = folder.write("chosen.tsb2", "");
  }
  void openPage(std::string_view pageClass, std::int32_t dialogTemplate, PageId id) {
    PageTest::open(pageClass);
    EXPECT_EQ(page->templateId(), dialogTemplate);
    EXPECT_EQ(page->pageId(), id);
  }
  // The grid of a label, which a frame may have too.
  CV27SetupGridWnd& grid(std::string_view label) {
    for (const Control& it : page->form().controls()) {
      if (it.grid != nullptr && it.label == label) return *it.grid;
    }
    throw std::logic_error("there is no such grid");
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
  std::string usableControls(const Labels& all) {
    std::string usable;
    for (const std::string& label : all) usable += control(label).usable() ? 'x' : '.';
    return usable;
  }
  // The grid of maps with one row for each area, where a button takes the chosen file.
  void expectMaps(CV27SetupGridWnd& maps, UTsbSelection& file, int area) {
    EXPECT_EQ(headersOf(maps), (Labels{"Area", "File Name", "", ""}));
    EXPECT_EQ(rowHeadersOf(maps), (Labels{"1", "2"}));
    EXPECT_EQ(usableOf(maps, area), "xx.");
    host.filters.clear();
    maps.OnClickedButtonRowCol(area, 2);
    EXPECT_EQ(host.filters, Labels{kMaps});
    EXPECT_EQ(file.fileName.text(), *host.chosenFile);
    EXPECT_EQ(usableOf(maps, area), "xxx");
    host.opened.clear();
    maps.OnClickedButtonRowCol(area, 3);
    EXPECT_EQ(host.opened, Labels{*host.chosenFile});
  }
  // A page of the family: layers or components on the left, the maps of the current one on the right.
  template <class List>
  void expectPair(const std::string& label, const Labels& rows, const Labels& titles, const List& values,
                  const std::string& tip) {
    CV27SetupGridWnd& left = grid(label);
    CV27SetupGridWnd& right = grid("Data files");
    const Control* frame = control("Data files").group;
    EXPECT_EQ(rowHeadersOf(left), rows);
    EXPECT_EQ(styleIn(left, 1, 1).choices, (Labels{"Constant value", "Type 2 data file"}));
    EXPECT_THAT(styleIn(left, 1, 2).toolTip, StartsWith(tip));
    // The first is the current one of a page that opens.
    EXPECT_EQ(left.CurrentRow(), 1);
    EXPECT_EQ(frame->label, "Data files of " + titles[0]);
    EXPECT_TRUE(frame->beside);
    EXPECT_EQ(usableOf(left, 1), "xx");
    EXPECT_EQ(usableOf(right, 1), "...");
    left.OnCurrentRow(2);
    EXPECT_EQ(frame->label, "Data files of " + titles[1]);
    EXPECT_EQ(left.StoreStyleRowCol(2, 2, "0.5"), 1);
    EXPECT_EQ(values(2).constant, 0.5F);
    EXPECT_EQ(left.StoreStyleRowCol(2, 1, "Type 2 data file"), 1);
    EXPECT_EQ(values(2).format, 1);
    EXPECT_EQ(usableOf(left, 2), "x.");
    expectMaps(right, values(2).at(2).file, 2);
    EXPECT_EQ(textIn(right, 1, 1), "");
    EXPECT_EQ(right.StoreStyleRowCol(1, 1, "typed.tsb2"), 1);
    EXPECT_EQ(values(2).at(1).file.fileName.text(), "typed.tsb2");
    left.OnCurrentRow(1);
    EXPECT_EQ(usableOf(right, 2), "...");
    EXPECT_EQ(textIn(right, 2, 1), "");
    left.OnCurrentRow(0);
    EXPECT_EQ(right.GetRowCount(), 0);
  }
  template <class List>
  void expectLayers(const std::string& label, List& list, const std::string& tip) {
    expectPair(
        label, {"1", "2", "3"}, {"layer 1", "layer 2"}, [&list](int n) -> auto& { return list.at(n); }, tip);
    EXPECT_EQ(headersOf(grid(label)), (Labels{"Layer", "Given as", "Value"}));
    // Layers that go take their maps with them.
    grid(label).OnCurrentRow(3);
    EXPECT_EQ(grid("Data files").GetRowCount(), 2);
    list.SetCount(2);
    page->SetData();
    EXPECT_EQ(grid(label).GetRowCount(), 2);
    EXPECT_EQ(grid("Data files").GetRowCount(), 0);
    EXPECT_EQ(grid("Data files").StoreStyleRowCol(1, 1, "x"), 0);
    EXPECT_EQ(control("Data files").group->label, "Data files of ");
  }

  test::TemporaryFolder folder;
};

TEST_F(BedPages, OfTheErosionOfEachLayer) {
  openPage("CNmtErosionForEachLayerCriticalDlg", 18831, PageId::mtErosionForEachLayerCritical);
  expectLayers("Critical shear stress for erosion", *root().nmtErosionForEachLayerCritical,
               "Shear stress [N/m²]");
  openPage("CNmtErosionForEachLayerFactorDlg", 18815, PageId::mtErosionForEachLayerFactor);
  expectLayers("Erosion coefficient factor", *root().nmtErosionForEachLayerFactor,
               "Erosion rate in grams [g/m²/s]");
  openPage("CNmtErosionForEachLayerFactor1Dlg", 18816, PageId::mtErosionForEachLayerFactor1);
  expectLayers("Erosion coefficient factor 1 [-]", *root().nmtErosionForEachLayerFactor1, "");
  openPage("CNmtErosionForEachLayerFactor2Dlg", 18817, PageId::mtErosionForEachLayerFactor2);
  expectLayers("Erosion coefficient factor 2 [-]", *root().nmtErosionForEachLayerFactor2, "");
  openPage("CNmtErosionForEachLayerPowerDlg", 18818, PageId::mtErosionForEachLayerPower);
  expectLayers("Erosion coefficient power/alpha", *root().nmtErosionForEachLayerPower, "");
  openPage("CNmtErosionForEachLayerDensityDlg", 18813, PageId::mtErosionForEachLayerDensity);
  expectLayers("Density of bed layer", *root().nmtErosionForEachLayerDensity,
               "Density of bed in grams [g/m³]");
}

TEST_F(BedPages, OfTheConstantFriction) {
  openPage("CNmtConstantSlidingDlg", 18812, PageId::mtConstantSliding);
  EXPECT_EQ(labels(), (Labels{"Constant friction coefficient", "Constant friction coefficient",
                              "Data files of layer 1", "Data files"}));
}

TEST_F(BedPages, OfTheConstantFrictionOfEachLayer) {
  PageTest::open("CNmtConstantSlidingDlg");
  CV27SetupGridWnd& left = PageTest::grid();
  EXPECT_EQ(headersOf(left), (Labels{"Layer", "Given as", "Value"}));
  EXPECT_EQ(rowHeadersOf(left), (Labels{"1", "2", "3"}));
  EXPECT_EQ(left.StoreStyleRowCol(3, 2, "0.25"), 1);
  EXPECT_EQ(root().nmtSliding->constant.at(3).constant, 0.25);
  EXPECT_EQ(styleIn(left, 1, 2).toolTip, "");
  left.OnCurrentRow(3);
  EXPECT_EQ(left.StoreStyleRowCol(3, 1, "Type 2 data file"), 1);
  EXPECT_EQ(control("Data files").group->label, "Data files of layer 3");
  expectMaps(grid("Data files"), root().nmtSliding->constant.at(3).at(1).file, 1);
}

TEST_F(BedPages, OfTheTransition) {
  openPage("CNmtTransitionBetweenLayersDlg", 18836, PageId::mtTransitionBetweenLayers);
  EXPECT_EQ(labels().front(), "Include transition of mud between layers");
  choose("Include transition of mud between layers", 1);
  EXPECT_EQ(root().nmtTransitionBetweenLayers->includeTransition, 1);
}

TEST_F(BedPages, OfTheTransitionRates) {
  PageTest::open("CNmtTransitionBetweenLayersDlg");
  CV27SetupGridWnd& rates = grid("Transition rates of mud");
  EXPECT_EQ(rowHeadersOf(rates), (Labels{"1", "2", "3"}));
  EXPECT_EQ(rates.StoreStyleRowCol(1, 2, "4"), 1);
  EXPECT_EQ(root().nmtTransitionBetweenLayers->at(1).constant, 4.0F);
  EXPECT_EQ(styleIn(rates, 1, 2).toolTip, "");
}

TEST_F(BedPages, OfTheVariableFriction) {
  openPage("CNmtVariableSlidingDlg", 18837, PageId::mtVariableSliding);
  CNmtVariableSlidingKvs& variable = root().nmtSliding->variable;
  EXPECT_EQ(labels(), (Labels{"Given as", "Variable friction coefficient", "Data files", "Solid density"}));
  EXPECT_EQ(control("Given as").choices, (Labels{"Constant value", "Type 2 data file"}));
  edit("Variable friction coefficient", "0.5");
  edit("Solid density", "2700");
  EXPECT_EQ(variable.constant, 0.5F);
  EXPECT_EQ(variable.solidDensity, 2700.0F);
  EXPECT_EQ(control("Variable friction coefficient").itemCode, 0);
  EXPECT_EQ(control("Solid density").itemCode, item::kBedDensity);
  EXPECT_EQ(usableOf(PageTest::grid(), 1), "...");
  choose("Given as", 1);
  EXPECT_EQ(variable.format, 1);
  EXPECT_FALSE(control("Variable friction coefficient").usable());
  expectMaps(PageTest::grid(), variable.at(2).file, 2);
}

TEST_F(BedPages, OfSliding) {
  openPage("CNmtSlidingDlg", 18832, PageId::mtSliding);
  CNmtSlidingKvs& sliding = *root().nmtSliding;
  EXPECT_EQ(labels(), (Labels{"Include sliding", "Sliding coefficients"}));
  EXPECT_EQ(control("Sliding coefficients").choices,
            (Labels{"Use constant sliding coefficients", "Use variable sliding coefficients"}));
  EXPECT_FALSE(control("Sliding coefficients").usable());
  choose("Include sliding", 1);
  EXPECT_EQ(sliding.includeSliding, 1);
  choose("Sliding coefficients", 1);
  EXPECT_EQ(sliding.includeVariableSlidingCoefficient, 1);
  choose("Include sliding", 0);
  EXPECT_FALSE(control("Sliding coefficients").usable());
  EXPECT_EQ(sliding.includeVariableSlidingCoefficient, 1);
}

TEST_F(BedPages, OfTheSettlingOfComponents) {
  openPage("CNmtMfSettlingAndDepositionDlg", 18825, PageId::mtMfSettlingAndDeposition);
  CNmtSettlingAndDespositionComponentKvs& second = root().nmtSettlingAndDesposition->at(2);
  EXPECT_EQ(headers(),
            (Labels{"Component", "Critical velocity for deposition", "Critical velocity for erosion",
                    "Relative height of centroid", "Mean settling velocity"}));
  EXPECT_EQ(rowHeadersOf(PageTest::grid()), (Labels{"Fraction no. 1", "Fraction no. 2"}));
  EXPECT_EQ(usableOf(PageTest::grid(), 2), "xxxx");
  for (int col = 1; col <= 4; ++col) EXPECT_EQ(store(2, col, std::to_string(col)), 1);
  EXPECT_EQ(second.criticalVelocityForDeposition, 1.0F);
  EXPECT_EQ(second.criticalVelocityForErosion, 2.0F);
  EXPECT_EQ(second.relativeHeightOfCentroid, 3.0F);
  EXPECT_EQ(second.meanSettlingVelocity, 4.0F);
  EXPECT_EQ(style(1, 1).toolTip, "Speed of current [m/s]");
  EXPECT_EQ(style(1, 2).toolTip, "Speed of current [m/s]");
  EXPECT_EQ(style(1, 3).toolTip, "");
  EXPECT_EQ(style(1, 4).toolTip, "Settling velocity [m/s]");
}

TEST_F(BedPages, OfWhatBelongsToTheComponents) {
  const Labels names{"Fraction no. 1", "Fraction no. 2"};
  CNmtSettlingAndDespositionKvs& settling = *root().nmtSettlingAndDesposition;
  openPage("CNmtSettlingAndDespositionBedCompositionDlg", 18826,
           PageId::mtSettlingAndDespositionBedComposition);
  expectPair(
      "Initial bed composition", names,
      names, [&settling](int n) -> auto& { return settling.at(n).bedComposition; }, "");
  EXPECT_EQ(headersOf(grid("Initial bed composition")), (Labels{"Component", "Given as", "Value"}));
  openPage("CNmtSettlingAndDespositionErosionDlg", 18827, PageId::mtSettlingAndDespositionErosion);
  expectPair(
      "Erosion coefficients", names, names, [&settling](int n) -> auto& { return settling.at(n).erosion; },
      "Erosion rate in grams [g/m²/s]");
}

TEST_F(BedPages, OfTheSettlingInLayers) {
  openPage("CNmtMlSettlingAndDepositionDlg", 18829, PageId::mtMlSettlingAndDeposition);
  CNmtMlSettlingAndDepositionKvs& settling = *root().nmtMlSettlingAndDeposition;
  const std::pair<const char*, float*> numbers[] = {
      {"Relative height of centroid [-]", &settling.relativeHeightOfCentroid},
      {"Factor kon1 [-]", &settling.factorKon1},
      {"Factor kon2 [-]", &settling.factorKon2},
      {"Power M1 [-]", &settling.powerM1},
      {"Power M2 [-]", &settling.powerM2},
      {"Power B1 [-]", &settling.powerB1},
      {"Power B2 [-]", &settling.powerB2},
      {"Concentration limit C1", &settling.concentrationC1},
      {"Concentration limit C2", &settling.concentrationC2},
      {"Salinity limit 1", &settling.salinityLimit1},
      {"Salinity limit 2", &settling.salinityLimit2},
      {"Critical shear stress", &settling.shearStress.constant}};
  float value = 0;
  for (const auto& [label, member] : numbers) {
    value += 0.5F;
    edit(label, std::to_string(value));
    EXPECT_EQ(*member, value) << label;
    const int quantity = std::string_view(label).starts_with("Concentration") ? item::kConcentration
                         : std::string_view(label).starts_with("Critical")    ? item::kShearStress
                                                                              : 0;
    EXPECT_EQ(control(label).itemCode, quantity) << label;
  }
  EXPECT_EQ(control("Profile").choices,
            (Labels{"Use stationary concentration profile", "Use dynamic concentration profile"}));
  EXPECT_EQ(control("Profile").index, 1);
  choose("Profile", 0);
  EXPECT_EQ(settling.stationaryProfile, 1);
  EXPECT_FALSE(control("Factor for deposition [-]").usable());
  choose("Use factor for deposition", 1);
  EXPECT_EQ(settling.useFactorForDeposition, 1);
  edit("Factor for deposition [-]", "20");
  EXPECT_EQ(settling.factorForDeposition, 20.0F);
  EXPECT_EQ(usableOf(PageTest::grid(), 1), "...");
  choose("Given as", 1);
  EXPECT_EQ(settling.shearStress.format, 1);
  EXPECT_FALSE(control("Critical shear stress").usable());
  expectMaps(PageTest::grid(), settling.shearStress.at(2).file, 2);
}

TEST_F(BedPages, OfTheErosionOfFractions) {
  openPage("CNmtMfErosionCharacteristicsDlg", 18824, PageId::mtMfErosionCharacteristics);
  CNmtMfErosionCharacteristicsKvs& erosion = *root().nmtMfErosionCharacteristics;
  EXPECT_EQ(labels(), (Labels{"Settings", "Bed is erodible", "Deposited sediment is erodible",
                              "Calculation method", "Sediment", "Scale factor"}));
  EXPECT_EQ(control("Sediment").choices,
            (Labels{"Only cohesive sediment", "Cohesive and non cohesive sediment"}));
  EXPECT_EQ(control("Sediment").index, 0);
  choose("Bed is erodible", 0);
  EXPECT_EQ(erosion.bedIsErodible, 0);
  choose("Deposited sediment is erodible", 0);
  EXPECT_EQ(erosion.depositedSedimentErodible, 0);
  choose("Sediment", 1);
  EXPECT_EQ(erosion.onlyCohesiveSediment, 0);
  edit("Scale factor", "2.5");
  EXPECT_EQ(erosion.scaleFactor, 2.5F);
}

TEST_F(BedPages, OfTheErosionOfLayers) {
  openPage("CNmtMlErosionCharacteristicsDlg", 18828, PageId::mtMlErosionCharacteristics);
  CNmtMlErosionCharacteristicsKvs& erosion = *root().nmtMlErosionCharacteristics;
  EXPECT_EQ(labels(), (Labels{"Include instantaneous erosion of layer 1", "Erosion coefficients"}));
  EXPECT_EQ(control("Erosion coefficients").choices,
            (Labels{"Use constant erosion coefficients", "Use variable erosion coefficients"}));
  choose("Include instantaneous erosion of layer 1", 1);
  EXPECT_EQ(erosion.instantaneousErosionOfLayer1, 1);
  EXPECT_EQ(control("Erosion coefficients").index, 0);
  choose("Erosion coefficients", 1);
  EXPECT_EQ(erosion.useConstantErosionCoefficient, 0);

  openPage("CNmtErosionLayerDlg", 18819, PageId::mtErosionLayer);
  EXPECT_EQ(headers(), (Labels{"Layer", "Erosion of"}));
  EXPECT_EQ(rowHeadersOf(PageTest::grid()), (Labels{"1", "2", "3"}));
  EXPECT_EQ(style(1, 1).choices, (Labels{"Dense bed", "Soft bed"}));
  EXPECT_EQ(cell(2, 1), "Dense bed");
  EXPECT_EQ(store(2, 1, "Soft bed"), 1);
  EXPECT_EQ(root().nmtErosionLayer->at(2).isDense, 0);
}

TEST_F(BedPages, OfConsolidationAndRoughness) {
  openPage("CNmtConsolidationDlg", 18811, PageId::mtConsolidation);
  choose("Include consolidation of mud within layers", 1);
  EXPECT_EQ(root().nmtConsolidation->useConsolidation, 1);

  openPage("CNmtBedRoughnessDlg", 18807, PageId::mtBedRoughness);
  CNmtBedRoughnessKvs& roughness = *root().nmtBedRoughness;
  EXPECT_EQ(labels(), (Labels{"Given as", "Bed roughness", "Data files"}));
  EXPECT_EQ(control("Bed roughness").itemCode, item::kRoughnessHeight);
  edit("Bed roughness", "0.002");
  EXPECT_EQ(roughness.constant, 0.002F);
  choose("Given as", 1);
  EXPECT_EQ(roughness.format, 1);
  EXPECT_FALSE(control("Bed roughness").usable());
  expectMaps(PageTest::grid(), roughness.at(1).file, 1);
}

TEST_F(BedPages, OfTheWaves) {
  openPage("CNmtWaveDataDlg", 18838, PageId::mtWaveData);
  CNmtWaveDataKvs& waves = *root().nmtWaveData;
  EXPECT_EQ(labels(), (Labels{"Wave description", "Wave input", "Constant waves", "Significant wave height",
                              "Significant wave period", "Angle with true north", "Wave fields", "Field",
                              "Data file", "...", "View...", "Minimum water depth for including waves",
                              "Liquefaction", "Include liquefaction", "Liquefaction factor"}));
  const Labels all{"Wave description",
                   "Wave input",
                   "Significant wave height",
                   "Field",
                   "Data file",
                   "Minimum water depth for including waves",
                   "...",
                   "Include liquefaction",
                   "Liquefaction factor"};
  EXPECT_EQ(usableControls(all), "x........");
  EXPECT_EQ(control("Wave description").choices, (Labels{"Waves not included", "Waves included"}));
  choose("Wave description", 1);
  EXPECT_EQ(waves.description, 1);
  EXPECT_EQ(usableControls(all), "xxx..x.x.");
  edit("Significant wave height", "2");
  edit("Significant wave period", "3");
  edit("Angle with true north", "4");
  edit("Minimum water depth for including waves", "5");
  choose("Include liquefaction", 1);
  edit("Liquefaction factor", "6");
  EXPECT_EQ(waves.significantHeight, 2.0F);
  EXPECT_EQ(waves.significantPeriod, 3.0F);
  EXPECT_EQ(waves.angleWithTrueNorth, 4.0F);
  EXPECT_EQ(waves.minimumDepth, 5.0F);
  EXPECT_EQ(waves.includeLiquefaction, 1);
  EXPECT_EQ(waves.liquefactionFactor, 6.0F);
  EXPECT_EQ(control("Significant wave height").itemCode, item::kSignificantWaveHeight);
  EXPECT_EQ(control("Significant wave period").itemCode, item::kWavePeriod);
  EXPECT_EQ(control("Angle with true north").itemCode, item::kWaveDirection);
  EXPECT_EQ(control("Minimum water depth for including waves").itemCode, item::kFloodDepth);
  EXPECT_EQ(control("Wave input").choices, (Labels{"Constant waves", "Wave fields"}));
  choose("Wave input", 1);
  EXPECT_EQ(waves.input, 1);
  EXPECT_EQ(usableControls(all), "xx.xxxxxx");
  EXPECT_EQ(control("Field").choices, (Labels{"Use interpolation in time", "Use database"}));
  choose("Field", 1);
  EXPECT_EQ(waves.useDatabase, 1);
  host.chosenItems = {1, 2, 3};
  press("...");
  EXPECT_EQ(host.filters, Labels{"Wave fields (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(waves.file.fileName.text(), *host.chosenFile);
  EXPECT_EQ(waves.file.items, (std::vector<std::uint32_t>{1, 2, 3}));
  EXPECT_TRUE(control("View...").usable());
}

}  // namespace mud_transport_bed_pages_test
}  // namespace gridbay
