// Initial concentrations and deposition: by component, and within each by area.

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "advection_dispersion/deposition_concentration.h"
#include "advection_dispersion/initial_concentration.h"
#include "basic/bathymetry.h"
#include "platform/units/units.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_values_by_area_test {

using test::savedText;
using Texts = std::vector<std::string>;

class ValuesByArea : public ::testing::Test {
 protected:
  void write(int quantity, int noJ, int noK, int steps = 1, double step = 3000) {
    TsbDefinition definition;
    definition.time.step = step;
    definition.time.count = static_cast<std::size_t>(steps);
    if (noJ > 0) {
      definition.axes = {{static_cast<std::size_t>(noJ), 0, 30, "m"},
                         {static_cast<std::size_t>(noK), 0, 30, "m"}};
    }
    definition.items = {{"Item", quantity, std::string(qunBaseUnit(quantity)->text)}};
    test::writeFile(path, definition);
  }
  static Texts faults(CKvsBase& object, PageId page) {
    const ValidationList messages = test::messagesOf(object);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, page);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  Texts invalid() const { return {"Data file  \" " + path + "\"  is not valid"}; }
  void knowGrid(int area, int noJ, int noK) {
    CBathymetryObjectKvs& grid = *root.bathymetry->GetArea(area);
    grid.noJ = noJ;
    grid.noK = noK;
    grid.dx = grid.dy = 30;
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  std::string path = folder.file("map.tsb2");
};

TEST_F(ValuesByArea, InitialConcentrationsInFileOrder) {
  root.bathymetry->SetNoAreas(2);
  CNadInitialObjectKvs& second = root.nadInitialConcentration->at(1).at(2);
  second.format = 1;
  second.value = 2.5F;
  second.file.fileName = "/case/i.tsb2";
  second.file.items = {3};
  EXPECT_EQ(savedText(*root.nadInitialConcentration),
            "INITIAL_CONCENTRATIONS {\n"
            "    COMPONENT_1 {\n"
            "        AREA_1 {\n"
            "            Data_Format 0\n"
            "            Constant_Value 0.0\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "        AREA_2 {\n"
            "            Data_Format 1\n"
            "            Constant_Value 2.5\n"
            "            File_Name (file)\"i.tsb2\"\n"
            "            Item_Numbers 3\n"
            "        }\n"
            "    }\n"
            "}\n");
}

TEST_F(ValuesByArea, DepositionInFileOrder) {
  CNadDepositionConcentrationKvs& deposition = *root.nadDepositionConcentration;
  deposition.includeSoil = true;
  deposition.soil.at(1).at(1).format = CNadSoilDepositionObjectKvs::kMap;
  EXPECT_EQ(savedText(deposition),
            "DEPOSITION_CONCENTRATIONS {\n"
            "    IncludeSurfaceDeposition #false\n"
            "    SurfaceDeposition {\n"
            "        COMPONENT_1 {\n"
            "            AREA_1 {\n"
            "                Data_Format -1\n"
            "                Constant_Value 0.0\n"
            "                File_Name (file)\"\"\n"
            "                Item_Numbers 1\n"
            "            }\n"
            "        }\n"
            "    }\n"
            "    IncludeSoilDeposition #true\n"
            "    SoilDeposition {\n"
            "        COMPONENT_1 {\n"
            "            AREA_1 {\n"
            "                Data_Format 2\n"
            "                Constant_Value 0.0\n"
            "                File_Name (file)\"\"\n"
            "                Item_Numbers 1\n"
            "            }\n"
            "        }\n"
            "    }\n"
            "}\n");
}

TEST_F(ValuesByArea, FollowComponentsAndAreas) {
  root.nadInitialConcentration->at(1).at(1).value = 7;
  root.nadDepositionConcentration->soil.at(1).at(1).value = 8;
  root.bathymetry->SetNoAreas(3);
  root.nadComponent->SetCount(2);
  const auto counts = [this] {
    std::vector<int> all{root.nadInitialConcentration->GetCount()};
    for (int n = 1; n <= all[0]; ++n) all.push_back(root.nadInitialConcentration->at(n).GetCount());
    const CNadDepositionConcentrationKvs& deposition = *root.nadDepositionConcentration;
    EXPECT_EQ(deposition.surface.GetCount(), all[0]);
    EXPECT_EQ(deposition.soil.GetCount(), all[0]);
    for (int n = 1; n <= all[0]; ++n) {
      EXPECT_EQ(deposition.surface.GetItem(n)->GetCount(), all[static_cast<std::size_t>(n)]);
      EXPECT_EQ(deposition.soil.GetItem(n)->GetCount(), all[static_cast<std::size_t>(n)]);
    }
    return all;
  };
  EXPECT_EQ(counts(), (std::vector<int>{2, 3, 3}));
  root.bathymetry->SetNoAreas(2);
  EXPECT_EQ(counts(), (std::vector<int>{2, 2, 2}));
  root.nadComponent->SetCount(1);
  EXPECT_EQ(counts(), (std::vector<int>{1, 2}));
  EXPECT_EQ(root.nadInitialConcentration->at(1).at(1).value, 7);
  EXPECT_EQ(root.nadDepositionConcentration->soil.at(1).at(1).value, 8);
  root.nadComponent->SetCount(0);
  EXPECT_EQ(counts(), std::vector<int>{0});
  EXPECT_EQ(savedText(*root.nadInitialConcentration), "INITIAL_CONCENTRATIONS {}\n");
}

TEST_F(ValuesByArea, MissingSectionsArePassedOver) {
  test::load(*root.nadInitialConcentration, "INITIAL_CONCENTRATIONS {}");
  test::load(*root.nadInitialConcentration, "INITIAL_CONCENTRATIONS { COMPONENT_1 {} }");
  test::load(*root.nadDepositionConcentration, "DEPOSITION_CONCENTRATIONS { SurfaceDeposition {} }");
  test::load(
      *root.nadDepositionConcentration,
      "DEPOSITION_CONCENTRATIONS { SoilDeposition { COMPONENT_1 { AREA_1 { Constant_Value 4.0 } } } }");
  EXPECT_TRUE(model.host.texts.empty());
  EXPECT_EQ(root.nadDepositionConcentration->soil.at(1).at(1).value, 4.0F);
}

TEST_F(ValuesByArea, FormatsOfDepositionOnFile) {
  CNadSurfaceDepositionObjectKvs& value = root.nadDepositionConcentration->surface.at(1).at(1);
  const auto loaded = [&](const std::string& format) {
    test::load(
        *root.nadDepositionConcentration,
        "DEPOSITION_CONCENTRATIONS { SurfaceDeposition { COMPONENT_1 { AREA_1 { " + format + " } } } }");
    return value.format;
  };
  EXPECT_EQ(loaded("Data_Format 2"), 2);
  EXPECT_EQ(loaded("Data_Format 1"), 2);  // no such format on file
  EXPECT_EQ(loaded("Constant_Value 1.0"), 2);
  EXPECT_EQ(loaded("Data_Format 0"), 1);
  EXPECT_EQ(loaded("Data_Format -1"), 0);
  for (const auto& [format, onFile] :
       {std::pair(0, "Data_Format -1\n"), std::pair(1, "Data_Format 0\n"), std::pair(2, "Data_Format 2\n"),
        std::pair(3, ""), std::pair(-1, "")}) {
    value.format = format;
    const std::string text = savedText(value);
    EXPECT_EQ(text.substr(0, text.find("Constant_Value")), onFile) << format;
  }
}

TEST_F(ValuesByArea, AreReadBackAndCopied) {
  root.bathymetry->SetNoAreas(2);
  root.nadComponent->SetCount(2);
  root.nadDepositionConcentration->surface.at(2).at(1).format = 1;
  root.nadDepositionConcentration->soil.at(1).at(2).value = 3;
  root.nadInitialConcentration->at(2).at(2).value = 5;
  test::Model other;
  other.root.bathymetry->SetNoAreas(2);
  other.root.nadComponent->SetCount(2);
  test::load(*other.root.nadDepositionConcentration, savedText(*root.nadDepositionConcentration));
  EXPECT_EQ(savedText(*other.root.nadDepositionConcentration), savedText(*root.nadDepositionConcentration));
  other.root.nadInitialConcentration->CopyFrom(*root.nadInitialConcentration);
  EXPECT_EQ(savedText(*other.root.nadInitialConcentration), savedText(*root.nadInitialConcentration));
  other.root.nadComponent->SetCount(1);
  other.root.nadDepositionConcentration->CopyFrom(*root.nadDepositionConcentration);
  EXPECT_EQ(savedText(*other.root.nadDepositionConcentration), savedText(*root.nadDepositionConcentration));
}

TEST_F(ValuesByArea, AnInitialMapFitsItsAreaAndComponent) {
  root.bathymetry->SetNoAreas(2);
  knowGrid(1, 4, 3);
  knowGrid(2, 7, 7);
  CNadInitialObjectKvs& value = root.nadInitialConcentration->at(1).at(2);
  value.file.fileName = path;
  const auto check = [this] { return faults(*root.nadInitialConcentration, PageId::adInitialConcentration); };
  EXPECT_TRUE(check().empty());  // a constant
  value.format = 1;
  EXPECT_EQ(check(), invalid());
  EXPECT_TRUE(test::messagesOf(*root.nadInitialConcentration, 0).empty());
  write(item::kConcentration, 7, 7);
  EXPECT_TRUE(check().empty());
  write(item::kConcentration, 4, 3);
  EXPECT_EQ(check(), invalid());
  write(item::kConcentration, 7, 7, 2, 10);  // varies, and ends before the simulation
  EXPECT_EQ(check(), invalid());
  write(item::kConcentration, 7, 7, 2);
  EXPECT_TRUE(check().empty());
  for (const int heat : {2, -2}) {
    root.nadComponent->at(1).type = heat;
    write(item::kConcentration, 7, 7);
    EXPECT_EQ(check(), invalid());
    write(item::kTemperature, 7, 7);
    EXPECT_TRUE(check().empty());
  }
  value.file.items = {2};
  EXPECT_EQ(check(), invalid());
}

TEST_F(ValuesByArea, DepositionIsCheckedWhereItIsIncluded) {
  CNadDepositionConcentrationKvs& deposition = *root.nadDepositionConcentration;
  deposition.surface.at(1).at(1).file.fileName = "/none.tsb0";
  deposition.surface.at(1).at(1).format = 1;
  deposition.soil.at(1).at(1).file.fileName = path;
  deposition.soil.at(1).at(1).format = 2;
  const auto check = [&] { return faults(deposition, PageId::adDepositionConcentration); };
  const std::string noSurface = "Data file  \" /none.tsb0\"  is not valid";
  EXPECT_TRUE(check().empty());
  deposition.includeSoil = true;
  EXPECT_EQ(check(), invalid());
  deposition.includeSurface = true;
  EXPECT_EQ(check(), (Texts{noSurface, invalid().front()}));
  EXPECT_TRUE(test::messagesOf(deposition, 0).empty());
  write(item::kDepositionRate, 4, 3);
  EXPECT_EQ(check(), Texts{noSurface});
  deposition.soil.at(1).at(1).format = 1;
  EXPECT_EQ(check(), (Texts{noSurface, invalid().front()}));
  write(item::kDepositionRate, 0, 0, 2);
  EXPECT_EQ(check(), Texts{noSurface});
  write(item::kDepositionRate, 0, 0, 1);  // a time series covers the simulation always
  EXPECT_EQ(check(), (Texts{noSurface, invalid().front()}));
  deposition.surface.at(1).at(1).format = 3;
  deposition.soil.at(1).at(1).format = 0;
  EXPECT_TRUE(check().empty());
}

TEST_F(ValuesByArea, AnEditInADeepListIsFoundAndTakenBack) {
  root.bathymetry->SetNoAreas(2);
  root.nadComponent->SetCount(2);
  test::Model twin;
  twin.root.AssignState(root);
  root.nadDepositionConcentration->soil.at(2).at(1).value = 3;
  const auto change = root.nadDepositionConcentration->TakeChange(*twin.root.nadDepositionConcentration);
  ASSERT_NE(change, nullptr);
  EXPECT_TRUE(twin.root.SameState(root));
  change->apply(*root.nadDepositionConcentration, false);
  EXPECT_EQ(root.nadDepositionConcentration->soil.at(2).at(1).value, 0);
}

}  // namespace advection_dispersion_values_by_area_test
}  // namespace gridbay
