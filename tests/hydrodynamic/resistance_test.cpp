#include "hydrodynamic/resistance.h"

#include <gmock/gmock.h>

#include <limits>

#include "platform/units/units.h"
#include "tests/hydrodynamic/area_fixture.h"

namespace gridbay {
namespace hydrodynamic_resistance_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class HdResistance : public test::AreaTest {
 protected:
  CNhdResistanceKvs& list() { return *root().nhdResistance; }
  std::vector<std::string> faults(int deep = 1) { return faultsOf(list(), PageId::resistance, deep); }
  // The files of waves and grains are told in other words.
  static std::string otherNotValid(const std::string& name) {
    return "Data file \"" + name + "\" is not valid";
  }
  std::int32_t savedGrainFormat() {
    const KvsHandle file = test::fileOf(savedText(list()));
    std::int32_t value = -99;
    kvsGetParam(kvsSectionByNameNum(kvsTargetByNameNum(*file, "RESISTANCE", 1), "SEDIMENT_DATA", 1),
                "Grain_Format", &value, 1, 1);
    return value;
  }
};

constexpr std::string_view kFilled =
    "RESISTANCE {\n"
    "    Formulation 2\n"
    "    AREA_1 {\n"
    "        Data_Format 2\n"
    "        Constant_Value 40.5\n"
    "        File_Name (file)\"r.tsb2\"\n"
    "        Item_Numbers 2\n"
    "        Include_Pier #true\n"
    "        PIER {\n"
    "            File_Name (file)\"p.tsb1\"\n"
    "            Item_Numbers 3\n"
    "        }\n"
    "    }\n"
    "    AREA_2 {\n"
    "        Data_Format 0\n"
    "        Constant_Value 25.0\n"
    "        File_Name (file)\"\"\n"
    "        Item_Numbers 1\n"
    "        Include_Pier #false\n"
    "        PIER {\n"
    "            File_Name (file)\"\"\n"
    "            Item_Numbers 1\n"
    "        }\n"
    "    }\n"
    "    SEDIMENT_DATA {\n"
    "        Grain_Format 3\n"
    "        Constant_Grain_Size 0.5\n"
    "        Relative_Density 2.5\n"
    "        File_Name (file)\"grain.tsb2\"\n"
    "        Item_Numbers 4\n"
    "    }\n"
    "    Type_Of_Roughness 1\n"
    "    Include_Wave_Height_Correction 0\n"
    "    Wave_Height_Over_Depth_Limit 0.5\n"
    "    Update_Frequency 7\n"
    "}\n"
    "WAVES {\n"
    "    \"Type_Of_Wave_Height \" 1\n"
    "    \"Type_Of_Wave_Period \" 1\n"
    "    Wave_Format 2\n"
    "    Constant_Wave_Height 1.5\n"
    "    Constant_Wave_Period 4.5\n"
    "    Constant_Wave_Direction 90.0\n"
    "    File_Name (file)\"w.tsb2\"\n"
    "    Item_Numbers 4 5 6\n"
    "}\n";

TEST_F(HdResistance, ANewOneIsWrittenInFileOrderWithTheWavesBeside) {
  test::Model one;
  EXPECT_EQ(savedText(*one.root.nhdResistance),
            "RESISTANCE {\n"
            "    Formulation 0\n"
            "    AREA_1 {\n"
            "        Data_Format 1\n"
            "        Constant_Value 32.0\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "        Include_Pier #false\n"
            "        PIER {\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "    }\n"
            "    SEDIMENT_DATA {\n"
            "        Grain_Format 0\n"
            "        Constant_Grain_Size 0.2\n"
            "        Relative_Density 2.65\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "    Type_Of_Roughness 0\n"
            "    Include_Wave_Height_Correction 1\n"
            "    Wave_Height_Over_Depth_Limit 0.85\n"
            "    Update_Frequency 1\n"
            "}\n"
            "WAVES {\n"
            "    \"Type_Of_Wave_Height \" 0\n"
            "    \"Type_Of_Wave_Period \" 0\n"
            "    Wave_Format 3\n"
            "    Constant_Wave_Height 1.0\n"
            "    Constant_Wave_Period 3.0\n"
            "    Constant_Wave_Direction 180.0\n"
            "    File_Name (file)\"\"\n"
            "    Item_Numbers 1 2 3\n"
            "}\n");
}

TEST_F(HdResistance, IsReadBack) {
  test::load(list(), kFilled);
  EXPECT_EQ(list().diameterFormat, 2);
  EXPECT_TRUE(list().at(1).includePier);
  EXPECT_EQ(list().waveHeightKind, 1);
  EXPECT_EQ(savedText(list()), kFilled);
}

