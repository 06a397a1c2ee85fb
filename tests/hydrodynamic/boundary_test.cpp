#include "hydrodynamic/boundary.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_boundary_test {

using test::Model;
using test::savedText;
using ::testing::HasSubstr;
using ::testing::StartsWith;

// A model with one boundary from (0,5) to (0,9).
class HdBoundary : public ::testing::Test {
 protected:
  HdBoundary() {
    model.root.bathymetry->GetArea(1)->dx = 20;
    model.root.bathymetry->GetArea(1)->dy = 30;
    model.root.boundary->SetNoBoundaries(1);
    model.root.boundary->GetItem(1)->Set(0, 5, 0, 9);
  }
  CNhdBoundaryObjectKvs& item() { return *model.root.nhdBoundary->GetItem(1); }
  std::vector<std::string> faults() {
    const ValidationList messages = test::messagesOf(*model.root.nhdBoundary);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::hdBoundary);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  // A profile along the boundary, covering the simulation.
  void writeProfile(int itemType, const std::string& unit, std::size_t points, double spacing,
                    int dataType = 0) {
    TsbDefinition definition;
    definition.dataType = dataType;
    definition.time.step = 3000;
    definition.time.count = 2;
    definition.axes = {{points, 0, spacing, "m"}};
    definition.items = {{"Profile", itemType, unit}};
    test::writeFile(path, definition);
  }
  void writeSeries(int itemType, const std::string& unit, double step = 3000) {
    TsbTimeAxis time;
    time.step = step;
    time.count = 2;
    test::writeSeries(path, time, itemType, unit);
  }

  test::TemporaryFolder folder;
  Model model;
  std::string path = folder.file("data.tsb1");
};

TEST_F(HdBoundary, ANewOneIsWrittenInFileOrder) {
  EXPECT_EQ(savedText(*model.root.nhdBoundary),
            "OPEN_BOUNDARY {\n"
            "    BOUNDARY_1 {\n"
            "        Formulation 1\n"
            "        Data_Format 1\n"
            "        Value 0.0\n"
            "        FAB_Type 12\n"
            "        Tilt_Type -1\n"
            "        Tilting_Point 0\n"
            "        Relaxation_Factor 0.5\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "        SINUSOIDAL_BOUNDARY {\n"
            "            Reference_Level 0.0\n"
            "            Range 1.0\n"
            "            Period 43200.0\n"
            "            Phase 0.0\n"
            "        }\n"
            "        USER_DIRECTIONS {\n"
            "            Enable_User_Directions #false\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "    }\n"
            "}\n");
}

TEST_F(HdBoundary, FollowsTheCountOfBoundaries) {
  item().value = 3;
  model.root.boundary->SetNoBoundaries(3);
  EXPECT_EQ(model.root.nhdBoundary->GetCount(), 3);
  EXPECT_EQ(item().value, 3);
  model.root.boundary->RecalculateBoundaries();  // the grid cannot be read
  EXPECT_EQ(model.root.nhdBoundary->GetCount(), 0);
}

TEST_F(HdBoundary, IsReadBack) {
  test::load(
      *model.root.nhdBoundary,
      "OPEN_BOUNDARY { BOUNDARY_1 { Formulation 2; Data_Format 5; Value 1.5; FAB_Type 2; Tilt_Type 1; "
      "Tilting_Point 7\n"
      " Relaxation_Factor 0.25; File_Name (file)\"t.tsb1\"; Item_Numbers\n"
      " SINUSOIDAL_BOUNDARY { Reference_Level 1.0; Range 2.0; Period 3.0; Phase 4.0 }\n"
      " USER_DIRECTIONS { Enable_User_Directions #true; File_Name (file)\"d.tsb1\"; Item_Numbers 2 } } }");
  EXPECT_EQ(item().formulation, 2);
  EXPECT_EQ(item().relaxationFactor, 0.25);
  EXPECT_TRUE(item().dataFile.items.empty());
  EXPECT_EQ(item().phase, 4.0F);
  EXPECT_EQ(item().directionFile.items, std::vector<std::uint32_t>{2});
  const std::string text = savedText(*model.root.nhdBoundary);
  Model other;
  other.root.boundary->SetNoBoundaries(1);
  test::load(*other.root.nhdBoundary, text);
  EXPECT_EQ(savedText(*other.root.nhdBoundary), text);
}

