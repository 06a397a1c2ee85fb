// Grid files that fixes of areas make: where they lie, their values, and what they leave as it was.

#include <fmt/format.h>
#include <gmock/gmock.h>
#include <sys/resource.h>

#include <csignal>
#include <filesystem>
#include <functional>

#include "basic/module_selection.h"
#include "hydrodynamic/surface_elevation.h"
#include "platform/tsb/tsb_file.h"
#include "tests/advice/advice_fixture.h"

namespace gridbay {
namespace advice_area_fixes_test {

using ::testing::HasSubstr;

constexpr float kMissing = -1e-35F;
constexpr int kPoints = 10;

struct Grid {
  TsbDefinition file;
  std::vector<float> values;  // of the first item

  float at(int j, int k) const { return values[static_cast<std::size_t>(k * kPoints + j)]; }
};

class AreaFixes : public test::AdviceTest {
 protected:
  Grid grid(const std::string& name, std::size_t item = 1) const {
    const Result<TsbFile> file = TsbFile::open(folder.file(name));
    EXPECT_TRUE(file) << file.error();
    Grid read{file->definition(), std::vector<float>(file->definition().pointCount())};
    EXPECT_TRUE(file->read(item, 0, std::span(read.values)));
    return read;
  }
  // A grid file with something else said of it.
  void rewrite(const std::string& name, const std::function<void(TsbDefinition&)>& edit) const {
    Grid read = grid(name);
    edit(read.file);
    Result<TsbWriter> writer = TsbWriter::create(folder.file(name), read.file);
    ASSERT_TRUE(writer) << writer.error();
    for (std::size_t item = 1; item <= read.file.items.size(); ++item)
      ASSERT_TRUE(writer->write(item, 0, std::span<const float>(read.values)));
    ASSERT_TRUE(writer->commit());
    areFilesClean = false;
  }
  void projection(const std::string& name, const std::string& text) const {
    rewrite(name, [&](TsbDefinition& file) { file.geography->projection = text; });
  }
  void local(const std::string& name, double x = 0, double y = 0) const {
    rewrite(name, [&](TsbDefinition& file) {
      file.geography.reset();
      file.axes[0].first = x;
      file.axes[1].first = y;
    });
  }
  void innerOff(double east, const test::Surface& surface = sea) {
    Area area = inner();
    area.easting += east;
    write(area, surface);
  }
  // A third area at point (2,2) of area 2, by the coordinates of that, so far off.
  void third(double east) {
    write({"third.tsb2", kPoints, 10, kInner + 60 + east, kInnerNorth + 60}, sea);
    model->bathymetry->SetNoAreas(3);
    model->bathymetry->GetArea(3)->fileName = folder.file("third.tsb2");
    model->bathymetry->GetArea(3)->origin = {2, 2};
    model->simulationPeriod->timeStepInterval = 5;
  }
  // Area 2 as a hot start file that lies so far off its point, and says itself that it lies at (5,6).
  void hotStart(double east) {
    const auto spec = [](double easting, double northing, int points, double spacing) {
      test::GridSpec grid{.noJ = points, .noK = points, .dx = spacing, .dy = spacing, .land = 6};
      grid.geography = TsbGeography{"UTM-32", 0, 0, 0};
      CVdMapProjection("UTM-32").Proj2Geo(easting, northing, &grid.geography->longitude,
                                          &grid.geography->latitude);
      return grid;
    };
    test::writeHotStart(folder.file("outer.tsb2"), spec(480000, 6100000, 31, 90), coast, 0, 0, 0);
    test::writeHotStart(folder.file("inner.tsb2"), spec(kInner + east, kInnerNorth, kPoints, 30), sea, 1, 5,
                        6);
    areFilesClean = false;
    model->bathymetry->hotStart = 1;
  }
  // Makes the fix of the only advice there is.
  void mend() {
    const std::vector<Advice> found = look();
    ASSERT_EQ(found.size(), 1U);
    const Outcome made = makeFix(*model, found[0].fix, path);
    ASSERT_TRUE(made) << made.error();
  }
};

TEST_F(AreaFixes, EachMendsWhatItSpeaksOf) {
  const auto origin = [this](int j, int k) { model->bathymetry->GetArea(2)->origin = {j, k}; };
  const auto water = [this](float level) { model->nhdSurfaceElevation->GetItem(1)->constantValue = level; };
  const auto outer = [this](const test::Surface& surface) {
    model->boundary->SetNoBoundaries(0);
    write({"outer.tsb2"}, surface);
  };
  const auto low = [](int j, int) { return j < 15 ? -5.0F : 3.0F; };
  const auto high = [](int, int) { return 8.0F; };
  const std::string nested = "Values of area 2 at points that nest, in inner_nested.tsb2";
  const std::string placed = "Coordinates of area 2 by its place in the setup, in inner_placed.tsb2";
  speaks({
      {"area-position", "it belongs at (6,6), 91.2414 m away. That is the nearest point, 15 m off.", nested,
       [=, this] {
         Area area = inner();
         area.northing += 15;
         write(area, sea);
         origin(5, 6);
       }},
      {"area-position", "and yet 20 m off", nested,
       [this] {
         innerOff(20);
         third(20);
       }},
      {"area-position", "There it does not lie inside area 1.", placed,
       [this] {
         innerOff(-51 * 90);
         third(-51 * 90);
       }},
      {"area-position", "it belongs at (6,6), 90 m away", "Move area 2 to (6,6), in inner_placed.tsb2",
       [=, this] {
         hotStart(0);
         origin(5, 6);
       }},
      {"area-position", "and yet 15 m off", "Coordinates of area 2 at point (6,6), in inner_placed.tsb2",
       [=, this] { hotStart(15); }},
      {"projection", "The file of area 2 is in local coordinates, that of area 1 in WGS 84 / UTM zone 32N.",
       placed, [this] { local("inner.tsb2"); }},
      {"projection", "The file of area 2 is in WGS 84 / UTM zone 32N, that of area 1 in local coordinates.",
       placed, [this] { local("outer.tsb2"); }},
      {"projection", "The file of area 1 names a projection that there is not: \"UTM-99\".",
       "File of area 1 in WGS 84 / UTM zone 32N, in outer_placed.tsb2",
       [this] { projection("outer.tsb2", "UTM-99"); }},
      {"projection", "The file of area 2 names a projection that there is not: \"none\".",
       "File of area 2 in WGS 84 / UTM zone 32N, in inner_placed.tsb2",
       [this] { projection("inner.tsb2", "none"); }},
      {"projection", "There is no projection \"UTM-99\".", "Local coordinates",
       [this] {
         local("outer.tsb2");
         local("inner.tsb2");
         model->bathymetry->projection = "UTM-99";
       }},
      {"projection", "There is no projection \"UTM-99\".", "Projection of area 1: WGS 84 / UTM zone 32N",
       [this] {
         projection("outer.tsb2", "UTM");
         model->bathymetry->projection = "UTM-99";
       }},
      {"projection", "There is no projection \"UTM-0\", in which weir 1 is given.",
       "Projection of weir 1: Local Coordinates",
       [this] {
         local("outer.tsb2");
         local("inner.tsb2");
         model->bathymetry->projection = "";
         weir({100, 200}, {100, 200}).coordinateType = "UTM-0";
       }},
      {"land-value", "No point of area 1 lies below its land value of 6 m",
       "Land value of 10 m for area 1, in outer_land.tsb2",
       [=] {
         outer(high);
         water(8.5F);
       }},
      {"land-value", "No point of area 1 lies below its land value of 6 m",
       "Land value of 9 m for area 1, in outer_land.tsb2",
       [=, this] {
         outer(high);
         model->moduleSelection->hydrodynamicFeatures = 0;
       }},
      {"land-value", "No point of area 2 lies below its land value of 6 m",
       "Turn the depths of area 2 to elevations, in inner_turned.tsb2",
       [=, this] {
         write(inner(), high);
         model->simulationPeriod->timeStepInterval = 15;
       }},
      {"land-value", "The highest point of area 1 lies at 3 m",
       "Land value of 3 m for area 1, in outer_land.tsb2",
       [=] {
         outer(low);
         water(2.5F);
       }},
  });
  speaks({{"land-value", "The highest point of area 1 lies at 5 m",
           "Land value of 3 m for area 1, in outer_land.tsb2",
           [=] { outer([](int j, int) { return j < 15 ? 5.0F : 2.0F; }); }}});
  isSilent({
      [=] {  // all of it is to be flooded
        outer(low);
        water(3);
      },
      [=, this] {  // the check tells that it does not lie inside
        innerOff(-51 * 90);
        origin(28, 28);
      },
  });
}

TEST_F(AreaFixes, PointsThatNestTakeWhatLiesThere) {
  // Deeper eastwards, with a rock, and a point that is not known.
  innerOff(20, [](int j, int k) {
    return j == 4 && k == 4 ? 9.0F : j == 7 && k == 7 ? kMissing : -1 - 0.4F * static_cast<float>(j);
  });
  rewrite("inner.tsb2", [](TsbDefinition& file) { file.customBlocks.push_back({"Other", {1, 2}}); });
  mend();
  EXPECT_EQ(model->bathymetry->GetArea(2)->fileName.text(), "inner_nested.tsb2");
  const Grid made = grid("inner_nested.tsb2");
  EXPECT_NEAR(made.file.axes[0].first, kInner, 1e-6);
  EXPECT_NEAR(made.file.axes[1].first, kInnerNorth, 1e-6);
  EXPECT_EQ(made.file.axes[0].spacing, 30);
  EXPECT_EQ(made.file.geography->projection, "UTM-32");
  ASSERT_EQ(made.file.customBlocks.size(), 2U);
  EXPECT_EQ(made.file.customBlocks[0].values, (std::vector<float>{0, 0, 0, 6}));
  EXPECT_EQ(made.file.customBlocks[1].values, (std::vector<float>{1, 2}));
  EXPECT_THAT(made.file.history, HasSubstr("points that nest in " + folder.file("outer.tsb2")));
  EXPECT_EQ(made.at(0, 3), -5);  // of area 1: more than half a point beyond its own
  EXPECT_NEAR(made.at(2, 1), -1 - 0.4 * (2 - 20.0 / 30), 1e-4);
  EXPECT_EQ(made.at(5, 4), 9);
  EXPECT_FLOAT_EQ(made.at(4, 4), -2.2F);  // the nearest one, as one beside it is land
  EXPECT_EQ(made.at(8, 7), -5);           // of area 1, as the nearest one is missing
  EXPECT_FLOAT_EQ(made.at(7, 7), -3.4F);
}

// A slope to the north by latitude stays one, whatever way the grid runs.
TEST_F(AreaFixes, AnotherProjectionTakesWhatLiesThere) {
  double longitude = 0;
  double latitude = 0;
  Area area = inner();
  CVdMapProjection("UTM-32").Proj2Geo(area.easting, area.northing, &longitude, &latitude);
  const CVdMapProjection zone33("UTM-33");
  zone33.Geo2Proj(longitude, latitude, &area.easting, &area.northing);
  area.projection = "UTM-33";
  const auto heightAt = [=](const CVdMapProjection& map, double x, double y) {
    double east = 0;
    double north = 0;
    map.Proj2Geo(x, y, &east, &north);
    return static_cast<float>(-5 + (north - latitude) * 500);
  };
  write(area, [&](int j, int k) { return heightAt(zone33, area.easting + 30 * j, area.northing + 30 * k); });
  mend();
  const Grid made = grid("inner_nested.tsb2");
  const CVdMapProjection zone32("UTM-32");
  EXPECT_EQ(made.file.geography->projection, "UTM-32");
  for (const auto& [j, k] : {std::pair{0, 0}, {4, 5}, {8, 8}, {2, 7}})
    EXPECT_NEAR(made.at(j, k), heightAt(zone32, kInner + 30 * j, kInnerNorth + 30 * k), 0.002)
        << j << ',' << k;
}

TEST_F(AreaFixes, CoordinatesAreThoseOfThePlaceInTheSetup) {
  local("outer.tsb2", 1000, 2000);
  local("inner.tsb2", 5000, 5000);
  third(0);
  local("third.tsb2", 5060, 5060);
  mend();
  const Grid made = grid("inner_placed.tsb2");
  EXPECT_EQ(made.file.axes[0].first, 1540);
  EXPECT_EQ(made.file.axes[1].first, 2540);
  EXPECT_EQ(made.values, grid("inner.tsb2").values);
  EXPECT_EQ(grid("third_placed.tsb2").file.axes[0].first, 1600);
  EXPECT_TRUE(look().empty());
}

TEST_F(AreaFixes, AHotStartSaysItselfWhereItLies) {
  hotStart(0);
  model->bathymetry->GetArea(2)->origin = {5, 6};
  mend();
  const Grid made = grid("inner_placed.tsb2");
  EXPECT_EQ(made.file.dataType, 11);
  EXPECT_EQ(std::vector<float>(made.values.begin(), made.values.begin() + 8),
            (std::vector<float>{0.5, 0.5, 0.5, 0.5, 1, 6, 6, 0.5}));
  EXPECT_EQ(grid("inner_placed.tsb2", 2).values, grid("inner.tsb2", 2).values);
  ValidationList messages;
  EXPECT_EQ(model->bathymetry->GetArea(2)->ReadGrid(messages, 2), 0U);
  EXPECT_EQ(model->bathymetry->GetArea(2)->origin, (GridPoint{6, 6}));
}

// Where neither the setup nor a file knows a projection, all become local, one by one.
TEST_F(AreaFixes, NoProjectionIsKnownAnywhere) {
  model->bathymetry->projection = "UTM-99";
  projection("outer.tsb2", "none");
  projection("inner.tsb2", "none");
  int fixes = 0;
  for (std::vector<Advice> found = look(); !found.empty() && fixes < 5; found = look()) {
    ASSERT_TRUE(makeFix(*model, found[0].fix, path));
    ++fixes;
  }
  EXPECT_EQ(fixes, 3);
  EXPECT_TRUE(look().empty());
  EXPECT_EQ(model->bathymetry->projection, "Local Coordinates");
  EXPECT_FALSE(grid("outer_placed.tsb2").file.geography);
  EXPECT_EQ(grid("inner_placed.tsb2").file.axes[0].first, kInner);
}

TEST_F(AreaFixes, AllThatNameAFileTakeItsCopy) {
  model->bathymetry->overlandFile = folder.file("outer.tsb2");
  write({"outer.tsb2"}, [](int j, int) { return j < 15 ? -5.0F : 3.0F; });
  mend();
  EXPECT_EQ(model->bathymetry->GetArea(1)->fileName.text(), "outer_land.tsb2");
  EXPECT_EQ(model->bathymetry->overlandFile.text(), "outer_land.tsb2");
}

// A conversion closes gaps with the land value, which is no terrain; a shore that is land throughout is.
TEST_F(AreaFixes, AFewPointsAtTheLandValueAreGaps) {
  const auto surface = [](int gaps) {
    return [gaps](int j, int k) { return k < gaps && j == 20 ? 50.0F : j < 15 ? -5.0F : 3.0F; };
  };
  Area area{"outer.tsb2"};
  area.land = 50;
  write(area, surface(1));
  std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  EXPECT_THAT(found[0].doubt,
              HasSubstr("The highest point of area 1 lies at 3 m, below its land value of 50 m"));
  mend();
  EXPECT_TRUE(look().empty());
  clean();
  write(area, surface(31));
  EXPECT_TRUE(look().empty());
}

// What was land by lying at the land value stays land where that rises.
TEST_F(AreaFixes, LandAtALandValueThatRisesStaysLand) {
  model->boundary->SetNoBoundaries(0);
  Area area{"outer.tsb2"};
  area.land = 0;
  write(area, [](int j, int) { return j == 0 ? 0.0F : 0.5F; });
  model->moduleSelection->hydrodynamicFeatures = 0;
  mend();
  const Grid made = grid("outer_land.tsb2");
  EXPECT_EQ(made.values[0], 2);
  EXPECT_EQ(made.values[1], 0.5F);
}

// What the file gives would be back with the next check.
TEST_F(AreaFixes, AHotStartFileSaysTheStepAndTheStart) {
  hotStart(0);
  model->simulationPeriod->timeStepInterval = 300;
  model->simulationPeriod->noPointsInTime = 25;  // two hours
  EXPECT_TRUE(look().empty());
  model->simulationPeriod->timeStepInterval = 20;
  model->simulationPeriod->noPointsInTime = 361;
  writeTide(smooth(14), start().plusDays(10.0 / 1440));
  const std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  EXPECT_THAT(found[0].fix.name, HasSubstr("tide_moved.tsb0"));
}

// Terrain that is all dry is no sea, though none of it is land.
TEST_F(AreaFixes, OfDryTerrainTheHigherHalfBecomesLand) {
  Area area{"outer.tsb2"};
  area.land = 50;
  write(area, [](int j, int) { return 2.0F + static_cast<float>(j); });
  model->boundary->SetNoBoundaries(0);
  const std::vector<Advice> found = look();
  const auto land = std::ranges::find(found, "land-value", &Advice::kind);
  ASSERT_NE(land, found.end());
  EXPECT_EQ(land->fix.name, "Land value of 17 m for area 1, in outer_land.tsb2");
  ASSERT_TRUE(makeFix(*model, land->fix, path));
  for (const Advice& left : look()) EXPECT_NE(left.kind, "land-value") << left.doubt;
}

// A flat sea at a land value that is too low is no land to keep, and what is nothing but land is left alone.
TEST_F(AreaFixes, ASeaAtTheLandValueBecomesWater) {
  model->boundary->SetNoBoundaries(0);
  Area area{"outer.tsb2"};
  area.land = 0;
  write(area, [](int j, int) { return j < 15 ? 0.0F : 4.0F; });
  mend();
  EXPECT_THAT(grid("outer_land.tsb2").values, ::testing::Each(::testing::AnyOf(0, 4)));
  EXPECT_TRUE(look().empty());
  clean();
  model->boundary->SetNoBoundaries(0);
  write(area, [](int, int) { return 0.0F; });
  EXPECT_TRUE(look().empty());
}

// Land and closed gaps are no depths.
TEST_F(AreaFixes, OfDepthsTheLandStays) {
  model->boundary->SetNoBoundaries(0);
  Area area{"outer.tsb2"};
  area.land = 10;
  write(area, [](int j, int) { return j < 15 ? 12.0F + static_cast<float>(j) : 10.0F; });
  mend();
  const Grid made = grid("outer_turned.tsb2");
  EXPECT_EQ(made.values[0], -12);
  EXPECT_EQ(made.values[20], 10);
}

// Where the water stands is not known of a rating curve, and an area ashore is no sea.
TEST_F(AreaFixes, WhatMayBeLandIsNotTurned) {
  model->boundary->SetNoBoundaries(0);
  write({"outer.tsb2"}, [](int, int) { return 8.0F; });
  CNhdBoundaryKvs& flow = *model->nhdBoundary;
  model->boundary->SetNoBoundaries(1);
  model->boundary->GetItem(1)->Set(0, 0, 0, 30);
  flow.GetItem(1)->formulation = CNhdBoundaryObjectKvs::kLevel;
  flow.GetItem(1)->dataFormat = CNhdBoundaryObjectKvs::kRatingCurve;
  const std::vector<Advice> found = look();
  const auto land = std::ranges::find(found, "land-value", &Advice::kind);
  ASSERT_NE(land, found.end());
  EXPECT_EQ(land->fix.name, "Land value of 9 m for area 1, in outer_land.tsb2");
  clean();
  write({"outer.tsb2"}, [](int j, int) { return j > 14 ? 8.0F : -5.0F; });
  write({"inner.tsb2", kPoints, 30, kInner + 14 * 90, kInnerNorth}, [](int, int) { return 8.0F; });
  model->bathymetry->GetArea(2)->origin = {20, 6};
  ASSERT_EQ(look().size(), 1U);
  EXPECT_EQ(look()[0].fix.name, "Land value of 9 m for area 2, in inner_land.tsb2");
}

TEST_F(AreaFixes, WhatIsNotToChangeStays) {
  TsbDefinition file = test::definitionOf({.noJ = 10, .noK = 12, .land = 6, .items = 2, .steps = 2});
  file.title = "A bay";
  file.history = "made";
  file.items[0].isDouble = true;
  file.items[0].deleteValue = -9999;
  file.customBlocks.insert(file.customBlocks.begin(), {"Other", {5}});
  std::vector<double> doubles(120, 12.1);
  doubles[7] = -9999;
  const std::vector<float> singles(120, 3);
  Result<TsbWriter> writer = TsbWriter::create(folder.file("a.tsb2"), file);
  ASSERT_TRUE(writer) << writer.error();
  for (const std::size_t step : {0U, 1U}) {
    ASSERT_TRUE(writer->write(1, step, std::span<const double>(doubles)));
    ASSERT_TRUE(writer->write(2, step, std::span<const float>(singles)));
  }
  ASSERT_TRUE(writer->commit());
  ASSERT_TRUE(makeFile(TurnedGrid{1}, folder.file("a.tsb2"), folder.file("b.tsb2"), {}));
  ASSERT_TRUE(makeFile(LandValueGrid{2.5F}, folder.file("b.tsb2"), folder.file("c.tsb2"), {}));
  const Result<TsbFile> made = TsbFile::open(folder.file("c.tsb2"));
  ASSERT_TRUE(made) << made.error();
  EXPECT_EQ(made->definition().title, "A bay");
  EXPECT_THAT(made->definition().history,
              ::testing::MatchesRegex("made\n.*: depths turned to elevations\n.*: land value set to 2.5"));
  ASSERT_EQ(made->definition().customBlocks.size(), 2U);
  EXPECT_EQ(made->definition().customBlocks[0].values, (std::vector<float>{5}));
  EXPECT_EQ(made->definition().customBlocks[1].values, (std::vector<float>{0, 0, 0, 2.5}));
  std::vector<double> turned(120);
  for (double& value : doubles) value = value == -9999 ? value : -value;
  std::vector<float> second(120);
  for (const std::size_t step : {0U, 1U}) {
    ASSERT_TRUE(made->read(1, step, std::span(turned)));
    EXPECT_EQ(turned, doubles);
    ASSERT_TRUE(made->read(2, step, std::span(second)));
    EXPECT_EQ(second, singles);
  }
}

TEST_F(AreaFixes, ALargeGridGoesByPieces) {
  constexpr int kMany = 1201;
  write({"large.tsb2", kMany}, [](int j, int k) { return static_cast<float>(1 + j + k); });
  std::vector<double> told;
  const auto tell = [&told](double done) {
    told.push_back(done);
    return true;
  };
  ASSERT_TRUE(makeFile(TurnedGrid{1}, folder.file("large.tsb2"), folder.file("turned.tsb2"), tell));
  ASSERT_EQ(told.size(), 2U);
  EXPECT_LT(told[0], 1);
  EXPECT_EQ(told[1], 1);
  EXPECT_EQ(grid("turned.tsb2").values.back(), -(1.0F + 2 * (kMany - 1)));
}

TEST_F(AreaFixes, WhatCantBeMadeLeavesNothingBehind) {
  const std::string from = folder.file("inner.tsb2");
  const std::string to = folder.file("made.tsb2");
  const GridLocation location{"UTM-32", 9, 55, 0, kInner, kInnerNorth};
  const ResampledGrid resampled{location, 30, 30, folder.file("outer.tsb2")};
  const FileMaking makings[] = {PlacedGrid{location}, resampled, LandValueGrid{3}, TurnedGrid{1}};
  const std::string text = test::textOf(from);
  folder.write("cut.tsb2", text.substr(0, text.size() / 2));
  folder.write("none.tsb2", "no data file");
  test::writeSeries(folder.file("series.tsb0"), {}, 100000, "m");
  const auto errorOf = [&](const std::string& source, const FileMaking& making,
                           const std::function<bool(double)>& progress = {}) {
    const Outcome made = makeFix(*model, {"Made", {}, {{folder.file(source), to, making}}}, path, progress);
    EXPECT_FALSE(std::filesystem::exists(to));
    return made ? std::string() : made.error();
  };
  const auto files = [this] { return std::distance(std::filesystem::directory_iterator(folder.path()), {}); };
  const auto before = files();
  for (const FileMaking& making : makings) {
    SCOPED_TRACE(making.index());
    EXPECT_THAT(errorOf("missing.tsb2", making), HasSubstr("missing.tsb2"));
    EXPECT_THAT(errorOf("cut.tsb2", making), HasSubstr("cut.tsb2"));
    EXPECT_THAT(errorOf("none.tsb2", making), HasSubstr("none.tsb2"));
    EXPECT_THAT(errorOf("series.tsb0", making), HasSubstr("series.tsb0 holds no map"));
    EXPECT_EQ(errorOf("inner.tsb2", making, [](double) { return false; }), "The fix was stopped");
    std::signal(SIGXFSZ, SIG_IGN);
    rlimit whole{};
    getrlimit(RLIMIT_FSIZE, &whole);
    rlimit little = whole;
    little.rlim_cur = 2000;
    setrlimit(RLIMIT_FSIZE, &little);
    const std::string full = errorOf("inner.tsb2", making);
    setrlimit(RLIMIT_FSIZE, &whole);
    EXPECT_THAT(full, HasSubstr("the disk is full"));
  }
  ResampledGrid alone = resampled;
  alone.around = folder.file("missing.tsb2");
  EXPECT_THAT(errorOf("inner.tsb2", alone), HasSubstr("missing.tsb2"));
  alone = resampled;
  alone.location.projection = "none";
  EXPECT_NE(errorOf("inner.tsb2", alone), "");
  EXPECT_EQ(files(), before);
}

}  // namespace advice_area_fixes_test
}  // namespace gridbay
