#include "hydrodynamic/infiltration.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_infiltration_test {

using test::Model;
using test::savedText;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::Not;

class HdInfiltration : public ::testing::Test {
 protected:
  HdInfiltration() {
    CBathymetryObjectKvs& area = *model.root.bathymetry->GetArea(1);
    area.noJ = 10;
    area.noK = 8;
    area.dx = 30;
    area.dy = 30;
  }
  CNhdInfiltrationKvs& object() { return *model.root.nhdInfiltration; }
  std::vector<std::string> faults() {
    const ValidationList messages = test::messagesOf(object());
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::infiltration);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  Model model;
};

TEST_F(HdInfiltration, ANewOneHasNeitherFormatNorSelection) {
  EXPECT_EQ(savedText(object()),
            "INFILTRATION {\n"
            "    InfiltrationType 0\n"
            "    GroundwaterDepthType 1\n"
            "    InitialVolumeType 1\n"
            "}\n");
  EXPECT_EQ(object().infiltrationFormat, 2);
  EXPECT_EQ(object().File(), nullptr);
}

TEST_F(HdInfiltration, ANetRateIsReadBack) {
  constexpr std::string_view kText =
      "INFILTRATION {\n"
      "    InfiltrationType 1\n"
      "    InfiltrationFormat 3\n"
      "    GroundwaterDepthType 2\n"
      "    InitialVolumeType 2\n"
      "    File_Name (file)\"maps/rate.tsb2\"\n"
      "    Item_Numbers 4\n"
      "}\n";
  test::load(object(), kText);
  EXPECT_EQ(object().infiltrationFormat, 3);
  EXPECT_EQ(object().groundwaterDepthType, 2);
  EXPECT_EQ(object().initialVolumeType, 2);
  EXPECT_EQ(object().netRateFile.fileName.text(), "maps/rate.tsb2");
  EXPECT_TRUE(object().capacityFile.fileName.empty());
  EXPECT_EQ(savedText(object()), kText);
}

TEST_F(HdInfiltration, ACapacityIsAlwaysOfFormatTwo) {
  test::load(object(),
             "INFILTRATION { InfiltrationType 2; InfiltrationFormat 3; File_Name (file)\"soil.tsb2\"\n"
             " Item_Numbers 5 4 3 2 1 }");
  EXPECT_EQ(object().infiltrationFormat, 2);
  EXPECT_TRUE(object().netRateFile.fileName.empty());
  object().infiltrationFormat = 3;
  EXPECT_EQ(savedText(object()),
            "INFILTRATION {\n"
            "    InfiltrationType 2\n"
            "    InfiltrationFormat 2\n"
            "    GroundwaterDepthType 1\n"
            "    InitialVolumeType 1\n"
            "    File_Name (file)\"soil.tsb2\"\n"
            "    Item_Numbers 5 4 3 2 1\n"
            "}\n");
}

TEST_F(HdInfiltration, ACapacityWithoutASelectionHasFiveItems) {
  test::load(object(), "INFILTRATION { InfiltrationType 2 }");
  EXPECT_THAT(savedText(object()), HasSubstr("File_Name (file)\"\"\n    Item_Numbers 1 2 3 4 5\n"));
  test::load(object(), "INFILTRATION { InfiltrationType 2; Item_Numbers 1 2 3 4 5 6 7 }");
  EXPECT_THAT(object().capacityFile.items, ElementsAre(1, 2, 3, 4, 5));
}

TEST_F(HdInfiltration, NoInfiltrationReadsNeitherFormatNorSelection) {
  test::load(object(),
             "INFILTRATION { InfiltrationType 0; InfiltrationFormat 3; File_Name (file)\"rate.tsb2\" }");
  EXPECT_EQ(object().infiltrationFormat, 2);
  EXPECT_TRUE(object().netRateFile.fileName.empty());
  EXPECT_TRUE(object().capacityFile.fileName.empty());
  object().netRateFile.fileName = "/rate.tsb2";
  EXPECT_THAT(savedText(object()), Not(HasSubstr("File_Name")));
}

