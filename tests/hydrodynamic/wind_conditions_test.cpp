#include "hydrodynamic/wind_conditions.h"

#include <gmock/gmock.h>

#include "core/edition.h"
#include "tests/hydrodynamic/area_fixture.h"

namespace gridbay {
namespace hydrodynamic_wind_conditions_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

using Items = std::vector<std::uint32_t>;

class WindConditions : public test::AreaTest {
 protected:
  CWindConditionsKvs& wind() { return *root().windConditions; }
  std::vector<std::string> faults(int deep = 1) { return faultsOf(wind(), PageId::windConditions, deep); }
  bool isValid(std::int32_t format, const Spec& spec) {
    wind().SetDataFormat(format);
    wind().windFile.fileName = write("w.tsb2", spec);
    const std::vector<std::string> found = faults();
    if (!found.empty()) EXPECT_THAT(found, ElementsAre(notValid(folder.file("w.tsb2"))));
    return found.empty();
  }
};

std::string filled(int dataFormat) {
  return "WIND_CONDITIONS {\n    Data_Format " + std::to_string(dataFormat) +
         "\n"
         "    Constant_Wind_Direction 45.5\n"
         "    Constant_Wind_Speed 12.5\n"
         "    Neutral_Pressure 1000.0\n"
         "    IncludeAirPressureCorrections #true\n"
         "    File_Name (file)\"wind.tsb2\"\n"
         "    Item_Numbers 3 1 2\n"
         "    Type_Of_Wind_Friction 1\n"
         "    Constant_Friction 0.002\n"
         "    Linear_Friction_1 0.001\n"
         "    Linear_Friction_2 0.003\n"
         "    Linear_Speed_1 2.5\n"
         "    Linear_Speed_2 30.0\n"
         "}\n";
}

TEST_F(WindConditions, ANewOneIsWrittenInFileOrder) {
  EXPECT_EQ(savedText(wind()),
            "WIND_CONDITIONS {\n"
            "    Data_Format 0\n"
            "    Constant_Wind_Direction 270.0\n"
            "    Constant_Wind_Speed 10.0\n"
            "    Neutral_Pressure 1013.0\n"
            "    IncludeAirPressureCorrections #false\n"
            "    File_Name (file)\"\"\n"
            "    Item_Numbers\n"
            "    Type_Of_Wind_Friction 0\n"
            "    Constant_Friction 0.0026\n"
            "    Linear_Friction_1 0.0016\n"
            "    Linear_Friction_2 0.0026\n"
            "    Linear_Speed_1 0.0\n"
            "    Linear_Speed_2 24.0\n"
            "}\n");
}

TEST_F(WindConditions, IsReadBackAndSwitchedOffInTheWetlandSweepKit) {
  test::load(wind(), filled(3));
  EXPECT_EQ(wind().dataFormat, theEdition.wetlandSweepKit ? 0 : 3);
  EXPECT_EQ(wind().windFile.items, (Items{3, 1, 2}));
  EXPECT_EQ(savedText(wind()), filled(theEdition.wetlandSweepKit ? 0 : 3));
  wind().dataFormat = 1;
  EXPECT_EQ(savedText(wind()), filled(theEdition.wetlandSweepKit ? 0 : 1));
}

TEST_F(WindConditions, CopiesAllMembers) {
  test::load(wind(), filled(3));
  wind().dataFormat = 3;
  test::Model other;
  CWindConditionsKvs& copy = *other.root.windConditions;
  copy.CopyFrom(wind());
  EXPECT_EQ(copy.dataFormat, 3);
  EXPECT_EQ(savedText(copy), savedText(wind()));
  EXPECT_EQ(copy.windFile, wind().windFile);
}

TEST_F(WindConditions, WhatTheFileLacksKeepsItsDefault) {
  test::load(wind(), "WIND_CONDITIONS { Linear_Speed_2 20.0; Data_Format 2 }");
  EXPECT_EQ(wind().speed2, 20);
  EXPECT_EQ(wind().constantDirection, 270);
  EXPECT_EQ(wind().windFile.items, theEdition.wetlandSweepKit ? Items{} : (Items{1, 2}));
}

TEST_F(WindConditions, TheFileHasTheItemsOfItsFormat) {
  if (!theEdition.wetlandSweepKit) {
    test::load(wind(), filled(2));
    EXPECT_EQ(wind().windFile.items, (Items{3, 1}));
  }
  test::load(wind(), filled(0));
  EXPECT_EQ(wind().windFile.items, (Items{3, 1, 2}));  // out of use, and kept
  wind().SetDataFormat(2);
  EXPECT_EQ(wind().windFile.items, (Items{3, 1}));
  wind().SetDataFormat(3);
  EXPECT_EQ(wind().windFile.items, (Items{3, 1, 3}));
  wind().SetDataFormat(1);
  EXPECT_EQ(wind().windFile.items.size(), 3U);
}

TEST_F(WindConditions, AFormatThatIsSetByItsPathBringsTheItems) {
  const std::string documentPath = "/case/setup.v27";
  const KvsHandle given = test::fileOf("Data_Format 3");
  PathAccess set{.what = PathAccess::What::set, .in = &given->tree().root(), .documentPath = &documentPath};
  EXPECT_TRUE(wind().AccessPath("WIND_CONDITIONS/Data_Format", set));
  EXPECT_EQ(set.isPinned, theEdition.wetlandSweepKit);
  EXPECT_EQ(wind().dataFormat, theEdition.wetlandSweepKit ? 0 : 3);
  if (!theEdition.wetlandSweepKit) EXPECT_EQ(wind().windFile.items, (Items{1, 2, 3}));
}

TEST_F(WindConditions, ANegativeSpeedIsToldWhateverTheFormat) {
  wind().constantSpeed = -1;
  for (const int deep : {0, 1}) {
    for (const std::int32_t format : {0, 1}) {
      wind().SetDataFormat(format);
      EXPECT_THAT(faults(deep), ElementsAre("Wind speed cannot be negative"));
    }
    wind().SetDataFormat(2);
    EXPECT_THAT(faults(deep), ElementsAre("Wind speed cannot be negative", notValid("")));
  }
  wind().SetDataFormat(0);
  wind().constantSpeed = 0;
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(WindConditions, ASeriesOfSpeedAndDirection) {
  const TsbItem direction{"D", 100003, "degree"};
  for (const int type : {100002, 100274})
    EXPECT_TRUE(isValid(2, {.items = {{"S", type, "m s-1"}, direction}, .axes = {}})) << type;
  const TsbItem speed{"S", 100274, "m s-1"};
  EXPECT_FALSE(isValid(2, {.items = {direction, speed}, .axes = {}}));
  EXPECT_FALSE(isValid(2, {.items = {speed, speed}, .axes = {}}));
  EXPECT_FALSE(isValid(2, {.items = {speed}, .axes = {}}));
  EXPECT_FALSE(isValid(2, {.items = {speed, direction}, .axes = {}, .seconds = 2000}));
  EXPECT_FALSE(isValid(2, {.items = {{"S", 100274, "km h-1"}, direction}, .axes = {}}));
}

TEST_F(WindConditions, MapsOfPressureAndComponents) {
  const TsbItem x{"X", 100274, "m s-1"};
  const TsbItem y{"Y", 100002, "m s-1"};
  for (const int type : {100409, 100450, 100196})
    EXPECT_TRUE(isValid(3, {.items = {{"P", type, "hPa"}, x, y}})) << type;
  const TsbItem pressure{"P", 100409, "hPa"};
  EXPECT_FALSE(isValid(3, {.items = {x, y, pressure}}));
  EXPECT_FALSE(isValid(3, {.items = {pressure, x, pressure}}));
  EXPECT_FALSE(isValid(3, {.items = {pressure, pressure, y}}));
  EXPECT_FALSE(isValid(3, {.items = {pressure, x}}));
  EXPECT_FALSE(isValid(3, {.items = {pressure, x, y}, .seconds = 2999}));
}

TEST_F(WindConditions, TheRequests) {
  const auto requested = [this](std::int32_t format) {
    wind().dataFormat = format;
    CVdFileSelectorDlg selector;
    wind().RequestFile(selector);
    std::vector<std::string> texts;
    for (const auto& request : selector.requests()) texts.push_back(request->description());
    EXPECT_EQ(selector.pluginEnabled(), texts.empty());
    return texts;
  };
  EXPECT_THAT(requested(0), IsEmpty());
  EXPECT_THAT(requested(1), IsEmpty());
  EXPECT_THAT(requested(2), ElementsAre("Wind speed", "Wind direction"));
  EXPECT_THAT(requested(3), ElementsAre("Air Pressure", "Wind X-component", "Wind Y-component"));
}

}  // namespace hydrodynamic_wind_conditions_test
}  // namespace gridbay
