// The main job on the terrain of a flooded street: missing values, a projection, and a nested pair.

#include <gmock/gmock.h>

#include <filesystem>
#include <nlohmann/json.hpp>

#include "basic/bathymetry.h"
#include "core/edition.h"
#include "setup/setup_file.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace main_job_merewether_test {

using test::runTool;
using ::testing::HasSubstr;

class Merewether : public ::testing::Test {
 protected:
  void SetUp() override {
    if (!std::filesystem::exists(GRIDBAY_SHARED_DATA)) GTEST_SKIP() << "the measurements are not here";
  }
  std::string convert(const std::string& name, const std::vector<std::string>& options) {
    std::vector<std::string> words{
        "convert",         "raster", std::string(GRIDBAY_SHARED_DATA) + "/merewether_terrain.asc",
        folder.file(name), "--land", "60",
        "--nodata-as",     "60",     "--crs",
        "EPSG:28356",      "--force"};
    words.insert(words.end(), options.begin(), options.end());
    const test::ProgramRun run = runTool(words);
    EXPECT_EQ(run.status, 0) << run.err;
    return folder.file(name);
  }
  test::TemporaryFolder folder;
  std::string setup = folder.file("merewether." + std::string(theEdition.fileKind));
};

TEST_F(Merewether, BoundariesAndProjection) {
  const std::string grid = convert("terrain.tsb2", {});
  ASSERT_EQ(runTool({"new", setup, "--area", grid}).status, 0);
  const test::ProgramRun run = runTool({"boundaries", setup, "--detect"});
  EXPECT_EQ(run.out, "1 (0,0) - (0,374)\n2 (1,415) - (320,415)\n3 (320,1) - (320,415)\n4 (0,0) - (288,0)\n");
  EXPECT_EQ(runTool({"validate", setup}).out, "0 faults\n");

  const auto terrain = nlohmann::json::parse(runTool({"info", grid, "--json"}).out);
  EXPECT_EQ(terrain["geography"]["projection"], "GDA94 / MGA zone 56");
  EXPECT_NEAR(terrain["axes"][0]["spacing"], 0.99993681000029, 1e-14);
  EXPECT_NEAR(terrain["axes"][0]["first"], 382249.79174463 + 0.99993681000029 / 2, 1e-6);
  EXPECT_NEAR(terrain["geography"]["longitude"], 151.7403, 1e-3);
  EXPECT_NEAR(terrain["geography"]["latitude"], -32.9436, 1e-3);
  EXPECT_EQ(nlohmann::json::parse(runTool({"info", setup, "--json"}).out)["projection"],
            "GDA94 / MGA zone 56");
  const test::ProgramRun gdal = test::runProgram("gdalinfo", {"NETCDF:" + grid});
  EXPECT_THAT(gdal.out, HasSubstr("GDA94 / MGA zone 56"));
}

// A street flood: rain on the catchment, rough land, what runs off the border, and maps of what is flooded.
TEST_F(Merewether, RainOnTheCatchment) {
  const std::string grid = convert("terrain.tsb2", {});
  const std::string start = "2007-06-08 12:00:00";
  const std::string table =
      folder.write("rain.csv", "minutes,Rain\n0,0\n30,90\n60,120\n90,40\n120,0\n180,0\n");
  test::ProgramRun run =
      runTool({"convert", "series", table, folder.file("rain.tsb0"), "--item-type", "Rainfall rate",
               "--start", start, "--time-unit", "min", "--skip-lines", "1"});
  ASSERT_EQ(run.status, 0) << run.err;
  ASSERT_EQ(
      runTool({"new", setup, "--area", grid, "--start", start, "--step", "0.5", "--steps", "21600"}).status,
      0);
  const std::string hd = "HYDRODYNAMIC_MODULE/";
  const std::string output = hd + "OUTPUT_SPECIFICATION/";
  run = runTool(
      {"set", setup, "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.002",
       "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Flooding_Depth=0.003", hd + "SOURCE_AND_SINK/PrecipitationType=0",
       hd + "SOURCE_AND_SINK/Precipitation/File_Name=rain.tsb0", hd + "RESISTANCE/AREA_1/Constant_Value=25",
       output + "Number_Of_Output_areas=1", output + "OUTPUT_AREA_1/File_Name=flood.tsb2",
       output + "OUTPUT_AREA_1/X_Range_And_Interval=0,320,1",
       output + "OUTPUT_AREA_1/Y_Range_And_Interval=0,415,1", output + "OUTPUT_AREA_1/Last_Time_Step=21600",
       output + "OUTPUT_AREA_1/Time_Step_interval=600",
       output + "INUNDATION_STATISTICS/IncludeInundationStatistics=#true",
       output + "INUNDATION_STATISTICS/InundationFileName=deepest.tsb2"});
  ASSERT_EQ(run.status, 0) << run.err;
  run = runTool({"validate", setup});
  EXPECT_EQ(run.out, "0 faults\n");
  const std::string report = runTool({"info", setup}).out;
  EXPECT_THAT(report, HasSubstr("Rain             time series in rain.tsb0, item 1, on dry land too\n"));
  EXPECT_THAT(report, HasSubstr("Resistance       Manning number, 25 m^⅓/s in area 1\n"));
  EXPECT_THAT(report, HasSubstr("time steps 0 to 21600 by 600, 3 items, to flood.tsb2\n"));

  // Rain that ends before the simulation does is refused.
  ASSERT_EQ(
      runTool({"set", setup, "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Number_Of_Timesteps=30000"}).status, 0);
  run = runTool({"validate", setup});
  EXPECT_EQ(run.status, 1);
  EXPECT_THAT(run.out, HasSubstr("page 41, severity 1: Data file  \" rain.tsb0\"  is not valid"));
}

