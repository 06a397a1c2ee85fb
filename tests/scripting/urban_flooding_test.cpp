#include <gtest/gtest.h>

#include <stdexcept>

#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/result.h"
#include "platform/cartography/cartography.h"
#include "tests/scripting/script.h"
#include "tests/support/grids.h"

namespace gridbay {
namespace scripting_urban_flooding_test {

using scripting::DateTime;
using scripting::OutputPosition;
using scripting::UrbanFlooding_V27Flowmodel;
using test::Script;

class UrbanFlooding : public ::testing::Test {
 protected:
  CNhdResultObjectKvs& last() {
    auto& outputs = urban.root().nhdResult->outputs;
    return outputs.at(outputs.GetCount());
  }
  void addMap(double x1, double y1, double x2, double y2, double steps = 1, bool part = true) {
    urban.AddOutput_MapsAndTimeSeries(0, part ? 1 : 0, x1, y1, x2, y2, 0, {}, {}, steps, "/m.tsb2", "Map",
                                      true, true, true, true);
  }
  std::string ranges() {
    return urban.flow(
        "OUTPUT_SPECIFICATION/OUTPUT_AREA_" + std::to_string(urban.root().nhdResult->outputs.GetCount()),
        {"X_Range_And_Interval", "Y_Range_And_Interval"});
  }

