#include <gmock/gmock.h>
#include <signal.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <nlohmann/json.hpp>
#include <thread>

#include "core/edition.h"
#include "platform/tsb/tsb_file.h"
#include "tests/support/grids.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace {

namespace fs = std::filesystem;
using test::ProgramRun;
using test::runTool;
using test::textOf;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;

class Tool : public ::testing::Test {
 protected:
  // A setup with one area that is clean: water along its west edge.
  void makeSetup() {
    test::writeGrid(folder.file("grid.tsb2"), {}, [](int j, int) { return j < 3 ? -5.0F : 10.0F; });
    const ProgramRun run = runTool({"new", setup, "--area", folder.file("grid.tsb2")});
    ASSERT_EQ(run.status, 0) << run.err;
  }
  std::string get(const std::string& path) { return runTool({"get", setup, path}).out; }

  test::TemporaryFolder folder;
  std::string setup = folder.file("a setup." + std::string(theEdition.fileKind));
};

TEST_F(Tool, HelpOnEveryCommand) {
  const std::vector<std::vector<std::string>> commands{
      {},      {"convert"}, {"convert", "raster"}, {"convert", "series"}, {"info"}, {"new"},
      {"get"}, {"set"},     {"boundaries"},        {"validate"},          {"run"}};
  for (std::vector<std::string> words : commands) {
    words.push_back("--help");
    const ProgramRun run = runTool(words);
    EXPECT_EQ(run.status, 0);
    EXPECT_THAT(run.out, HasSubstr("Usage:"));
    EXPECT_THAT(run.err, IsEmpty());
  }
  EXPECT_THAT(runTool({"--help"}).out, HasSubstr(std::string(theEdition.editorName.format)));
}

TEST_F(Tool, CommandLinesThatAreNone) {
  EXPECT_EQ(runTool({}).status, 2);
  EXPECT_EQ(runTool({"nonsense"}).status, 2);
  EXPECT_EQ(runTool({"validate"}).status, 2);
  EXPECT_EQ(runTool({"validate", "a", "--nonsense"}).status, 2);
  EXPECT_EQ(runTool({"convert", "raster", "a", "b"}).status, 2);
  EXPECT_THAT(runTool({"validate"}).err, HasSubstr("FILE is required"));
}

TEST_F(Tool, ANewSetupHasItsBoundaries) {
  makeSetup();
  EXPECT_EQ(runTool({"boundaries", setup}).out, "1 (0,0) - (0,7)\n2 (0,7) - (2,7)\n3 (0,0) - (2,0)\n");
  EXPECT_EQ(runTool({"validate", setup}).status, 0);
  EXPECT_THAT(textOf(setup), HasSubstr("FILE_NAME (file)\"grid.tsb2\""));
}

TEST_F(Tool, ANewSetupDoesNotReplaceAnOldOneUnasked) {
  makeSetup();
  const std::string before = textOf(setup);
  const ProgramRun run = runTool({"new", setup});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("is there already; --force replaces it"));
  EXPECT_EQ(textOf(setup), before);
  EXPECT_EQ(runTool({"new", setup, "--force"}).status, 0);
  EXPECT_NE(textOf(setup), before);
}

TEST_F(Tool, NewSaysWhatIsWrongWithItsAreas) {
  test::writeGrid(folder.file("g.tsb2"), {});
  const std::string grid = folder.file("g.tsb2");
  EXPECT_THAT(runTool({"new", setup, "--area", folder.file("none.tsb2")}).err,
              HasSubstr("there is no such file"));
  EXPECT_THAT(runTool({"new", setup, "--area", grid + "@1,2"}).err,
              HasSubstr("The first area lies in no other"));
  EXPECT_THAT(runTool({"new", setup, "--area", grid, "--area", grid}).err,
              HasSubstr("Area 2 lies in another: say where"));
  EXPECT_THAT(runTool({"new", setup, "--enclosing", "1"}).err,
              HasSubstr("--enclosing follows the --area that it is for"));
  EXPECT_THAT(runTool({"new", setup, "--start", "yesterday"}).err,
              HasSubstr("\"yesterday\" is no moment of the form"));
  EXPECT_EQ(runTool({"new", setup, "--steps", "-1"}).status, 2);
  EXPECT_FALSE(fs::exists(setup));
}