TEST_F(HdInfiltration, ANetRateWithoutAFormatKeepsTheDefault) {
  test::load(object(), "INFILTRATION { InfiltrationType 1 }");
  EXPECT_EQ(object().infiltrationFormat, 2);
  object().infiltrationType = 2;
  test::load(object(), "OTHER { InfiltrationType 0 }");
  EXPECT_EQ(object().infiltrationType, 2);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(HdInfiltration, ValuesOfTheWrongKindAndUnknownTypes) {
  test::load(object(), "INFILTRATION { InfiltrationType 9; InfiltrationFormat \"x\"; File_Name 7 }");
  EXPECT_EQ(object().infiltrationType, 9);
  EXPECT_EQ(object().File(), nullptr);
  EXPECT_TRUE(faults().empty());
  EXPECT_THAT(savedText(object()), Not(HasSubstr("InfiltrationFormat")));
}

TEST_F(HdInfiltration, Copying) {
  test::load(object(),
             "INFILTRATION { InfiltrationType 1; InfiltrationFormat 3; GroundwaterDepthType 2\n"
             " InitialVolumeType 2; File_Name (file)\"rate.tsb2\"; Item_Numbers 4 }");
  object().capacityFile.fileName = "/soil.tsb2";
  CNhdInfiltrationKvs copy(nullptr);
  copy.CopyFrom(object());
  EXPECT_TRUE(copy.SameState(object()));
  EXPECT_EQ(copy.capacityFile.fileName.text(), "/soil.tsb2");
}

TEST_F(HdInfiltration, OnlyTheNameIsChecked) {
  EXPECT_TRUE(faults().empty());
  for (const int type : {1, 2}) {
    object().infiltrationType = type;
    EXPECT_EQ(faults(), std::vector<std::string>{"File is not valid"});
    object().File()->fileName = "/there/is/none.tsb2";
    EXPECT_TRUE(faults().empty());
  }
  object().infiltrationType = 0;
  object().netRateFile.fileName = "";
  EXPECT_TRUE(faults().empty());
}

class InfiltrationRequests : public HdInfiltration {
 protected:
  // What is wrong with a file of maps, all zero, for a request; empty for nothing.
  struct Maps {
    std::vector<std::pair<int, std::string>> items;
    int noJ = 10;
    std::size_t steps = 1;
  };
  std::string why(void (CNhdInfiltrationKvs::*request)(CVdFileSelectorDlg&), const Maps& maps) {
    TsbDefinition definition = test::definitionOf({.noJ = maps.noJ, .steps = static_cast<int>(maps.steps)});
    definition.time.step = 3000;
    definition.items.clear();
    for (const auto& [type, unit] : maps.items) definition.items.push_back({"Map", type, unit});
    const std::string path = folder.file("maps.tsb2");
    test::writeFile(path, definition);
    CVdFileSelectorDlg selector;
    (object().*request)(selector);
    EXPECT_FALSE(selector.pluginEnabled());
    std::string text;
    selector.IsTsbFileValid(path, &text);
    return text;
  }
  test::TemporaryFolder folder;
};

TEST_F(InfiltrationRequests, ANetRate) {
  const auto fault = [this](int type, const std::string& unit, std::size_t steps, int noJ = 10) {
    return why(&CNhdInfiltrationKvs::RequestNetRate, {.items = {{type, unit}}, .noJ = noJ, .steps = steps});
  };
  EXPECT_EQ(fault(100061, "mm h-1", 1), "");
  EXPECT_EQ(fault(100379, "mm h-1", 1), "");
  EXPECT_EQ(fault(100062, "mm d-1", 1), "");
  EXPECT_THAT(fault(100369, "mm h-1", 1), HasSubstr("Infiltration: Item 1"));
  EXPECT_THAT(fault(100061, "mm h-1", 1, 9), HasSubstr("has 9 points along axis 1; 10 are expected"));
  object().infiltrationFormat = CNhdInfiltrationKvs::kVaryingInTime;
  EXPECT_EQ(fault(100369, "mm h-1", 2), "");
  EXPECT_EQ(fault(100061, "mm h-1", 2), "");
  EXPECT_EQ(fault(100379, "mm h-1", 2), "");
  EXPECT_THAT(fault(100062, "mm d-1", 2), HasSubstr("Infiltration: Item 1"));
  EXPECT_THAT(fault(100369, "mm h-1", 1), HasSubstr("The file covers"));
}

TEST_F(InfiltrationRequests, ACapacity) {
  Maps maps{.items = {{100061, "mm h-1"}, {100456, "1"}, {100366, "m"}, {110257, "mm h-1"}, {100239, "%"}}};
  const auto fault = [&] { return why(&CNhdInfiltrationKvs::RequestCapacity, maps); };
  const auto with = [&](std::size_t place, int type, const std::string& unit) {
    const auto before = std::exchange(maps.items[place], {type, unit});
    const std::string text = fault();
    maps.items[place] = before;
    return text;
  };
  EXPECT_EQ(fault(), "");
  for (const auto& [type, unit] : {std::pair{100379, "mm h-1"}, {100062, "mm d-1"}})
    EXPECT_EQ(with(0, type, unit), "");
  for (const int type : {100292, 100144, 100375}) EXPECT_EQ(with(1, type, "1"), "");
  EXPECT_EQ(with(4, 100516, "%"), "");
  EXPECT_THAT(with(0, 100079, "m"), HasSubstr("Infiltration: "));
  EXPECT_THAT(with(1, 100079, "m"), HasSubstr("Porosity: "));
  EXPECT_THAT(with(2, 100180, "m"), HasSubstr("Depth Below Ground: "));
  EXPECT_THAT(with(3, 100079, "m"), HasSubstr("Leakage: "));
  EXPECT_THAT(with(4, 100377, "1"), HasSubstr("Percentage: "));
  maps.noJ = 11;
  EXPECT_THAT(fault(), HasSubstr("has 11 points along axis 1; 10 are expected"));
  maps.noJ = 10;
  object().groundwaterDepthType = CNhdInfiltrationKvs::kLevel;
  EXPECT_THAT(fault(), HasSubstr("Elevation: "));
  EXPECT_EQ(with(2, 100180, "m"), "");
  object().groundwaterDepthType = CNhdInfiltrationKvs::kDepth;
  object().initialVolumeType = CNhdInfiltrationKvs::kWaterContent;
  EXPECT_THAT(fault(), HasSubstr("Volumetric Water Content: "));
  EXPECT_EQ(with(4, 100377, "1"), "");
  maps.items.push_back({100079, "m"});
  EXPECT_EQ(with(4, 100377, "1"), "");  // there may be more
  maps.items.resize(4);
  EXPECT_THAT(fault(), HasSubstr("The file has 4 items; at least 5 are expected"));
}

}  // namespace hydrodynamic_infiltration_test
}  // namespace gridbay
