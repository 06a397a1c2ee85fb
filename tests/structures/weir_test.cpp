#include "structures/weir.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "platform/cartography/cartography.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace structures_weir_test {

using test::Model;
using test::savedText;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::StartsWith;

// A weir's section, all of it given.
constexpr std::string_view kFilled =
    "    weir_data {\n"
    "        Location \"\" -1e-155 \"Old mill\" \"TopoID\"\n"
    "        delhs 0.025\n"
    "        coordinate_type \"UTM-33\"\n"
    "        number_of_points 3\n"
    "        x 400100.5 400200.25 400300.0\n"
    "        y 6000100.0 6000150.125 6000175.0\n"
    "        HorizOffset 12.5\n"
    "        Attributes 3 2\n"
    "        HeadLossFactors 0.1 0.2 0.3 0.4 0.6 0.7\n"
    "        WeirFormulaParam 5.5 2.25 1.7 1.6 3.125\n"
    "        WeirFormula2Param 7.5 8.25 1.9\n"
    "        WeirFormula3Param 1.5 2.5 3.5 4.5 5.5 6.5 7.5 8.5 9.5 10.5 11.5 12.5 13.5 14.5\n"
    "        Geometry {\n"
    "            Attributes 4 -2.75\n"
    "            Level_Width {\n"
    "                Data 0.5 10.25\n"
    "                Data 1.5 20.1\n"
    "            }\n"
    "        }\n"
    "    }\n";

class Weirs : public ::testing::Test {
 protected:
  void load(std::string_view inWeir) { test::load(weirs, "WEIR {\n" + std::string(inWeir) + "\n}"); }
  // One weir, by what its section holds.
  CNhdWeirObjectKvs& loaded(std::string_view section) {
    load("number_of_weirs 1\nweir_data {\n" + std::string(section) + "\n}");
    return weirs.at(1);
  }
  static std::string withProjection(std::string_view projection) {
    return "coordinate_type \"" + std::string(projection) + '"';
  }

  test::TemporaryFolder folder;
  Model model;
  CNhdWeirKvs& weirs = *model.root.nhdWeir;
};

TEST_F(Weirs, AnEmptyListIsWrittenWithTheHeadOfAllStructures) {
  EXPECT_EQ(savedText(weirs),
            "Structure_Version 1 1\n"
            "CROSSSECTIONS {\n"
            "    CrossSectionDataBridge \"xns11\"\n"
            "    CrossSectionFile (file)\"\"\n"
            "}\n"
            "WEIR {\n"
            "    number_of_weirs 0\n"
            "}\n");
}

TEST_F(Weirs, ANewOneIsWrittenInFileOrder) {
  weirs.SetCount(1);
  weirs.at(1).coordinateType = "UTM-32";
  EXPECT_THAT(savedText(weirs), HasSubstr("WEIR {\n"
                                          "    number_of_weirs 1\n"
                                          "    weir_data {\n"
                                          "        Location \"\" -1e-155 \"Weir 1\" \"TopoID\"\n"
                                          "        delhs 0.01\n"
                                          "        coordinate_type \"UTM-32\"\n"
                                          "        number_of_points 0\n"
                                          "        x\n"
                                          "        y\n"
                                          "        HorizOffset 0.0\n"
                                          "        Attributes 0 0\n"
                                          "        HeadLossFactors 0.5 1.0 1.0 0.5 1.0 1.0\n"
                                          "        WeirFormulaParam 1.0 1.0 1.838 1.5 1.0\n"
                                          "        WeirFormula2Param 1.0 1.0 1.838\n"
                                          "        WeirFormula3Param 0.0 0.0 0.0 0.6 1.02 1.37 1.0 0.03 "
                                          "1.018 1.0 0.0 2.6 1.0 0.7\n"
                                          "        Geometry {\n"
                                          "            Attributes 0 0.0\n"
                                          "            Level_Width {}\n"
                                          "        }\n"
                                          "    }\n"
                                          "}\n"));
}