  test::TemporaryFolder folder;
  Script<UrbanFlooding_V27Flowmodel> urban;
};

TEST_F(UrbanFlooding, BoundaryValuesAreThoseOfTheOtherClass) {
  urban.setNoOfBndCondition(1);
  urban.root().nhdBoundary->at(1).SetDataFormat(3);
  urban.root().nhdBoundary->at(1).fabType = 0;
  urban.setBndCondition_Value(0, 9, 9, 9, 9, 9, 9);
  urban.setBndCondition_Value(2, 9, 9, 9, 9, 9, 9);
  EXPECT_EQ(urban.flow("OPEN_BOUNDARY/BOUNDARY_1/Formulation"), "1");
  urban.setBndCondition_Value(1, 1, 2, 3, 4, 2, 0.5);
  EXPECT_EQ(urban.global("OPEN_BOUNDARY/BOUNDARY_1/First_Point"), "1 2");
  EXPECT_EQ(urban.global("OPEN_BOUNDARY/BOUNDARY_1/Last_Point"), "3 4");
  EXPECT_EQ(urban.flow("OPEN_BOUNDARY/BOUNDARY_1", {"Formulation", "Data_Format", "Value", "FAB_Type"}),
            "Formulation=2 Data_Format=1 Value=0.5 FAB_Type=12");
}

TEST_F(UrbanFlooding, TheExtensionSaysWhatABoundaryFileIs) {
  struct Case {
    const char* file;
    const char* stored;  // with format 1 and FAB type 1 before
  };
  for (const Case& it :
       {Case{"/a/tide.tsb0", "Data_Format=3 FAB_Type=12 File_Name=/a/tide.tsb0 Item_Numbers=5"},
        Case{"/tide.tb0", "Data_Format=3 FAB_Type=12 File_Name=/tide.tb0 Item_Numbers=5"},
        Case{"/tide.tsb1", "Data_Format=4 FAB_Type=12 File_Name=/tide.tsb1 Item_Numbers=5"},
        Case{"/x.y.tb1", "Data_Format=4 FAB_Type=12 File_Name=/x.y.tb1 Item_Numbers=5"},
        Case{"/tide.TSB0", "Data_Format=1 FAB_Type=1 File_Name= Item_Numbers=1"},
        Case{"/tide.tsb2", "Data_Format=1 FAB_Type=1 File_Name= Item_Numbers=1"},
        Case{"/a.tsb0/tide", "Data_Format=1 FAB_Type=1 File_Name= Item_Numbers=1"},
        Case{"C:\\a.tsb0\\tide", "Data_Format=1 FAB_Type=1 File_Name= Item_Numbers=1"},
        Case{"/tide.tsb0 ", "Data_Format=1 FAB_Type=1 File_Name= Item_Numbers=1"},
        Case{"", "Data_Format=1 FAB_Type=1 File_Name= Item_Numbers=1"}}) {
    urban.setNoOfBndCondition(0);
    urban.setNoOfBndCondition(1);
    urban.root().nhdBoundary->at(1).fabType = 1;
    urban.setBndCondition_File(1, 4, 3, 2, 1, 2, it.file, 5);
    EXPECT_EQ(
        urban.flow("OPEN_BOUNDARY/BOUNDARY_1", {"Data_Format", "FAB_Type", "File_Name", "Item_Numbers"}),
        it.stored);
    EXPECT_EQ(urban.flow("OPEN_BOUNDARY/BOUNDARY_1/Formulation"), "2") << it.file;
    EXPECT_EQ(urban.global("OPEN_BOUNDARY/BOUNDARY_1/First_Point"), "4 3") << it.file;
    EXPECT_EQ(urban.global("OPEN_BOUNDARY/BOUNDARY_1/Last_Point"), "2 1") << it.file;
  }
}

TEST_F(UrbanFlooding, AFormatThatIsSetKeepsWhatDependsOnIt) {
  urban.setNoOfBndCondition(1);
  CNhdBoundaryObjectKvs& condition = urban.root().nhdBoundary->at(1);
  condition.SetDataFormat(3);
  condition.fabType = 0;
  urban.setBndCondition_File(1, 0, 0, 0, 1, 1, "/tide.tsb0", 2);
  EXPECT_EQ(condition.fabType, 0);
  condition.dataFile.SetNoItems(0);
  EXPECT_THROW(urban.setBndCondition_File(1, 0, 0, 0, 1, 1, "/tide.tsb0", 2), std::invalid_argument);
  for (const int index : {0, 2}) {
    urban.setBndCondition_File(index, 9, 9, 9, 9, 9, "/other.tsb1", 9);
    urban.setBndCondition_File(index, 9, 9, 9, 9, 9, "/other", 9);
  }
  EXPECT_EQ(condition.dataFormat, 3);
  EXPECT_EQ(condition.formulation, 1);
}

TEST_F(UrbanFlooding, WithoutAGridCoordinatesAreGridPoints) {
  addMap(1.9, 2.2, 30.99, -0.9);
  EXPECT_EQ(ranges(), "X_Range_And_Interval=1 30 1 Y_Range_And_Interval=2 0 1");
  addMap(-1.9, -2.2, 1e300, -1e300);
  EXPECT_EQ(ranges(), "X_Range_And_Interval=-1 2147483647 1 Y_Range_And_Interval=-2 -2147483648 1");
  addMap(1, 1, 2, 2, 1, false);
  EXPECT_EQ(last().part.x.last, -1);
}

TEST_F(UrbanFlooding, CoordinatesCountFromTheOriginOfTheGrid) {
  test::GridSpec spec;
  spec.dx = 20;
  spec.dy = 50;
  spec.geography = TsbGeography{"UTM-32", 9.2, 55.3, 0};
  test::writeGrid(folder.file("grid.tsb2"), spec);
  urban.setCoarseBathymetryFile(folder.file("grid.tsb2"));
  double east = 0;
  double north = 0;
  ASSERT_TRUE(CVdMapProjection("UTM-32").Geo2Proj(9.2, 55.3, &east, &north));
  addMap(east + 25, north + 49, east + 119, north + 101);
  EXPECT_EQ(ranges(), "X_Range_And_Interval=1 5 1 Y_Range_And_Interval=0 2 1");
  // Left of the origin by more than a cell: negative, which validation reports.
  addMap(east - 25, north - 49, east + 119, north + 101);
  EXPECT_EQ(ranges(), "X_Range_And_Interval=-1 5 1 Y_Range_And_Interval=0 2 1");
  ValidationList messages;
  EXPECT_GT(urban.root().nhdResult->Validate(messages, 1), 0U);

  // A file without a place on a map has its origin at 0.
  spec.geography.reset();
  test::writeGrid(folder.file("local.tsb2"), spec);
  urban.setCoarseBathymetryFile(folder.file("local.tsb2"));
  addMap(25, 49, 119, 101);
  EXPECT_EQ(ranges(), "X_Range_And_Interval=1 5 1 Y_Range_And_Interval=0 2 1");
  EXPECT_EQ(urban.shown, std::vector<std::string>());
}

TEST_F(UrbanFlooding, ItemsFollowTheFlags) {
  struct Case {
    bool depth, elevation, velocities, fluxes;
    const char* items;
  };
  for (const Case& it : {Case{true, true, true, true, "Output_item=6 ITEM_NUMBERS=1 2 3 4 5 6"},
                         Case{true, false, false, false, "Output_item=1 ITEM_NUMBERS=1"},
                         Case{false, true, false, false, "Output_item=1 ITEM_NUMBERS=4"},
                         Case{false, false, true, false, "Output_item=2 ITEM_NUMBERS=5 6"},
                         Case{false, false, false, true, "Output_item=2 ITEM_NUMBERS=2 3"},
                         Case{false, false, false, false, "Output_item=0 ITEM_NUMBERS="}}) {
    urban.ClearHDResultOutputs();
    urban.AddOutput_MapsAndTimeSeries(0, 0, 0, 0, 0, 0, 0, {}, {}, 1, "/m.tsb2", "Map", it.depth,
                                      it.elevation, it.velocities, it.fluxes);
    EXPECT_EQ(urban.flow("OUTPUT_SPECIFICATION/OUTPUT_AREA_1", {"Output_item", "ITEM_NUMBERS"}), it.items);
  }
  EXPECT_EQ(urban.flow("OUTPUT_SPECIFICATION/OUTPUT_AREA_1", {"Area_no", "Title", "File_Name"}),
            "Area_no=1 Title=Map File_Name=/m.tsb2");
}

TEST_F(UrbanFlooding, CoordinatesOfAPointHaveNoEffect) {
  urban.AddOutput_MapsAndTimeSeries(1, 1, 5, 6, 7, 8, 0, {}, {}, 1, "/p.tsb0", "Gauge", true, false, false,
                                    false);
  EXPECT_EQ(urban.flow("OUTPUT_SPECIFICATION/OUTPUT_AREA_1",
                       {"Type", "Number_Of_Points", "X_Range_And_Interval", "Y_Range_And_Interval"}),
            "Type=0 Number_Of_Points=1 X_Range_And_Interval=0.0 Y_Range_And_Interval=0.0");
}

TEST_F(UrbanFlooding, AnotherTypeIsTold) {
  urban.AddOutput_MapsAndTimeSeries(3, 1, 5, 6, 7, 8, 0, {}, {}, 1, "", "", true, false, false, false);
  EXPECT_EQ(urban.shown, std::vector<std::string>{"Unsupported output type"});
  EXPECT_EQ(last().type, CNhdResultObjectKvs::kMap);
}

TEST_F(UrbanFlooding, IntervalFollowsTheNumberOfSteps) {
  urban.SetSimulationPeriod({100, 0}, {101, 0}, 60);
  for (const auto& [steps, interval] : {std::pair(10.0, 144),
                                        {7.0, 205},
                                        {1440.0, 1},
                                        {1441.0, 1},
                                        {1e9, 1},
                                        {0.5, 2880},
                                        {0.0, 1},
                                        {-3.0, 1}}) {
    addMap(0, 0, 1, 1, steps);
    EXPECT_EQ(last().steps.interval, interval) << steps;
    EXPECT_EQ(last().steps.last, 1440);
  }
  urban.AddOutput_MapsAndTimeSeries(0, 0, 0, 0, 0, 0, 1, {100.25, 0}, {100.5, 0}, 4, "", "", true, false,
                                    false, false);
  EXPECT_EQ(urban.flow("OUTPUT_SPECIFICATION/OUTPUT_AREA_9",
                       {"First_Time_Step", "Last_Time_Step", "Time_Step_interval"}),
            "First_Time_Step=360 Last_Time_Step=720 Time_Step_interval=90");
}

TEST_F(UrbanFlooding, TheReaderIgnoresItsSecondArgument) {
  addMap(1, 2, 3, 4);
  for (const int ignored : {0, 1, 2, -1}) {
    OutputPosition position = urban.GetOutputsListHeadPos();
    int part = -1, j1 = -1, k1 = -1, j2 = -1, k2 = -1, period = -1, frequency = -1;
    std::vector<double> pointsJ, pointsK;
    DateTime first, end;
    std::string file, title;
    std::vector<int> items;
    const auto next = [&] {
      urban.GetNextOutputs_MapsJKAndTS(position, ignored, part, j1, k1, j2, k2, pointsJ, pointsK, period,
                                       first, end, frequency, file, title, items);
    };
    next();
    EXPECT_EQ((std::vector{part, j1, k1, j2, k2, period, frequency}), (std::vector{1, 1, 2, 3, 4, 1, 100}));
    EXPECT_EQ(file + title, "/m.tsb2Map");
    EXPECT_EQ(items.size(), 6U);
    EXPECT_FALSE(position);
    EXPECT_THROW(next(), std::invalid_argument);
  }
}

}  // namespace scripting_urban_flooding_test
}  // namespace gridbay