TEST_F(HdBoundary, AnOlderFileKeepsTheDefaultsThatItLacks) {
  test::load(*model.root.nhdBoundary, "OPEN_BOUNDARY { BOUNDARY_1 { Value 2.0 } }");
  EXPECT_EQ(item().value, 2.0F);
  EXPECT_EQ(item().relaxationFactor, 0.5);
  EXPECT_EQ(item().period, 43200.0F);
  EXPECT_EQ(item().fabType, 12);
  test::load(*model.root.nhdBoundary, "OTHER {}");
  EXPECT_TRUE(model.host.texts.empty());
  test::load(*model.root.nhdBoundary, "OPEN_BOUNDARY {}");
  EXPECT_EQ(model.host.texts, std::vector<std::string>{
                                  "Error in the KVS-FILE\nThe number of Hydrodynamic Boundary sections does "
                                  "not correspond to the number of Boundaries"});
}

TEST_F(HdBoundary, AStoredFabType3IsWrittenAs12) {
  item().fabType = 3;
  EXPECT_THAT(savedText(*model.root.nhdBoundary), HasSubstr("FAB_Type 12\n"));
}

TEST_F(HdBoundary, Copying) {
  item().formulation = 2;
  item().range = 5;
  item().relaxationFactor = 0.1;
  item().dataFile.fileName = "/x/y.tsb0";
  CNhdBoundaryObjectKvs copy(nullptr);
  copy.CopyFrom(item());
  EXPECT_EQ(copy.formulation, 2);
  EXPECT_EQ(copy.dataFile.fileName.text(), "/x/y.tsb0");
  EXPECT_EQ(copy.range, 1.0F);
  EXPECT_EQ(copy.relaxationFactor, 0.5);
  Model other;
  other.root.nhdBoundary->CopyFrom(*model.root.nhdBoundary);
  EXPECT_EQ(savedText(*other.root.nhdBoundary), savedText(*model.root.nhdBoundary));
}

TEST_F(HdBoundary, AChangeOfTheDataFormat) {
  const auto set = [this](std::int32_t format, std::int32_t fabType, std::size_t items) {
    item().SetDataFormat(format);
    EXPECT_EQ(item().dataFormat, format);
    EXPECT_EQ(item().fabType, fabType) << format;
    EXPECT_EQ(item().dataFile.items.size(), items) << format;
  };
  set(5, 2, 0);
  set(1, 12, 0);
  set(3, 12, 1);
  set(5, 2, 0);
  set(7, 2, 1);
  item().fabType = 0;
  item().SetDataFormat(7);
  EXPECT_EQ(item().fabType, 0);
  set(2, 12, 1);
  set(4, 12, 1);
}

TEST_F(HdBoundary, AConstantAndASineSeriesHaveNoChecks) {
  item().range = -5;
  EXPECT_TRUE(faults().empty());
  item().dataFormat = 2;
  EXPECT_TRUE(faults().empty());
  EXPECT_TRUE(test::messagesOf(*model.root.nhdBoundary, 0).empty());
}

TEST_F(HdBoundary, ATimeSeries) {
  item().SetDataFormat(3);
  item().dataFile.fileName = path;
  EXPECT_EQ(faults(), std::vector<std::string>{"Data file  \" " + path +
                                               "\"  is not valid  Error Message: cannot read \"" + path +
                                               "\": there is no such file"});
  for (const int type : {100000, 100078}) {
    writeSeries(type, "m");
    EXPECT_TRUE(faults().empty());
  }
  item().formulation = 2;
  EXPECT_THAT(
      faults().at(0),
      HasSubstr(
          "Boundary: Item 1 \"Series 1\" is Surface elevation (type 100078); Discharge (type 100001) or "
          "Flow rate (type 100430) is expected"));
  for (const int type : {100001, 100430}) {
    writeSeries(type, "m3 s-1");
    EXPECT_TRUE(faults().empty());
  }
  writeSeries(100001, "m3 s-1", 10);
  EXPECT_THAT(faults().at(0), HasSubstr("The file covers"));
  item().dataFile.items = {2};
  EXPECT_THAT(faults().at(0), HasSubstr("the file has no item 2"));
}