TEST_F(Merewether, AMovedFolderStillWorks) {
  std::filesystem::create_directories(folder.path() / "a" / "grids");
  const std::string grid = convert("a/grids/terrain ü.tsb2", {});
  const std::string here = folder.file("a/setup.v27");
  ASSERT_EQ(runTool({"new", here, "--area", grid}).status, 0);
  EXPECT_EQ(
      runTool({"get", here, "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_1/DATA_FILE/FILE_NAME"}).out,
      "grids/terrain ü.tsb2\n");
  std::filesystem::rename(folder.path() / "a", folder.path() / "b");
  EXPECT_EQ(runTool({"validate", folder.file("b/setup.v27")}).out, "0 faults\n");
}

// The inner area at the terrain's own spacing, inside the outer one coarsened by 3, so that the points
// coincide.
class MerewetherPair : public Merewether {
 protected:
  void SetUp() override {
    Merewether::SetUp();
    if (IsSkipped()) return;
    if (theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition has one area";
    outer = convert("outer.tsb2", {"--coarsen", "3"});
    // Outer points (20,30) to (60,80).
    inner = convert("inner.tsb2", {"--window", "60,90,180,240"});
    ASSERT_EQ(runTool({"new", setup, "--area", outer, "--area", inner + "@20,30"}).status, 0);
  }
  std::string faults() { return runTool({"validate", setup}).out; }
  void set(const std::string& setting) {
    const test::ProgramRun run =
        runTool({"set", setup, "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_2/" + setting});
    EXPECT_EQ(run.status, 0) << run.err;
  }
  // What validation says of the pair with another inner grid.
  std::string withInner(const std::vector<std::string>& options) {
    convert("inner.tsb2", options);
    return faults();
  }
  std::string refused(const std::string& tail) {
    return "page 27, severity 1: Can not nest file inner.tsb2 in file outer.tsb2" + tail + "\n1 fault\n";
  }
  std::string outer;
  std::string inner;
};

TEST_F(MerewetherPair, IsPlacedAndClean) {
  EXPECT_EQ(faults(), "0 faults\n");
  // The points coincide: inner (3a, 3b) is outer (20 + a, 30 + b).
  CollectingMessageHost host;
  Result<SetupFile> opened = SetupFile::open(setup, &host);
  ASSERT_TRUE(opened);
  CBathymetryKvs& areas = *opened->model().bathymetry;
  ValidationList messages;
  ASSERT_EQ(areas.Validate(messages, 1), 0U);
  for (const auto& [a, b] : {std::pair{0, 0}, {40, 50}, {7, 13}}) {
    EXPECT_EQ(areas.GetArea(2)->grid(3 * a, 3 * b), areas.GetArea(1)->grid(20 + a, 30 + b));
  }
}

TEST_F(MerewetherPair, EachNestingRuleBrokenInTurn) {
  const std::string ratio = refused(".  Ratio between gridpoint spacing is not 3.");
  const std::string position = refused(".  Illegal position of area.");
  EXPECT_EQ(withInner({"--window", "60,90,180,240", "--coarsen", "2"}), ratio);
  EXPECT_EQ(withInner({"--window", "60,90,181,240"}), refused(".  Grid dimension incorrect (jextr)."));
  EXPECT_EQ(withInner({"--window", "60,90,180,241"}), refused(".  Grid dimension incorrect (kextr)."));
  EXPECT_EQ(withInner({"--window", "60,90,180,240"}), "0 faults\n");
  set("Origin=0,30");
  EXPECT_EQ(faults(), position);
  set("Origin=20,0");
  EXPECT_EQ(faults(), position);
  set("Origin=66,30");  // 66 + 40 is past the outer NoJ - 2 = 105
  EXPECT_EQ(faults(), position);
  set("Origin=20,88");  // 88 + 50 is past the outer NoK - 2 = 137
  EXPECT_EQ(faults(), position);
  set("Origin=2,30");  // near the border, where the inner edge has water
  EXPECT_EQ(faults(), position);
  set("Origin=20,30");
  set("Enclosing_Area=2");
  EXPECT_EQ(faults(), "page 27, severity 2: Not a valid outer bathymetry chosen\n1 fault\n");
  set("Enclosing_Area=1");
  EXPECT_EQ(faults(), "0 faults\n");
}

}  // namespace main_job_merewether_test
}  // namespace gridbay
