#include "structures/culvert.h"

#include <gmock/gmock.h>

#include "structures/weir.h"
#include "tests/support/model.h"

namespace gridbay {
namespace structures_culvert_test {

using test::Model;
using test::savedText;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class Culverts : public ::testing::Test {
 protected:
  CNhdCulvertObjectKvs& loaded(std::string_view section) {
    test::load(culverts,
               "CULVERTS { number_of_Culverts 1; Culvert_data {\n" + std::string(section) + "\n} }");
    return culverts.at(1);
  }

  Model model;
  CNhdCulvertKvs& culverts = *model.root.nhdCulvert;
};

TEST_F(Culverts, ANewOneIsWrittenInFileOrderWithAnEmptyName) {
  EXPECT_EQ(savedText(culverts), "CULVERTS {\n    number_of_Culverts 0\n}\n");
  culverts.SetCount(1);
  EXPECT_EQ(savedText(culverts),
            "CULVERTS {\n"
            "    number_of_Culverts 1\n"
            "    Culvert_data {\n"
            "        Location \"\" -1e-155 \"\" \"TopoID\"\n"
            "        delhs 0.01\n"
            "        coordinate_type \"Local Coordinates\"\n"
            "        number_of_points 0\n"
            "        x\n"
            "        y\n"
            "        HorizOffset 0.0\n"
            "        Attributes 0.0 0.0 1.0 0.013 1 0 0\n"
            "        Geometry {\n"
            "            Type 0\n"
            "            Rectangular 1.0 1.0\n"
            "            Cicular_Diameter 1.0\n"
            "            Irregular {}\n"
            "        }\n"
            "        HeadLossFactors 0.5 1.0 1.0 0.0 0.5 1.0 1.0 0.0\n"
            "    }\n"
            "}\n");
}

TEST_F(Culverts, AFilledOneComesBackAsItWas) {
  const std::string text =
      "CULVERTS {\n"
      "    number_of_Culverts 2\n"
      "    Culvert_data {\n"
      "        Location \"\" -1e-155 \"Under the road\" \"TopoID\"\n"
      "        delhs 0.035\n"
      "        coordinate_type \"UTM-33\"\n"
      "        number_of_points 2\n"
      "        x 400100.5 400200.25\n"
      "        y 6000100.0 6000150.125\n"
      "        HorizOffset 2.5\n"
      "        Attributes 1.25 -0.75 35.5 0.025 4 2 1\n"
      "        Geometry {\n"
      "            Type 2\n"
      "            Rectangular 2.5 3.5\n"
      "            Cicular_Diameter 4.5\n"
      "            Irregular {\n"
      "                Data 0.5 1.25\n"
      "                Data 1.5 2.75\n"
      "            }\n"
      "        }\n"
      "        HeadLossFactors 0.1 0.2 0.3 0.4 0.6 0.7 0.8 0.9\n"
      "    }\n"
      "    Culvert_data {\n"
      "        Location \"\" -1e-155 \"\" \"TopoID\"\n"
      "        delhs 0.01\n"
      "        coordinate_type \"Local Coordinates\"\n"
      "        number_of_points 0\n"
      "        x\n"
      "        y\n"
      "        HorizOffset 0.0\n"
      "        Attributes 0.0 0.0 1.0 0.013 1 0 0\n"
      "        Geometry {\n"
      "            Type 8\n"
      "            Rectangular 1.0 1.0\n"
      "            Cicular_Diameter 1.0\n"
      "            Irregular {}\n"
      "        }\n"
      "        HeadLossFactors 0.5 1.0 1.0 0.0 0.5 1.0 1.0 0.0\n"
      "    }\n"
      "}\n";
  test::load(culverts, text);
  ASSERT_EQ(culverts.GetCount(), 2);
  const CNhdCulvertObjectKvs& culvert = culverts.at(1);
  EXPECT_EQ(culvert.name, "Under the road");
  EXPECT_EQ(culvert.upstreamInvert, 1.25);
  EXPECT_EQ(culvert.downstreamInvert, -0.75);
  EXPECT_EQ(culvert.length, 35.5);
  EXPECT_EQ(culvert.manningN, 0.025);
  EXPECT_EQ(culvert.numberOfCulverts, 4);
  EXPECT_EQ(culvert.valve, 2);
  EXPECT_EQ(culvert.sectionType, 1);
  EXPECT_EQ(culvert.geometryType, CNhdCulvertObjectKvs::kIrregular);
  EXPECT_EQ(culvert.sectionWidth, 2.5);
  EXPECT_EQ(culvert.sectionHeight, 3.5);
  EXPECT_EQ(culvert.diameter, 4.5);
  EXPECT_THAT(culvert.level, ElementsAre(0.5F, 1.5F));
  EXPECT_EQ(culvert.headLoss[7], 0.9);
  EXPECT_EQ(savedText(culverts), text);
}

TEST_F(Culverts, NamesAreFoundInAnyCase) {
  test::load(culverts,
             "Culverts { NUMBER_OF_CULVERTS 1; culvert_data { DelHs 0.5; geometry { IRREGULAR { data 1.0 2.0 "
             "} } } }");
  ASSERT_EQ(culverts.GetCount(), 1);
  EXPECT_EQ(culverts.at(1).alphaZero, 0.5);
  EXPECT_THAT(culverts.at(1).width, ElementsAre(2.0F));
}

TEST_F(Culverts, AnotherShapeKeepsTheValuesOfTheOthers) {
  loaded("Geometry { Type 0; Rectangular 2.5 3.5; Cicular_Diameter 4.5; Irregular { Data 0.5 1.25 } }")
      .geometryType = CNhdCulvertObjectKvs::kCircular;
  EXPECT_THAT(savedText(culverts), HasSubstr("Type 1\n            Rectangular 2.5 3.5\n"
                                             "            Cicular_Diameter 4.5\n"
                                             "            Irregular {\n                Data 0.5 1.25\n"));
}

TEST_F(Culverts, TwoAndOneSectionAreTwo) {
  test::load(culverts, "CULVERTS { number_of_Culverts 2; Culvert_data { delhs 1.0 } }");
  ASSERT_EQ(culverts.GetCount(), 2);
  EXPECT_EQ(culverts.at(2).alphaZero, 0.01);
  EXPECT_EQ(culverts.at(2).name, "");
  test::load(culverts, "OTHER {}");
  EXPECT_EQ(culverts.GetCount(), 0);
}

TEST_F(Culverts, AreNotChecked) {
  loaded("Attributes 1.0 2.0 -3.0 -4.0 -5 77 9");
  EXPECT_THAT(test::messagesOf(culverts), IsEmpty());
  EXPECT_THAT(test::messagesOf(culverts, 0), IsEmpty());
  ValidationList messages;
  model.root.Validate(messages, 1);
  for (const CMessage& message : messages) EXPECT_NE(message.page, PageId::culverts);
}

TEST_F(Culverts, ACopyHasARecordOfItsOwn) {
  loaded("HeadLossFactors 9.0");
  Model other;
  other.root.nhdCulvert->CopyFrom(culverts);
  EXPECT_EQ(savedText(*other.root.nhdCulvert), savedText(culverts));
  culverts.at(1).headLoss[0] = 5;
  EXPECT_EQ(other.root.nhdCulvert->at(1).headLoss[0], 9);
}

TEST_F(Culverts, StandBesideTheWeirsInBothEditions) {
  const KvsHandle file = test::fileOf(
      "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE { STRUCTURE_MODULE {\n"
      " CULVERTS { number_of_Culverts 1; Culvert_data { delhs 1.0 } }\n"
      " WEIR { number_of_weirs 1; weir_data { delhs 2.0 } }; Structure_Version 3 4 } } }");
  Model whole;
  whole.root.Load(&file->tree().root(), "/case/setup.v27");
  ASSERT_EQ(whole.root.nhdWeir->GetCount(), 1);
  ASSERT_EQ(whole.root.nhdCulvert->GetCount(), 1);
  EXPECT_EQ(whole.root.nhdWeir->at(1).alphaZero, 2);
  EXPECT_EQ(whole.root.nhdCulvert->at(1).alphaZero, 1);
  const std::string text = savedText(whole.root);
  const std::size_t weir = text.find("WEIR {");
  EXPECT_LT(text.find("Structure_Version 3 4"), weir);
  EXPECT_LT(weir, text.find("CULVERTS {"));
  EXPECT_LT(text.find("CULVERTS {"), text.find("STRUCTURES {}"));
  EXPECT_LT(text.find("STRUCTURE_MODULE {"), weir);
}

}  // namespace structures_culvert_test
}  // namespace gridbay