TEST_F(HdResistance, TheWavesAreReadWithoutTheResistanceAndWithoutTheBlanks) {
  test::load(list(), "WAVES { Type_Of_Wave_Height 1; Type_Of_Wave_Period 1; Constant_Wave_Height 2.5 }");
  EXPECT_EQ(list().waveHeightKind, 1);
  EXPECT_EQ(list().wavePeriodKind, 1);
  EXPECT_EQ(list().constantWaveHeight, 2.5F);
  EXPECT_EQ(list().formulation, 0);
  EXPECT_THAT(model.host.texts, IsEmpty());
  test::load(list(), "RESISTANCE { AREA_1 {}; AREA_2 {}; Formulation 1 }");
  EXPECT_EQ(list().formulation, 1);
  EXPECT_EQ(list().waveHeightKind, 1);
}

TEST_F(HdResistance, TheGrainFormatOnFileIsOneMoreButForNone) {
  const auto afterLoad = [this](const std::string& onFile) {
    test::load(list(), "RESISTANCE { AREA_1 {}; AREA_2 {}; SEDIMENT_DATA { " + onFile + " } }");
    return list().diameterFormat;
  };
  EXPECT_EQ(afterLoad("Grain_Format 0"), 0);
  EXPECT_EQ(savedGrainFormat(), 0);
  EXPECT_EQ(afterLoad("Grain_Format 2"), 1);
  EXPECT_EQ(savedGrainFormat(), 2);
  EXPECT_EQ(afterLoad("Grain_Format 3"), 2);
  EXPECT_EQ(savedGrainFormat(), 3);
  EXPECT_EQ(afterLoad("Other 1"), 2);
  EXPECT_EQ(afterLoad("Grain_Format 1"), 0);
  EXPECT_EQ(savedGrainFormat(), 0);
  using Limits = std::numeric_limits<std::int32_t>;
  EXPECT_EQ(afterLoad("Grain_Format " + std::to_string(Limits::min())), Limits::min());
  list().diameterFormat = Limits::max();
  EXPECT_EQ(savedGrainFormat(), Limits::max());
}

TEST_F(HdResistance, ACopyOfTheListTakesFormulationAndEntries) {
  test::load(list(), kFilled);
  test::Model other;
  CNhdResistanceKvs& copy = *other.root.nhdResistance;
  copy.CopyFrom(list());
  EXPECT_EQ(copy.formulation, 2);
  ASSERT_EQ(copy.GetCount(), 2);
  EXPECT_EQ(copy.at(1).dataFormat, 2);
  EXPECT_EQ(copy.at(1).constantValue, 40.5F);
  EXPECT_TRUE(copy.at(1).includePier);
  EXPECT_EQ(copy.at(1).map.fileName.text(), "r.tsb2");
  EXPECT_EQ(copy.at(1).pierFile.fileName.text(), "p.tsb1");
  EXPECT_EQ(copy.at(1).GetParent(), &copy);
  // All else stays.
  EXPECT_EQ(copy.diameterFormat, 0);
  EXPECT_EQ(copy.constantGrainSize, 0.2F);
  EXPECT_EQ(copy.relativeDensity, 2.65F);
  EXPECT_EQ(copy.grainSizeMap, UTsbSelection(1));
  EXPECT_EQ(copy.typeOfRoughness, 0);
  EXPECT_EQ(copy.waveHeightCorrection, 1);
  EXPECT_EQ(copy.waveHeightOverDepthLimit, 0.85F);
  EXPECT_EQ(copy.updateFrequency, 1);
  EXPECT_EQ(copy.waveFormat, 3);
  EXPECT_EQ(copy.waveFile, UTsbSelection(3));
  EXPECT_EQ(copy.constantWaveHeight, 1.0F);
}

TEST_F(HdResistance, ACopyOfAnEntryHasTheMapForItsPierFileAndTheOthersParent) {
  test::load(list(), kFilled);
  CNhdResistanceObjectKvs copy(nullptr);
  copy.CopyFrom(list().at(1));
  EXPECT_EQ(copy.dataFormat, 2);
  EXPECT_EQ(copy.constantValue, 40.5F);
  EXPECT_TRUE(copy.includePier);
  EXPECT_EQ(copy.map, list().at(1).map);
  EXPECT_EQ(copy.pierFile, list().at(1).map);
  EXPECT_EQ(copy.GetParent(), &list());
}

