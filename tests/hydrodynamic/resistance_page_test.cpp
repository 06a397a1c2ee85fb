#include "hydrodynamic/resistance_page.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "hydrodynamic/resistance.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_resistance_page_test {

class ResistancePage : public test::ShapeTest {
 protected:
  ResistancePage() {
    root().bathymetry->SetNoAreas(2);
    document.RecordEdit(PageId::resistance, "before");
    PageTest::open("CNhdResistanceDlg");
  }
  CNhdResistanceKvs& list() { return *root().nhdResistance; }
  CV27SetupGridWnd& cells() { return PageTest::grid(); }
  void setFormulation(std::int32_t formulation) {
    list().formulation = formulation;
    page->OnUpdate();
  }
  test::TemporaryFolder folder;
};

const std::vector<std::string> kWaveControls{"Sediment",
                                             "Diameter format:",
                                             "Effective diameter:",
                                             "Data file:",
                                             "...",
                                             "View...",
                                             "Relative density:",
                                             "Wave induced bed resistance parameters",
                                             "Type of roughness:",
                                             "Include wave height correction",
                                             "Wave height/depth limit:",
                                             "Update frequency:"};

TEST_F(ResistancePage, TypeAndGrid) {
  EXPECT_EQ(page->templateId(), 18923);
  EXPECT_EQ(page->pageId(), PageId::resistance);
  EXPECT_EQ(control("Resistance type:").choices, (Labels{"Manning number", "Chezy numbers"}));
  EXPECT_EQ(headers(),
            (Labels{"Area", "Format", "Constant", "Filename", "", "", "Pier res.", "Filename", "", ""}));
  EXPECT_EQ(cells().GetRowCount(), 2);
  EXPECT_EQ(rowOf(cells(), 1),
            (Labels{"Constant", "32.000000", "", "   ...   ", "View...", "0", "", "   ...   ", "View..."}));
  EXPECT_EQ(style(1, 1).choices, (Labels{"Excluded", "Constant", "Data file"}));
  choose("Resistance type:", 1);
  EXPECT_EQ(list().formulation, 1);
}

TEST_F(ResistancePage, TheFormatDecidesWhatIsTaken) {
  EXPECT_EQ(usableOf(cells(), 1), "xx...x...");
  store(1, 1, "Data file");
  EXPECT_EQ(list().at(1).dataFormat, 2);
  EXPECT_EQ(usableOf(cells(), 1), "x.xx.x...");
  store(1, 1, "Excluded");
  EXPECT_EQ(list().at(1).dataFormat, 0);
  EXPECT_EQ(usableOf(cells(), 1), "x....x...");
  EXPECT_EQ(store(1, 6, "1"), 1);
  EXPECT_TRUE(list().at(1).includePier);
  EXPECT_EQ(usableOf(cells(), 1), "x....xxx.");
  EXPECT_EQ(usableOf(cells(), 2), "xx...x...");
}

TEST_F(ResistancePage, TheConstantStaysAsItIsTyped) {
  document.units().setSystem(UnitSystem::us);
  EXPECT_EQ(store(2, 2, "40"), 1);
  EXPECT_EQ(list().at(2).constantValue, 40.0F);
  EXPECT_EQ(cell(2, 2), "40.000000");
  EXPECT_EQ(style(2, 2).toolTip, "Manning number [m^⅓/s]");
  list().formulation = 1;
  EXPECT_EQ(style(2, 2).toolTip, "Chezy number [m^½/s]");
}

TEST_F(ResistancePage, EditsAreTakenBack) {
  store(2, 2, "40");
  store(1, 6, "1");
  choose("Resistance type:", 1);
  document.Undo();
  EXPECT_EQ(list().formulation, 0);
  document.Undo();
  EXPECT_FALSE(list().at(1).includePier);
  document.Undo();
  EXPECT_EQ(list().at(2).constantValue, 32.0F);
  document.Redo();
  EXPECT_EQ(list().at(2).constantValue, 40.0F);
}

