#include <gtest/gtest.h>

#include <array>
#include <stdexcept>
#include <thread>
#include <type_traits>

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/heat_exchange.h"
#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "core/edition.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "tests/scripting/script.h"
#include "tests/support/grids.h"

namespace gridbay {
namespace {

using scripting::CClimateChange_V27;
using scripting::DateTime;

// With the members for classes that derive from it in sight.
class Climate : public test::Script<CClimateChange_V27> {
 public:
  using CClimateChange_V27::GetNoWaterlevel;
  using CClimateChange_V27::GetWaterLevel;
  using CClimateChange_V27::GetWaterLevelBoundaryObject;

  CNhdSourceSinkKvs& flows() { return *root().nhdSourceSink; }
};

class ClimateChange : public ::testing::Test {
 protected:
  test::TemporaryFolder folder;
  Climate climate;
};

// The members of one of the three forcings that are alike.
struct Family {
  using C = CClimateChange_V27;

  const char* name;
  int (C::*noValues)();
  int (C::*getValue)(int, double&);
  int (C::*setValue)(int, double);
  int (C::*noSeries)();
  int (C::*getFile)(int, std::string&, int&);
  int (C::*setFile)(int, std::string);
  int (C::*noGrids)();
  int (C::*getGrid)(int, std::string&, int&);
  int (C::*setGrid)(int, std::string);
  // What they work on, with how the three kinds are stored.
  std::int32_t& (*kind)(Climate&);
  std::array<std::int32_t, 3> kinds;  // constant, series, grid
  float& (*value)(Climate&);
  UTsbSelection& (*file)(Climate&);
};

std::int32_t& precipitationKind(Climate& it) {
  return it.flows().precipitationKind;
}
float& precipitation(Climate& it) {
  return it.flows().precipitation;
}
UTsbSelection& precipitationFile(Climate& it) {
  return it.flows().precipitationFile;
}
std::int32_t& evaporationKind(Climate& it) {
  return it.flows().evaporationKind;
}
float& evaporation(Climate& it) {
  return it.flows().evaporation;
}
UTsbSelection& evaporationFile(Climate& it) {
  return it.flows().evaporationFile;
}
std::int32_t& airFormat(Climate& it) {
  return it.root().nadHeatExchange->airFormat;
}
float& airTemperature(Climate& it) {
  return it.root().nadHeatExchange->airTemperature;
}
UTsbSelection& airFile(Climate& it) {
  return it.root().nadHeatExchange->airFile;
}

const Family kFamilies[] = {
    {"precipitation",
     &CClimateChange_V27::GetNoPrecValues,
     &CClimateChange_V27::GetPrecValues,
     &CClimateChange_V27::SetPrecValues,
     &CClimateChange_V27::GetNoPrecTimeSeries,
     &CClimateChange_V27::GetPrecFileItem,
     &CClimateChange_V27::SetPrecFile,
     &CClimateChange_V27::GetNoPrecGridSeries,
     &CClimateChange_V27::GetPrecGridFileItem,
     &CClimateChange_V27::SetPrecGridFile,
     precipitationKind,
     {0, 1, 2},
     precipitation,
     precipitationFile},
    {"evaporation",
     &CClimateChange_V27::GetNoEvapValues,
     &CClimateChange_V27::GetEvapValues,
     &CClimateChange_V27::SetEvapValues,
     &CClimateChange_V27::GetNoEvapTimeSeries,
     &CClimateChange_V27::GetEvapFileItem,
     &CClimateChange_V27::SetEvapFile,
     &CClimateChange_V27::GetNoEvapGridSeries,
     &CClimateChange_V27::GetEvapGridFileItem,
     &CClimateChange_V27::SetEvapGridFile,
     evaporationKind,
     {0, 1, 2},
     evaporation,
     evaporationFile},
    {"temperature",
     &CClimateChange_V27::GetNoTempValues,
     &CClimateChange_V27::GetTempValues,
     &CClimateChange_V27::SetTempValues,
     &CClimateChange_V27::GetNoTempTimeSeries,
     &CClimateChange_V27::GetTempFileItem,
     &CClimateChange_V27::SetTempFile,
     &CClimateChange_V27::GetNoTempGridSeries,
     &CClimateChange_V27::GetTempGridFileItem,
     &CClimateChange_V27::SetTempGridFile,
     airFormat,
     {-1, 0, 2},
     airTemperature,
     airFile},
};

class ForcingFamilies : public ::testing::TestWithParam<const Family*> {
 protected:
  ForcingFamilies() {
    if (isTemperature) climate.root().nadComponent->at(1).type = CNadComponentObjectKvs::kHeatExchange;
  }
  std::array<int, 3> counts() {
    return {(climate.*f.noValues)(), (climate.*f.noSeries)(), (climate.*f.noGrids)()};
  }