TEST_F(Tool, NestedAreasArePlaced) {
  test::writeGrid(folder.file("a@1,2.tsb2"), {.noJ = 30, .noK = 30, .dx = 90, .dy = 90});
  test::writeGrid(folder.file("b.tsb2"), {.noJ = 13, .noK = 13, .dx = 30, .dy = 30});
  const ProgramRun run =
      runTool({"new", setup, "--area", folder.file("a@1,2.tsb2"), "--area", folder.file("b.tsb2@4,5"),
               "--area", folder.file("b.tsb2@12,13"), "--enclosing", "1"});
  if (theEdition.wetlandSweepKit) {
    EXPECT_EQ(run.status, 2);
    EXPECT_THAT(run.err, HasSubstr("The Wetland Sweep Kit has at most 1 area"));
    return;
  }
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_1/DATA_FILE/FILE_NAME"), "a@1,2.tsb2\n");
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_2/Origin"), "4 5\n");
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_3/Origin"), "12 13\n");
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_3/Enclosing_Area"), "1\n");
  EXPECT_EQ(runTool({"validate", setup}).status, 0);
}

TEST_F(Tool, GetsValuesAndSections) {
  makeSetup();
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth"), "0.02\n");
  EXPECT_EQ(get("VANE27_NESTED_MODEL/nested_model_globals/flood_and_dry/drying_depth"), "0.02\n");
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Start_Time"), "1990 1 1 12 0 0\n");
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Overland_Solver"), "#false\n");
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Projection"), "Local Coordinates\n");
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK"), "Number_Of_Sources 0\n");
  // What the file lacks has the value that then stands.
  folder.write("short.v27", "VANE27_NESTED_MODEL {}");
  EXPECT_EQ(runTool({"get", folder.file("short.v27"), "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth"}).out,
            "0.02\n");
}

TEST_F(Tool, AnUnknownPathSuggestsTheNearest) {
  makeSetup();
  const auto suggestion = [this](const std::string& path) {
    const ProgramRun run = runTool({"get", setup, path});
    EXPECT_EQ(run.status, 2);
    return run.err;
  };
  EXPECT_EQ(suggestion("NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Dryng_Depth"),
            "There is no \"NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Dryng_Depth\" in this setup; did you mean "
            "\"NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth\"?\n");
  EXPECT_THAT(suggestion("FLOOD_AND_DRY/Drying_Depth"),
              HasSubstr("did you mean \"NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth\"?"));
  EXPECT_THAT(suggestion("Qqqqqqqqqqqqqqqq"), Not(HasSubstr("did you mean")));
  EXPECT_THAT(runTool({"set", setup, "FLOOD/Drying_Dept=1"}).err, HasSubstr("did you mean"));
}