TEST_F(ResistancePage, FilesAreChosen) {
  store(1, 1, "Data file");
  store(1, 6, "1");
  host.chosenFile = folder.write("f.tsb2", "");
  host.chosenItems = {2};
  cells().OnClickedButtonRowCol(1, 4);
  EXPECT_EQ(list().at(1).map.fileName.text(), *host.chosenFile);
  EXPECT_TRUE(list().at(1).pierFile.fileName.empty());
  EXPECT_EQ(usableOf(cells(), 1), "x.xxxxxx.");
  cells().OnClickedButtonRowCol(1, 8);
  EXPECT_EQ(list().at(1).pierFile.fileName.text(), *host.chosenFile);
  EXPECT_EQ(list().at(1).pierFile.items, std::vector<std::uint32_t>{2});
  EXPECT_EQ(host.filters, (Labels{"Resistance Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||",
                                  "Pier Resistance (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"}));
  cells().OnClickedButtonRowCol(1, 9);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

TEST_F(ResistancePage, SedimentAndWavesShowOnlyWithTheFormulationThatAFileSets) {
  for (const std::int32_t formulation : {0, 1, 2, 0}) {
    setFormulation(formulation);
    for (const std::string& label : kWaveControls)
      EXPECT_EQ(control(label).visible, formulation == 2) << label << formulation;
  }
  setFormulation(2);
  EXPECT_EQ(control("Resistance type:").index, -1);
  store(1, 2, "5");
  EXPECT_EQ(list().formulation, 2);  // kept until another is chosen
}

TEST_F(ResistancePage, Sediment) {
  setFormulation(2);
  EXPECT_EQ(control("Diameter format:").choices,
            (Labels{"Constant", "Constant in Time, Varying in Space", "Varying in Time and Space "}));
  const auto usable = [this] {
    return std::string(control("Effective diameter:").enabled ? "x" : ".") +
           (control("Data file:").enabled ? "x" : ".") + (control("...").enabled ? "x" : ".") +
           (control("View...").enabled ? "x" : ".");
  };
  EXPECT_EQ(usable(), "x...");
  EXPECT_EQ(text("Effective diameter:"), "0.2");
  EXPECT_EQ(control("Effective diameter:").unit, "mm");
  edit("Effective diameter:", "0.3");
  EXPECT_EQ(list().constantGrainSize, 0.3F);
  EXPECT_EQ(text("Relative density:"), "2.65");
  edit("Relative density:", "2.5");
  EXPECT_EQ(list().relativeDensity, 2.5F);
  for (const int format : {1, 2}) {
    choose("Diameter format:", format);
    EXPECT_EQ(list().diameterFormat, format);
    EXPECT_EQ(usable(), ".xx.");
  }
  host.chosenFile = folder.write("g.tsb2", "");
  host.chosenItems = {4};
  press("...");
  EXPECT_EQ(host.filters, Labels{"Grain Diameter Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(list().grainSizeMap.fileName.text(), *host.chosenFile);
  EXPECT_EQ(list().grainSizeMap.items, std::vector<std::uint32_t>{4});
  EXPECT_EQ(usable(), ".xxx");
}

TEST_F(ResistancePage, WaveInducedParameters) {
  setFormulation(2);
  EXPECT_EQ(control("Type of roughness:").choices, (Labels{"Parameterized", "Non-Parameterized"}));
  choose("Type of roughness:", 1);
  EXPECT_EQ(list().typeOfRoughness, 1);
  EXPECT_EQ(control("Include wave height correction").index, 1);
  edit("Wave height/depth limit:", "0.7");
  EXPECT_EQ(list().waveHeightOverDepthLimit, 0.7F);
  choose("Include wave height correction", 0);
  EXPECT_EQ(list().waveHeightCorrection, 0);
  EXPECT_FALSE(control("Wave height/depth limit:").enabled);
  EXPECT_EQ(text("Update frequency:"), "1");
  edit("Update frequency:", "5");
  EXPECT_EQ(list().updateFrequency, 5);
}

class WavePage : public test::PageTest {
 protected:
  WavePage() { open("CNhdResistanceWaveDlg"); }
  CNhdResistanceKvs& list() { return *root().nhdResistance; }
  test::TemporaryFolder folder;
};

TEST_F(WavePage, ControlsAndDefaults) {
  EXPECT_EQ(page->templateId(), 19655);
  EXPECT_EQ(page->pageId(), PageId::waves);
  EXPECT_EQ(labels(),
            (Labels{"Wave field", "Type of wave height:", "Type of wave period:", "Wave format:",
                    "Wave height:", "Wave direction:", "Wave period:", "Data file:", "...", "View..."}));
  EXPECT_EQ(control("Type of wave height:").choices, (Labels{"Significant wave height", "RMS wave height"}));
  EXPECT_EQ(control("Type of wave period:").choices, (Labels{"Peak wave period", "Mean wave period"}));
  EXPECT_EQ(control("Wave format:").choices,
            (Labels{"Constant in Time and Space", "Varying in Time,Constant in Space",
                    "Constant in Time,Varying in Space", "Varying in Time and Space"}));
  EXPECT_EQ(control("Wave format:").index, 3);
  EXPECT_EQ(text("Wave height:"), "1");
  EXPECT_EQ(text("Wave direction:"), "180");
  EXPECT_EQ(text("Wave period:"), "3");
  EXPECT_EQ(control("Wave direction:").unit, "°");
  EXPECT_EQ(control("Wave period:").unit, "s");
}

TEST_F(WavePage, TheFormatDecidesBetweenValuesAndFile) {
  for (const int format : {0, 1, 2, 3}) {
    choose("Wave format:", format);
    EXPECT_EQ(list().waveFormat, format);
    for (const char* label : {"Wave height:", "Wave direction:", "Wave period:"})
      EXPECT_EQ(control(label).enabled, format == 0) << label;
    EXPECT_EQ(control("Data file:").enabled, format != 0);
    EXPECT_EQ(control("...").enabled, format != 0);
    EXPECT_FALSE(control("View...").enabled);
  }
}

TEST_F(WavePage, EveryControlReachesTheModel) {
  choose("Type of wave height:", 1);
  choose("Type of wave period:", 1);
  choose("Wave format:", 0);
  edit("Wave height:", "1.5");
  edit("Wave direction:", "90");
  edit("Wave period:", "6");
  EXPECT_EQ(list().waveHeightKind, 1);
  EXPECT_EQ(list().wavePeriodKind, 1);
  EXPECT_EQ(list().constantWaveHeight, 1.5F);
  EXPECT_EQ(list().constantWaveDirection, 90.0F);
  EXPECT_EQ(list().constantWavePeriod, 6.0F);
}

TEST_F(WavePage, TheFileIsChosenByItsFormat) {
  host.chosenFile = folder.write("w.tsb2", "");
  host.chosenItems = {3, 2, 1};
  press("...");
  EXPECT_EQ(list().waveFile.items, (std::vector<std::uint32_t>{3, 2, 1}));
  EXPECT_EQ(list().waveFile.fileName.text(), *host.chosenFile);
  EXPECT_TRUE(control("View...").enabled);
  choose("Wave format:", 1);
  press("...");
  EXPECT_EQ(host.filters, (Labels{"Wave Field (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||",
                                  "Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"}));
}

}  // namespace hydrodynamic_resistance_page_test
}  // namespace gridbay
