#include "basic/module_selection.h"

#include <gtest/gtest.h>

#include "core/edition.h"
#include "tests/support/model.h"

namespace gridbay {
namespace basic_module_selection_test {

using test::load;
using test::savedText;

TEST(ModuleSelection, Defaults) {
  const CModuleSelectionKvs selection(nullptr);
  EXPECT_EQ(selection.simulationType, 0);
  EXPECT_EQ(selection.adScheme, 1);
  EXPECT_FALSE(selection.highPrecision);
  EXPECT_EQ(selection.hydrodynamicFeatures, 1);
}

TEST(ModuleSelection, IsWrittenAsHeldOrPinned) {
  CModuleSelectionKvs selection(nullptr);
  selection.simulationType = 9;
  selection.adScheme = -5;
  EXPECT_EQ(savedText(selection), theEdition.wetlandSweepKit
                                      ? "MODULE_SELECTION {\n    Simulation_Type 0\n    AD_Scheme 1\n    "
                                        "hydrodynamic_features 0\n}\n"
                                      : "MODULE_SELECTION {\n    Simulation_Type 9\n    AD_Scheme -5\n    "
                                        "hydrodynamic_features 1\n}\n");
}

TEST(ModuleSelection, IsReadOrPinned) {
  CModuleSelectionKvs selection(nullptr);
  load(selection, "MODULE_SELECTION { Simulation_Type 2; AD_Scheme 5; hydrodynamic_features 0 }");
  EXPECT_EQ(selection.simulationType, theEdition.wetlandSweepKit ? 0 : 2);
  EXPECT_EQ(selection.adScheme, theEdition.wetlandSweepKit ? 1 : 5);
  EXPECT_EQ(selection.hydrodynamicFeatures, 0);
}

TEST(ModuleSelection, AMissingSectionKeepsTheDefaultsOrPins) {
  CModuleSelectionKvs selection(nullptr);
  load(selection, "OTHER {}");
  EXPECT_EQ(selection.hydrodynamicFeatures, theEdition.wetlandSweepKit ? 0 : 1);
  EXPECT_EQ(selection.adScheme, 1);
}

TEST(ModuleSelection, AllButHighPrecisionIsCopied) {
  CModuleSelectionKvs selection(nullptr);
  selection.simulationType = 8;
  selection.adScheme = -1;
  selection.hydrodynamicFeatures = 0;
  selection.highPrecision = true;
  CModuleSelectionKvs copy(nullptr);
  copy.CopyFrom(selection);
  EXPECT_EQ(copy.simulationType, 8);
  EXPECT_EQ(copy.adScheme, -1);
  EXPECT_EQ(copy.hydrodynamicFeatures, 0);
  EXPECT_FALSE(copy.highPrecision);
}

TEST(ModuleSelection, NothingIsChecked) {
  CModuleSelectionKvs selection(nullptr);
  selection.simulationType = 12345;
  EXPECT_TRUE(test::messagesOf(selection).empty());
}

TEST(Edition, StringsOfTheDocument) {
  EXPECT_EQ(theEdition.document.id, theEdition.wetlandSweepKit ? 19200 : 18951);
  EXPECT_EQ(
      theEdition.document.format,
      theEdition.wetlandSweepKit
          ? "V27WSK.chm\nUntitled\nVANE 27 Wetland Sweep Kit\nVANE 27 Wetland Sweep Kit (*.v27wsk)\n.v27wsk\n"
            "VANE27FlowModelWSK.Document\nWetland Sweep Kit"
          : "V27Nested.chm\nUntitled\nVANE 27 Flow model\nVANE 27 Flow Model (*.v27)\n.v27\n"
            "VANE27FlowModel.Document\nFlow Model");
  EXPECT_EQ(theEdition.editorName.format, theEdition.wetlandSweepKit ? "Wetland Sweep Kit" : "Flow Model");
  EXPECT_EQ(theEdition.fileKind, theEdition.wetlandSweepKit ? "v27wsk" : "v27");
}

}  // namespace basic_module_selection_test
}  // namespace gridbay
