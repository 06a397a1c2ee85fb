// Settling, erosion, sliding, consolidation, roughness and waves: what is given for the bed as a whole, or
// for each fraction.

#include <gmock/gmock.h>

#include <functional>

#include "basic/bathymetry.h"
#include "mud_transport/bed_roughness.h"
#include "mud_transport/consolidation.h"
#include "mud_transport/erosion_characteristics.h"
#include "mud_transport/ml_settling_and_deposition.h"
#include "mud_transport/settling_and_desposition.h"
#include "mud_transport/sliding.h"
#include "mud_transport/transition_between_layers.h"
#include "mud_transport/wave_data.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_bed_test {

using test::savedText;
using Texts = std::vector<std::string>;

const std::string kNewComponent =
    "        Critical_Velocity_For_Deposition 0.1\n"
    "        Critical_Velocity_For_Erosion 0.3\n"
    "        Relative_Height_Of_Centroid 0.3\n"
    "        Mean_Settling_Velocity 0.0005\n"
    "        Initial_bed_composition {\n"
    "            Data_Format 0\n"
    "            Constant_Value 1.0\n"
    "            AREA_1 {\n"
    "                File_Name (file)\"\"\n"
    "                Item_Numbers 1\n"
    "            }\n"
    "        }\n"
    "        EROSION_COEFFICIENTS {\n"
    "            Data_Format 0\n"
    "            Constant_Value 0.005\n"
    "            AREA_1 {\n"
    "                File_Name (file)\"\"\n"
    "                Item_Numbers 1\n"
    "            }\n"
    "        }\n";

