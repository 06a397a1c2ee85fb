#include "mud_transport_expanded/initial_conditions.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "mud_transport_expanded/task_selection.h"
#include "platform/units/units.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_expanded_initial_conditions_test {

using test::savedText;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

class ExpandedInitial : public ::testing::Test {
 protected:
  void write(int noJ = 12, int itemType = 100403) {
    CBathymetryObjectKvs& area = *root.bathymetry->GetArea(1);
    area.noJ = 12;
    area.noK = 10;
    area.dx = area.dy = 100;
    test::writeGrid(path,
                    {.noJ = noJ, .noK = 10, .dx = 100, .dy = 100, .itemType = itemType, .unit = "kg m-3"});
  }
  Texts faults(int deep = 1) {
    const ValidationList messages = test::messagesOf(initial, deep);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::mtExpInitialConditions);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  CNmtExpInitialConditionsKvs& initial = *root.nmtExpInitialConditions;
  std::string path = folder.file("map.tsb2");
  const std::string invalid = "Data file  \" " + path + "\"  is not valid";
};

TEST_F(ExpandedInitial, AFilledOneHasSalinityLastAndTheThicknessOnce) {
  root.bathymetry->SetNoAreas(2);
  root.nmtExpTaskSelection->SetCounts(2, 2, true);
  initial.components.at(2).at(2).format = 1;
  initial.components.at(2).at(2).value = 0.5F;
  initial.components.at(2).at(2).file.fileName = "/case/c.tsb2";
  initial.components.at(2).at(2).file.items = {3};
  initial.thicknesses.at(2).at(1).format = 1;
  initial.thicknesses.at(2).at(1).value = 2.5F;
  initial.thicknesses.at(2).at(2).value = 7;  // that of the first area holds
  initial.thicknesses.at(2).at(2).file.fileName = "/case/t2.tsb2";
  initial.distribution.at(2).percentages = {70, 30};
  const auto area = [](int number, const char* value) {
    return "        AREA_" + std::to_string(number) +
           " {\n            Data_Format 0\n            Constant_Value " + value +
           "\n            File_Name (file)\"\"\n            Item_Numbers 1\n        }\n";
  };
  const std::string text = savedText(initial);
  EXPECT_EQ(text,
            "INITIAL_CONCENTRATIONS {\n"
            "    SEDIMENT_FRACTION_1 {\n" +
                area(1, "0.0") +
                "        AREA_2 {\n"
                "            Data_Format 1\n"
                "            Constant_Value 0.5\n"
                "            File_Name (file)\"c.tsb2\"\n"
                "            Item_Numbers 3\n"
                "        }\n"
                "    }\n"
                "    SEDIMENT_FRACTION_2 {\n" +
                area(1, "0.0") + area(2, "0.0") +
                "    }\n"
                "    Salinity {\n" +
                area(1, "40.0") + area(2, "40.0") +
                "    }\n"
                "}\n"
                "INITIAL_BED_THICKNESS {\n"
                "    BED_LAYER_1 {\n"
                "        Data_Format 0\n"
                "        Constant_Value 0.0\n"
                "        AREA_1 {\n"
                "            File_Name (file)\"\"\n"
                "            Item_Numbers 1\n"
                "        }\n"
                "        AREA_2 {\n"
                "            File_Name (file)\"\"\n"
                "            Item_Numbers 1\n"
                "        }\n"
                "    }\n"
                "    BED_LAYER_2 {\n"
                "        Data_Format 1\n"
                "        Constant_Value 2.5\n"
                "        AREA_1 {\n"
                "            File_Name (file)\"\"\n"
                "            Item_Numbers 1\n"
                "        }\n"
                "        AREA_2 {\n"
                "            File_Name (file)\"t2.tsb2\"\n"
                "            Item_Numbers 1\n"
                "        }\n"
                "    }\n"
                "}\n"
                "INITIAL_BED_SEDIMENT_DISTRIBUTION {\n"
                "    BED_LAYER_1 {\n"
                "        Fraction_Distribution 50 50\n"
                "    }\n"
                "    BED_LAYER_2 {\n"
                "        Fraction_Distribution 70 30\n"
                "    }\n"
                "}\n");
  test::Model other;
  other.root.bathymetry->SetNoAreas(2);
  other.root.nmtExpTaskSelection->SetCounts(2, 2, true);
  test::load(*other.root.nmtExpInitialConditions, text);
  EXPECT_EQ(savedText(*other.root.nmtExpInitialConditions), text);
  EXPECT_EQ(other.root.nmtExpInitialConditions->thicknesses.at(2).at(1).format, 1);
  EXPECT_EQ(other.root.nmtExpInitialConditions->thicknesses.at(2).at(2).format, 0);
  test::Model third;
  third.root.nmtExpTaskSelection->SetCounts(2, 2, true);
  third.root.nmtExpInitialConditions->CopyFrom(initial);
  EXPECT_EQ(savedText(*third.root.nmtExpInitialConditions), text);
}