  const Family& f = *GetParam();
  const bool isTemperature = std::string_view(f.name) == "temperature";
  Climate climate;
};

TEST_P(ForcingFamilies, CountsWhatThereIs) {
  f.value(climate) = 2.5F;
  f.kind(climate) = f.kinds[0];
  EXPECT_EQ(counts(), (std::array{1, 0, 0}));
  f.kind(climate) = f.kinds[1];
  EXPECT_EQ(counts(), (std::array{0, 1, 0}));
  f.kind(climate) = f.kinds[2];
  EXPECT_EQ(counts(), (std::array{0, 0, 1}));
  f.kind(climate) = 9;
  EXPECT_EQ(counts(), (std::array{0, 0, 0}));
}

// But for the temperature, a constant that is not above 0 is absent.
TEST_P(ForcingFamilies, AConstantOfZero) {
  const int there = isTemperature ? 1 : 0;
  for (const float zero : {0.0F, -1.0F}) {
    f.kind(climate) = f.kinds[0];
    f.value(climate) = zero;
    EXPECT_EQ(counts(), (std::array{there, 0, 0}));
    double value = -9;
    EXPECT_EQ((climate.*f.getValue)(1, value), there);
    EXPECT_EQ(value, there == 1 ? zero : -9);
    EXPECT_EQ((climate.*f.setValue)(1, 5), there);
    EXPECT_EQ(f.value(climate), there == 1 ? 5 : zero);
  }
}

TEST_P(ForcingFamilies, Values) {
  f.kind(climate) = f.kinds[0];
  f.value(climate) = 2.5F;
  double value = -9;
  EXPECT_EQ((climate.*f.getValue)(1, value), 1);
  EXPECT_EQ(value, 2.5);
  value = -9;
  for (const int index : {0, 2, -1}) {
    EXPECT_EQ((climate.*f.getValue)(index, value), 0) << index;
    // With the one temperature the answer is 1 all the same.
    EXPECT_EQ((climate.*f.setValue)(index, 7), isTemperature ? 1 : 0) << index;
  }
  EXPECT_EQ(value, -9);
  EXPECT_EQ(f.value(climate), 2.5F);
  EXPECT_EQ((climate.*f.setValue)(1, 0.1), 1);
  EXPECT_EQ(f.value(climate), 0.1F);
  f.kind(climate) = f.kinds[1];
  EXPECT_EQ((climate.*f.getValue)(1, value), 0);
  EXPECT_EQ((climate.*f.setValue)(1, 7), isTemperature ? 1 : 0);
  EXPECT_EQ(f.value(climate), 0.1F);
}

TEST_P(ForcingFamilies, Files) {
  for (const int kind : {1, 2}) {
    const auto get = kind == 1 ? f.getFile : f.getGrid;
    const auto set = kind == 1 ? f.setFile : f.setGrid;
    f.kind(climate) = f.kinds[static_cast<std::size_t>(kind)];
    UTsbSelection& selection = f.file(climate);
    selection.fileName = "/old";
    selection.items = {3, 4};
    std::string file = "?";
    int item = -9;
    for (const int index : {0, 2, -1}) {
      EXPECT_EQ((climate.*get)(index, file, item), 0);
      EXPECT_EQ((climate.*set)(index, "/new"), 0);
    }
    // Members for the other kind find nothing.
    EXPECT_EQ((climate.*(kind == 1 ? f.getGrid : f.getFile))(1, file, item), 0);
    EXPECT_EQ((climate.*(kind == 1 ? f.setGrid : f.setFile))(1, "/new"), 0);
    EXPECT_EQ(file, "?");
    EXPECT_EQ(item, -9);
    EXPECT_EQ(selection.fileName.text(), "/old");
    EXPECT_EQ((climate.*get)(1, file, item), 1);
    EXPECT_EQ(file, "/old");
    EXPECT_EQ(item, 1);
    EXPECT_EQ((climate.*set)(1, "/no/such/file"), 1);
    EXPECT_EQ(selection.fileName.text(), "/no/such/file");
    EXPECT_EQ(selection.items, std::vector<std::uint32_t>{3});
  }
}

INSTANTIATE_TEST_SUITE_P(Forcings, ForcingFamilies,
                         ::testing::Values(&kFamilies[0], &kFamilies[1], &kFamilies[2]),
                         [](const auto& forcing) { return forcing.param->name; });

TEST_F(ClimateChange, TemperatureIsThatOfJustOneComponent) {
  climate.root().nadHeatExchange->airFormat = -1;
  EXPECT_EQ(climate.GetNoTempValues(), 0);
  EXPECT_EQ(climate.SetTempValues(1, 30), 0);
  climate.root().nadComponent->SetCount(3);
  climate.root().nadComponent->at(2).type = -2;
  EXPECT_EQ(climate.GetNoTempValues(), 1);
  climate.root().nadComponent->at(3).type = -2;
  double value = -9;
  std::string file = "?";
  int item = -9;
  for (const int format : {-1, 0, 2}) {
    climate.root().nadHeatExchange->airFormat = format;
    EXPECT_EQ(climate.GetNoTempValues() + climate.GetNoTempTimeSeries() + climate.GetNoTempGridSeries(), 0);
    EXPECT_EQ(climate.GetTempValues(1, value) + climate.SetTempValues(1, 30), 0);
    EXPECT_EQ(climate.GetTempFileItem(1, file, item) + climate.SetTempFile(1, "/f"), 0);
    EXPECT_EQ(climate.GetTempGridFileItem(1, file, item) + climate.SetTempGridFile(1, "/f"), 0);
  }
  EXPECT_EQ(climate.root().nadHeatExchange->airTemperature, 20);
}

// The Wetland Sweep Kit loads no components.
TEST_F(ClimateChange, TemperatureFromAFile) {
  const std::string setup = folder.write(
      "warm.v27",
      "VANE27_NESTED_MODEL {\nNESTED_MODEL_GLOBALS { MODULE_SELECTION { Simulation_Type 2; } }\n"
      "ADVECTION_DISPERSION_MODULE {\n"
      "COMPONENT_SPECIFICATIONS { No_Of_Components 1; COMPONENT_1 { Component_Description -2; } }\n"
      "COMPONENTS { HEAT_EXCHANGE { AirFormat -1; AirConstantValue 17.5; } }\n"
      "HEAT_EXCHANGE { AirFormat -1; AirConstantValue 17.5; }\n} }\n");
  EXPECT_EQ(climate.OpenFile(setup), 1);
  EXPECT_EQ(climate.GetNoTempValues(), theEdition.wetlandSweepKit ? 0 : 1);
  EXPECT_EQ(climate.SetTempValues(1, 18), theEdition.wetlandSweepKit ? 0 : 1);
}

// Boundaries: a level as constant, a flux, a level as sine series, two as time series, a flux as time series,
// one as line series, one of transfer data.
class WaterLevels : public ClimateChange {
 protected:
  WaterLevels() {
    struct Boundary {
      int formulation;
      int format;
    };
    constexpr Boundary kBoundaries[] = {{1, 1}, {2, 1}, {1, 2}, {1, 3}, {2, 3}, {1, 3}, {1, 4}, {1, 5}};
    climate.root().boundary->SetNoBoundaries(8);
    for (int n = 1; n <= 8; ++n) {
      climate.root().boundary->at(n).Set(n, 0, n, 10 * n);
      at(n).formulation = kBoundaries[n - 1].formulation;
      at(n).SetDataFormat(kBoundaries[n - 1].format);
      at(n).value = static_cast<float>(n);
      at(n).referenceLevel = static_cast<float>(-n);
      at(n).dataFile.fileName = "/f" + std::to_string(n);
    }
  }
  CNhdBoundaryObjectKvs& at(int number) { return climate.root().nhdBoundary->at(number); }