class MudBed : public ::testing::Test {
 protected:
  // Messages, each behind the number of its page.
  static Texts faults(CKvsBase& object, int deep = 1) {
    Texts texts;
    for (const CMessage& message : test::messagesOf(object, deep)) {
      EXPECT_EQ(message.severity, Severity::fault);
      texts.push_back(std::to_string(static_cast<int>(message.page)) + " " + message.text);
    }
    return texts;
  }
  static std::string notValid(int page, const std::string& file) {
    return std::to_string(page) + " Data file  \" " + file + "\"  is not valid";
  }
  // Saved, read into another model, and copied, it is the same.
  template <class Object>
  void expectComesBack(const Object& object, std::unique_ptr<Object> MudTransportParts::*member,
                       const std::function<void(Object&)>& setUp = {}) {
    const std::string saved = savedText(const_cast<Object&>(object));
    test::Model other;
    other.root.bathymetry->SetNoAreas(root.bathymetry->GetCount());
    Object& read = *(other.root.*member);
    if (setUp) setUp(read);
    test::load(read, saved);
    EXPECT_EQ(savedText(read), saved);
    test::Model third;
    Object& copy = *(third.root.*member);
    copy.CopyFrom(object);
    EXPECT_EQ(savedText(copy), saved);
    EXPECT_TRUE(copy.SameState(object));
    EXPECT_EQ(read.TakeChange(copy) == nullptr, read.SameState(object));
    EXPECT_TRUE(copy.SameState(read));
    // A section that is missing changes nothing.
    test::load(read, "OTHER { Constant_Value 5.0 }");
    EXPECT_EQ(savedText(read), saved);
  }
  void knowGrid(int area, int noK = 8) {
    CBathymetryObjectKvs& it = *root.bathymetry->GetArea(area);
    it.noJ = 10;
    it.noK = noK;
    it.dx = 30;
    it.dy = 30;
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
};

TEST_F(MudBed, SettlingOfComponentsInFileOrder) {
  auto& settling = *root.nmtSettlingAndDesposition;
  settling.SetCount(0);
  EXPECT_EQ(savedText(settling), "SETTLING_AND_DEPOSITION {}\n");
  settling.SetCount(2);
  auto& second = settling.at(2);
  second.criticalVelocityForDeposition = 0.2F;
  second.criticalVelocityForErosion = 0.4F;
  second.relativeHeightOfCentroid = 0.35F;
  second.meanSettlingVelocity = 0.002F;
  second.bedComposition.format = 1;
  second.bedComposition.constant = 0.5F;
  second.bedComposition.at(1).file.fileName = "/case/bed.tsb2";
  second.erosion.format = 1;
  second.erosion.constant = 0.01F;
  second.erosion.at(1).file.fileName = "/case/er.tsb2";
  EXPECT_EQ(savedText(settling),
            "SETTLING_AND_DEPOSITION {\n"
            "    COMPONENT_1 {\n" +
                kNewComponent +
                "    }\n"
                "    COMPONENT_2 {\n"
                "        Critical_Velocity_For_Deposition 0.2\n"
                "        Critical_Velocity_For_Erosion 0.4\n"
                "        Relative_Height_Of_Centroid 0.35\n"
                "        Mean_Settling_Velocity 0.002\n"
                "        Initial_bed_composition {\n"
                "            Data_Format 1\n"
                "            Constant_Value 0.5\n"
                "            AREA_1 {\n"
                "                File_Name (file)\"bed.tsb2\"\n"
                "                Item_Numbers 1\n"
                "            }\n"
                "        }\n"
                "        EROSION_COEFFICIENTS {\n"
                "            Data_Format 1\n"
                "            Constant_Value 0.01\n"
                "            AREA_1 {\n"
                "                File_Name (file)\"er.tsb2\"\n"
                "                Item_Numbers 1\n"
                "            }\n"
                "        }\n"
                "    }\n"
                "}\n");
  expectComesBack<CNmtSettlingAndDespositionKvs>(settling, &MudTransportParts::nmtSettlingAndDesposition,
                                                 [](auto& read) { read.SetCount(2); });
}

TEST_F(MudBed, SalinityComesAndGoesAtTheHeadOfTheSettlingComponents) {
  auto& settling = *root.nmtSettlingAndDesposition;
  root.bathymetry->SetNoAreas(2);
  settling.SetCount(2);
  settling.at(1).meanSettlingVelocity = 1;
  settling.at(2).meanSettlingVelocity = 2;
  settling.itemList().InsertHead();
  EXPECT_EQ(settling.GetCount(), 3);
  EXPECT_EQ(settling.at(1).meanSettlingVelocity, 0.0005F);
  EXPECT_EQ(settling.at(1).bedComposition.GetCount(), 2);
  EXPECT_EQ(settling.at(1).erosion.GetCount(), 2);
  EXPECT_EQ(settling.at(2).meanSettlingVelocity, 1.0F);
  settling.itemList().RemoveHead();
  EXPECT_EQ(settling.GetCount(), 2);
  EXPECT_EQ(settling.at(2).meanSettlingVelocity, 2.0F);
  settling.SetCount(0);
  settling.itemList().RemoveHead();
  EXPECT_EQ(settling.GetCount(), 0);
}

TEST_F(MudBed, SettlingFollowsTheAreasInBothOfItsParts) {
  auto& settling = *root.nmtSettlingAndDesposition;
  settling.SetCount(2);
  root.bathymetry->SetNoAreas(3);
  for (const int component : {1, 2}) {
    EXPECT_EQ(settling.at(component).bedComposition.GetCount(), 3);
    EXPECT_EQ(settling.at(component).erosion.GetCount(), 3);
  }
  settling.SetCount(3);
  EXPECT_EQ(settling.at(3).erosion.GetCount(), 3);
}

TEST_F(MudBed, MapsOfComponentsAreCheckedWhereTheyAreUsed) {
  auto& settling = *root.nmtSettlingAndDesposition;
  settling.SetCount(2);
  settling.at(2).bedComposition.at(1).file.fileName = "/case/b.tsb2";
  settling.at(2).erosion.at(1).file.fileName = "/case/e.tsb2";
  EXPECT_TRUE(faults(settling).empty());
  settling.at(2).bedComposition.format = 1;
  settling.at(2).erosion.format = 1;
  EXPECT_EQ(faults(settling), (Texts{notValid(100, "/case/b.tsb2"), notValid(101, "/case/e.tsb2")}));
  EXPECT_TRUE(faults(settling, 0).empty());
}

TEST_F(MudBed, SettlingOfLayersInFileOrder) {
  EXPECT_EQ(savedText(*root.nmtMlSettlingAndDeposition),
            "SETTLING_AND_DEPOSITION {\n"
            "    Relative_Height_Of_Centroid 0.3\n"
            "    Factor_kon1 0.0004\n"
            "    Power_M1 0.0\n"
            "    Power_M2 1.37\n"
            "    Power_B1 0.0\n"
            "    Power_B2 0.49\n"
            "    Concentration_C1 0.0\n"
            "    Concentration_C2 1000.0\n"
            "    Factor_kon2 1.34e-07\n"
            "    Salinity_limit1 340.0\n"
            "    Salinity_limit2 10000.0\n"
            "    Stationary_Profile 0\n"
            "    Use_Factor_for_depositon 0\n"
            "    Factor_for_depositon 24.88\n"
            "    CRITICAL_SHEARSTRESS_FOR_DEPOSITION {\n"
            "        Data_Format 0\n"
            "        Constant_Value 0.02\n"
            "        AREA_1 {\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "    }\n"
            "}\n");
}