TEST_F(Tool, SetsEveryKindOfValue) {
  makeSetup();
  const std::string globals = "NESTED_MODEL_GLOBALS/";
  const ProgramRun run = runTool({"set", setup, globals + "FLOOD_AND_DRY/Drying_Depth=0.01",
                                  globals + "SIMULATION_PERIOD/Number_Of_Timesteps=7",
                                  globals + "SIMULATION_PERIOD/Start_Time=2000,2,29 6 7 8",
                                  globals + "BATHYMETRY_SELECTION/Overland_Solver=true",
                                  globals + "BATHYMETRY_SELECTION/Overland_Filename=fine grid.tsb2",
                                  globals + "BATHYMETRY_SELECTION/Projection=UTM-32"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.err, IsEmpty());
  EXPECT_EQ(get(globals + "FLOOD_AND_DRY/Drying_Depth"), "0.01\n");
  EXPECT_EQ(get(globals + "SIMULATION_PERIOD/Number_Of_Timesteps"), "7\n");
  EXPECT_EQ(get(globals + "SIMULATION_PERIOD/Start_Time"), "2000 2 29 6 7 8\n");
  EXPECT_EQ(get(globals + "BATHYMETRY_SELECTION/Overland_Solver"), "#true\n");
  EXPECT_EQ(get(globals + "BATHYMETRY_SELECTION/Overland_Filename"), "fine grid.tsb2\n");
  EXPECT_EQ(get(globals + "BATHYMETRY_SELECTION/Projection"), "UTM-32\n");
}

TEST_F(Tool, ANewCountIsASetting) {
  makeSetup();
  const ProgramRun run = runTool({"set", setup, "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources=2",
                                  "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_2/Type=1"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.err, IsEmpty());
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_2/Type"), "1\n");
}

TEST_F(Tool, ASettingThatCannotBeLeavesTheFile) {
  makeSetup();
  const std::string before = textOf(setup);
  const auto refused = [this](const std::string& setting) {
    const ProgramRun run =
        runTool({"set", setup, "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.5", setting});
    EXPECT_EQ(run.status, 2) << setting;
    return run.err;
  };
  EXPECT_THAT(refused("NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Flooding_Depth=deep"),
              HasSubstr("Flooding_Depth takes a number, not \"deep\""));
  EXPECT_THAT(refused("NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Warm_Up_Period=1.5"),
              HasSubstr("Warm_Up_Period takes a whole number, not \"1.5\""));
  EXPECT_THAT(refused("NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Start_Time=1,2"),
              HasSubstr("Start_Time takes 6 values, not 2"));
  EXPECT_THAT(refused("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Overland_Solver=maybe"),
              HasSubstr("takes true or false"));
  EXPECT_THAT(refused("NESTED_MODEL_GLOBALS/FLOOD_AND_DRY=1"),
              HasSubstr("is a section; name a keyword in it"));
  EXPECT_THAT(refused("NESTED_MODEL_GLOBALS"), HasSubstr("is not of the form PATH=VALUE"));
  EXPECT_THAT(refused("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources=-3"),
              HasSubstr("cannot be -3 here: it stays 0"));
  if (theEdition.wetlandSweepKit) {
    EXPECT_THAT(refused("NESTED_MODEL_GLOBALS/MODULE_SELECTION/Simulation_Type=2"),
                HasSubstr("cannot be 2 here: it stays 0"));
  }
  EXPECT_EQ(textOf(setup), before);
}

TEST_F(Tool, OptionsOfTheEngineComeThrough) {
  folder.write(
      "s.v27",
      "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE { OPTION_PARAMETERS { Speed 3; Deep { X \"y\" } } } }");
  ASSERT_EQ(runTool({"set", folder.file("s.v27"), "HYDRODYNAMIC_MODULE/OPTION_PARAMETERS/Speed=4"}).status,
            0);
  EXPECT_EQ(runTool({"get", folder.file("s.v27"), "HYDRODYNAMIC_MODULE/OPTION_PARAMETERS"}).out,
            "Speed 4\nDeep {\n    X \"y\"\n}\n");
}

TEST_F(Tool, SectionsThatAreNotKnownAreNamedBeforeTheyGo) {
  folder.write("s.v27", "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE { FUTURE { A 1 } } }");
  const ProgramRun run =
      runTool({"set", folder.file("s.v27"), "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.1"});
  EXPECT_EQ(run.status, 0);
  EXPECT_THAT(run.err, HasSubstr("Warning: this version does not know section HYDRODYNAMIC_MODULE/FUTURE"));
}

TEST_F(Tool, ValidationTellsEachMessageAndTheCountLast) {
  makeSetup();
  runTool({"set", setup, "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=-1",
           "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Time_Step_Interval=0"});
  const ProgramRun run = runTool({"validate", setup});
  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.out,
            "page 26, severity 1: Drying depth must be positive\n"
            "page 39, severity 1: Time step interval must be at least 0.01\n"
            "2 faults\n");
  const auto report = nlohmann::json::parse(runTool({"validate", setup, "--json"}).out);
  EXPECT_EQ(report["faults"], 2);
  EXPECT_EQ(report["messages"][0],
            (nlohmann::json{{"page", 26}, {"severity", 1}, {"text", "Drying depth must be positive"}}));
}

TEST_F(Tool, WhatALoadHasToSayIsOnStandardError) {
  folder.write("s.v27",
               "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { OPEN_BOUNDARY { Number_Of_Boundaries 3 } } }");
  const ProgramRun run = runTool({"boundaries", folder.file("s.v27")});
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.err,
            "Error in the KVS-FILE\nThe number of Boundary sections does not correspond to the number of sub "
            "domaines (3 times)\n");
}

