// The commands that know where things lie: area, export gis.

#include <fmt/format.h>

#include <filesystem>

#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "setup/setup_file.h"
#include "structures/dike.h"
#include "tests/map/map_fixture.h"
#include "tests/support/programs.h"

namespace gridbay {
namespace cli_map_commands_test {

namespace fs = std::filesystem;
using test::ProgramRun;
using test::runProgram;
using test::runTool;
using ::testing::AllOf;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class MapCommands : public test::MapFixture {
 protected:
  std::string save() {
    const std::string path = folder.file("s." + std::string(theEdition.fileKind));
    EXPECT_TRUE(document.OnSaveDocument(path)) << (host.texts.empty() ? "" : host.texts.back());
    return path;
  }
  // What the setup at the path says of the area.
  static std::string placeOf(const std::string& setup, int number) {
    CollectingMessageHost quiet;
    Result<SetupFile> file = SetupFile::open(setup, &quiet);
    EXPECT_TRUE(file);
    const CBathymetryObjectKvs* area = file->model().bathymetry->GetArea(number);
    return area == nullptr ? "none"
                           : fmt::format("{} in {} from ({},{})", fs::path(area->fileName.text()).string(),
                                         area->enclosingArea, area->origin.j, area->origin.k);
  }
};

class AreaCommands : public MapCommands {
 protected:
  void SetUp() override {
    if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one area";
    makeTwoAreas();
    setup = save();
    test::writeGrid(folder.file("in.tsb2"),
                    {.noJ = 7, .noK = 7, .dx = 10, .dy = 10, .geography = placeAt(500330 + 3, 6000240 + 4)});
  }
  std::string setup;
};

TEST_F(AreaCommands, AddTakesThePositionFromTheGrids) {
  const ProgramRun run = runTool({"area", "add", setup, folder.file("in.tsb2"), "--snap", "--at", "10,8"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.out, AllOf(HasSubstr("(11.10,8.13), 5 m from the point"),
                             HasSubstr("Area 3 lies in area 1 from (11,8)")));
  EXPECT_THAT(run.err, HasSubstr("(10,8) is 33.24 m off"));
  EXPECT_EQ(placeOf(setup, 3), "in.tsb2 in 1 from (11,8)");
}

TEST_F(AreaCommands, AddTakesAGivenPositionAndSaysHowFarItIsOff) {
  ProgramRun run = runTool({"area", "add", setup, folder.file("in.tsb2"), "--at", "10,8"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.err, HasSubstr("(10,8) is 33.24 m off, (11,8) would be 5 m off"));
  EXPECT_EQ(placeOf(setup, 3), "in.tsb2 in 1 from (10,8)");
  run = runTool({"area", "move", setup, "3", "--snap"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.err, HasSubstr("(10,8) is 33.24 m off"));
  EXPECT_EQ(placeOf(setup, 3), "in.tsb2 in 1 from (11,8)");
  run = runTool({"area", "move", setup, "3", "--at", "5,5"});
  EXPECT_EQ(run.status, 0);
  EXPECT_THAT(run.err, HasSubstr("Overlap"));
  EXPECT_EQ(placeOf(setup, 3), "in.tsb2 in 1 from (5,5)");
  run = runTool({"area", "remove", setup, "3"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(placeOf(setup, 3), "none");
  EXPECT_TRUE(fs::exists(folder.file("in.tsb2")));
}

TEST_F(AreaCommands, WhatCanNotBeDoneLeavesTheSetupAlone) {
  const std::string before = test::textOf(setup);
  const std::string grid = folder.file("in.tsb2");
  const std::string local = folder.file("a2.tsb2");
  const std::vector<std::pair<std::vector<std::string>, std::string>> cases{
      {{"add", setup, grid}, "--at J,K"},
      {{"add", setup, grid, "--at", "x"}, "\"x\" is no grid point"},
      {{"add", setup, grid, "--in", "5", "--snap"}, "There is no area 5"},
      {{"add", setup, folder.file("none.tsb2"), "--snap"}, "none.tsb2"},
      {{"add", setup, local, "--snap"}, "do not both have coordinates"},
      {{"add", folder.file("none.v27"), grid, "--snap"}, "none.v27"},
      {{"move", setup, "1", "--at", "2,2"}, "no area 1 that could be moved"},
      {{"move", setup, "4", "--at", "2,2"}, "no area 4 that could be moved"},
      {{"move", setup, "2"}, "--at J,K"},
      {{"move", setup, "2", "--in", "2"}, "can't lie in area 2"},
      {{"move", setup, "2", "--snap"}, "do not both have coordinates"},
      {{"remove", setup, "1"}, "it encloses area 2"},
      {{"remove", setup, "9"}, "There is no area 9"},
      {{"remove", setup, "x"}, "x"}};
  for (auto [words, why] : cases) {
    words.insert(words.begin(), "area");
    const ProgramRun run = runTool(words);
    EXPECT_EQ(run.status, 2) << testing::PrintToString(words);
    EXPECT_THAT(run.err, HasSubstr(why));
  }
  EXPECT_EQ(test::textOf(setup), before);
}

TEST_F(AreaCommands, AreasNeitherLieInACircleNorLoseTheirEnclosingArea) {
  ASSERT_EQ(
      runTool({"area", "add", setup, folder.file("in.tsb2"), "--in", "2", "--at", "2,2", "--force"}).status,
      0);
  ProgramRun run = runTool({"area", "move", setup, "2", "--in", "3"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("Area 2 can't lie in area 3, which lies in it"));
  ASSERT_EQ(runTool({"area", "move", setup, "3", "--in", "1", "--at", "2,2"}).status, 0);
  ASSERT_EQ(runTool({"area", "move", setup, "2", "--in", "3", "--at", "2,2"}).status, 0);
  run = runTool({"area", "remove", setup, "3"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("it encloses area 2"));
}

TEST_F(AreaCommands, AGridThatCanNotNestIsRefusedWithWhatWould) {
  const std::string before = test::textOf(setup);
  const auto refused = [this](const test::GridSpec& spec, const std::string& at) {
    test::writeGrid(folder.file("n.tsb2"), spec);
    const ProgramRun run = runTool({"area", "add", setup, folder.file("n.tsb2"), "--at", at});
    EXPECT_EQ(run.status, 2);
    EXPECT_THAT(run.err, HasSubstr("The setup is unchanged; --force adds the area all the same"));
    return run.err;
  };
  EXPECT_THAT(
      refused({.noJ = 8, .noK = 7, .dx = 10, .dy = 10}, "10,8"),
      AllOf(HasSubstr("Grid dimension incorrect (jextr)."),
            HasSubstr("Area 3 has 8 x 7 points, 10 x 10 m apart: it goes from (10,8) to (12.3333,10) of "
                      "area 1, whose last point is (19,15)."),
            HasSubstr("What nests there is 10 x 10 m apart and lies from (1,1) to (18,14), with 1 + a "
                      "multiple of 3 points along each edge: 4, 7, 10 and so on, at most 25 x 19 from "
                      "(10,8)")));
  EXPECT_THAT(refused({.noJ = 28, .noK = 7, .dx = 10, .dy = 10}, "10,8"),
              AllOf(HasSubstr("Illegal position of area."), HasSubstr("to (19,10) of area 1")));
  EXPECT_THAT(refused({.noJ = 7, .noK = 7, .dx = 15, .dy = 15}, "0,8"),
              AllOf(HasSubstr("15 x 15 m apart"), HasSubstr("along each edge\n")));
  // Beside an area that it overlaps it would nest.
  EXPECT_THAT(refused({.noJ = 7, .noK = 7, .dx = 10, .dy = 10}, "6,5"),
              AllOf(HasSubstr("verlap"), testing::Not(HasSubstr("What nests there"))));
  EXPECT_EQ(test::textOf(setup), before);
  const ProgramRun run = runTool({"area", "add", setup, folder.file("n.tsb2"), "--at", "6,5", "--force"});
  EXPECT_EQ(run.status, 0);
  EXPECT_THAT(run.err, HasSubstr("verlap"));
  EXPECT_EQ(placeOf(setup, 3), "n.tsb2 in 1 from (6,5)");
}

TEST_F(AreaCommands, AnyAreaThatEnclosesNoneIsRemoved) {
  ASSERT_EQ(runTool({"area", "add", setup, folder.file("in.tsb2"), "--at", "10,8"}).status, 0);
  ProgramRun run = runTool({"area", "remove", setup, "2"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.out,
              HasSubstr("Area 2 is removed; its grid file is left\nThe areas behind it, up to 3, have "
                        "numbers less by one now\n"));
  EXPECT_EQ(placeOf(setup, 2), "in.tsb2 in 1 from (10,8)");
  EXPECT_EQ(placeOf(setup, 3), "none");
}

TEST_F(AreaCommands, HotStartFilesNameAreasByTheirNumbers) {
  ASSERT_EQ(runTool({"area", "add", setup, folder.file("in.tsb2"), "--at", "10,8"}).status, 0);
  ASSERT_EQ(runTool({"set", setup, "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Hot_Start=1"}).status, 0);
  const ProgramRun run = runTool({"area", "remove", setup, "2"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("whose hot start files name the areas that enclose them"));
  EXPECT_EQ(runTool({"area", "remove", setup, "3"}).status, 0);
}

TEST_F(AreaCommands, RemovalTellsWhatStoodOnTheArea) {
  root().sourceSink->SetNoSources(1);
  root().sourceSink->at(1).sourceArea = 2;
  setup = save();
  const ProgramRun run = runTool({"area", "remove", setup, "2"});
  EXPECT_EQ(run.status, 0);
  EXPECT_THAT(run.err, HasSubstr("page 40 stands on it"));
}

TEST_F(MapCommands, WhatIsPlacedIsReadBackFromTheExport) {
  makeTwoAreas();
  if (theEdition.wetlandSweepKit) root().bathymetry->SetNoAreas(1);
  root().boundary->defaultPosition = 0;
  root().boundary->SetNoBoundaries(1);
  root().boundary->at(1).Set(0, 2, 0, 9);
  root().sourceSink->SetNoSources(1);
  root().sourceSink->at(1).type = CSourceSinkObjectKvs::kPair;
  root().sourceSink->at(1).source = {1, 2};
  root().sourceSink->at(1).sink = {12, 9};
  root().nhdDike->SetCount(1);
  CNhdDikeObjectKvs& dike = root().nhdDike->at(1);
  dike.name = "Sea wall";
  dike.crestLevel = 2.5;
  dike.coordinateType = "EPSG:4326";
  const TsbGeography a = placeAt(500100, 6000100);
  const TsbGeography b = placeAt(500200, 6000200);
  dike.points.push_back({a.longitude, a.latitude, 3});
  dike.points.push_back({b.longitude, b.latitude, 3});
  const std::string out = folder.file("o.gpkg");
  const ProgramRun run = runTool({"export", "gis", save(), out});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.out,
              AllOf(HasSubstr("open_boundaries 1"), HasSubstr("source_sink_pairs 1"), HasSubstr("dikes 1")));
  const std::string summary = runProgram("ogrinfo", {"-so", "-al", out}).out;
  EXPECT_THAT(summary, HasSubstr("WGS 84 / UTM zone 32N"));
  const auto layer = [&out](const std::string& name) { return runProgram("ogrinfo", {"-q", out, name}).out; };
  EXPECT_THAT(layer("areas"), AllOf(HasSubstr("POLYGON ((499985"), HasSubstr("points_j (Integer64) = 20"),
                                    HasSubstr("land_value (Real) = 10")));
  EXPECT_THAT(layer("open_boundaries"),
              AllOf(HasSubstr("last_k (Integer64) = 9"), HasSubstr("driven_by (String) = level, constant"),
                    HasSubstr("LINESTRING")));
  EXPECT_THAT(layer("sources_and_sinks"),
              AllOf(HasSubstr("kind (String) = source"), HasSubstr("kind (String) = sink"),
                    HasSubstr("j (Integer64) = 12")));
  const std::string dikes = layer("dikes");
  EXPECT_THAT(dikes, AllOf(HasSubstr("name (String) = Sea wall"), HasSubstr("crest_level_m (Real) = 2.5"),
                           HasSubstr("page (String) = Dikes")));
  EXPECT_THAT(dikes, testing::ContainsRegex("LINESTRING \\((500100|500099\\.99)"));

  EXPECT_EQ(runTool({"export", "gis", save(), out}).status, 2);
  EXPECT_EQ(runTool({"export", "gis", save(), out, "--force"}).status, 0);
}

TEST_F(MapCommands, ExportsThatCanNotBe) {
  makeTwoAreas();
  if (theEdition.wetlandSweepKit) root().bathymetry->SetNoAreas(1);
  const std::string out = folder.file("o.gpkg");
  const std::string setup = save();
  EXPECT_EQ(runTool({"export", "gis", folder.file("none.v27"), out}).status, 2);
  ProgramRun run = runTool({"export", "gis", setup, folder.file("no/o.gpkg")});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("no/o.gpkg"));
  run = runTool({"export", "gis", setup, setup, "--force"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("must end in .gpkg"));
  fs::create_symlink(folder.file("a1.tsb2"), folder.file("a1.gpkg"));
  run = runTool({"export", "gis", setup, folder.file("a1.gpkg"), "--force"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("is a file that is read here"));
  fs::remove(folder.file("a1.tsb2"));
  run = runTool({"export", "gis", setup, out});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("Without the grid of Area 1"));
  EXPECT_FALSE(fs::exists(out));
  setFile(1, {.noJ = 20, .noK = 16});
  run = runTool({"export", "gis", setup, out});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.err, HasSubstr("local coordinates"));
  EXPECT_TRUE(fs::exists(out));
}

}  // namespace cli_map_commands_test
}  // namespace gridbay