TEST_F(ExpandedInitial, WhatTheFileLacksKeepsItsValue) {
  root.nmtExpTaskSelection->SetCounts(2, 2, true);
  test::load(initial,
             "INITIAL_CONCENTRATIONS { SEDIMENT_FRACTION_2 { AREA_1 { Constant_Value 3.0 } } }\n"
             "INITIAL_BED_SEDIMENT_DISTRIBUTION { BED_LAYER_1 { Fraction_Distribution 80 }\n"
             " BED_LAYER_2 { Fraction_Distribution 1 2 3 4 } }");
  EXPECT_EQ(initial.components.at(1).at(1).value, 40);
  EXPECT_EQ(initial.components.at(2).at(1).value, 0);
  EXPECT_EQ(initial.components.at(3).at(1).value, 3);
  EXPECT_EQ(initial.distribution.at(1).percentages, (std::vector<std::int32_t>{80, 50}));
  EXPECT_EQ(initial.distribution.at(2).percentages, (std::vector<std::int32_t>{1, 2}));
  EXPECT_THAT(model.host.texts, IsEmpty());
}

TEST_F(ExpandedInitial, LayersAreSharedInWholePercentages) {
  CNmtExpBedDistributionObjectKvs layer(nullptr);
  const auto shared = [&](int fractions) {
    layer.Share(fractions);
    return layer.percentages;
  };
  EXPECT_EQ(shared(1), (std::vector<std::int32_t>{100}));
  EXPECT_EQ(shared(3), (std::vector<std::int32_t>{34, 33, 33}));
  EXPECT_EQ(shared(8), (std::vector<std::int32_t>{16, 12, 12, 12, 12, 12, 12, 12}));
  EXPECT_THAT(shared(0), IsEmpty());
  EXPECT_THAT(shared(-1), IsEmpty());
}

TEST_F(ExpandedInitial, PercentagesSumUpTo100) {
  const Texts told{"Total Bed Distribution different from 100"};
  auto& shares = initial.distribution.at(1).percentages;
  for (const std::vector<std::int32_t>& wrong :
       {std::vector<std::int32_t>{99}, {101}, {}, {2147483647, 2147483647, 102}, {-100}}) {
    shares = wrong;
    EXPECT_EQ(faults(), told);
  }
  shares = {60, 45, -5};
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(ExpandedInitial, ConstantsBelowZero) {
  root.nmtExpTaskSelection->SetCounts(2, 2, false);
  initial.components.at(2).at(1).value = -0.1F;
  initial.thicknesses.at(1).at(1).value = -1;
  EXPECT_EQ(faults(), (Texts{"Constant value for initial concentration must be highr than 0",
                             "Constant value for initial bed thickness must be highr than 0"}));
  EXPECT_THAT(faults(0), IsEmpty());
}

TEST_F(ExpandedInitial, MapsMustFitTheirArea) {
  initial.components.at(1).at(1).file.fileName = path;
  EXPECT_THAT(faults(), IsEmpty());
  initial.components.at(1).at(1).format = 1;
  EXPECT_EQ(faults(), Texts{invalid});
  write();
  EXPECT_THAT(faults(), IsEmpty());
  write(12, item::kBedDensity);  // of any quantity
  EXPECT_THAT(faults(), IsEmpty());
  write(11);
  EXPECT_EQ(faults(), Texts{invalid});
}

TEST_F(ExpandedInitial, TheFormatOfAThicknessIsThatOfTheFirstArea) {
  root.bathymetry->SetNoAreas(2);
  initial.thicknesses.at(1).at(1).format = 1;
  initial.thicknesses.at(1).at(1).file.fileName = path;
  initial.thicknesses.at(1).at(2).file.fileName = "none.tsb2";
  write();
  EXPECT_EQ(faults(), Texts{"Data file  \" none.tsb2\"  is not valid"});
  initial.thicknesses.at(1).at(1).format = 0;
  initial.thicknesses.at(1).at(2).format = 1;
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(ExpandedInitial, ValuesByTheirPaths) {
  root.nmtExpTaskSelection->SetCounts(1, 2, true);
  const auto set = [this](std::string_view at, std::string_view text) {
    const KvsHandle file = test::fileOf(text);
    const std::string documentPath;
    PathAccess access{
        .what = PathAccess::What::set, .in = &file->tree().root(), .documentPath = &documentPath};
    EXPECT_TRUE(initial.AccessPath(at, access)) << at;
  };
  set("INITIAL_CONCENTRATIONS/SEDIMENT_FRACTION_1/AREA_1/Constant_Value", "Constant_Value 2.0");
  set("INITIAL_CONCENTRATIONS/Salinity/AREA_1/Constant_Value", "Constant_Value 30.0");
  set("INITIAL_BED_THICKNESS/BED_LAYER_1/Constant_Value", "Constant_Value 4.0");
  set("INITIAL_BED_SEDIMENT_DISTRIBUTION/BED_LAYER_1/Fraction_Distribution", "Fraction_Distribution 20 80");
  EXPECT_EQ(initial.components.at(2).at(1).value, 2);
  EXPECT_EQ(initial.components.at(1).at(1).value, 30);
  EXPECT_EQ(initial.thicknesses.at(1).at(1).value, 4);
  EXPECT_EQ(initial.distribution.at(1).percentages, (std::vector<std::int32_t>{20, 80}));
  PathAccess look{.what = PathAccess::What::look};
  EXPECT_FALSE(initial.AccessPath("INITIAL_CONCENTRATIONS/SEDIMENT_FRACTION_0/AREA_1/Constant_Value", look));
  EXPECT_FALSE(initial.AccessPath("INITIAL_CONCENTRATIONS/SEDIMENT_FRACTION_3/AREA_1/Constant_Value", look));
}

}  // namespace mud_transport_expanded_initial_conditions_test
}  // namespace gridbay
