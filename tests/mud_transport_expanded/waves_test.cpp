// The forcings, the waves and their database.

#include "mud_transport_expanded/waves.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/wave_database.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_expanded_waves_test {

using test::savedText;
using ::testing::IsEmpty;
using ::testing::SizeIs;
using Texts = std::vector<std::string>;

class ExpandedWaves : public ::testing::Test {
 protected:
  void set(CKvsBase& object, std::string_view path, std::string_view text) {
    const KvsHandle file = test::fileOf(text);
    const std::string documentPath;
    PathAccess access{
        .what = PathAccess::What::set, .in = &file->tree().root(), .documentPath = &documentPath};
    EXPECT_TRUE(object.AccessPath(path, access)) << path;
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  CNmtExpForcingsKvs& forcings = *root.nmtExpForcings;
  CNmtExpWavesKvs& waves = *root.nmtExpWaves;
  CNmtExpWaveDatabaseKvs& database = *root.nmtExpWaveDatabase;
};

TEST_F(ExpandedWaves, OfANewModel) {
  EXPECT_EQ(savedText(forcings), "Include_dredging 0\n");
  EXPECT_EQ(savedText(waves),
            "Type_of_Wave_variation 0\n"
            "Shearstress_Formulation 0\n"
            "Include_Liquefaction 0\n"
            "Do_Combined_Wave_Current_Shearstress_Calculations #true\n"
            "Liquefaction_factor 1.0\n"
            "Minimum_waterdepth_for_including_waves 0.0\n");
  EXPECT_EQ(savedText(*root.nmtExpConstantWaves),
            "Constant_Wave_Data {\n"
            "    Constant_Wave_Height 0.3\n"
            "    Constant_Wave_Period 3.0\n"
            "    Constant_Wave_Direction 0.0\n"
            "}\n");
  EXPECT_EQ(savedText(*root.nmtExpTsvWaves),
            "TWOD_Wavefields {\n"
            "    File_Name (file)\"\"\n"
            "    Item_Numbers 1\n"
            "}\n");
  EXPECT_EQ(savedText(database),
            "WAVE_DATABASE_PARAMETERS {\n"
            "    WIND_SPEED {\n"
            "        Starting_value_of_windspeed 5.0\n"
            "        Increment_value_of_windspeed 5.0\n"
            "        Number_of_windspeeds 1\n"
            "    }\n"
            "    WIND_DIRECTION {\n"
            "        Starting_value_of_wind_direction 90.0\n"
            "        Increment_value_of_wind_direction 90.0\n"
            "        Number_of_wind_directions 1\n"
            "    }\n"
            "    WATER_LEVEL {\n"
            "        Starting_value_of_water_level 0.0\n"
            "        Increment_value_of_water_level 1.0\n"
            "        Number_of_water_levels 1\n"
            "    }\n"
            "    Data_Base_File_Name_1_1_1 (file)\"\"\n"
            "}\n");
}

TEST_F(ExpandedWaves, TheTypeIsOnFileWhileThereAreWaves) {
  forcings.includeWaves = 1;
  forcings.includeDredging = 1;
  waves.typeOfWaveVariation = 3;
  waves.shearStressFormulation = 2;
  waves.includeLiquefaction = 1;
  waves.liquefactionFactor = 2.5F;
  waves.minimumDepth = 0.5F;
  const std::string text = savedText(waves);
  EXPECT_EQ(text,
            "Type_of_Wave_variation 3\n"
            "Shearstress_Formulation 2\n"
            "Include_Liquefaction 1\n"
            "Do_Combined_Wave_Current_Shearstress_Calculations #true\n"
            "Liquefaction_factor 2.5\n"
            "Minimum_waterdepth_for_including_waves 0.5\n");
  EXPECT_EQ(savedText(forcings), "Include_dredging 1\n");
  test::Model other;
  test::load(*other.root.nmtExpWaves, text);
  test::load(*other.root.nmtExpForcings, text);
  EXPECT_EQ(savedText(*other.root.nmtExpWaves), text);
  EXPECT_EQ(other.root.nmtExpForcings->includeWaves, 1);
}

TEST_F(ExpandedWaves, AFileWithoutWavesLoadsType1AndNoWaves) {
  forcings.includeWaves = 1;
  waves.typeOfWaveVariation = 3;
  test::load(waves, "Type_of_Wave_variation 0");
  test::load(forcings, "Type_of_Wave_variation 0");
  EXPECT_EQ(waves.typeOfWaveVariation, 1);
  EXPECT_EQ(forcings.includeWaves, 0);
  waves.typeOfWaveVariation = 2;
  test::load(waves, "Other 1");
  test::load(forcings, "Include_dredging 1");
  EXPECT_EQ(waves.typeOfWaveVariation, 2);
  EXPECT_EQ(forcings.includeDredging, 1);
  test::load(waves, "Do_Combined_Wave_Current_Shearstress_Calculations #false");
  EXPECT_THAT(savedText(waves), ::testing::HasSubstr("Calculations #true\n"));
}

TEST_F(ExpandedWaves, TheWholeModelLosesTheDredgingOnLoad) {
  root.moduleSelection->simulationType = module::kMudTransportExpanded;
  forcings.includeDredging = 1;
  forcings.includeWaves = 1;
  waves.typeOfWaveVariation = 2;
  const std::string text = savedText(root);
  if (theEdition.wetlandSweepKit) return;  // it has no modules
  test::Model other;
  test::load(other.root, text);
  EXPECT_EQ(other.root.nmtExpForcings->includeDredging, 0);
  EXPECT_EQ(other.root.nmtExpForcings->includeWaves, 1);
  EXPECT_EQ(other.root.nmtExpWaves->typeOfWaveVariation, 2);
}

TEST_F(ExpandedWaves, TheTypeByItsPathTurnsWavesOnAndOff) {
  set(waves, "Type_of_Wave_variation", "Type_of_Wave_variation 2");
  EXPECT_EQ(forcings.includeWaves, 1);
  EXPECT_EQ(waves.typeOfWaveVariation, 2);
  set(waves, "Type_of_Wave_variation", "Type_of_Wave_variation 0");
  EXPECT_EQ(forcings.includeWaves, 0);
}

TEST_F(ExpandedWaves, ConstantOnesAndFilesComeBack) {
  test::load(*root.nmtExpConstantWaves,
             "Constant_Wave_Data { Constant_Wave_Direction 200.0; Constant_Wave_Height 2.0 }");
  EXPECT_EQ(root.nmtExpConstantWaves->direction, 200);
  EXPECT_EQ(root.nmtExpConstantWaves->height, 2);
  EXPECT_EQ(root.nmtExpConstantWaves->period, 3);
  const std::string text =
      "TWOD_Wavefields {\n"
      "    File_Name (file)\"w.tsb2\"\n"
      "    Item_Numbers 1 2 4\n"
      "}\n";
  test::load(*root.nmtExpTsvWaves, text);
  EXPECT_EQ(savedText(*root.nmtExpTsvWaves), text);
  EXPECT_THAT(test::messagesOf(*root.nmtExpTsvWaves), IsEmpty());
}

TEST_F(ExpandedWaves, TheDirectionRunsFastestInTheDatabase) {
  test::load(
      database,
      "WAVE_DATABASE_PARAMETERS { WIND_SPEED { Number_of_windspeeds 2; Starting_value_of_windspeed 3.0 }\n"
      " WIND_DIRECTION { Number_of_wind_directions 3; Increment_value_of_wind_direction 45.0 }\n"
      " WATER_LEVEL { Number_of_water_levels 2 }\n"
      " Data_Base_File_Name_1_1_2 (file)\"a\"; Data_Base_File_Name_2_1_3 (file)\"b\";"
      " Data_Base_File_Name_3_1_1 (file)\"c\" }");
  ASSERT_EQ(database.maps.GetCount(), 12);
  EXPECT_EQ(database.maps.at(2).file.text(), "a");
  EXPECT_EQ(database.maps.at(9).file.text(), "b");
  const std::string text = savedText(database, "");
  std::string names;
  for (std::size_t at = 0; (at = text.find("Name_", at)) != text.npos; at += 5)
    names += text.substr(at + 5, 6);
  EXPECT_EQ(names, "1_1_1 1_1_2 1_1_3 1_2_1 1_2_2 1_2_3 2_1_1 2_1_2 2_1_3 2_2_1 2_2_2 2_2_3 ");
}

TEST_F(ExpandedWaves, AMapStaysWithItsSpeedLevelAndDirection) {
  database.SetCounts({.windSpeeds = 2, .waterLevels = 1, .windDirections = 2});
  for (int number = 1; number <= 4; ++number) database.maps.at(number).file = std::to_string(number);
  database.SetCounts({.windSpeeds = 2, .waterLevels = 2, .windDirections = 3});
  std::string files;
  for (int number = 1; number <= database.maps.GetCount(); ++number) {
    const std::string& name = database.maps.at(number).file.text();
    files += name.empty() ? "." : name;
  }
  EXPECT_EQ(files, "12....34....");
  database.SetCounts({.windSpeeds = 2, .waterLevels = 1, .windDirections = 1});
  EXPECT_EQ(database.maps.GetCount(), 2);
  EXPECT_EQ(database.maps.at(2).file.text(), "3");
  set(database, "WAVE_DATABASE_PARAMETERS/WIND_DIRECTION/Number_of_wind_directions",
      "Number_of_wind_directions 2");
  EXPECT_EQ(database.maps.GetCount(), 4);
  EXPECT_EQ(database.maps.at(3).file.text(), "3");
  set(database, "WAVE_DATABASE_PARAMETERS/Data_Base_File_Name_2_1_2",
      "Data_Base_File_Name_2_1_2 (file)\"/x\"");
  EXPECT_EQ(database.maps.at(4).file.text(), "/x");
  PathAccess look{.what = PathAccess::What::look};
  EXPECT_FALSE(database.AccessPath("WAVE_DATABASE_PARAMETERS/Data_Base_File_Name_3_1_1", look));
}

TEST_F(ExpandedWaves, ADatabaseHasUpTo120Maps) {
  const auto tooMany = [this] {
    const ValidationList messages = test::messagesOf(database, 0);
    return messages == ValidationList{{PageId::mtExpWaveDatabase, "Maximum number of Wavemaps exceeded"}};
  };
  database.SetCounts({5, 4, 6});
  EXPECT_THAT(test::messagesOf(database, 0), IsEmpty());
  EXPECT_THAT(test::messagesOf(database), SizeIs(120));  // of files that are not there
  database.SetCounts({5, 5, 5});
  EXPECT_TRUE(tooMany());
  EXPECT_THAT(test::messagesOf(database), SizeIs(126));
  database.SetCounts({2147483647, 2147483647, 2147483647});
  EXPECT_TRUE(tooMany());
  EXPECT_EQ(database.maps.GetCount(), CNmtExpWaveDatabaseKvs::kMostHeld);
  database.SetCounts({-1, 5, 0});
  EXPECT_THAT(test::messagesOf(database), IsEmpty());
  EXPECT_EQ(database.maps.GetCount(), 0);
}

TEST_F(ExpandedWaves, MapsHaveHeightDirectionAndPeriodOfArea1) {
  CBathymetryObjectKvs& area = *root.bathymetry->GetArea(1);
  area.noJ = 12;
  area.noK = 10;
  area.dx = area.dy = 100;
  const std::string path = folder.file("w.tsb2");
  database.maps.at(1).file = path;
  const auto faultsWith = [&](std::vector<TsbItem> items, std::size_t noJ = 12) {
    TsbDefinition definition;
    definition.time.count = 1;
    definition.axes = {{noJ, 0, 100, "m"}, {10, 0, 100, "m"}};
    definition.items = std::move(items);
    test::writeFile(path, definition);
    return test::messagesOf(database);
  };
  const TsbItem height{"H", 100084, "m"};
  const TsbItem direction{"D", 100095, "degree"};
  const TsbItem period{"T", 100085, "s"};
  const ValidationList invalid{{PageId::mtExpWaveDatabase, "Data file  \" " + path + "\"  is not valid"}};
  EXPECT_EQ(test::messagesOf(database), invalid);
  EXPECT_THAT(faultsWith({height, direction, period}), IsEmpty());
  EXPECT_THAT(faultsWith({height, direction, period, height}), IsEmpty());
  EXPECT_EQ(faultsWith({height, direction}), invalid);
  EXPECT_EQ(faultsWith({height, period, direction}), invalid);
  EXPECT_EQ(faultsWith({height, direction, period}, 11), invalid);
}

}  // namespace mud_transport_expanded_waves_test
}  // namespace gridbay