TEST_F(HdResistance, AConstantMayNotBeNegative) {
  for (const int deep : {0, 1}) {
    list().at(2).constantValue = -0.1F;
    EXPECT_THAT(faults(deep), ElementsAre("Negative Bed resistance"));
    list().at(2).constantValue = 0;
    EXPECT_THAT(faults(deep), IsEmpty());
  }
  list().at(2).constantValue = -0.1F;
  list().at(2).dataFormat = 0;
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(HdResistance, TheMapIsOfTheNumberThatIsMeant) {
  list().at(2).dataFormat = 2;
  const auto map = [this](int type, const std::vector<TsbGridAxis>& axes) {
    return write("m.tsb2", {.items = {{"Number", type, std::string(qunBaseUnit(type)->text)}}, .axes = axes});
  };
  list().at(2).map.fileName = map(100030, innerAxes());
  EXPECT_THAT(faults(), IsEmpty());
  for (const std::int32_t formulation : {1, 2}) {
    list().formulation = formulation;
    list().waveFormat = 0;
    EXPECT_THAT(faults(), ElementsAre(notValid(folder.file("m.tsb2"))));
    EXPECT_THAT(faults(0), ElementsAre(notValid(folder.file("m.tsb2"))));
  }
  map(100032, innerAxes());
  EXPECT_THAT(faults(), IsEmpty());
  map(100032, Spec().axes);
  EXPECT_THAT(faults(), ElementsAre(notValid(folder.file("m.tsb2"))));
}

TEST_F(HdResistance, PiersHaveAProfileOfTheirOwnKind) {
  list().at(1).dataFormat = 0;
  list().at(1).includePier = true;
  list().at(1).pierFile.fileName =
      write("p.tsb1", {.items = {{"Pier"}}, .axes = {{5, 0, 1, "m"}}, .dataType = 800});
  EXPECT_THAT(faults(), IsEmpty());
  write("p.tsb1", {.items = {{"Pier"}}, .axes = {{5, 0, 1, "m"}}, .dataType = 0});
  EXPECT_THAT(faults(0), ElementsAre(notValid(folder.file("p.tsb1"))));
  write("p.tsb1", {.items = {{"Pier"}}, .dataType = 800});
  EXPECT_THAT(faults(), ElementsAre(notValid(folder.file("p.tsb1"))));
  list().at(1).includePier = false;
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(HdResistance, LimitAndUpdateFrequency) {
  const std::string limit = "The Wave height/depth limit must be specified positive";
  const std::string low = "The update frequency for must be positive and non-zero";
  const std::string high = "The update frequency for cannot be greater than the number of timesteps";
  for (const float bad : {0.0F, -1.0F}) {
    list().waveHeightOverDepthLimit = bad;
    EXPECT_THAT(faults(0), ElementsAre(limit));
  }
  list().waveHeightOverDepthLimit = 0.01F;
  for (const std::int32_t bad : {0, -5}) {
    list().updateFrequency = bad;
    EXPECT_THAT(faults(), ElementsAre(low));
  }
  list().updateFrequency = 101;  // as many points in time as there are
  EXPECT_THAT(faults(), IsEmpty());
  list().updateFrequency = 102;
  EXPECT_THAT(faults(), ElementsAre(high));
  root().simulationPeriod->noPointsInTime = 1;
  list().updateFrequency = 1;
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(HdResistance, TheChecksRunInTheirOrder) {
  list().at(1).constantValue = -1;
  list().at(2).dataFormat = 2;
  list().at(2).includePier = true;
  list().waveHeightOverDepthLimit = 0;
  list().updateFrequency = 0;
  list().formulation = 2;
  list().diameterFormat = 1;
  ValidationList messages;
  EXPECT_EQ(list().Validate(messages, 0), 7U);
  EXPECT_THAT(test::textsOf(messages), ElementsAre("Negative Bed resistance", notValid(""), notValid(""),
                                                   "The Wave height/depth limit must be specified positive",
                                                   "The update frequency for must be positive and non-zero",
                                                   otherNotValid(""), otherNotValid("")));
  EXPECT_EQ(messages[5].page, PageId::waves);
  EXPECT_EQ(messages[6].page, PageId::resistance);
}

TEST_F(HdResistance, TheWaveFile) {
  list().formulation = 2;
  const std::vector<TsbItem> items{{"H", 100097, "m"}, {"T", 100085, "s"}, {"D", 100095, "degree"}};
  const auto isValid = [this](std::int32_t format, const Spec& spec) {
    list().waveFormat = format;
    list().waveFile.fileName = write("w.tsb2", spec);
    ValidationList messages;
    if (list().Validate(messages, 1) == 0) return true;
    EXPECT_EQ(messages,
              (ValidationList{{PageId::waves, otherNotValid(folder.file("w.tsb2")), Severity::fault}}));
    return false;
  };
  for (const std::int32_t format : {1, 2, 3}) {
    EXPECT_TRUE(isValid(format, {.items = items})) << format;
    EXPECT_TRUE(
        isValid(format, {.items = {{"H", 100084, "m"}, {"T", 100085, "s"}, {"D", 100407, "degree"}}}));
    EXPECT_FALSE(isValid(format, {.items = {items[0], items[1]}})) << format;
    EXPECT_FALSE(isValid(format, {.items = {items[1], items[0], items[2]}})) << format;
    EXPECT_FALSE(isValid(format, {.items = {items[0], items[0], items[2]}})) << format;
    EXPECT_FALSE(isValid(format, {.items = {items[0], items[1], items[0]}})) << format;
    // Which of them cover the simulation, and which fit area 1.
    EXPECT_EQ(isValid(format, {.items = items, .seconds = 2000}), format == 2);
    EXPECT_EQ(isValid(format, {.items = items, .axes = innerAxes()}), format == 1);
    EXPECT_EQ(isValid(format, {.items = items, .axes = {}}), format == 1);
  }
  EXPECT_TRUE(isValid(0, {.items = {items[0]}}));
  list().waveFile.items = {1, 2};
  EXPECT_FALSE(isValid(3, {.items = items}));
  for (const std::int32_t formulation : {0, 1}) {
    list().formulation = formulation;
    EXPECT_TRUE(isValid(3, {.items = {items[0]}}));
  }
}

TEST_F(HdResistance, TheGrainSizeMap) {
  const auto isValid = [this](std::int32_t format, const Spec& spec) {
    list().diameterFormat = format;
    list().grainSizeMap.fileName = write("g.tsb2", spec);
    const std::vector<std::string> found = faults();
    if (!found.empty()) EXPECT_THAT(found, ElementsAre(otherNotValid(folder.file("g.tsb2"))));
    return found.empty();
  };
  for (const std::int32_t format : {1, 2}) {
    for (const int type : {100461, 100127, 100406})
      EXPECT_TRUE(isValid(format, {.items = {{"D", type, "mm"}}})) << type;
    EXPECT_FALSE(isValid(format, {.items = {{"D", 100079, "m"}}}));
    EXPECT_FALSE(isValid(format, {.items = {{"D", 100461, "mm"}}, .axes = innerAxes()}));
    EXPECT_EQ(isValid(format, {.items = {{"D", 100461, "mm"}}, .seconds = 2000}), format == 1);
  }
  EXPECT_TRUE(isValid(0, {.items = {{"D", 100079, "m"}}}));
  EXPECT_TRUE(isValid(3, {.items = {{"D", 100079, "m"}}}));
}

TEST_F(HdResistance, TheRequests) {
  const auto descriptions = [](const CVdFileSelectorDlg& selector) {
    std::vector<std::string> texts;
    for (const auto& request : selector.requests()) texts.push_back(request->description());
    EXPECT_FALSE(selector.pluginEnabled());
    return texts;
  };
  CVdFileSelectorDlg map;
  list().at(1).RequestMap(map, 1);
  EXPECT_THAT(descriptions(map), ElementsAre("Resistance"));
  CVdFileSelectorDlg pier;
  list().at(1).RequestPierFile(pier, 1);
  EXPECT_THAT(descriptions(pier), ElementsAre("Pier Resistance"));
  CVdFileSelectorDlg waves;
  list().RequestWaveFile(waves);
  EXPECT_THAT(descriptions(waves), ElementsAre("Wave height", "Wave period", "Wave direction"));
  CVdFileSelectorDlg grain;
  list().diameterFormat = 1;
  list().RequestGrainSizeMap(grain);
  EXPECT_THAT(descriptions(grain), ElementsAre("Sediment grain diameter"));
}

TEST_F(HdResistance, PathsLeadToTheWavesWithAndWithoutTheBlank) {
  const std::string documentPath = "/case/setup.v27";
  for (const char* path : {"WAVES/Type_Of_Wave_Height", "waves/type_of_wave_height "}) {
    const KvsHandle given = test::fileOf("Type_Of_Wave_Height 1");
    PathAccess set{.what = PathAccess::What::set, .in = &given->tree().root(), .documentPath = &documentPath};
    list().waveHeightKind = 0;
    EXPECT_TRUE(list().AccessPath(path, set)) << path;
    EXPECT_EQ(list().waveHeightKind, 1) << path;
  }
  PathAccess look{.what = PathAccess::What::look, .documentPath = &documentPath};
  EXPECT_FALSE(list().AccessPath("RESISTANCE/WAVES/Wave_Format", look));
  EXPECT_FALSE(list().AccessPath("WAVES/ Type_Of_Wave_Height", look));
  EXPECT_TRUE(list().AccessPath("RESISTANCE/AREA_2 /PIER/Item_Numbers", look));
}

}  // namespace hydrodynamic_resistance_test
}  // namespace gridbay
