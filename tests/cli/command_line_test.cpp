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
#include "platform/tsb/tsb_writer.h"
#include "tests/support/grids.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace cli_command_line_test {

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
  const std::vector<std::vector<std::string>> commands{{},
                                                       {"convert"},
                                                       {"convert", "raster"},
                                                       {"convert", "series"},
                                                       {"convert", "types"},
                                                       {"info"},
                                                       {"new"},
                                                       {"get"},
                                                       {"set"},
                                                       {"boundaries"},
                                                       {"validate"},
                                                       {"fix"},
                                                       {"run"},
                                                       {"ensemble"}};
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
              HasSubstr(theEdition.wetlandSweepKit
                            ? "has at most 1 area"
                            : "Area 2 lies in another: say where its first point is, as --area FILE@J,K"));
  EXPECT_THAT(runTool({"new", setup, "--area", grid + "@1;2"}).err,
              HasSubstr("where an area lies is told as FILE@J,K, by two whole numbers"));
  EXPECT_THAT(runTool({"new", setup, "--enclosing", "1"}).err,
              HasSubstr("--enclosing follows the --area that it is for"));
  EXPECT_THAT(runTool({"new", setup, "--start", "yesterday"}).err,
              HasSubstr("\"yesterday\" is no moment of the form"));
  EXPECT_EQ(runTool({"new", setup, "--steps", "-1"}).status, 2);
  for (const char* step : {"0", "-1", "0.0099", "nan", "inf", "1e39", "soon"})
    EXPECT_THAT(runTool({"new", setup, "--step", step}).err, HasSubstr("--step: ")) << step;
  test::writeSeries(folder.file("s.tsb0"), {}, 100000, "m");
  EXPECT_THAT(runTool({"new", setup, "--area", folder.file("s.tsb0")}).err, HasSubstr("holds no map"));
  EXPECT_FALSE(fs::exists(setup));
  EXPECT_EQ(runTool({"new", setup, "--step", "0.01"}).status, 0);
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Time_Step_Interval"), "0.01\n");
}

TEST_F(Tool, NewRefusesPlacesThatCannotBe) {
  if (theEdition.wetlandSweepKit) return;  // it has one area
  test::writeGrid(folder.file("g.tsb2"), {.noJ = 10, .noK = 8});
  const std::string grid = folder.file("g.tsb2");
  const auto refused = [&](std::vector<std::string> words) {
    words.insert(words.begin(), {"new", setup, "--area", grid});
    const ProgramRun run = runTool(words);
    EXPECT_EQ(run.status, 2);
    EXPECT_FALSE(fs::exists(setup));
    return run.err;
  };
  EXPECT_EQ(refused({"--area", grid + "@-1,2"}), "Area 2 cannot lie at -1,2: J and K count from 0\n");
  EXPECT_EQ(refused({"--area", grid + "@1,-2"}), "Area 2 cannot lie at 1,-2: J and K count from 0\n");
  EXPECT_EQ(refused({"--area", grid + "@10,2"}), "Area 2 cannot lie at 10,2: area 1 has 10 x 8 points\n");
  EXPECT_EQ(refused({"--area", grid + "@2,8"}), "Area 2 cannot lie at 2,8: area 1 has 10 x 8 points\n");
  EXPECT_EQ(refused({"--area", grid + "@1,2", "--enclosing", "2"}),
            "Area 2 cannot lie in area 2, but in one before it, which is 1\n");
  EXPECT_EQ(refused({"--area", grid + "@1,2", "--area", grid + "@1,2", "--enclosing", "0"}),
            "Area 3 cannot lie in area 0, but in one before it, 1 to 2\n");
  EXPECT_THAT(refused({"--area", grid + "@1,2", "--enclosing", "1", "--enclosing", "1"}),
              HasSubstr("one --enclosing, not two"));
}