TEST_F(Weirs, AFilledOneComesBackAsItWas) {
  const std::string text =
      "Structure_Version 2 7\n"
      "CROSSSECTIONS {\n"
      "    CrossSectionDataBridge \"other\"\n"
      "    CrossSectionFile (file)\"sections.xns\"\n"
      "}\n"
      "WEIR {\n"
      "    number_of_weirs 1\n" +
      std::string(kFilled) + "}\n";
  test::load(weirs, text);
  EXPECT_EQ(weirs.versionMajor, 2);
  EXPECT_EQ(weirs.versionMinor, 7);
  EXPECT_EQ(weirs.crossSectionFile.text(), "sections.xns");
  ASSERT_EQ(weirs.GetCount(), 1);
  const CNhdWeirObjectKvs& weir = weirs.at(1);
  EXPECT_EQ(weir.name, "Old mill");
  EXPECT_EQ(weir.alphaZero, 0.025);
  EXPECT_THAT(weir.x, ElementsAre(400100.5, 400200.25, 400300.0));
  EXPECT_EQ(weir.type, CNhdWeirObjectKvs::kFormula2);
  EXPECT_EQ(weir.valve, 2);
  EXPECT_EQ(weir.headLoss[3], 0.4);
  EXPECT_EQ(weir.coefficient1, 1.7);
  EXPECT_EQ(weir.width2, 7.5);
  EXPECT_EQ(weir.crestLevel2, 8.25);
  EXPECT_EQ(weir.coefficient2, 1.9);
  EXPECT_EQ(weir.formula3[13], 14.5);
  EXPECT_EQ(weir.geometryAttribute, 4);
  EXPECT_EQ(weir.datum, -2.75);
  EXPECT_THAT(weir.width, ElementsAre(10.25F, 20.1F));
  EXPECT_EQ(savedText(weirs), text);
}