TEST_F(Tool, BoundariesStayWhereTheGridCannotBeRead) {
  makeSetup();
  const std::string before = textOf(setup);
  fs::remove(folder.file("grid.tsb2"));
  const ProgramRun run = runTool({"boundaries", setup, "--detect"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("the setup is unchanged"));
  EXPECT_EQ(textOf(setup), before);
}

TEST_F(Tool, SetupsThatCannotBeRead) {
  const auto refusedBy = [](const std::string& path) {
    std::string errors;
    for (const std::vector<std::string>& words : {std::vector<std::string>{"validate", path},
                                                  {"boundaries", path},
                                                  {"get", path, "A"},
                                                  {"set", path, "A=1"},
                                                  {"info", path}}) {
      const ProgramRun run = runTool(words);
      EXPECT_EQ(run.status, 2) << words[0];
      EXPECT_THAT(run.out, IsEmpty());
      EXPECT_THAT(run.err, HasSubstr(path));
      errors = run.err;
    }
    return errors;
  };
  EXPECT_THAT(refusedBy(folder.file("none.v27")), HasSubstr("No such file or directory"));
  EXPECT_THAT(refusedBy(folder.path().string()), HasSubstr("it is not a file"));
  EXPECT_THAT(refusedBy(folder.write("empty.v27", "")), HasSubstr("is not a setup"));
  EXPECT_THAT(refusedBy(folder.write("cut.v27", "VANE27_NESTED_MODEL {\n  A {\n")),
              HasSubstr("line 3, column 1: found the end of the file"));
  EXPECT_THAT(refusedBy(folder.write("bytes.v27", std::string("\x7F"
                                                              "ELF\0\0",
                                                              6))),
              HasSubstr("found a control character"));
  EXPECT_THAT(refusedBy(folder.write("latin.v27", "A \"\xE9\"")), HasSubstr("a byte that is not UTF-8 text"));
  EXPECT_THAT(refusedBy(folder.write("wide.v27", std::string("\xFF\xFE"
                                                             "A\0",
                                                             4))),
              HasSubstr("UTF-16 text"));
}

TEST_F(Tool, InfoOfDataFiles) {
  test::GridSpec spec{.noJ = 5, .noK = 4, .dx = 20, .dy = 25};
  spec.geography = TsbGeography{"UTM-32", 9, 55, 0};
  test::writeGrid(folder.file("g.tsb2"), spec, [](int j, int k) { return static_cast<float>(j + k); });
  const ProgramRun run = runTool({"info", folder.file("g.tsb2")});
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.out,
            "Data file    test (data type 0)\n"
            "Time         1 step from 1990-01-01 12:00:00, 0 to 0 s\n"
            "Axis X       5 points, 20 m apart, from 0\n"
            "Axis Y       4 points, 25 m apart, from 0\n"
            "Item 1       Item 1: Bathymetry (type 100079) in m, 0 to 7\n"
            "Block        V27_Misc: 0, 0, 0, 10\n"
            "Projection   WGS 84 / UTM zone 32N\n"
            "First point  longitude 9.000000, latitude 55.000000\n");
  const auto report = nlohmann::json::parse(runTool({"info", folder.file("g.tsb2"), "--json"}).out);
  EXPECT_EQ(report["axes"][1]["spacing"], 25);
  EXPECT_EQ(report["custom_blocks"]["V27_Misc"][3], 10);
  const ProgramRun damaged = runTool({"info", folder.write("d.tsb2", "\x89HDF\r\n\x1A\n nothing more")});
  EXPECT_EQ(damaged.status, 2);
  EXPECT_THAT(damaged.err, HasSubstr("it is no data file, or it is damaged"));
}