TEST_F(Tool, NewDoesNotReplaceAGridThatItReads) {
  test::writeGrid(folder.file("g.tsb2"), {});
  const std::string before = textOf(folder.file("g.tsb2"));
  const ProgramRun run = runTool({"new", folder.file("g.tsb2"), "--area", folder.file("g.tsb2"), "--force"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("is a file that is read here"));
  EXPECT_EQ(textOf(folder.file("g.tsb2")), before);
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

TEST_F(Tool, APathNeedsNoBlankAtTheEndOfAKeyword) {
  makeSetup();
  const std::string waves = "HYDRODYNAMIC_MODULE/WAVES/";
  EXPECT_EQ(get(waves + "Type_Of_Wave_Height"), "0\n");
  const ProgramRun run =
      runTool({"set", setup, waves + "Type_Of_Wave_Height=1", waves + "type_of_wave_period =1"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(get(waves + "Type_Of_Wave_Height "), "1\n");
  EXPECT_EQ(get(waves + "Type_Of_Wave_Period"), "1\n");
  EXPECT_THAT(textOf(setup), HasSubstr("\"Type_Of_Wave_Height \" 1\n"));
}

TEST_F(Tool, AHundredSettingsAreOneLoadAndOneSave) {
  makeSetup();
  std::vector<std::string> words{"set", setup, "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources=100"};
  for (int n = 1; n <= 100; ++n) {
    words.push_back("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_" + std::to_string(n) +
                    "/Source_Point=" + std::to_string(n) + ",2");
  }
  const ProgramRun run = runTool(words);
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_100/Source_Point"), "100 2\n");
  words.push_back("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_101/Type=1");
  words[2] = "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.5";
  EXPECT_EQ(runTool(words).status, 2);
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth"), "0.02\n");
}

TEST_F(Tool, SettingsLeaveTheOptionsOfASectionAtTheTopAlone) {
  const std::string path = folder.write(
      "x.v27",
      "VANE27_NESTED_MODEL {\nNESTED_MODEL_GLOBALS {\nMODULE_SELECTION {\nSimulation_Type 8\n}\n}\n"
      "XENOBIOTIC_MODULE {\nOPTION_PARAMETERS {\nTop 7\n}\n}\n}\n");
  const ProgramRun run = runTool({"set", path, "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.01",
                                  "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Flooding_Depth=0.3"});
  ASSERT_EQ(run.status, 0) << run.err;
  if (theEdition.wetlandSweepKit) {
    EXPECT_THAT(run.err, HasSubstr("XENOBIOTIC_MODULE"));
    return;
  }
  EXPECT_THAT(run.err, IsEmpty());
  EXPECT_EQ(
      runTool({"get", path, "MUD_TRANSPORT_EXPANDED_MODULE/XENOBIOTIC_MODULE/OPTION_PARAMETERS/Top"}).out,
      "7\n");
}

TEST_F(Tool, OneOfSeveralSectionsOfANameIsReachedByItsNumber) {
  makeSetup();
  const std::string weirs = "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE/WEIR/";
  const ProgramRun run =
      runTool({"set", setup, weirs + "number_of_weirs=3", weirs + "weir_data[2]/delhs=0.25",
               weirs + "WEIR_DATA[3]/Location=Old mill", weirs + "weir_data[2]/x=1.5,2.5",
               weirs + "weir_data[2]/y=3.5,4.5", weirs + "weir_data[3]/Attributes=2,1"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(get(weirs + "weir_data[1]/delhs"), "0.01\n");
  EXPECT_EQ(get(weirs + "weir_data/delhs"), "0.01\n");  // the first
  EXPECT_EQ(get(weirs + "weir_data[2]/delhs"), "0.25\n");
  EXPECT_EQ(get(weirs + "weir_data[2]/number_of_points"), "2\n");
  EXPECT_EQ(get(weirs + "weir_data[3]/Location"), "Old mill\n");
  EXPECT_EQ(get(weirs + "weir_data[3]/Attributes"), "2 1\n");
  EXPECT_THAT(get(weirs + "weir_data[3]"), HasSubstr("Location \"\" -1e-155 \"Old mill\" \"TopoID\"\n"));
  for (const char* none : {"weir_data[4]/delhs", "weir_data[0]/delhs", "weir_data[x]/delhs", "weir_data[2"})
    EXPECT_NE(runTool({"get", setup, weirs + none}).status, 0) << none;
  const std::string before = textOf(setup);
  EXPECT_NE(runTool({"set", setup, weirs + "weir_data[4]/delhs=1.0"}).status, 0);
  EXPECT_EQ(textOf(setup), before);
}

TEST_F(Tool, ANewCountIsASetting) {
  makeSetup();
  const ProgramRun run = runTool({"set", setup, "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources=2",
                                  "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_2/Type=1"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.err, IsEmpty());
  EXPECT_EQ(get("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_2/Type"), "1\n");
}

TEST_F(Tool, AFileIsSetByAnyOfItsNames) {
  makeSetup();
  const std::string key = "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_1/DATA_FILE/FILE_NAME";
  const std::filesystem::path beside = std::filesystem::path(setup).parent_path();
  for (const auto& [given, written] :
       {std::pair((beside / "g.tsb2").string(), std::string("g.tsb2")),
        {(beside.parent_path() / "other" / "g.tsb2").string(), "../other/g.tsb2"},
        {"../g.tsb2", "../g.tsb2"},
        {"/var/g.tsb2", "/var/g.tsb2"}}) {
    const ProgramRun run = runTool({"set", setup, key + "=" + given});
    EXPECT_EQ(run.status, 0) << run.err;
    EXPECT_EQ(get(key), written + "\n");
  }
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
              HasSubstr("cannot be -3 here: it stays 0; allowed is 0 to 65535"));
  for (const char* number : {"1e400", "inf", "1e39"})
    EXPECT_THAT(refused(std::string("NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Flooding_Depth=") + number),
                HasSubstr("allowed is a finite number"))
        << number;
  if (theEdition.wetlandSweepKit) {
    EXPECT_THAT(refused("NESTED_MODEL_GLOBALS/MODULE_SELECTION/Simulation_Type=2"),
                HasSubstr("cannot be 2 here: it stays 0; allowed is 0"));
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

// What an edit takes out is wanted out; what no load took in is not.
TEST_F(Tool, TheEndOfAListThatIsShortenedGoesInSilence) {
  folder.write("s.v27",
               "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { SOURCE_AND_SINK { Number_Of_Sources 3\n"
               " SOURCE_SINK_1 { Type 0 }\n SOURCE_SINK_3 { Type 0 }\n SOURCE_SINK_5 { Type 0 } } } }");
  const ProgramRun run =
      runTool({"set", folder.file("s.v27"), "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources=1"});
  EXPECT_EQ(run.status, 0);
  EXPECT_THAT(run.err, Not(HasSubstr("SOURCE_SINK_3")));
  EXPECT_THAT(run.err, HasSubstr("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_5"));
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

TEST_F(Tool, InfoTellsTheRangeOverAllSteps) {
  // Three steps of two items, the second of 64 bits; the first value of the second step is missing.
  TsbDefinition definition = test::definitionOf({.noJ = 3, .noK = 3, .items = 2, .steps = 3});
  definition.items[1].isDouble = true;
  const std::string path = folder.file("r.tsb2");
  {
    Result<TsbWriter> writer = TsbWriter::create(path, definition);
    ASSERT_TRUE(writer) << writer.error();
    for (std::size_t step = 0; step < 3; ++step) {
      std::vector<float> values(9, static_cast<float>(step) - 1.1F);
      values[4] = step == 2 ? 7.5F : 0.25F;
      if (step == 1) values[0] = static_cast<float>(definition.items[0].deleteValue);
      ASSERT_TRUE(writer->write(1, step, std::span<const float>(values)));
      std::vector<double> doubles(9, 0.1 * static_cast<double>(step));
      ASSERT_TRUE(writer->write(2, step, std::span<const double>(doubles)));
    }
    ASSERT_TRUE(writer->commit());
  }
  const auto items = nlohmann::json::parse(runTool({"info", path, "--json"}).out)["items"];
  EXPECT_EQ(items[0]["first_step"], (nlohmann::json{{"least", -1.1}, {"greatest", 0.25}}));
  EXPECT_EQ(items[0]["range"], (nlohmann::json{{"least", -1.1}, {"greatest", 7.5}}));
  EXPECT_EQ(items[1]["range"], (nlohmann::json{{"least", 0}, {"greatest", 0.2}}));
  EXPECT_THAT(runTool({"info", path}).out, HasSubstr("in m, -1.1 to 7.5\n"));
}

// 272 MB of values that take no place on the disk; of them only the first step is read.
TEST_F(Tool, InfoOfALargeFileTellsTheFirstStepAlone) {
  TsbDefinition definition = test::definitionOf({.noJ = 1000, .noK = 1000, .steps = 68});
  definition.items[0].unit = "m";
  const std::string path = folder.file("r.tsb2");
  {
    Result<TsbWriter> writer = TsbWriter::create(path, definition);
    ASSERT_TRUE(writer) << writer.error();
    const std::vector<float> values(1000000, 3);
    ASSERT_TRUE(writer->write(1, 0, std::span<const float>(values)));
    const std::vector<float> more(1000000, 9);
    ASSERT_TRUE(writer->write(1, 67, std::span<const float>(more)));
    ASSERT_TRUE(writer->commit());
  }
  const auto item = nlohmann::json::parse(runTool({"info", path, "--json"}).out)["items"][0];
  EXPECT_EQ(item["first_step"], (nlohmann::json{{"least", 3}, {"greatest", 3}}));
  EXPECT_TRUE(item["range"].is_null());
  EXPECT_THAT(runTool({"info", path}).out, HasSubstr("in m, 3 to 3 at the first step\n"));
}

// A single step that is read some rows at a time.
TEST_F(Tool, InfoOfALargeGrid) {
  test::writeGrid(folder.file("g.tsb2"), {.noJ = 2500, .noK = 2500},
                  [](int j, int k) { return static_cast<float>(k == 2499 && j == 2499 ? -7 : k); });
  EXPECT_THAT(runTool({"info", folder.file("g.tsb2")}).out, HasSubstr("in m, -7 to 2499\n"));
}

TEST_F(Tool, InfoOfASetup) {
  makeSetup();
  const ProgramRun run = runTool({"info", setup});
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.out,
            "Setup            module code 0 (hydrodynamics alone)\n"
            "Period           1990-01-01 12:00:00 to 1990-01-01 12:50:00, 100 steps of 30 s\n"
            "Projection       Local Coordinates\n"
            "Area 1           grid.tsb2, 10 x 8 points, 30 x 30 m apart, land at 10 m\n"
            "Courant number   at most 7.00714, in area 1\n"
            "Boundary 1       (0,0) - (0,7)\n"
            "Boundary 2       (0,7) - (2,7)\n"
            "Boundary 3       (0,0) - (2,0)\n"
            "Flood and dry    drying at 0.02 m, flooding at 0.05 m\n"
            "Rain             none\n"
            "Evaporation      none\n"
            "Infiltration     none\n"
            "At boundary 1    level, 0 m\n"
            "At boundary 2    level, 0 m\n"
            "At boundary 3    level, 0 m\n"
            "Initial level    0 m in area 1\n"
            "Wind             none\n"
            "Eddy viscosity   none\n"
            "Resistance       Manning number, 32 m^⅓/s in area 1\n"
            "Hot start        not written\n");
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

TEST_F(RunEngine, ASetupWithFaultsIsNotStartedUnasked) {
  makeSetup();
  ASSERT_EQ(runTool({"set", setup, "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=-1"}).status, 0);
  const std::string program = engine("echo started; exit 3");
  ProgramRun run = runTool({"run", setup, "--engine", program});
  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.out, "");
  EXPECT_EQ(run.err,
            "page 26, severity 1: Drying depth must be positive\n"
            "1 fault: not started; --force starts it nevertheless\n");
  run = runTool({"run", setup, "--engine", program, "--force"});
  EXPECT_EQ(run.status, 3);
  EXPECT_EQ(run.out, "started\n");
  EXPECT_THAT(run.err, HasSubstr("1 fault, started nevertheless\n"));
  const std::string broken = folder.write("broken." + std::string(theEdition.fileKind), "A {");
  run = runTool({"run", broken, "--engine", program, "--force"});
  EXPECT_EQ(run.status, 2);
  EXPECT_EQ(run.out, "");
  EXPECT_THAT(run.err, HasSubstr("found the end of the file"));
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

TEST_F(Tool, AFixShowsTheNameThatStandsOnFile) {
  makeSetup();
  ASSERT_EQ(runTool({"set", setup, "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Time_Step_Interval=3"}).status, 0);
  const std::string grid = folder.file("grid.tsb2");
  std::string text = textOf(setup);
  const std::size_t name = text.find("\"grid.tsb2\"");
  ASSERT_NE(name, text.npos);
  folder.write(fs::path(setup).filename().string(), text.replace(name + 1, 9, grid));
  const ProgramRun run = runTool({"fix", setup, "1"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.out, HasSubstr(": " + grid + " -> grid.tsb2\n"));
}

TEST_F(Tool, AdviceIsTakenByItsNumber) {
  makeSetup();
  ASSERT_EQ(runTool({"set", setup, "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Time_Step_Interval=3"}).status, 0);
  ProgramRun run = runTool({"validate", setup, "--advice"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(run.out, "0 faults\nno advice\n");
  const std::string depth = "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Flooding_Depth";
  ASSERT_EQ(runTool({"set", setup, depth + "=0.5"}).status, 0);
  EXPECT_EQ(runTool({"validate", setup}).out, "0 faults\n");
  run = runTool({"validate", setup, "--advice"});
  EXPECT_EQ(run.status, 0);
  EXPECT_THAT(run.out,
              HasSubstr("0 faults\nadvice 1, page 26 (Flood and Dry): The flooding depth of 0.5 m is 25 "
                        "times the drying depth of 0.02 m."));
  EXPECT_THAT(run.out, HasSubstr("\n  fix: Flooding depth of 0.04 m (" +
                                 std::string(theEdition.wetlandSweepKit ? "v27setup-wsk" : "v27setup") +
                                 " fix '" + setup + "' 1)\n"));
  const nlohmann::json report = nlohmann::json::parse(runTool({"validate", setup, "--advice", "--json"}).out);
  EXPECT_EQ(report["faults"], 0);
  ASSERT_EQ(report["advice"].size(), 1U);
  EXPECT_EQ(report["advice"][0]["kind"], "flood-and-dry");
  EXPECT_EQ(report["advice"][0]["pageName"], "Flood and Dry");
  EXPECT_EQ(report["advice"][0]["fix"]["settings"][0]["path"], depth);
  EXPECT_FALSE(nlohmann::json::parse(runTool({"validate", setup, "--json"}).out).contains("advice"));

  EXPECT_EQ(runTool({"fix", setup, "0"}).status, 2);
  EXPECT_EQ(runTool({"fix", setup, "2"}).status, 2);
  EXPECT_EQ(runTool({"fix", setup, "-1"}).err,
            "There is no advice -1: there is 1. \"" +
                std::string(theEdition.wetlandSweepKit ? "v27setup-wsk" : "v27setup") +
                " validate --advice '" + setup + "'\" lists them\n");
  run = runTool({"fix", setup, "1"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(run.out, "Flooding depth of 0.04 m\n  " + depth + ": 0.5 -> 0.04\n");
  EXPECT_EQ(get(depth), "0.04\n");
  EXPECT_EQ(runTool({"validate", setup, "--advice"}).out, "0 faults\nno advice\n");

  // Faults keep their status, and name their pages beside advice.
  ASSERT_EQ(
      runTool({"set", setup, "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.3", depth + "=0.2"}).status,
      0);
  run = runTool({"validate", setup, "--advice"});
  EXPECT_EQ(run.status, 1);
  EXPECT_THAT(run.out, HasSubstr("page 26 (Flood and Dry), severity 1: "));
  EXPECT_THAT(runTool({"validate", setup}).out, HasSubstr("page 26, severity 1: "));
  // And what they speak of.
  ASSERT_EQ(runTool({"set", setup, depth + "=0.5", "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources=1",
                     "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_1/Source_Point=5000,5000"})
                .status,
            0);
  EXPECT_THAT(runTool({"validate", setup, "--advice"}).out,
              HasSubstr("page 40 (Source and Sink), source 1, severity 1: Source no.1 is outside of grid\n"));
  const nlohmann::json faults = nlohmann::json::parse(runTool({"validate", setup, "--advice", "--json"}).out);
  EXPECT_EQ(faults["messages"][0]["thing"], "source 1");
}

}  // namespace cli_command_line_test
}  // namespace gridbay