TEST_F(HdBoundary, AProfileAlongTheBoundary) {
  item().SetDataFormat(4);
  item().dataFile.fileName = path;
  writeProfile(100000, "m", 5, 30);
  EXPECT_TRUE(faults().empty());
  writeProfile(100000, "m", 6, 30);
  EXPECT_THAT(faults().at(0), HasSubstr("has 6 points along axis 1; 5 are expected"));
  writeProfile(100000, "m", 5, 20);
  EXPECT_THAT(faults().at(0), HasSubstr("has a spacing of 20 along axis 1; 30 is expected"));
  item().formulation = 2;
  writeProfile(100080, "m2 s-1", 5, 30);
  EXPECT_TRUE(faults().empty());
  model.root.boundary->GetItem(1)->Set(0, 5, 3, 9);
  EXPECT_THAT(faults().at(0), HasSubstr("-1 are expected"));
}

TEST_F(HdBoundary, ATransferFile) {
  item().SetDataFormat(5);
  item().dataFile.fileName = path;
  item().formulation = 2;
  writeProfile(100000, "m", 5, 30, 1);
  EXPECT_TRUE(faults().empty());
  writeProfile(100000, "m", 5, 30, 0);
  EXPECT_THAT(faults().at(0), HasSubstr("The file's data type is 0; 1 is expected"));
}

TEST_F(HdBoundary, ARatingCurve) {
  item().formulation = 2;
  item().SetDataFormat(7);
  EXPECT_THAT(faults().at(0), StartsWith("Data file  \" \"  is not valid  Error Message: "));
  item().dataFile.fileName = folder.write("curve.TSB0", "");
  EXPECT_TRUE(faults().empty());
  item().dataFile.fileName = folder.write("curve.txt", "");
  EXPECT_EQ(faults().size(), 1U);
  item().dataFile.fileName = folder.file("none.tsb0");
  EXPECT_EQ(faults().size(), 1U);

  CVdFileSelectorDlg selector;
  item().RequestDataFile(selector, 1);
  EXPECT_FALSE(selector.pluginEnabled());
  test::writeSeries(path, {.type = TsbTimeAxisType::relative, .unit = "m", .count = 2, .values = {0, 1}},
                    100001, "m3 s-1");
  std::string error;
  EXPECT_TRUE(selector.IsTsbFileValid(path, &error)) << error;
  test::writeSeries(path, {}, 100001, "m3 s-1");
  EXPECT_FALSE(selector.IsTsbFileValid(path, &error));
}

TEST_F(HdBoundary, TheTiltingPoint) {
  const auto at = [this](int type, int point) {
    item().tiltType = type;
    item().tiltingPoint = point;
    return faults();
  };
  const std::vector<std::string> outside{"Tilting point is outside of boundary line"};
  EXPECT_TRUE(at(1, 5).empty());
  EXPECT_TRUE(at(1, 9).empty());
  EXPECT_EQ(at(1, 4), outside);
  EXPECT_EQ(at(0, 10), outside);
  EXPECT_TRUE(at(-1, 100).empty());
  model.root.boundary->GetItem(1)->Set(2, 4, 6, 4);
  EXPECT_TRUE(at(0, 6).empty());
  EXPECT_EQ(at(0, 7), outside);
  model.root.boundary->GetItem(1)->Set(0, 0, 3, 3);
  EXPECT_TRUE(at(1, 0).empty());
  EXPECT_EQ(at(1, 1), outside);
  model.root.nhdBoundary->SetNoBoundaries(2);
  model.root.nhdBoundary->GetItem(2)->tiltType = 0;
  EXPECT_EQ(at(-1, 0), std::vector<std::string>{" No Boundary Data item "});
}

TEST_F(HdBoundary, FlowDirections) {
  item().enableUserDirections = true;
  item().directionFile.fileName = path;
  EXPECT_EQ(faults(), std::vector<std::string>{"Data file  \" " + path + "\"  is not valid"});
  writeProfile(100408, "degree", 5, 30);
  EXPECT_TRUE(faults().empty());
  writeProfile(100408, "degree", 4, 30);
  EXPECT_EQ(faults().size(), 1U);
  item().fabType = 2;
  EXPECT_EQ(faults().size(), 1U);
  for (const int fabType : {0, 1}) {
    item().fabType = fabType;
    EXPECT_TRUE(faults().empty());
  }
}

}  // namespace hydrodynamic_boundary_test
}  // namespace gridbay