TEST_F(Tool, InfoOfASetup) {
  makeSetup();
  const ProgramRun run = runTool({"info", setup});
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.out,
            "Setup            module code 0\n"
            "Period           1990-01-01 12:00:00 to 1990-01-01 12:50:00, 100 steps of 30 s\n"
            "Projection       Local Coordinates\n"
            "Area 1           grid.tsb2, 10 x 8 points, 30 x 30 m apart, land at 10 m\n"
            "Courant number   at most 7.00714, in area 1\n"
            "Boundary 1       (0,0) - (0,7)\n"
            "Boundary 2       (0,7) - (2,7)\n"
            "Boundary 3       (0,0) - (2,0)\n"
            "Flood and dry    drying at 0.02 m, flooding at 0.05 m\n");
}

// A raster of 4 x 3 points with one missing value, row 0 in the north.
constexpr std::string_view kRaster =
    "ncols 4\nnrows 3\nxllcorner 100\nyllcorner 200\ncellsize 10\nNODATA_value -99\n"
    "8 9 10 11\n4 5 6 -99\n0 1 2 3\n";

class ConvertRaster : public Tool {
 protected:
  nlohmann::json convert(std::vector<std::string> options) {
    std::vector<std::string> words{"convert", "raster", folder.write("r.asc", kRaster), out, "--land", "60"};
    words.insert(words.end(), options.begin(), options.end());
    run = runTool(words);
    EXPECT_EQ(run.status, 0) << run.err;
    return nlohmann::json::parse(runTool({"info", out, "--json"}).out);
  }
  std::vector<float> values(std::size_t count) {
    std::vector<float> all(count);
    Result<TsbFile> file = TsbFile::open(out);
    EXPECT_TRUE(file->read(1, 0, std::span<float>(all)));
    return all;
  }
  std::string out = folder.file("r.tsb2");
  ProgramRun run;
};

TEST_F(ConvertRaster, RowsAreTurnedSoThatKRunsNorth) {
  const auto info = convert({});
  EXPECT_EQ(info["axes"][0], (nlohmann::json{{"points", 4}, {"first", 105}, {"spacing", 10}, {"unit", "m"}}));
  EXPECT_EQ(info["axes"][1], (nlohmann::json{{"points", 3}, {"first", 205}, {"spacing", 10}, {"unit", "m"}}));
  EXPECT_EQ(info["items"][0]["type"], 100079);
  EXPECT_EQ(info["custom_blocks"]["V27_Misc"], (nlohmann::json{0, 0, 0, 60}));
  EXPECT_FALSE(info.contains("geography"));
  EXPECT_EQ(values(12), (std::vector<float>{0, 1, 2, 3, 4, 5, 6, 60, 8, 9, 10, 11}));
  EXPECT_THAT(run.out, HasSubstr("1 missing values written as 60"));
}

TEST_F(ConvertRaster, Options) {
  auto info = convert({"--nodata-as", "-7", "--crs", "UTM-32", "--origin-x", "500000", "--origin-y",
                       "6094791.419", "--item-type", "100078", "--window", "1,0,3,2", "--coarsen", "2"});
  EXPECT_EQ(values(4), (std::vector<float>{1, 3, 9, 11}));
  EXPECT_EQ(info["axes"][0],
            (nlohmann::json{{"points", 2}, {"first", 500000}, {"spacing", 20}, {"unit", "m"}}));
  EXPECT_EQ(info["items"][0]["type"], 100078);
  EXPECT_NEAR(info["geography"]["longitude"], 9, 1e-6);
  EXPECT_NEAR(info["geography"]["latitude"], 55, 1e-4);
  info = convert({"--window", "1,1,3,2"});
  EXPECT_EQ(values(6), (std::vector<float>{5, 6, 60, 9, 10, 11}));
  EXPECT_EQ(info["axes"][0]["first"], 115);
  EXPECT_EQ(info["axes"][1]["first"], 215);
}