TEST_F(Weirs, ThreeWeirsAndTwoSectionsAreThreeWeirs) {
  load("number_of_weirs 3\nweir_data { delhs 1.0 }\nweir_data { Location \"\" 0.0 \"B\" \"x\" }");
  ASSERT_EQ(weirs.GetCount(), 3);
  EXPECT_EQ(weirs.at(1).alphaZero, 1.0);
  EXPECT_EQ(weirs.at(1).name, "Weir 1");
  EXPECT_EQ(weirs.at(2).name, "B");
  EXPECT_EQ(weirs.at(3).name, "Weir 3");
  EXPECT_EQ(weirs.at(3).alphaZero, 0.01);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(Weirs, TheListIsWhatTheFileHas) {
  weirs.SetCount(4);
  test::load(weirs, "Structure_Version 1 1\n");
  EXPECT_EQ(weirs.GetCount(), 0);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(Weirs, AHugeCountIsBelievedAsFarAsTheFileBearsItOut) {
  load("number_of_weirs 2000000000\nweir_data { number_of_points 2000000000; x 1.0; y 2.0 }");
  EXPECT_EQ(weirs.GetCount(), 1 + kCountSlack);
  EXPECT_THAT(model.host.texts, ElementsAre(HasSubstr("2000000000")));
  EXPECT_THAT(weirs.at(1).x, ElementsAre(1.0));
}

TEST_F(Weirs, PointsAreReadUpToTheirNumberAndToWhatStandsThere) {
  EXPECT_THAT(loaded("number_of_points 2\nx 1.5 2.5 3.5\ny 4.5 5.5 6.5").x, ElementsAre(1.5, 2.5));
  EXPECT_THAT(weirs.at(1).y, ElementsAre(4.5, 5.5));
  EXPECT_THAT(loaded("number_of_points 9\nx 1.5 2.5 3.5\ny 4.5 5.5").x, ElementsAre(1.5, 2.5, 3.5));
  EXPECT_THAT(weirs.at(1).y, ElementsAre(4.5, 5.5));  // nothing of it is lost
  EXPECT_THAT(savedText(weirs), HasSubstr("number_of_points 3\n"));
  EXPECT_THAT(loaded("number_of_points -1\nx 1.5\ny 4.5").x, IsEmpty());
  EXPECT_THAT(loaded("x 1.5\ny 4.5").x, IsEmpty());
  EXPECT_THAT(loaded("number_of_points 2\nx 1 #true").x, ElementsAre(1, 0));
  EXPECT_THAT(weirs.at(1).y, IsEmpty());
}

TEST_F(Weirs, TheTableIsReadPairByPair) {
  EXPECT_THAT(loaded("Geometry { Level_Width { Data 1.0 2.0; data 3.0; Data } }").level,
              ElementsAre(1.0F, 3.0F, 0.0F));
  EXPECT_THAT(weirs.at(1).width, ElementsAre(2.0F, 0.0F, 0.0F));
  EXPECT_EQ(weirs.at(1).datum, 0);
  EXPECT_THAT(loaded("Geometry { Level_Width { Other 1.0; Data 3.0 4.0 } }").level, ElementsAre(3.0F));
  EXPECT_THAT(loaded("Geometry { Attributes 1 2.5 }").level, IsEmpty());
}

TEST_F(Weirs, ValuesOfAWrongKindKeepTheDefaults) {
  const CNhdWeirObjectKvs& weir = loaded(
      "Location \"\" 0.0 5; delhs \"x\"; Attributes #true 3; HeadLossFactors 0.25 \"a\"\n"
      "WeirFormulaParam\nWeirFormula2Param \"w\" 4\nWeirFormula3Param 9.0");
  EXPECT_EQ(weir.name, "Weir 1");
  EXPECT_EQ(weir.alphaZero, 0.01);
  EXPECT_EQ(weir.type, 0);
  EXPECT_EQ(weir.valve, 3);
  EXPECT_EQ(weir.headLoss, (std::array<double, 6>{0.25, 1, 1, 0.5, 1, 1}));
  EXPECT_EQ(weir.exponent1, 1.5);
  EXPECT_EQ(weir.width2, 1);
  EXPECT_EQ(weir.crestLevel2, 4);
  EXPECT_EQ(weir.formula3[0], 9);
  EXPECT_EQ(weir.formula3[3], 0.6);
}

TEST_F(Weirs, UnknownTypesAndValvesAreKept) {
  EXPECT_EQ(loaded("Attributes 1 77").type, 1);
  EXPECT_THAT(savedText(weirs), HasSubstr("Attributes 1 77\n"));
}

TEST_F(Weirs, WhatIsTakenOffIsLost) {
  weirs.SetCount(3);
  weirs.at(3).name = "C";
  weirs.at(2).name = "B";
  weirs.SetCount(2);
  weirs.SetCount(3);
  EXPECT_EQ(weirs.at(2).name, "B");
  EXPECT_EQ(weirs.at(3).name, "Weir 3");
}

TEST_F(Weirs, ACopyHasRecordsOfItsOwn) {
  loaded(
      "Location \"\" 0.0 \"Mill\"; number_of_points 1; x 1.0; y 2.0; WeirFormula3Param 9.0\n"
      "Geometry { Level_Width { Data 3.0 4.0 } }");
  Model other;
  other.root.nhdWeir->CopyFrom(weirs);
  EXPECT_EQ(savedText(*other.root.nhdWeir), savedText(weirs));
  weirs.at(1).formula3[0] = 5;
  weirs.at(1).headLoss[0] = 5;
  EXPECT_EQ(other.root.nhdWeir->at(1).formula3[0], 9);
  EXPECT_EQ(other.root.nhdWeir->at(1).headLoss[0], 0.5);
}

TEST_F(Weirs, AreNotChecked) {
  loaded("Attributes 77 -9; number_of_points 2; x 1.0; delhs -5.0");
  EXPECT_THAT(test::messagesOf(weirs), IsEmpty());
  ValidationList messages;
  model.root.Validate(messages, 1);
  for (const CMessage& message : messages) EXPECT_NE(message.page, PageId::weirs);
}

TEST_F(Weirs, ANewOneHasTheProjectionOfTheModel) {
  const std::string path = folder.file("g.tsb2");
  test::writeGrid(path, {.geography = TsbGeography{"UTM-33", 15, 55, 0}});
  model.root.bathymetry->GetArea(1)->fileName = path;
  weirs.SetCount(2);
  const std::string utm33 = CVdMapProjection("UTM-33").GetProjectionString();
  EXPECT_THAT(utm33, StartsWith("PROJCS["));
  EXPECT_EQ(weirs.at(1).coordinateType, utm33);
  EXPECT_EQ(weirs.at(2).coordinateType, utm33);
  // The model has taken over the projection of its grid, with the Coriolis force.
  EXPECT_EQ(model.root.bathymetry->projection, "UTM-33");
  EXPECT_TRUE(model.root.bathymetry->coriolis);
  // One that the model holds goes before that of the file.
  model.root.bathymetry->projection = "UTM-31";
  weirs.SetCount(3);
  EXPECT_EQ(weirs.at(2).coordinateType, utm33);
  EXPECT_EQ(weirs.at(3).coordinateType, CVdMapProjection("UTM-31").GetProjectionString());
}

TEST_F(Weirs, ANewOneHasLocalCoordinatesWhereTheModelHas) {
  weirs.SetCount(1);
  EXPECT_EQ(weirs.at(1).coordinateType, "Local Coordinates");
}

TEST_F(Weirs, ANewOneOfNoProjectionAtAllIsInUtm32) {
  const std::string path = folder.file("g.tsb2");
  test::writeGrid(path, {.geography = TsbGeography{"UTM-33", 15, 55, 0}});
  model.root.bathymetry->GetArea(1)->fileName = path;
  model.root.bathymetry->projection = "of no use";
  weirs.SetCount(1);
  EXPECT_EQ(weirs.at(1).coordinateType, CVdPRJParser::Format("UTM-32"));
  CNhdWeirKvs alone(nullptr);
  alone.SetCount(1);
  EXPECT_EQ(alone.at(1).coordinateType, CVdPRJParser::Format("UTM-32"));
}

TEST_F(Weirs, ALoadAsksTheModelOnlyForWhatTheFileLacks) {
  model.root.bathymetry->projection = "held";
  EXPECT_EQ(loaded(withProjection("mine")).coordinateType, "mine");
  EXPECT_EQ(loaded(withProjection("")).coordinateType, "");
  EXPECT_EQ(model.root.bathymetry->projection, "held");
  EXPECT_EQ(loaded("delhs 1.0").coordinateType, "Local Coordinates");
  EXPECT_EQ(model.root.bathymetry->projection, "Local Coordinates");
  load("number_of_weirs 1");
  EXPECT_EQ(weirs.at(1).coordinateType, "Local Coordinates");
}

TEST_F(Weirs, PathsReachWhatAWeirHolds) {
  loaded(
      "Location \"\" 0.0 \"Mill\"; number_of_points 2; x 1.0 2.0; y 3.0 4.0\n"
      "Geometry { Level_Width { Data 5.0 6.0; Data 7.0 8.0 } }");
  const std::string place;
  const auto text = [&](const std::string& path) {
    KvsFile file;
    PathAccess access{PathAccess::What::write, &file, nullptr, &place};
    return weirs.AccessPath("WEIR/weir_data[1]/" + path, access) ? *file.text() : "none";
  };
  const auto set = [&](const std::string& path, std::string_view values) {
    const KvsHandle given = test::fileOf(values);
    PathAccess access{PathAccess::What::set, nullptr, &given->tree().root(), &place};
    return weirs.AccessPath("WEIR/weir_data[1]/" + path, access);
  };
  EXPECT_EQ(text("Location"), "Location \"Mill\"\n");
  EXPECT_TRUE(set("Location", "Location \"Dam\""));
  EXPECT_EQ(weirs.at(1).name, "Dam");
  EXPECT_EQ(text("number_of_points"), "number_of_points 2\n");
  EXPECT_TRUE(set("number_of_points", "number_of_points 3"));
  EXPECT_THAT(weirs.at(1).y, ElementsAre(3, 4, 0));
  EXPECT_TRUE(set("number_of_points", "number_of_points 2000000000"));
  EXPECT_TRUE(set("number_of_points", "number_of_points -1"));
  EXPECT_EQ(weirs.at(1).x.size(), 3U);
  EXPECT_EQ(text("x"), "x 1.0 2.0 0.0\n");
  EXPECT_TRUE(set("y", "y 9.0"));
  EXPECT_EQ(text("y"), "y 9.0\n");
  EXPECT_EQ(text("Geometry/Level_Width/Data[2]"), "Data 7.0 8.0\n");
  EXPECT_TRUE(set("Geometry/Level_Width/Data", "Data 5.5 6.5"));
  EXPECT_EQ(text("Geometry/Level_Width"), "Level_Width {\n    Data 5.5 6.5\n    Data 7.0 8.0\n}\n");
  EXPECT_EQ(text("Geometry/Level_Width/Data[3]"), "none");
  EXPECT_EQ(text("Geometry/Level_Width/Other"), "none");
  EXPECT_EQ(text("Geometry/Attributes"), "Attributes 0 0.0\n");
}

}  // namespace structures_weir_test
}  // namespace gridbay