  int place = -9;
  std::string text = "?";
};

TEST_F(WaterLevels, Counts) {
  EXPECT_EQ(climate.GetNoWLValue(), 2);
  EXPECT_EQ(climate.GetNoWLTimeSeries(), 2);
  EXPECT_EQ(climate.GetNoWLLineSeries(), 1);
  for (const auto& [kind, count] : {std::pair(0, 0), {1, 2}, {2, 2}, {3, 1}, {4, 0}})
    EXPECT_EQ(climate.GetNoWaterlevel(kind), count);
  climate.root().boundary->SetNoBoundaries(0);
  EXPECT_EQ(climate.GetNoWaterlevel(1), 0);
}

TEST_F(WaterLevels, NumbersAndLocations) {
  struct Case {
    int kind, index, number;
    const char* location;
  };
  for (const Case& it :
       {Case{1, 1, 1, "(1,0) - (1,10)"}, Case{1, 2, 3, "(3,0) - (3,30)"}, Case{2, 1, 4, "(4,0) - (4,40)"},
        Case{2, 2, 6, "(6,0) - (6,60)"}, Case{3, 1, 7, "(7,0) - (7,70)"}}) {
    EXPECT_EQ(climate.GetWaterLevel(it.kind, it.index, place, text), 1);
    EXPECT_EQ(place, it.number);
    EXPECT_EQ(text, it.location);
    place = -9;
    EXPECT_EQ(climate.GetWaterLevelBoundaryObject(it.kind, it.index, place), 1);
    EXPECT_EQ(place, it.number);
    const auto member = it.kind == 1   ? &CClimateChange_V27::GetWLvalueIDLocation
                        : it.kind == 2 ? &CClimateChange_V27::GetWLTSIDLocation
                                       : &CClimateChange_V27::GetWLLineIDLocation;
    place = -9;
    text.clear();
    EXPECT_EQ((climate.*member)(it.index, place, text), 1);
    EXPECT_EQ(place, it.number);
    EXPECT_EQ(text, it.location);
    place = -9;
    text = "?";
    for (const int index : {0, -1, 3}) EXPECT_EQ((climate.*member)(index, place, text), 0);
    EXPECT_EQ(climate.GetWaterLevelBoundaryObject(it.kind, 3, place), 0);
    EXPECT_EQ(place, -9);
    EXPECT_EQ(text, "?");
  }
}

TEST_F(WaterLevels, Values) {
  double value = -99;
  for (const int index : {0, 3}) {
    EXPECT_EQ(climate.GetWLValue(index, value), 0);
    EXPECT_EQ(climate.SetWLValue(index, 5), 0);
  }
  EXPECT_EQ(value, -99);
  EXPECT_EQ(climate.GetWLValue(1, value), 1);
  EXPECT_EQ(value, 1);
  EXPECT_EQ(climate.GetWLValue(2, value), 1);
  EXPECT_EQ(value, -3);
  EXPECT_EQ(climate.SetWLValue(1, 1.5), 1);
  EXPECT_EQ(climate.SetWLValue(2, 2.5), 1);
  EXPECT_EQ(at(1).value, 1.5F);
  EXPECT_EQ(at(1).referenceLevel, -1);
  EXPECT_EQ(at(3).value, 3);
  EXPECT_EQ(at(3).referenceLevel, 2.5F);
}

TEST_F(WaterLevels, Files) {
  at(6).dataFile.items = {4};
  at(7).dataFile.items = {5};
  EXPECT_EQ(climate.GetWLFileItem(2, text, place), 1);
  EXPECT_EQ(text, "/f6");
  EXPECT_EQ(place, 4);
  EXPECT_EQ(climate.GetWLLineFileItem(1, text, place), 1);
  EXPECT_EQ(text, "/f7");
  EXPECT_EQ(place, 5);
  text = "?";
  place = -9;
  for (const int index : {0, 3}) {
    EXPECT_EQ(climate.GetWLFileItem(index, text, place) + climate.SetWLFile(index, "/x"), 0);
    EXPECT_EQ(climate.GetWLLineFileItem(index, text, place) + climate.SetWLLineFile(index, "/x", 1), 0);
  }
  EXPECT_EQ(text, "?");
  EXPECT_EQ(place, -9);

  at(6).dataFile.items = {4, 5, 6};
  EXPECT_EQ(climate.SetWLFile(2, "/new"), 1);
  EXPECT_EQ(at(6).dataFile.fileName.text(), "/new");
  EXPECT_EQ(at(6).dataFile.items, std::vector<std::uint32_t>{1});
  for (const int item : {0, -1}) EXPECT_EQ(climate.SetWLLineFile(1, "/x", item), 0);
  EXPECT_EQ(at(7).dataFile.fileName.text(), "/f7");
  EXPECT_EQ(climate.SetWLLineFile(1, "/line", 8), 1);
  EXPECT_EQ(at(7).dataFile.fileName.text(), "/line");
  EXPECT_EQ(at(7).dataFile.items, std::vector<std::uint32_t>{8});
  // A selection with no item has nothing to give.
  at(7).dataFile.SetNoItems(0);
  EXPECT_EQ(climate.GetWLLineFileItem(1, text, place), 0);
}

TEST_F(ClimateChange, OpensChangesAndSaves) {
  test::writeGrid(folder.file("grid.tsb2"));
  scripting::Flooding_V27FlowModel flood;
  flood.setCoarseBathymetryFile(folder.file("grid.tsb2"));
  flood.setRain_File(folder.file("rain.tsb0"), 1, 1);
  ShowMessagesWith(flood, [](const std::string&) {});
  flood.SaveFile(folder.file("setup.v27"));
  EXPECT_EQ(climate.OpenFile(folder.file("setup.v27")), 1);
  EXPECT_TRUE(climate.root().bathymetry->GetItem(1)->isRead());
  EXPECT_EQ(climate.SetPrecFile(1, "more_rain.tsb0"), 1);
  EXPECT_EQ(climate.SaveFile(folder.file("changed.v27")), 1);
  std::string expected = test::textOf(folder.file("setup.v27"));
  const std::string was = "(file)rain.tsb0";
  const std::size_t place = expected.find("(file)\"rain.tsb0\"");
  ASSERT_NE(place, std::string::npos);
  expected.replace(place, was.size() + 2, "(file)\"more_rain.tsb0\"");
  EXPECT_EQ(test::textOf(folder.file("changed.v27")), expected);
  // Nothing is shown, whatever the state of the model, and also when nothing could be written.
  EXPECT_EQ(climate.SaveFile(folder.file("none/changed.v27")), 1);
  EXPECT_EQ(kvsPeekErrorGlb(), kKvsNoError);
  EXPECT_EQ(climate.shown, std::vector<std::string>());
}

TEST_F(ClimateChange, WhatCannotBeOpened) {
  climate.flows().precipitation = 3;
  const std::string broken = folder.write("broken.v27", "VANE27_NESTED_MODEL {\n  Key \"open\n");
  EXPECT_EQ(climate.OpenFile(broken), 0);
  ASSERT_EQ(climate.shown.size(), 1U);
  EXPECT_NE(climate.shown[0].find("Syntax error in \"" + broken + "\""), std::string::npos);
  climate.shown.clear();
  EXPECT_EQ(climate.OpenFile(folder.file("none.v27")), 0);
  EXPECT_EQ(climate.OpenFile(folder.path().string()), 0);
  EXPECT_EQ(climate.OpenFile(""), 0);
  // What the library reads is read, though it says nothing of a setup.
  EXPECT_EQ(climate.OpenFile(folder.write("other.v27", "OTHER { Key 1; }\n")), 1);
  EXPECT_EQ(climate.shown, std::vector<std::string>());
  EXPECT_EQ(climate.GetNoPrecValues(), 1);
}

TEST_F(ClimateChange, SimulationPeriod) {
  DateTime start{1, 1};
  DateTime end{1, 1};
  EXPECT_EQ(climate.GetSimulationPeriod(start, end), 0);
  EXPECT_EQ(start, (DateTime{32874.5, 0}));
  EXPECT_NEAR(end.day, 32874.5 + 100 * 30 / 86400.0, 1e-9);
  EXPECT_EQ(end.status, 0);
  // A start before day 0, and one that is no date: the end is called valid all the same.
  climate.root().simulationPeriod->start = {-1.25, 1};
  climate.root().simulationPeriod->timeStepInterval = 1728;
  EXPECT_EQ(climate.GetSimulationPeriod(start, end), 0);
  EXPECT_EQ(start, (DateTime{-1.25, 1}));
  EXPECT_NEAR(end.day, 1.25, 1e-9);
  EXPECT_EQ(end.status, 0);
  climate.root().simulationPeriod->timeStepInterval = -432;
  climate.GetSimulationPeriod(start, end);
  EXPECT_NEAR(end.day, -2.75, 1e-9);
}

TEST_F(ClimateChange, LongitudeAndLatitude) {
  double longitude = -9;
  double latitude = -9;
  const auto locate = [&] {
    longitude = latitude = -9;
    return climate.GetLongLat(longitude, latitude);
  };
  EXPECT_EQ(locate(), 0);
  EXPECT_EQ(longitude, 0);
  EXPECT_EQ(latitude, 0);
  const std::string file = folder.file("grid.tsb2");
  climate.root().bathymetry->GetItem(1)->fileName = file;
  test::GridSpec spec;
  for (const char* projection : {"UTM-32", "UTM"}) {
    spec.geography = TsbGeography{projection, 9.25, 55.5, 0};
    test::writeGrid(file, spec);
    EXPECT_EQ(locate(), 1) << projection;
    EXPECT_NEAR(longitude, 9.25, 1e-9);
    EXPECT_NEAR(latitude, 55.5, 1e-9);
  }
  spec.geography = TsbGeography{"Local Coordinates", 0, 0, 0};
  test::writeGrid(file, spec);
  EXPECT_EQ(locate(), 0);
  EXPECT_EQ(longitude, 0);
  for (const char* unreadable : {"none.tsb2", "text.tsb2"}) {
    folder.write("text.tsb2", "no grid");
    climate.root().bathymetry->GetItem(1)->fileName = folder.file(unreadable);
    longitude = 9;
    EXPECT_EQ(locate(), 0) << unreadable;
    EXPECT_EQ(longitude, 0);
  }
  climate.root().bathymetry->SetNoAreas(0);
  EXPECT_EQ(locate(), 0);
  EXPECT_EQ(latitude, 0);
}

TEST_F(ClimateChange, OutputsWithFolders) {
  auto& outputs = climate.root().nhdResult->outputs;
  EXPECT_EQ(climate.ResultOutputsHasAbsolutePath(), 0);
  outputs.SetCount(3);
  EXPECT_EQ(climate.ResultOutputsHasAbsolutePath(), 0);
  for (const auto& [name, result] :
       {std::pair("map.tsb2", 0), {"out/map.tsb2", 1}, {"/map.tsb2", 1}, {"C:\\map.tsb2", 1}, {"", 0}}) {
    outputs.at(2).file = name;
    EXPECT_EQ(climate.ResultOutputsHasAbsolutePath(), result) << name;
  }
}

TEST_F(ClimateChange, ObjectsInTwoThreads) {
  const std::string source = folder.file("source.v27");
  climate.flows().precipitation = 6;
  ASSERT_EQ(climate.SaveFile(source), 1);
  std::array<double, 2> values{};
  const auto change = [&](std::size_t which) {
    for (int i = 0; i < 4; ++i) {
      CClimateChange_V27 own;
      const std::string target = folder.file("target" + std::to_string(which) + ".v27");
      if (own.OpenFile(source) != 1 || own.SetPrecValues(1, static_cast<double>(which) + 7) != 1) return;
      own.SaveFile(target);
      own.OpenFile(target);
      own.GetPrecValues(1, values[which]);
    }
  };
  std::thread beside(change, 0);
  change(1);
  beside.join();
  EXPECT_EQ(values, (std::array<double, 2>{7, 8}));
}

TEST_F(ClimateChange, CopiesShareTheModel) {
  static_assert(std::has_virtual_destructor_v<CClimateChange_V27>);
  CClimateChange_V27 first;
  {
    CClimateChange_V27 second(climate);
    first = second;
    climate.flows().precipitation = 6;
  }
  double value = 0;
  EXPECT_EQ(first.GetPrecValues(1, value), 1);
  EXPECT_EQ(value, 6);
}

}  // namespace
}  // namespace gridbay