TEST_F(MudBed, SettlingOfLayersComesBack) {
  auto& settling = *root.nmtMlSettlingAndDeposition;
  root.bathymetry->SetNoAreas(2);
  EXPECT_EQ(settling.shearStress.GetCount(), 2);
  float value = 0;
  for (float* it : {&settling.relativeHeightOfCentroid, &settling.factorKon1, &settling.powerM1,
                    &settling.powerM2, &settling.powerB1, &settling.powerB2, &settling.concentrationC1,
                    &settling.concentrationC2, &settling.factorKon2, &settling.salinityLimit1,
                    &settling.salinityLimit2, &settling.factorForDeposition, &settling.shearStress.constant})
    *it = ++value;
  settling.stationaryProfile = 1;
  settling.useFactorForDeposition = 1;
  settling.shearStress.format = 1;
  settling.shearStress.at(2).file.fileName = "/case/m.tsb2";
  EXPECT_EQ(savedText(settling),
            "SETTLING_AND_DEPOSITION {\n"
            "    Relative_Height_Of_Centroid 1.0\n"
            "    Factor_kon1 2.0\n"
            "    Power_M1 3.0\n"
            "    Power_M2 4.0\n"
            "    Power_B1 5.0\n"
            "    Power_B2 6.0\n"
            "    Concentration_C1 7.0\n"
            "    Concentration_C2 8.0\n"
            "    Factor_kon2 9.0\n"
            "    Salinity_limit1 10.0\n"
            "    Salinity_limit2 11.0\n"
            "    Stationary_Profile 1\n"
            "    Use_Factor_for_depositon 1\n"
            "    Factor_for_depositon 12.0\n"
            "    CRITICAL_SHEARSTRESS_FOR_DEPOSITION {\n"
            "        Data_Format 1\n"
            "        Constant_Value 13.0\n"
            "        AREA_1 {\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "        AREA_2 {\n"
            "            File_Name (file)\"m.tsb2\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "    }\n"
            "}\n");
  expectComesBack(settling, &MudTransportParts::nmtMlSettlingAndDeposition);
  EXPECT_EQ(faults(settling), (Texts{notValid(98, ""), notValid(98, "/case/m.tsb2")}));
  EXPECT_TRUE(faults(settling, 0).empty());
  settling.shearStress.format = 0;
  EXPECT_TRUE(faults(settling).empty());
}

TEST_F(MudBed, ErosionOfFractions) {
  auto& erosion = *root.nmtMfErosionCharacteristics;
  EXPECT_EQ(savedText(erosion),
            "EROSION_CHARACTERISTICS {\n"
            "    SETTINGS {\n"
            "        Bed_Is_Erodible 1\n"
            "        Deposited_Sediment_Erodible 1\n"
            "    }\n"
            "    CALCULATION_METHOD {\n"
            "        Only_cohesive_sediment 1\n"
            "        Cohesive_and_non_cohesive_sediment 0\n"
            "        Scale_factor 1.0\n"
            "    }\n"
            "}\n");
  erosion.bedIsErodible = 0;
  erosion.depositedSedimentErodible = 0;
  erosion.onlyCohesiveSediment = 0;
  erosion.scaleFactor = 2.5F;
  EXPECT_EQ(savedText(erosion),
            "EROSION_CHARACTERISTICS {\n"
            "    SETTINGS {\n"
            "        Bed_Is_Erodible 0\n"
            "        Deposited_Sediment_Erodible 0\n"
            "    }\n"
            "    CALCULATION_METHOD {\n"
            "        Only_cohesive_sediment 0\n"
            "        Cohesive_and_non_cohesive_sediment 1\n"
            "        Scale_factor 2.5\n"
            "    }\n"
            "}\n");
  expectComesBack(erosion, &MudTransportParts::nmtMfErosionCharacteristics);
  // The other key of the pair is not read.
  test::load(erosion,
             "EROSION_CHARACTERISTICS { CALCULATION_METHOD { Only_cohesive_sediment 1; "
             "Cohesive_and_non_cohesive_sediment 1 } }");
  EXPECT_EQ(erosion.onlyCohesiveSediment, 1);
  test::load(erosion,
             "EROSION_CHARACTERISTICS { CALCULATION_METHOD { Cohesive_and_non_cohesive_sediment 1 } }");
  EXPECT_EQ(erosion.onlyCohesiveSediment, 1);
  EXPECT_TRUE(faults(erosion).empty());
}

