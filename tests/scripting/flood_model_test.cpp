#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <filesystem>
#include <limits>
#include <stdexcept>
#include <thread>
#include <type_traits>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "hydrodynamic/surface_elevation.h"
#include "tests/scripting/script.h"
#include "tests/support/grids.h"

namespace gridbay {
namespace scripting_flood_model_test {

using scripting::DateTime;
using scripting::Flooding_V27FlowModel;
using scripting::Flooding_V27WSKFlowModel;
using scripting::OutputPosition;
using scripting::UrbanFlooding_V27Flowmodel;
using test::Script;

// What a fresh object writes.
const std::string kFreshFile = test::textOf(std::string(GRIDBAY_TESTS) + "/scripting/fresh.v27");

using Strings = std::vector<std::string>;

class FloodModelTest : public ::testing::Test {
 protected:
  std::string grid(const std::string& name, const std::string& projection = "UTM-32",
                   const test::GridSpec& like = {}) {
    test::GridSpec spec = like;
    if (!projection.empty()) spec.geography = TsbGeography{projection, 9, 55, 0};
    test::writeGrid(folder.file(name), spec);
    return folder.file(name);
  }
  // What a save writes.
  template <class Scripted>
  std::string saved(Script<Scripted>& script) {
    script.SaveFile(folder.file("saved.v27"));
    return test::textOf(folder.file("saved.v27"));
  }