TEST_F(ConvertRaster, OtherFormatsAndDirections) {
  folder.write("r.asc", kRaster);
  const std::string tif = folder.file("r.tif");
  ASSERT_EQ(test::runProgram("gdal_translate", {"-q", "-a_srs", "EPSG:28356", "-a_scale", "2", "-a_offset",
                                                "1", folder.file("r.asc"), tif})
                .status,
            0);
  ASSERT_EQ(runTool({"convert", "raster", tif, out, "--land", "60"}).status, 0);
  EXPECT_EQ(values(12), (std::vector<float>{1, 3, 5, 7, 9, 11, 13, 60, 17, 19, 21, 23}));
  EXPECT_EQ(nlohmann::json::parse(runTool({"info", out, "--json"}).out)["geography"]["projection"],
            "GDA94 / MGA zone 56");
}

TEST_F(ConvertRaster, WhatCannotBeDone) {
  const std::string raster = folder.write("r.asc", kRaster);
  const auto refused = [&](std::vector<std::string> words) {
    words.insert(words.begin(), {"convert", "raster"});
    const ProgramRun refusal = runTool(words);
    EXPECT_EQ(refusal.status, 2);
    EXPECT_FALSE(fs::exists(out));
    return refusal.err;
  };
  EXPECT_THAT(refused({folder.file("none.asc"), out, "--land", "1"}), HasSubstr("none.asc"));
  EXPECT_THAT(refused({folder.write("junk.asc", "junk"), out, "--land", "1"}), HasSubstr("junk.asc"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--crs", "nonsense"}),
              HasSubstr("\"nonsense\" is no projection that is known"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--item-type", "7"}),
              HasSubstr("There is no item type 7"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--window", "0,0,4,2"}), HasSubstr("which goes to 3,2"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--coarsen", "0"}), HasSubstr("--coarsen"));
  EXPECT_THAT(refused({raster, folder.file("no/r.tsb2"), "--land", "1"}),
              HasSubstr("No such file or directory"));
  ASSERT_EQ(
      test::runProgram("gdal_translate", {"-q", "-a_srs", "EPSG:4326", raster, folder.file("d.tif")}).status,
      0);
  EXPECT_THAT(refused({folder.file("d.tif"), out, "--land", "1"}), HasSubstr("The raster is in degrees"));
}

class ConvertSeries : public Tool {
 protected:
  ProgramRun convert(std::string_view text, std::vector<std::string> options = {}) {
    std::vector<std::string> words{"convert", "series",  folder.write("s.txt", text), out, "--item-type",
                                   "100000",  "--start", "2000-01-01 00:00:00"};
    words.insert(words.end(), options.begin(), options.end());
    return runTool(words);
  }
  nlohmann::json info() { return nlohmann::json::parse(runTool({"info", out, "--json"}).out); }
  std::string out = folder.file("s.tsb0");
};

TEST_F(ConvertSeries, DelimitersColumnsAndHeadings) {
  for (const std::string_view text :
       {"time,Level a,b\n0,1,2\n1,3,4\n", "time;Level a;b\n0;1;2\n1;3;4",
        "time\tLevel a\tb\r\n0\t1\t2\r\n1\t3\t4\r\n", "time  Level a  b\n 0   1 2\n\n1 3   4 \n"}) {
    const ProgramRun run = convert(text, {"--skip-lines", "1", "--time-unit", "h"});
    ASSERT_EQ(run.status, 0) << run.err;
    const auto report = info();
    EXPECT_EQ(report["items"][0]["name"], "Level a");
    EXPECT_EQ(report["items"][1]["name"], "b");
    EXPECT_EQ(report["items"][1]["first_step"]["least"], 2);
    EXPECT_EQ(report["time"]["step"], 1);
    EXPECT_EQ(report["time"]["unit"], "h");
    EXPECT_EQ(report["dimensions"], 0);
    double second = 0;
    ASSERT_TRUE(TsbFile::open(out)->read(2, 1, std::span<double>(&second, 1)));
    EXPECT_EQ(second, 4);
  }
}

TEST_F(ConvertSeries, UnevenTimesAreKept) {
  ASSERT_EQ(convert("0 1\n1 2\n5 3\n").status, 0);
  EXPECT_EQ(info()["time"]["equidistant"], false);
  EXPECT_EQ(info()["time"]["last"], 5);
}

TEST_F(ConvertSeries, WhatCannotBeDone) {
  EXPECT_THAT(convert("time x\n0 1\n").err,
              HasSubstr("line 1: \"time\" is no number (are there heading lines?"));
  EXPECT_THAT(convert("0 1\n1 2 3\n").err, HasSubstr("line 2: 3 fields, where the lines before have 2"));
  EXPECT_THAT(convert("0 1\n0 2\n").err, HasSubstr("line 2: the time does not rise"));
  EXPECT_THAT(convert("0\n").err, HasSubstr("line 1: a time and at least one value are expected"));
  EXPECT_THAT(convert("").err, HasSubstr("there are no values"));
  EXPECT_THAT(convert("0 1\n", {"--time-unit", "m"}).err, HasSubstr("\"m\" is no unit of time"));
  EXPECT_EQ(convert("0 1\n", {"--time-unit", "m"}).status, 2);
  EXPECT_FALSE(fs::exists(out));
}

class RunEngine : public Tool {
 protected:
  std::string engine(const std::string& script, const std::string& name = "gridbay") {
    const std::string path = folder.write(name, "#!/bin/sh\n" + script + "\n");
    EXPECT_EQ(::chmod(path.c_str(), 0755), 0);
    return path;
  }
};

TEST_F(RunEngine, GetsTheSavedFileAndItsStatusIsPassedOn) {
  makeSetup();
  const std::string program = engine("echo \"out $1\"; echo err >&2; exit 3");
  ProgramRun run = runTool({"run", setup, "--engine", program});
  EXPECT_EQ(run.status, 3);
  EXPECT_EQ(run.out, "out " + setup + "\n");
  EXPECT_EQ(run.err, "err\n");
  EXPECT_EQ(runTool({"run", setup}, {"GRIDBAY_ENGINE=" + program}).status, 3);
  EXPECT_EQ(runTool({"run", setup}, {"PATH=/nowhere:" + folder.path().string()}).status, 3);
  engine("exit 4", "gridbay.exe");
  EXPECT_EQ(runTool({"run", setup}, {"PATH=" + folder.path().string()}).status, 4);
}

TEST_F(RunEngine, WithoutAnEngineItSaysWhereItLooked) {
  makeSetup();
  const ProgramRun run = runTool({"run", setup}, {"PATH=/nowhere"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("There is no engine: gridbay.exe or gridbay was looked for in "));
  EXPECT_THAT(run.err, HasSubstr("GRIDBAY_ENGINE"));
  EXPECT_THAT(runTool({"run", setup, "--engine", folder.file("none")}).err,
              HasSubstr("There is no engine \"" + folder.file("none")));
  EXPECT_THAT(runTool({"run", folder.file("none.v27"), "--engine", engine("")}).err, HasSubstr("none.v27"));
}

TEST_F(RunEngine, IsEndedWhenTheToolIsToldToStop) {
  makeSetup();
  const std::string program =
      engine("trap 'echo ended > ended; exit 9' TERM\necho $$ > started\nwhile :; do sleep 0.05; done");
  const pid_t child = ::fork();
  if (child == 0) {
    fs::current_path(folder.path());
    ::close(STDERR_FILENO);
    ::execl(test::toolPath().c_str(), "tool", "run", setup.c_str(), "--engine", program.c_str(), nullptr);
    ::_exit(98);
  }
  for (int i = 0; i < 500 && textOf(folder.file("started")).empty(); ++i)
    std::this_thread::sleep_for(std::chrono::milliseconds(10));
  const std::string started = textOf(folder.file("started"));
  ASSERT_FALSE(started.empty());
  ASSERT_EQ(::kill(child, SIGINT), 0);
  int status = 0;
  ASSERT_EQ(::waitpid(child, &status, 0), child);
  EXPECT_EQ(WEXITSTATUS(status), 9);
  EXPECT_EQ(textOf(folder.file("ended")), "ended\n");
  EXPECT_NE(::kill(std::stoi(started), 0), 0);
}

}  // namespace
}  // namespace gridbay