TEST_F(MudBed, ErosionOfLayers) {
  auto& erosion = *root.nmtMlErosionCharacteristics;
  EXPECT_EQ(savedText(erosion),
            "EROSION_CHARACTERISTICS {\n"
            "    SETTINGS {\n"
            "        Include_Instantaneous_Erosion_Of_Layer_1 0\n"
            "        Use_Constant_Erosion_Coefficient 1\n"
            "    }\n"
            "}\n");
  erosion.instantaneousErosionOfLayer1 = 1;
  erosion.useConstantErosionCoefficient = 0;
  expectComesBack(erosion, &MudTransportParts::nmtMlErosionCharacteristics);

  auto& layers = *root.nmtErosionLayer;
  EXPECT_EQ(savedText(layers), "BED_SOFTNESS_PARAMETERS {}\n");
  layers.SetCount(2);
  layers.at(2).isDense = 0;
  EXPECT_EQ(savedText(layers),
            "BED_SOFTNESS_PARAMETERS {\n"
            "    LAYER_1 {\n"
            "        Include_Erosion_Of_Dense_Bed 1\n"
            "        Include_Erosion_Of_Soft_Bed 0\n"
            "    }\n"
            "    LAYER_2 {\n"
            "        Include_Erosion_Of_Dense_Bed 0\n"
            "        Include_Erosion_Of_Soft_Bed 1\n"
            "    }\n"
            "}\n");
  expectComesBack<CNmtErosionLayerKvs>(layers, &MudTransportParts::nmtErosionLayer,
                                       [](auto& read) { read.SetCount(2); });
  test::load(layers, "BED_SOFTNESS_PARAMETERS { LAYER_1 { Include_Erosion_Of_Soft_Bed 1 } }");
  EXPECT_EQ(layers.at(1).isDense, 1);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(MudBed, SlidingInFileOrder) {
  auto& sliding = *root.nmtSliding;
  const std::string tail =
      "    VARIABLE_SLIDING_COEFFICIENT {\n"
      "        Data_Format 0\n"
      "        Constant_Value 0.0001\n"
      "        Solid_Density 2650.0\n"
      "        AREA_1 {\n"
      "            File_Name (file)\"\"\n"
      "            Item_Numbers 1\n"
      "        }\n"
      "    }\n"
      "}\n";
  EXPECT_EQ(savedText(sliding),
            "SLIDING {\n"
            "    Include_Sliding 0\n"
            "    Include_variable_sliding_coefficient 0\n"
            "    CONSTANT_SLIDING_COEFFICIENT {}\n" +
                tail);
  sliding.SetCount(1);
  EXPECT_EQ(savedText(sliding),
            "SLIDING {\n"
            "    Include_Sliding 0\n"
            "    Include_variable_sliding_coefficient 0\n"
            "    CONSTANT_SLIDING_COEFFICIENT {\n"
            "        LAYER_1 {\n"
            "            Data_Format 0\n"
            "            Constant_Value 0.0001\n"
            "            AREA_1 {\n"
            "                File_Name (file)\"\"\n"
            "                Item_Numbers 1\n"
            "            }\n"
            "        }\n"
            "    }\n" +
                tail);
}

TEST_F(MudBed, SlidingComesBackAndFollowsTheAreas) {
  auto& sliding = *root.nmtSliding;
  root.bathymetry->SetNoAreas(2);
  sliding.SetCount(2);
  EXPECT_EQ(sliding.variable.GetCount(), 2);
  EXPECT_EQ(sliding.constant.at(2).GetCount(), 2);
  sliding.includeSliding = 1;
  sliding.includeVariableSlidingCoefficient = 1;
  sliding.constant.at(2).constant = 0.5;
  sliding.constant.at(2).at(1).file.fileName = "/case/c.tsb2";
  sliding.variable.format = 1;
  sliding.variable.constant = 0.002F;
  sliding.variable.solidDensity = 2600;
  sliding.variable.at(2).file.fileName = "/case/v.tsb2";
  expectComesBack<CNmtSlidingKvs>(sliding, &MudTransportParts::nmtSliding,
                                  [](auto& read) { read.SetCount(2); });
}

// By their formats alone: the switches do not matter.
TEST_F(MudBed, MapsOfSlidingAreCheckedAlsoWhereThereIsNone) {
  auto& sliding = *root.nmtSliding;
  sliding.SetCount(1);
  sliding.constant.at(1).at(1).file.fileName = "/case/c.tsb2";
  sliding.variable.at(1).file.fileName = "/case/v.tsb2";
  EXPECT_TRUE(faults(sliding).empty());
  sliding.constant.at(1).format = 1;
  sliding.variable.format = 1;
  EXPECT_EQ(faults(sliding), (Texts{notValid(51, "/case/c.tsb2"), notValid(107, "/case/v.tsb2")}));
  EXPECT_TRUE(faults(sliding, 0).empty());
}

// What is a part of another object goes with its state, its changes and its paths.
TEST_F(MudBed, ThePartsOfSlidingAreInItsChangesAndPaths) {
  auto& sliding = *root.nmtSliding;
  sliding.SetCount(2);
  CNmtSlidingKvs twin(nullptr);
  twin.AssignState(sliding);
  EXPECT_EQ(sliding.TakeChange(twin), nullptr);
  const std::string before = savedText(sliding);
  sliding.constant.at(2).constant = 3;
  sliding.variable.solidDensity = 7;
  sliding.variable.at(1).file.fileName = "/case/v.tsb2";
  const std::string after = savedText(sliding);
  const auto change = sliding.TakeChange(twin);
  ASSERT_NE(change, nullptr);
  EXPECT_TRUE(twin.SameState(sliding));
  change->apply(sliding, false);
  EXPECT_EQ(savedText(sliding), before);
  change->apply(sliding, true);
  EXPECT_EQ(savedText(sliding), after);

  const auto at = [&sliding](std::string_view path) {
    KvsFile file;
    const std::string documentPath = "/case/setup.v27";
    PathAccess access{.what = PathAccess::What::write, .out = &file, .documentPath = &documentPath};
    return sliding.AccessPath(path, access) ? *file.text() : "none";
  };
  EXPECT_EQ(at("SLIDING/CONSTANT_SLIDING_COEFFICIENT/LAYER_2/Constant_Value"), "Constant_Value 3.0\n");
  EXPECT_EQ(at("SLIDING/VARIABLE_SLIDING_COEFFICIENT/Solid_Density"), "Solid_Density 7.0\n");
  EXPECT_EQ(at("SLIDING/VARIABLE_SLIDING_COEFFICIENT/AREA_1/File_Name"), "File_Name (file)\"v.tsb2\"\n");
  EXPECT_EQ(at("SLIDING/VARIABLE_SLIDING_COEFFICIENT/AREA_2/File_Name"), "none");
}

TEST_F(MudBed, TransitionConsolidationAndRoughness) {
  auto& transition = *root.nmtTransitionBetweenLayers;
  transition.includeTransition = 1;
  expectComesBack(transition, &MudTransportParts::nmtTransitionBetweenLayers);

  auto& consolidation = *root.nmtConsolidation;
  EXPECT_EQ(savedText(consolidation),
            "CONSOLIDATION_OF_MUD_WITHIN_LAYERS {\n    Use_Consolidation_Module 0\n}\n");
  consolidation.useConsolidation = 1;
  expectComesBack(consolidation, &MudTransportParts::nmtConsolidation);
  EXPECT_TRUE(faults(consolidation).empty());

  auto& roughness = *root.nmtBedRoughness;
  EXPECT_EQ(savedText(roughness),
            "BED_ROUGHNESS {\n"
            "    Data_Format 0\n"
            "    Constant_Value 0.001\n"
            "    AREA_1 {\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "}\n");
  root.bathymetry->SetNoAreas(2);
  EXPECT_EQ(roughness.GetCount(), 2);
  roughness.format = 1;
  roughness.constant = 0.5F;
  roughness.at(2).file.fileName = "/case/r.tsb2";
  expectComesBack(roughness, &MudTransportParts::nmtBedRoughness);
  EXPECT_EQ(faults(roughness), (Texts{notValid(47, ""), notValid(47, "/case/r.tsb2")}));
  roughness.format = 0;
  EXPECT_TRUE(faults(roughness).empty());
}

TEST_F(MudBed, WavesInFileOrder) {
  auto& waves = *root.nmtWaveData;
  EXPECT_EQ(savedText(waves),
            "WAVE_DATA {\n"
            "    Wave_Description 0\n"
            "    Wave_Input 0\n"
            "    Use_database #false\n"
            "    Use_interpolation_in_time #true\n"
            "    Significant_Waveheight 1.0\n"
            "    Significant_Waveperiod 5.0\n"
            "    Angle_With_True_North 180.0\n"
            "    Include_Liquefaction 0\n"
            "    Liquefaction_Factor 1.0\n"
            "    Minimum_water_depth_for_including_waves 1.0\n"
            "    File_Name (file)\"\"\n"
            "    Item_Numbers 1\n"
            "}\n");
  waves.description = 1;
  waves.input = 1;
  waves.useDatabase = 1;
  waves.significantHeight = 2;
  waves.significantPeriod = 3;
  waves.angleWithTrueNorth = 4;
  waves.includeLiquefaction = 1;
  waves.liquefactionFactor = 6;
  waves.minimumDepth = 7;
  waves.file.fileName = "/case/w.tsb2";
  waves.file.items = {3, 1, 2};
  EXPECT_EQ(savedText(waves),
            "WAVE_DATA {\n"
            "    Wave_Description 1\n"
            "    Wave_Input 1\n"
            "    Use_database #true\n"
            "    Use_interpolation_in_time #false\n"
            "    Significant_Waveheight 2.0\n"
            "    Significant_Waveperiod 3.0\n"
            "    Angle_With_True_North 4.0\n"
            "    Include_Liquefaction 1\n"
            "    Liquefaction_Factor 6.0\n"
            "    Minimum_water_depth_for_including_waves 7.0\n"
            "    File_Name (file)\"w.tsb2\"\n"
            "    Item_Numbers 3 1 2\n"
            "}\n");
  expectComesBack(waves, &MudTransportParts::nmtWaveData);
  test::load(waves, "WAVE_DATA { Use_interpolation_in_time #true }");
  EXPECT_EQ(waves.useDatabase, 1);
  test::load(waves, "WAVE_DATA { Use_database #false; Use_interpolation_in_time #false }");
  EXPECT_EQ(waves.useDatabase, 0);
}

TEST_F(MudBed, TheFileOfWavesIsCheckedWhereItIsUsed) {
  auto& waves = *root.nmtWaveData;
  knowGrid(1);
  waves.file.fileName = "/case/none.tsb2";
  const Texts none{notValid(108, "/case/none.tsb2")};
  for (const int description : {0, 1}) {
    for (const int input : {0, 1}) {
      waves.description = description;
      waves.input = input;
      EXPECT_EQ(faults(waves), description == 1 && input == 1 ? none : Texts());
    }
  }
  const std::string one = folder.file("one.tsb2");
  test::writeGrid(one, {.items = 3});
  waves.file.fileName = one;
  EXPECT_EQ(faults(waves), Texts{notValid(108, one)});  // one item is chosen
  waves.file.items = {1, 2, 3};
  EXPECT_TRUE(faults(waves).empty());
  knowGrid(1, 9);
  EXPECT_EQ(faults(waves), Texts{notValid(108, one)});
  knowGrid(1);
  // Several steps must cover the simulation where they are interpolated, and not in a database.
  const std::string many = folder.file("many.tsb2");
  test::GridSpec spec{.items = 3, .steps = 2};
  spec.time.start = {2010, 1, 1, 0, 0, 0};
  test::writeGrid(many, spec);
  waves.file.fileName = many;
  EXPECT_EQ(faults(waves), Texts{notValid(108, many)});
  waves.useDatabase = 1;
  EXPECT_TRUE(faults(waves).empty());
}

}  // namespace mud_transport_bed_test
}  // namespace gridbay