  test::TemporaryFolder folder;
  Script<Flooding_V27FlowModel> flood;
};

TEST_F(FloodModelTest, AFreshFileHasTheWholeTree) {
  EXPECT_EQ(flood.root().bathymetry->GetCount(), 1);
  EXPECT_FALSE(flood.root().moduleSelection->highPrecision);
  EXPECT_EQ(saved(flood), kFreshFile);
  EXPECT_EQ(flood.shown, Strings{"VANE 27: Data file  \" \"  is not valid"});
  Script<UrbanFlooding_V27Flowmodel> urban;
  EXPECT_EQ(saved(urban), kFreshFile);
  EXPECT_EQ(flood.GetFileExtension(), ".v27");
  EXPECT_EQ(urban.GetFileExtension(), ".v27");
}

TEST_F(FloodModelTest, SavesWithAllFaultsInOneText) {
  flood.setNoOfBndCondition(1);
  flood.setHDBndCondition_Value(1, -1, 0, 0, 3, 1, 0);
  flood.setCoarseBathymetryFile(grid("grid.tsb2"));
  flood.setDryingFloodingDepth(0.05F, 0.02F);
  ValidationList messages;
  flood.root().Validate(messages, 1);
  ASSERT_GE(messages.size(), 2U);
  std::string whole;
  for (const CMessage& message : messages)
    whole += std::string(whole.empty() ? "" : "\n") + "VANE 27: " + message.text;
  const std::string text = saved(flood);
  EXPECT_EQ(flood.shown, Strings{whole});
  EXPECT_NE(text.find("First_Point -1 0\n"), std::string::npos);
}

TEST_F(FloodModelTest, ACleanModelIsSavedInSilence) {
  flood.setCoarseBathymetryFile(grid("grid.tsb2"));
  saved(flood);
  EXPECT_EQ(flood.shown, Strings());
}

TEST_F(FloodModelTest, ReadsWhatItWrote) {
  flood.setCoarseBathymetryFile(grid("grid.tsb2"));
  flood.setNoOfBndCondition(1);
  flood.setHDBndCondition_Value(1, 0, 0, 0, 7, 2, 3.5);
  flood.setNoOfSourceSink(2);
  flood.AddOutput_MapsAndTimeSeriesJK(0, 1, 1, 2, 3, 4, {}, {}, 0, {}, {}, 5, "out.tsb2", "Out", {1});
  const std::string text = saved(flood);
  Script<Flooding_V27FlowModel> other;
  for (int times = 1; times <= 2; ++times) {
    other.LoadFile(folder.file("saved.v27"));
    EXPECT_EQ(saved(other), text) << times;
  }
  EXPECT_TRUE(other.root().bathymetry->GetItem(1)->isRead());
  EXPECT_EQ(other.getCoarseBathymetryFile(), "grid.tsb2");
  EXPECT_EQ(other.shown, Strings());

  // From now on names start from the folder of the setup, wherever they are given.
  test::writeSeries(folder.file("tide.tsb0"), {}, 100000, "m");
  other.documentPath = folder.file("saved.v27");
  other.setNoOfBndCondition(2);
  for (int index : {1, 2}) other.setHDBndCondition_File(index, 0, 0, 0, 7, 1, 3, "tide.tsb0", 1);
  for (int index : {1, 2}) {
    EXPECT_EQ(other.root().nhdBoundary->at(index).dataFile.fileName.absolute(), folder.file("tide.tsb0"));
    EXPECT_EQ(other.flow("OPEN_BOUNDARY/BOUNDARY_" + std::to_string(index) + "/File_Name"), "tide.tsb0");
  }
}

TEST_F(FloodModelTest, ASecondLoadHasNothingOfTheFirst) {
  flood.setCoarseBathymetryFile(grid("grid.tsb2"));
  const std::string text = saved(flood);
  const auto partOf = [this](const std::string& what) {
    return folder.write("part.v27", "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { " + what + " } }\n");
  };
  Script<Flooding_V27FlowModel> other;
  other.setDryingFloodingDepth(0.5F, 0.6F);
  other.LoadFile(partOf("SOURCE_AND_SINK { Number_Of_Sources 3; }"));
  EXPECT_EQ(other.getNoOfSourceSink(), 3);
  EXPECT_EQ(other.global("FLOOD_AND_DRY/Drying_Depth"), "0.5");
  other.LoadFile(partOf(""));
  EXPECT_EQ(other.getNoOfSourceSink(), 0);
  EXPECT_EQ(saved(other), kFreshFile);
  other.LoadFile(folder.file("part.v27"));
  flood.LoadFile(folder.file("none.v27"));
  EXPECT_EQ(saved(flood), text);
}

TEST_F(FloodModelTest, WhatCannotBeReadLeavesTheModel) {
  flood.setResistance_Value(25);
  flood.setNoOfBndCondition(2);
  const std::string before = saved(flood);
  flood.shown.clear();
  const std::string broken = folder.write("broken.v27", "VANE27_NESTED_MODEL {\n  Key \"open\n");
  flood.LoadFile(broken);
  ASSERT_EQ(flood.shown.size(), 1U);
  EXPECT_NE(flood.shown[0].find("Syntax error in \"" + broken + "\""), std::string::npos) << flood.shown[0];
  flood.shown.clear();
  for (const std::string& file :
       {folder.file("none.v27"), folder.path().string(), std::string(), folder.write("empty.v27", ""),
        folder.write("other.v27", "OTHER { Key 1; }\n")})
    flood.LoadFile(file);
  EXPECT_EQ(flood.shown, Strings());
  EXPECT_EQ(saved(flood), before);
  EXPECT_EQ(kvsPeekErrorGlb(), kKvsNoError);
}

TEST_F(FloodModelTest, ALoadReadsTheGridsAndKeepsQuiet) {
  grid("grid.tsb2");
  folder.write(
      "short.v27",
      "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS {\n"
      "BATHYMETRY_SELECTION { No_Of_Areas 1; AREA_1 { DATA_FILE { FILE_NAME (file)\"grid.tsb2\" } } }\n"
      "OPEN_BOUNDARY { Number_Of_Boundaries 2; }\n"
      "} }\n");
  flood.LoadFile(folder.file("short.v27"));
  EXPECT_EQ(flood.root().bathymetry->GetItem(1)->noJ, 10);
  EXPECT_EQ(flood.getNoOfBndConditions(), 2);
  EXPECT_EQ(flood.shown, Strings());
}

TEST_F(FloodModelTest, TellsWhyAFileIsNotWritten) {
  flood.setCoarseBathymetryFile(grid("grid.tsb2"));
  flood.SaveFile(folder.file("none/setup.v27"));
  ASSERT_EQ(flood.shown.size(), 1U);
  EXPECT_NE(flood.shown[0].find("none/setup.v27"), std::string::npos) << flood.shown[0];
  EXPECT_EQ(kvsPeekErrorGlb(), kKvsNoError);
}

TEST_F(FloodModelTest, ItemsThatCannotBeSavedThrow) {
  const std::string before = saved(flood);
  flood.AddOutput_MapsAndTimeSeriesJK(0, 0, 0, 0, 0, 0, {}, {}, 0, {}, {}, 1, "out.tsb2", "", {1, 15});
  EXPECT_THROW(flood.SaveFile(folder.file("saved.v27")), std::invalid_argument);
  EXPECT_EQ(test::textOf(folder.file("saved.v27")), before);
}

TEST_F(FloodModelTest, WithoutABoxTextsGoToStandardError) {
  ::testing::internal::CaptureStderr();
  {
    Flooding_V27FlowModel silent;
    silent.SaveFile(folder.file("saved.v27"));
    ShowMessagesWith(flood, {});
    flood.SaveFile(folder.file("saved.v27"));
  }
  const std::string line = "VANE 27: Data file  \" \"  is not valid\n";
  EXPECT_EQ(::testing::internal::GetCapturedStderr(), line + line);
}

TEST_F(FloodModelTest, SimulationPeriod) {
  struct Case {
    double start, end;
    float step;
    const char* steps;
  };
  constexpr double kInfinite = std::numeric_limits<double>::infinity();
  for (const Case& it :
       {Case{46102.25, 46102.75, 3, "14400"}, Case{46102.25, 46102.25, 3, "0"},
        Case{100, 100 + 100.4 / 86400, 10, "10"}, Case{100, 100 + 99.6 / 86400, 10, "10"},
        Case{100, 100 + 99.4 / 86400, 10, "9"}, Case{100, 101, 7, "12342"}, Case{101, 100, 10, "-8639"},
        // Day -1.25 is 06:00 of the day before day 0, -0.75 is 18:00 of day 0.
        Case{-1.25, 0, 3600, "18"}, Case{-1.75, -1.25, 3600, "-11"}, Case{-0.75, 1, 3600, "6"},
        Case{-0.000001, 1, 3600, "24"}, Case{0, 1, 0, "2147483646"}, Case{0, 0, -1, "0"},
        Case{0, kInfinite, 1, "2147483646"}, Case{0, std::nan(""), 1, "0"}}) {
    flood.SetSimulationPeriod({it.start, 0}, {it.end, 1}, it.step);
    EXPECT_EQ(flood.global("SIMULATION_PERIOD/Number_Of_Timesteps"), it.steps) << it.start << ' ' << it.end;
  }
  flood.SetSimulationPeriod({46102.25, 0}, {46102.75, 0}, 0.5F);
  EXPECT_EQ(flood.global("SIMULATION_PERIOD/Start_Time"), "2026 3 21 6 0 0");
  EXPECT_EQ(flood.global("SIMULATION_PERIOD/Time_Step_Interval"), "0.5");
  EXPECT_EQ(flood.global("SIMULATION_PERIOD/Number_Of_Timesteps"), "86400");
  EXPECT_EQ(flood.root().simulationPeriod->noPointsInTime, 86401);
  flood.SetSimulationPeriod({46102.25, 1}, {46102.75, 0}, 0.5F);
  EXPECT_FALSE(flood.root().simulationPeriod->start.valid());
}

TEST_F(FloodModelTest, DryingAndFlooding) {
  flood.setDryingFloodingDepth(0.002F, 0.003F);
  EXPECT_EQ(flood.global("FLOOD_AND_DRY/Enable_Flood_And_Dry_Checking"), "1");
  EXPECT_EQ(flood.global("FLOOD_AND_DRY/Drying_Depth"), "0.002");
  EXPECT_EQ(flood.global("FLOOD_AND_DRY/Flooding_Depth"), "0.003");
}

TEST_F(FloodModelTest, CoarseGridAndItsProjection) {
  struct Case {
    const char* inFile;
    const char* stored;
    const char* before = "";
    bool stale = false;
  };
  for (const Case& it : {Case{"UTM-33", "UTM-33"}, Case{"UTM", "UTM-32"}, Case{"", "Local Coordinates"},
                         Case{"UTM-33", "UTM-31", "UTM-31"}, Case{"UTM-33", "UTM-33", "UTM-31", true},
                         Case{"", "Local Coordinates", "UTM-31"}}) {
    Script<Flooding_V27FlowModel> script;
    script.root().bathymetry->projection = it.before;
    script.root().bathymetry->projectionStale = it.stale;
    script.root().bathymetry->coriolis = true;
    script.setCoarseBathymetryFile(grid("grid.tsb2", it.inFile));
    EXPECT_EQ(script.root().bathymetry->projection, it.stored) << it.inFile << " over " << it.before;
    EXPECT_FALSE(script.root().bathymetry->projectionStale);
    EXPECT_FALSE(script.root().bathymetry->coriolis);
    EXPECT_EQ(script.root().bathymetry->GetItem(1)->noK, 8);
    EXPECT_EQ(script.getCoarseBathymetryFile(), folder.file("grid.tsb2"));
    EXPECT_EQ(script.shown, Strings());
  }
  // The zone is that of the longitude.
  test::GridSpec west;
  west.geography = TsbGeography{"UTM", -75, 40, 0};
  flood.setCoarseBathymetryFile(grid("west.tsb2", "", west));
  EXPECT_EQ(flood.global("BATHYMETRY_SELECTION/Projection"), "UTM-18");
  // What can't be read is stored and told by nobody; its place is unknown, and the grid empty.
  for (const std::string& wrong :
       {folder.file("none.tsb2"), folder.write("text.tsb2", "no grid"), std::string()}) {
    flood.setCoarseBathymetryFile(wrong);
    EXPECT_EQ(flood.getCoarseBathymetryFile(), wrong);
    EXPECT_EQ(flood.global("BATHYMETRY_SELECTION/Projection"), "Local Coordinates");
    EXPECT_EQ(flood.root().bathymetry->GetItem(1)->noJ, 0);
  }
  EXPECT_EQ(flood.shown, Strings());
}

TEST_F(FloodModelTest, WithoutAnAreaTheGridThrows) {
  flood.root().bathymetry->SetNoAreas(0);
  EXPECT_THROW(flood.setCoarseBathymetryFile("grid.tsb2"), std::invalid_argument);
  EXPECT_THROW(flood.getCoarseBathymetryFile(), std::invalid_argument);
  flood.setEddyViscosity_IncludedWithDefaultValue();
  EXPECT_NEAR(flood.root().nhdEddyViscosity->at(1).constantValue, 0.02 / 30, 1e-9);
}

TEST_F(FloodModelTest, OverlandSolver) {
  flood.setFineBathymetryFile("/no/such/fine.tsb2");
  EXPECT_EQ(flood.getFineBathymetryFile(), "/no/such/fine.tsb2");
  EXPECT_EQ(flood.global("BATHYMETRY_SELECTION/Overland_Filename"), "/no/such/fine.tsb2");
  for (const auto& [option, stored] :
       {std::pair(1, "#true"), {2, "#false"}, {1, "#true"}, {-1, "#false"}, {1, "#true"}, {0, "#false"}}) {
    flood.setOverlandSolverOption(option);
    EXPECT_EQ(flood.global("BATHYMETRY_SELECTION/Overland_Solver"), stored) << option;
  }
}

TEST_F(FloodModelTest, ResistanceAndStartingSurface) {
  const Strings keywords{"Data_Format", "Constant_Value", "File_Name", "Item_Numbers"};
  flood.root().nhdResistance->formulation = 2;
  flood.root().nhdResistance->SetCount(3);
  flood.setResistance_Value(25.1);
  EXPECT_EQ(flood.root().nhdResistance->GetCount(), 1);
  EXPECT_EQ(flood.flow("RESISTANCE/Formulation"), "0");
  EXPECT_EQ(flood.flow("RESISTANCE/AREA_1", keywords),
            "Data_Format=1 Constant_Value=25.1 File_Name= Item_Numbers=1");
  flood.root().nhdResistance->formulation = 1;
  flood.root().nhdResistance->SetCount(0);
  flood.setResistance_File("/rough.tsb2", 3);
  EXPECT_EQ(flood.flow("RESISTANCE/Formulation"), "0");
  EXPECT_EQ(flood.flow("RESISTANCE/AREA_1", keywords),
            "Data_Format=2 Constant_Value=32.0 File_Name=/rough.tsb2 Item_Numbers=3");

  const Strings surface{"Type", "Constant_Value", "File_Name", "Item_Numbers"};
  flood.root().nhdSurfaceElevation->SetCount(2);
  flood.setInitialCondition_File("/level.tsb2", 2);
  EXPECT_EQ(flood.root().nhdSurfaceElevation->GetCount(), 1);
  EXPECT_EQ(flood.flow("SURFACE_ELEVATION/AREA_1", surface),
            "Type=2 Constant_Value=0.0 File_Name=/level.tsb2 Item_Numbers=2");
  flood.setInitialCondition_Value(-0.3);
  EXPECT_EQ(flood.flow("SURFACE_ELEVATION/AREA_1", surface),
            "Type=1 Constant_Value=-0.3 File_Name=/level.tsb2 Item_Numbers=2");
}

TEST_F(FloodModelTest, BoundaryCount) {
  EXPECT_EQ(flood.global("OPEN_BOUNDARY/Default_Position"), "1");
  flood.setNoOfBndCondition(-1);
  EXPECT_EQ(flood.global("OPEN_BOUNDARY/Default_Position"), "0");
  EXPECT_EQ(flood.getNoOfBndConditions(), 0);
  flood.setNoOfBndCondition(3);
  flood.setHDBndCondition_Value(1, 1, 2, 3, 4, 2, 5);
  flood.setNoOfBndCondition(2);
  EXPECT_EQ(flood.getNoOfBndConditions(), 2);
  EXPECT_EQ(flood.root().nhdBoundary->GetCount(), 2);
  EXPECT_EQ(flood.flow("OPEN_BOUNDARY/BOUNDARY_1/Value"), "5.0");
  flood.setNoOfBndCondition(-7);
  EXPECT_EQ(flood.getNoOfBndConditions(), 2);
  flood.setNoOfBndCondition(0);
  EXPECT_EQ(flood.root().nhdBoundary->GetCount(), 0);
}

TEST_F(FloodModelTest, HugeCountsAreRefused) {
  constexpr int kHuge = std::numeric_limits<int>::max();
  EXPECT_THROW(flood.setNoOfBndCondition(kHuge), std::invalid_argument);
  EXPECT_THROW(flood.setNoOfBndCondition(scripting::kMostObjects + 1), std::invalid_argument);
  EXPECT_THROW(flood.setNoOfSourceSink(kHuge), std::invalid_argument);
  EXPECT_EQ(flood.getNoOfBndConditions() + flood.getNoOfSourceSink(), 0);
  EXPECT_EQ(flood.global("OPEN_BOUNDARY/Default_Position"), "1");
}

TEST_F(FloodModelTest, BoundaryValues) {
  const Strings keywords{"Formulation", "Data_Format", "Value", "FAB_Type"};
  const std::string first = "OPEN_BOUNDARY/BOUNDARY_1";
  flood.setNoOfBndCondition(1);
  flood.setCoarseBathymetryFile(grid("grid.tsb2"));
  const std::string before = saved(flood);
  for (const int index : {0, 2, -1, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()}) {
    flood.setHDBndCondition_Value(index, 9, 9, 9, 9, 9, 9);
    flood.setHDBndCondition_File(index, 9, 9, 9, 9, 9, 5, "file", 9);
  }
  EXPECT_EQ(saved(flood), before);
  EXPECT_EQ(flood.shown, Strings());

  flood.root().nhdBoundary->at(1).fabType = 1;
  flood.setHDBndCondition_Value(1, 0, 1, 2, 3, 2, 1.5);
  EXPECT_EQ(flood.global(first + "/First_Point"), "0 1");
  EXPECT_EQ(flood.global(first + "/Last_Point"), "2 3");
  EXPECT_EQ(flood.flow(first, keywords), "Formulation=2 Data_Format=1 Value=1.5 FAB_Type=1");
  flood.root().nhdBoundary->at(1).dataFormat = 4;
  flood.setHDBndCondition_Value(1, 0, 1, 2, 3, 1, 0.1);
  EXPECT_EQ(flood.flow(first, keywords), "Formulation=1 Data_Format=1 Value=0.1 FAB_Type=12");
}

TEST_F(FloodModelTest, BoundaryFiles) {
  struct Case {
    int before, format;
    const char* stored;
    std::size_t itemsBefore = 2;
  };
  const Strings keywords{"Data_Format", "FAB_Type", "File_Name", "Item_Numbers"};
  for (const Case& it : {Case{1, 2, "Data_Format=2 FAB_Type=12 File_Name=/f Item_Numbers=7 2"},
                         Case{2, 1, "Data_Format=1 FAB_Type=12 File_Name=/f Item_Numbers=7 2"},
                         Case{1, 3, "Data_Format=3 FAB_Type=12 File_Name=/f Item_Numbers=7"},
                         Case{3, 4, "Data_Format=4 FAB_Type=12 File_Name=/f Item_Numbers=7"},
                         Case{3, 7, "Data_Format=7 FAB_Type=1 File_Name=/f Item_Numbers=7"},
                         Case{1, 6, "Data_Format=6 FAB_Type=1 File_Name=/f Item_Numbers=7 2"},
                         Case{4, 4, "Data_Format=4 FAB_Type=1 File_Name=/f Item_Numbers=7 2"},
                         Case{5, 3, "Data_Format=3 FAB_Type=12 File_Name=/f Item_Numbers=7", 0}}) {
    flood.setNoOfBndCondition(0);
    flood.setNoOfBndCondition(1);
    CNhdBoundaryObjectKvs& condition = flood.root().nhdBoundary->at(1);
    condition.dataFormat = it.before;
    condition.fabType = 1;
    condition.dataFile.SetNoItems(static_cast<int>(it.itemsBefore));
    flood.setHDBndCondition_File(1, 4, 3, 2, 1, 2, it.format, "/f", 7);
    EXPECT_EQ(flood.flow("OPEN_BOUNDARY/BOUNDARY_1", keywords), it.stored) << it.before;
    EXPECT_EQ(flood.flow("OPEN_BOUNDARY/BOUNDARY_1/Formulation"), "2");
    EXPECT_EQ(flood.global("OPEN_BOUNDARY/BOUNDARY_1/First_Point"), "4 3");
    EXPECT_EQ(flood.global("OPEN_BOUNDARY/BOUNDARY_1/Last_Point"), "2 1");
  }
  // Transfer data have no item to take the number; all else is set by then.
  for (const int before : {1, 5}) {
    flood.setNoOfBndCondition(0);
    flood.setNoOfBndCondition(1);
    if (before == 5) flood.root().nhdBoundary->at(1).SetDataFormat(5);
    EXPECT_THROW(flood.setHDBndCondition_File(1, 4, 3, 2, 1, 2, 5, "/t", 7), std::invalid_argument);
    EXPECT_EQ(flood.flow("OPEN_BOUNDARY/BOUNDARY_1", keywords),
              "Data_Format=5 FAB_Type=2 File_Name=/t Item_Numbers=");
    EXPECT_EQ(flood.flow("OPEN_BOUNDARY/BOUNDARY_1/Formulation"), "2");
    EXPECT_EQ(flood.global("OPEN_BOUNDARY/BOUNDARY_1/First_Point"), "4 3");
  }
}

TEST_F(FloodModelTest, BoundariesAreGivenBack) {
  int j1 = -1, k1 = -1, j2 = -1, k2 = -1, formulation = -1, format = -1, item = -1;
  double value = -1;
  std::string file = "old";
  const auto get = [&](int index) {
    flood.getHDBndCondition(index, j1, k1, j2, k2, formulation, format, value, file, item);
    return std::array{j1, k1, j2, k2, formulation, format, item};
  };
  flood.setNoOfBndCondition(2);
  flood.setHDBndCondition_Value(1, 1, 2, 3, 4, 2, 0.5);
  flood.setHDBndCondition_File(2, 5, 6, 7, 8, 1, 3, "/tide.tsb0", 4);
  for (const int index : {0, 3, -1}) EXPECT_EQ(get(index), (std::array{-1, -1, -1, -1, -1, -1, -1}));
  EXPECT_EQ(get(1), (std::array{1, 2, 3, 4, 2, 1, -1}));
  EXPECT_EQ(value, 0.5);
  EXPECT_EQ(file, "old");
  EXPECT_EQ(get(2), (std::array{5, 6, 7, 8, 1, 3, 4}));
  EXPECT_EQ(value, 0.5);
  EXPECT_EQ(file, "/tide.tsb0");
  flood.root().nhdBoundary->at(2).SetDataFormat(5);
  item = -1;
  EXPECT_EQ(get(2), (std::array{5, 6, 7, 8, 1, 5, -1}));
}

TEST_F(FloodModelTest, SourceCount) {
  flood.setNoOfSourceSink(-1);
  EXPECT_EQ(flood.getNoOfSourceSink(), 0);
  flood.setNoOfSourceSink(3);
  flood.setNoOfSourceSink(-1);
  EXPECT_EQ(flood.getNoOfSourceSink(), 3);
  EXPECT_EQ(flood.root().nhdSourceSink->GetCount(), 3);
  EXPECT_EQ(flood.global("SOURCE_AND_SINK/SOURCE_SINK_3/Source_Area"), "1");
  EXPECT_EQ(flood.global("SOURCE_AND_SINK/SOURCE_SINK_3/Sink_Area"), "1");
  flood.setNoOfSourceSink(1);
  EXPECT_EQ(flood.root().nhdSourceSink->GetCount(), 1);
}

TEST_F(FloodModelTest, Sources) {
  const Strings keywords{"Outlet_Dir",        "Data_Format", "Constant_Magnitude",
                         "Constant_Velocity", "File_Name",   "Item_Numbers"};
  const std::string first = "SOURCE_AND_SINK/SOURCE_SINK_1";
  const auto place = [&] {
    std::string all;
    for (const char* keyword : {"Type", "Source_Point", "Sink_Point", "Source_Area", "Sink_Area"})
      all += flood.global(first + "/" + keyword) + ", ";
    return all;
  };
  const auto otherArea = [&] {
    flood.root().sourceSink->at(1).sourceArea = 2;
    flood.root().sourceSink->at(1).sinkArea = 3;
  };
  flood.setCoarseBathymetryFile(grid("grid.tsb2"));
  flood.setNoOfSourceSink(1);
  const std::string before = saved(flood);
  for (const int index : {0, 2, -1}) {
    flood.setHDSourceSink_Value(index, 1, 9, 9, 9, 9, 9, 9, 9);
    flood.setHDSourceSink_File(index, 1, 9, 9, 9, 9, "/f", 9, 9, 9);
    flood.setHDSourceSink_FileEx(index, 1, 9, 9, 9, 9, "/f", 9, 9, 9);
  }
  EXPECT_EQ(saved(flood), before);

  otherArea();
  flood.setHDSourceSink_Value(1, 2, 1, 2, 3, 4, 4.5, 0.5, 180);
  EXPECT_EQ(place(), "2, 1 2, 3 4, 2, 3, ");
  EXPECT_EQ(flood.flow(first, keywords),
            "Outlet_Dir=180.0 Data_Format=0 Constant_Magnitude=4.5 Constant_Velocity=0.5 File_Name= "
            "Item_Numbers=1 2");
  flood.setHDSourceSink_File(1, 1, 5, 6, 7, 8, "/f.tsb0", 90, 3, 4);
  EXPECT_EQ(place(), "1, 5 6, 7 8, 1, 1, ");
  EXPECT_EQ(flood.flow(first, keywords),
            "Outlet_Dir=90.0 Data_Format=1 Constant_Magnitude=4.5 Constant_Velocity=0.5 File_Name= "
            "Item_Numbers=3 4");
  otherArea();
  flood.root().nhdSourceSink->at(1).dataFile.fileName = "/kept.tsb0";
  flood.setHDSourceSink_FileEx(1, 0, 1, 1, 2, 2, "/f.tsb0", 7, 8, 9);
  EXPECT_EQ(place(), "0, 1 1, 2 2, 1, 1, ");
  EXPECT_EQ(flood.flow(first, keywords),
            "Outlet_Dir=90.0 Data_Format=2 Constant_Magnitude=4.5 Constant_Velocity=0.5 File_Name=/kept.tsb0 "
            "Item_Numbers=7 8 9");
}

TEST_F(FloodModelTest, SourcesAreGivenBack) {
  int type = -1, format = -1, j1 = -1, k1 = -1, j2 = -1, k2 = -1;
  std::array<int, 3> items{-1, -1, -1};
  double magnitude = -1, velocity = -1, direction = -1;
  std::string file = "old";
  const auto get = [&](int index) {
    items = {-1, -1, -1};
    flood.getHDSourceSink(index, type, format, j1, k1, j2, k2, magnitude, velocity, direction, file, items[0],
                          items[1], items[2]);
    return std::array{type, format, j1, k1, j2, k2, items[0], items[1], items[2]};
  };
  flood.setNoOfSourceSink(1);
  for (const int index : {0, 2}) EXPECT_EQ(get(index), (std::array{-1, -1, -1, -1, -1, -1, -1, -1, -1}));
  EXPECT_EQ(magnitude, -1);
  flood.setHDSourceSink_Value(1, 2, 1, 2, 3, 4, 4.5, 0.5, 180);
  EXPECT_EQ(get(1), (std::array{2, 0, 1, 2, 3, 4, 1, 2, -1}));
  EXPECT_EQ((std::array{magnitude, velocity, direction}), (std::array{4.5, 0.5, 180.0}));
  flood.setHDSourceSink_FileEx(1, 0, 1, 1, 2, 2, "/f.tsb0", 7, 8, 9);
  EXPECT_EQ(get(1), (std::array{0, 2, 1, 1, 2, 2, 7, 8, 9}));
  flood.setHDSourceSink_File(1, 0, 1, 1, 2, 2, "/f.tsb0", 10, 5, 6);
  flood.root().nhdSourceSink->at(1).dataFile.fileName = "/there.tsb0";
  EXPECT_EQ(get(1), (std::array{0, 1, 1, 1, 2, 2, 5, 6, -1}));
  for (const int count : {0, 1, 4}) {
    flood.root().nhdSourceSink->at(1).dataFile.SetNoItems(count);
    EXPECT_EQ(get(1), (std::array{0, 1, 1, 1, 2, 2, -1, -1, -1})) << count;
  }
  EXPECT_EQ(file, "old");
}

TEST_F(FloodModelTest, EddyViscosity) {
  const auto state = [&] {
    return flood.flow("EDDY_VISCOSITY", {"Data_Format", "Formulation", "AREA_1/Constant_Value"});
  };
  EXPECT_EQ(state(), "Data_Format=0 Formulation=1 AREA_1/Constant_Value=0.0");
  flood.SetSimulationPeriod({100, 0}, {101, 0}, 2);
  flood.root().nhdEddyViscosity->SetCount(2);
  flood.setEddyViscosity_IncludedWithDefaultValue();
  EXPECT_EQ(flood.root().nhdEddyViscosity->GetCount(), 1);
  EXPECT_EQ(state(), "Data_Format=1 Formulation=0 AREA_1/Constant_Value=0.01");
  test::GridSpec spec;
  spec.dx = 20;
  spec.dy = 50;
  flood.setCoarseBathymetryFile(grid("grid.tsb2", "", spec));
  flood.setEddyViscosity_IncludedWithDefaultValue();
  EXPECT_EQ(state(), "Data_Format=1 Formulation=0 AREA_1/Constant_Value=10.0");
  flood.setEddyViscosity_Value(0.25, 1);
  EXPECT_EQ(state(), "Data_Format=1 Formulation=1 AREA_1/Constant_Value=0.25");
  flood.setEddyViscosity_NotIncluded();
  EXPECT_EQ(state(), "Data_Format=0 Formulation=1 AREA_1/Constant_Value=0.25");
}

TEST_F(FloodModelTest, Rain) {
  const auto state = [&] {
    return flood.flow("SOURCE_AND_SINK", {"NetPrecipitation", "RainOnDryLand", "Precipitation",
                                          "Precipitation/File_Name", "Precipitation/Item_Numbers"});
  };
  const auto typeOnFile = [&] {
    const std::string text = saved(flood);
    const std::size_t at = text.find("PrecipitationType ");
    return at == std::string::npos ? "none" : text.substr(at + 18, text.find('\n', at) - at - 18);
  };
  flood.root().nhdSourceSink->rainOnDryLand = false;
  for (const auto& [type, onFile] :
       {std::pair(0, "-1"), {1, "0"}, {2, "2"}, {3, "none"}, {7, "none"}, {-1, "none"}}) {
    flood.setRain_File("/rain.tsb0", type, 3);
    EXPECT_EQ(state(),
              "NetPrecipitation=#true RainOnDryLand=#true Precipitation=0.0 "
              "Precipitation/File_Name=/rain.tsb0 Precipitation/Item_Numbers=3");
    EXPECT_EQ(typeOnFile(), onFile) << type;
  }
  flood.root().nhdSourceSink->rainOnDryLand = false;
  flood.setRain_Value(12.5);
  EXPECT_EQ(state(),
            "NetPrecipitation=#false RainOnDryLand=#true Precipitation=12.5 "
            "Precipitation/File_Name=/rain.tsb0 Precipitation/Item_Numbers=3");
  EXPECT_EQ(typeOnFile(), "-1");
}

TEST_F(FloodModelTest, DeepestFlood) {
  flood.setOutput_MaximumFloodDepthAndExtend("/deepest.tsb2", 60);
  EXPECT_EQ(flood.flow("OUTPUT_SPECIFICATION/INUNDATION_STATISTICS",
                       {"IncludeInundationStatistics", "InundationFileName", "InundationFileStoreStep"}),
            "IncludeInundationStatistics=#true InundationFileName=/deepest.tsb2 InundationFileStoreStep=60");
}

// What a script is given of an output.
struct Given {
  int type = -1, useSubArea = -1, firstJ = -1, firstK = -1, lastJ = -1, lastK = -1;
  std::vector<double> pointsJ{-1}, pointsK{-1};
  int usePeriod = -1;
  DateTime first{-1, 1}, last{-1, 1};
  int frequency = -1;
  std::string file, title;
  std::vector<int> items;

  void next(Flooding_V27FlowModel& script, OutputPosition& position) {
    script.GetNextOutputs_MapsJKAndTS(position, type, useSubArea, firstJ, firstK, lastJ, lastK, pointsJ,
                                      pointsK, usePeriod, first, last, frequency, file, title, items);
  }
  std::array<int, 5> area() const { return {useSubArea, firstJ, firstK, lastJ, lastK}; }
};

TEST_F(FloodModelTest, OutputsAreAppendedWhole) {
  const std::string first = "OUTPUT_SPECIFICATION/OUTPUT_AREA_1";
  flood.SetSimulationPeriod({100, 0}, {101, 0}, 60);
  flood.setCoarseBathymetryFile(grid("grid.tsb2"));
  flood.AddOutput_MapsAndTimeSeriesJK(0, 0, 1, 2, 3, 4, {7}, {8}, 0, {}, {}, 0, "/out.tsb2", "Maps", {4, 1});
  EXPECT_EQ(flood.flow("OUTPUT_SPECIFICATION/Number_Of_Output_areas"), "1");
  EXPECT_EQ(flood.flow(first, {"Type", "X_Range_And_Interval", "Y_Range_And_Interval", "Area_no",
                               "First_Time_Step", "Last_Time_Step", "Time_Step_interval", "Output_item",
                               "ITEM_NUMBERS", "Title", "File_Name"}),
            "Type=2 X_Range_And_Interval=0 9 1 Y_Range_And_Interval=0 7 1 Area_no=1 First_Time_Step=0 "
            "Last_Time_Step=1440 Time_Step_interval=1 Output_item=2 ITEM_NUMBERS=4 1 Title=Maps "
            "File_Name=/out.tsb2");
  flood.AddOutput_MapsAndTimeSeriesJK(0, 1, 1, 2, 3, 4, {}, {}, 1, {100.25, 0}, {100.5, 0}, 15, "", "", {});
  EXPECT_EQ(flood.flow("OUTPUT_SPECIFICATION/OUTPUT_AREA_2",
                       {"X_Range_And_Interval", "Y_Range_And_Interval", "First_Time_Step", "Last_Time_Step",
                        "Time_Step_interval", "Output_item"}),
            "X_Range_And_Interval=1 3 1 Y_Range_And_Interval=2 4 1 First_Time_Step=360 Last_Time_Step=720 "
            "Time_Step_interval=15 Output_item=0");
  flood.AddOutput_MapsAndTimeSeriesJK(1, 1, 1, 2, 3, 4, {1, 2}, {3, 4}, 0, {}, {}, -5, "/g.tsb0", "", {1});
  EXPECT_EQ(
      flood.flow("OUTPUT_SPECIFICATION/OUTPUT_AREA_3", {"Type", "Number_Of_Points", "X_Range_And_Interval",
                                                        "Y_Range_And_Interval", "Time_Step_interval"}),
      "Type=0 Number_Of_Points=2 X_Range_And_Interval=1.0 2.0 Y_Range_And_Interval=3.0 4.0 "
      "Time_Step_interval=1");
  EXPECT_EQ(flood.shown, Strings());
  flood.ClearHDResultOutputs();
  EXPECT_EQ(flood.flow("OUTPUT_SPECIFICATION/Number_Of_Output_areas"), "0");
  EXPECT_FALSE(flood.GetOutputsListHeadPos());
}

TEST_F(FloodModelTest, PointsNeedBothLists) {
  for (const auto& [pointsJ, pointsK] :
       {std::pair(std::vector<double>{3}, std::vector<double>{}), {{}, {3}}, {{}, {}}}) {
    flood.AddOutput_MapsAndTimeSeriesJK(1, 0, 0, 0, 0, 0, pointsJ, pointsK, 0, {}, {}, 1, "", "", {1});
    const CNhdResultObjectKvs& output =
        flood.root().nhdResult->outputs.at(flood.root().nhdResult->outputs.GetCount());
    EXPECT_EQ(output.pointsJ, std::vector<double>{0});
    EXPECT_EQ(output.pointsK, std::vector<double>{0});
  }
}

TEST_F(FloodModelTest, AnotherTypeIsToldAndStaysAMap) {
  flood.AddOutput_MapsAndTimeSeriesJK(2, 1, 1, 2, 3, 4, {1}, {1}, 0, {}, {}, 1, "/f.tsb2", "", {1});
  EXPECT_EQ(flood.shown, Strings{"Unsupported output type"});
  EXPECT_EQ(flood.flow("OUTPUT_SPECIFICATION/OUTPUT_AREA_1",
                       {"Type", "X_Range_And_Interval", "Y_Range_And_Interval", "File_Name"}),
            "Type=2 X_Range_And_Interval=1 3 1 Y_Range_And_Interval=2 4 1 File_Name=/f.tsb2");
}

TEST_F(FloodModelTest, StepsOfAPeriod) {
  struct Case {
    float step;
    double first, last;
    int firstStep, lastStep;
  };
  for (const Case& it :
       {Case{10, 100, 100.5, 0, 4320}, Case{7, 100, 101, 0, 12342},
        Case{10, 100 + 19.6 / 86400, 100 + 29.4 / 86400, 2, 2}, Case{10, 99, 102, -8639, 17280}}) {
    flood.SetSimulationPeriod({100, 0}, {101, 0}, it.step);
    flood.ClearHDResultOutputs();
    flood.AddOutput_MapsAndTimeSeriesJK(0, 0, 0, 0, 0, 0, {}, {}, 1, {it.first, 0}, {it.last, 0}, 1, "", "",
                                        {});
    const USubLine& steps = flood.root().nhdResult->outputs.at(1).steps;
    EXPECT_EQ((std::pair(steps.first, steps.last)), (std::pair(it.firstStep, it.lastStep))) << it.first;
  }
}

TEST_F(FloodModelTest, OutputsAreGivenBack) {
  flood.SetSimulationPeriod({100, 0}, {101, 0}, 60);
  flood.setCoarseBathymetryFile(grid("grid.tsb2"));
  flood.AddOutput_MapsAndTimeSeriesJK(0, 0, 0, 0, 0, 0, {}, {}, 0, {}, {}, 1, "/m.tsb2", "Maps", {4, 1});
  flood.AddOutput_MapsAndTimeSeriesJK(0, 1, 1, 2, 3, 4, {}, {}, 1, {100.25, 0}, {100.5, 0}, 15, "", "", {});
  flood.AddOutput_MapsAndTimeSeriesJK(1, 0, 0, 0, 0, 0, {1, 2}, {3, 4}, 0, {}, {}, 5, "/p.tsb0", "", {1});
  OutputPosition position = flood.GetOutputsListHeadPos();
  EXPECT_EQ(position.number, 1);

  Given given;
  given.next(flood, position);
  EXPECT_EQ(given.type, 0);
  EXPECT_EQ(given.area(), (std::array{0, -1, -1, -1, -1}));
  EXPECT_EQ(given.pointsJ, std::vector<double>{-1});
  EXPECT_EQ(given.usePeriod, 0);
  EXPECT_EQ(given.frequency, -1);
  EXPECT_EQ(given.first, (DateTime{-1, 1}));
  EXPECT_EQ(given.file + given.title, "/m.tsb2Maps");
  EXPECT_EQ(given.items, (std::vector<int>{4, 1}));

  given.next(flood, position);
  EXPECT_EQ(given.area(), (std::array{1, 1, 2, 3, 4}));
  EXPECT_EQ(given.usePeriod, 1);
  EXPECT_EQ(given.frequency, 15);
  EXPECT_EQ(given.first, (DateTime{100.25, 0}));
  EXPECT_EQ(given.last, (DateTime{100.5, 0}));
  EXPECT_EQ(given.items, std::vector<int>());

  given = {};
  given.next(flood, position);
  EXPECT_EQ(given.type, 1);
  EXPECT_EQ(given.area(), (std::array{-1, -1, -1, -1, -1}));
  EXPECT_EQ(given.pointsJ, (std::vector<double>{1, 2}));
  EXPECT_EQ(given.pointsK, (std::vector<double>{3, 4}));
  EXPECT_EQ(given.usePeriod, 1);
  EXPECT_EQ(given.last, (DateTime{101, 0}));
  EXPECT_FALSE(position);
  EXPECT_THROW(given.next(flood, position), std::invalid_argument);
  for (const int number : {4, -1, std::numeric_limits<int>::max()}) {
    OutputPosition nowhere{number};
    EXPECT_THROW(given.next(flood, nowhere), std::invalid_argument);
  }
}

TEST_F(FloodModelTest, OutputsOfOtherShapesAreGivenBack) {
  flood.SetSimulationPeriod({-1.25, 0}, {2, 0}, 0.1F);
  flood.AddOutput_MapsAndTimeSeriesJK(0, 0, 0, 0, 0, 0, {}, {}, 0, {}, {}, 1, "", "", {});
  CNhdResultObjectKvs& output = flood.root().nhdResult->outputs.at(1);
  const auto get = [&] {
    Given given;
    OutputPosition position = flood.GetOutputsListHeadPos();
    given.next(flood, position);
    return given;
  };
  // A grid that has not been read has its ends at -1.
  EXPECT_EQ(get().useSubArea, 0);
  output.part = {{5, -1, 1}, {6, -1, 1}};
  EXPECT_EQ(get().useSubArea, 0);
  output.part = {{0, -1, 1}, {0, 3, 1}};
  EXPECT_EQ(get().area(), (std::array{1, 0, 0, -1, 3}));
  // Moments are cut to the second, their steps in single precision.
  output.steps = {1, 16, 1};
  EXPECT_EQ(get().first, (DateTime{-1.25, 0}));
  EXPECT_NEAR(get().last.day, -1.25 - 1.0 / 86400, 1e-9);
  output.type = CNhdResultObjectKvs::kLine;
  const Given line = get();
  EXPECT_EQ(line.type, -1);
  EXPECT_EQ(line.area(), (std::array{-1, -1, -1, -1, -1}));
  EXPECT_EQ(line.frequency, 1);
  EXPECT_EQ(flood.shown, Strings{"Unsupported output type"});
  // A message box that throws does so when the output has been given.
  output.title = "a line";
  ShowMessagesWith(flood, [](const std::string& text) { throw std::runtime_error(text); });
  Given given;
  OutputPosition position = flood.GetOutputsListHeadPos();
  EXPECT_THROW(given.next(flood, position), std::runtime_error);
  EXPECT_EQ(given.title, "a line");
  EXPECT_FALSE(position);
}

TEST_F(FloodModelTest, CopiesShareTheModel) {
  Flooding_V27FlowModel first;
  {
    Flooding_V27FlowModel second;
    second.setNoOfBndCondition(4);
    first = second;
    second.setNoOfBndCondition(5);
  }
  EXPECT_EQ(first.getNoOfBndConditions(), 5);
  const Flooding_V27FlowModel& itself = first;
  first = itself;
  EXPECT_EQ(first.getNoOfBndConditions(), 5);
}

// What one class makes, the members of another one drive.
TEST_F(FloodModelTest, ClassesHaveOneModelInCommon) {
  static_assert(sizeof(Flooding_V27FlowModel) == sizeof(Flooding_V27WSKFlowModel));
  static_assert(sizeof(Flooding_V27FlowModel) == sizeof(UrbanFlooding_V27Flowmodel));
  static_assert(sizeof(Flooding_V27FlowModel) == sizeof(std::shared_ptr<ScriptedModel>));
  static_assert(std::is_copy_assignable_v<Flooding_V27WSKFlowModel>);
  Flooding_V27WSKFlowModel shell;
  Script<Flooding_V27FlowModel> driver(shell);
  EXPECT_EQ(saved(driver), kFreshFile);
  driver.setNoOfBndCondition(2);
  UrbanFlooding_V27Flowmodel urban(driver);
  urban.setBndCondition_Value(2, 0, 1, 2, 3, 2, 9);
  EXPECT_EQ(driver.flow("OPEN_BOUNDARY/BOUNDARY_2/Value"), "9.0");
  Flooding_V27WSKFlowModel other;
  other = Flooding_V27WSKFlowModel(driver);
  EXPECT_EQ(Flooding_V27FlowModel(other).getNoOfBndConditions(), 2);
}

TEST_F(FloodModelTest, ObjectsInTwoThreads) {
  const std::string file = grid("grid.tsb2");
  constexpr int kTimes = 4;
  std::array<std::string, 2> texts;
  const auto build = [&](std::size_t which) {
    for (int i = 0; i < kTimes; ++i) {
      Script<Flooding_V27FlowModel> own;
      const std::string setup = folder.file("setup" + std::to_string(which) + ".v27");
      own.SetSimulationPeriod({100, 0}, {101, 0}, 10);
      own.setCoarseBathymetryFile(file);
      own.setNoOfBndCondition(static_cast<int>(which) + 1);
      own.SaveFile(setup);
      own.LoadFile(setup);
      own.SaveFile(setup);
      texts[which] = own.shown.empty() ? test::textOf(setup) : own.shown.front();
    }
  };
  std::thread beside(build, 0);
  build(1);
  beside.join();
  for (const std::size_t which : {0U, 1U}) {
    EXPECT_NE(texts[which].find("Number_Of_Boundaries " + std::to_string(which + 1)), std::string::npos)
        << texts[which];
    EXPECT_NE(texts[which].find("Projection \"UTM-32\""), std::string::npos);
  }
}

// Each member is done as a whole before the next one begins.
TEST_F(FloodModelTest, OneObjectInTwoThreads) {
  constexpr int kTimes = 200;
  const auto append = [&](int item) {
    for (int i = 0; i < kTimes; ++i)
      flood.AddOutput_MapsAndTimeSeriesJK(0, 0, 0, 0, 0, 0, {}, {}, 0, {}, {}, 1, "", "", {item, item});
  };
  std::thread beside(append, 1);
  append(2);
  beside.join();
  std::array<int, 3> found{};
  OutputPosition position = flood.GetOutputsListHeadPos();
  while (position) {
    Given given;
    given.next(flood, position);
    ASSERT_EQ(given.items.size(), 2U);
    ASSERT_EQ(given.items[0], given.items[1]);
    ++found[static_cast<std::size_t>(given.items[0])];
  }
  EXPECT_EQ(found, (std::array{0, kTimes, kTimes}));
}

}  // namespace scripting_flood_model_test
}  // namespace gridbay
