#include "advection_dispersion/box_summation.h"
#include "advection_dispersion/line_discharge.h"
#include "advection_dispersion/result.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/source_sink.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/result.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"
#include "tests/map/map_fixture.h"

namespace gridbay {
namespace map_scene_test {

using ::testing::DoubleNear;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class MapSceneTest : public test::MapFixture {
 protected:
  const MapScene& scene() { return map.scene(root()); }
  const std::string& fault(int number) { return scene().area(number)->fault; }

  SetupMap map;
};

TEST_F(MapSceneTest, AreasLieWhereTheSetupNestsThem) {
  makeTwoAreas();
  const MapScene& scene = this->scene();
  EXPECT_EQ(scene.projection, "WGS 84 / UTM zone 32N");
  EXPECT_THAT(scene.projectionText, HasSubstr("PROJCS"));
  ASSERT_EQ(scene.areas.size(), 2U);
  const MapArea& outer = scene.areas[0];
  EXPECT_THAT(outer.fault, IsEmpty());
  EXPECT_EQ(outer.level, 0);
  EXPECT_EQ(outer.nx, 20);
  EXPECT_EQ(outer.ny, 16);
  EXPECT_EQ(outer.landValue, 10.0F);
  EXPECT_EQ(text(outer.corners), "499985,5999985 500585,5999985 500585,6000465 499985,6000465");
  const MapArea& inner = scene.areas[1];
  EXPECT_THAT(inner.fault, IsEmpty());
  EXPECT_EQ(inner.level, 1);
  EXPECT_EQ(inner.enclosing, 1);
  EXPECT_EQ(inner.origin, (GridPoint{5, 4}));
  EXPECT_EQ(text(inner.grid.first), "500150,6000120");
  EXPECT_EQ(text(inner.grid.at(12, 9)), "500270,6000210");
  EXPECT_EQ(inner.file, folder.file("a2.tsb2"));
  EXPECT_FALSE(inner.offBy.has_value());
}

TEST_F(MapSceneTest, TurnedGridsTurnWhatLiesInThem) {
  makeTwoAreas(30);
  const MapArea& outer = *scene().area(1);
  EXPECT_NEAR(outer.rotation, 30, 1e-9);
  EXPECT_NEAR(outer.grid.stepK.east, 15, 1e-9);  // K leads 30 degrees clockwise from north
  EXPECT_NEAR(outer.grid.stepK.north, 30 * std::sqrt(3) / 2, 1e-9);
  EXPECT_NEAR(outer.grid.stepJ.east, 30 * std::sqrt(3) / 2, 1e-9);
  EXPECT_NEAR(outer.grid.stepJ.north, -15, 1e-9);
  const MapArea& inner = *scene().area(2);
  EXPECT_EQ(text(inner.grid.first), text(outer.grid.at(5, 4)));
  EXPECT_EQ(text(inner.grid.at(3, 6)), text(outer.grid.at(6, 6)));
  const MapPoint place = outer.grid.at(7.2, 5.9);
  EXPECT_EQ(map.pick(place, 1)->point, (GridPoint{7, 6}));
  EXPECT_EQ(map.pick(place, 0)->area, 2);
  EXPECT_EQ(map.pick(place, 0)->point, (GridPoint{7, 6}));  // 2.2 and 1.9 steps of 3 points
  EXPECT_EQ(map.pick(outer.grid.at(1, 1), 0)->area, 1);
  EXPECT_FALSE(map.pick(outer.grid.at(-2, 1), 0).has_value());
  const auto there = map.geographic(outer.grid.first);
  ASSERT_TRUE(there.has_value());
  EXPECT_NEAR((*there)[0], 9, 1e-6);
}

TEST_F(MapSceneTest, AFileSaysHowFarItIsFromWhereItsAreaIsPlaced) {
  makeTwoAreas();
  setFile(2, {.noJ = 13, .noK = 10, .dx = 10, .dy = 10, .geography = placeAt(500150 + 3, 6000120 - 4)});
  ASSERT_TRUE(scene().area(2)->offBy.has_value());
  EXPECT_NEAR(*scene().area(2)->offBy, 5, 1e-4);
  // In another projection it is brought to that of Area 1 first.
  double longitude = 0;
  double latitude = 0;
  CVdMapProjection("UTM-32").Proj2Geo(500150, 6000120, &longitude, &latitude);
  setFile(
      2,
      {.noJ = 13, .noK = 10, .dx = 10, .dy = 10, .geography = TsbGeography{"UTM-33", longitude, latitude}});
  EXPECT_NEAR(*scene().area(2)->offBy, 0, 1e-3);
}

TEST_F(MapSceneTest, WhatCanNotBePlacedSaysWhy) {
  makeTwoAreas();
  area(2).enclosingArea = 7;
  EXPECT_THAT(fault(2), HasSubstr("can't be placed in area 7"));
  area(2).enclosingArea = 2;
  EXPECT_FALSE(scene().area(2)->isPlaced);
  area(2).enclosingArea = 1;
  area(2).origin = {16, 4};  // 4 steps from there are beyond the last but one
  EXPECT_TRUE(scene().area(2)->isPlaced);
  EXPECT_THAT(fault(2), HasSubstr("Can not nest file"));
  area(2).origin = {5, 4};
  setFile(2, {.noJ = 13, .noK = 10, .dx = 15, .dy = 15});
  EXPECT_THAT(fault(2), HasSubstr("Ratio between gridpoint spacing is not 3"));
  setFile(2, {.noJ = 12, .noK = 10, .dx = 10, .dy = 10});
  EXPECT_THAT(fault(2), HasSubstr("jextr"));
  area(2).fileName = folder.file("none.tsb2");
  EXPECT_THAT(fault(2), HasSubstr("none.tsb2"));
  EXPECT_FALSE(scene().area(2)->isPlaced);
  area(2).fileName = folder.write("text.tsb2", "no grid");
  EXPECT_FALSE(scene().area(2)->isPlaced);
  test::writeSeries(folder.file("s.tsb0"), {}, 100000, "m");
  area(2).fileName = folder.file("s.tsb0");
  EXPECT_THAT(fault(2), HasSubstr("no two-dimensional grid"));
  area(2).fileName = "";
  EXPECT_EQ(fault(2), "Area 2 has no grid file");
  area(1).fileName = "";
  EXPECT_EQ(fault(1), "Area 1 has no grid file");
  EXPECT_EQ(scene().projection, "Local Coordinates");
}

TEST_F(MapSceneTest, AreasInARingAndAreasOnEachOther) {
  makeTwoAreas();
  root().bathymetry->SetNoAreas(3);
  setFile(3, {.noJ = 13, .noK = 10, .dx = 10, .dy = 10});
  area(3).enclosingArea = 1;
  area(3).origin = {8, 5};
  EXPECT_THAT(fault(3), HasSubstr("Overlap"));
  EXPECT_THAT(fault(2), HasSubstr("Overlap"));
  area(3).origin = {11, 5};
  EXPECT_THAT(fault(3), IsEmpty());
  area(2).enclosingArea = 3;
  area(3).enclosingArea = 2;
  EXPECT_FALSE(scene().area(2)->isPlaced);
  EXPECT_THAT(fault(3), HasSubstr("in area 2"));
}

TEST_F(MapSceneTest, HeadersAreReadAgainWhenTheFileIsWritten) {
  makeTwoAreas();
  const std::uint64_t before = scene().area(1)->fileState;
  EXPECT_EQ(scene().area(1)->fileState, before);
  setFile(1, {.noJ = 30, .noK = 16, .geography = placeAt(500000, 6000000)});
  EXPECT_NE(scene().area(1)->fileState, before);
  EXPECT_EQ(scene().area(1)->nx, 30);
}

TEST_F(MapSceneTest, BoundariesAreColouredByWhatDrivesThem) {
  makeTwoAreas();
  using Boundary = CNhdBoundaryObjectKvs;
  root().boundary->SetNoBoundaries(4);
  root().boundary->at(1).Set(0, 2, 0, 9);
  root().boundary->at(2).Set(3, 0, 9, 0);
  root().boundary->at(3).Set(3, 0, 9, 5);
  root().boundary->at(4).Set(19, 2, 19, 40);
  root().nhdBoundary->at(2).formulation = Boundary::kFlux;
  root().nhdBoundary->at(2).dataFormat = Boundary::kType0File;
  root().nhdBoundary->at(3).dataFormat = Boundary::kSineSeries;
  root().nhdBoundary->at(4).dataFormat = Boundary::kRatingCurve;
  const MapScene& scene = this->scene();
  const MapFeature& first = feature(scene, MapKind::boundary);
  EXPECT_EQ(text(*first.points), "500000,6000060 500000,6000270");
  EXPECT_EQ(first.label, "1");
  EXPECT_EQ(first.id.page, 28);
  EXPECT_EQ(first.row, 1);
  EXPECT_EQ(first.drive, MapDrive::levelConstant);
  EXPECT_THAT(first.fault, IsEmpty());
  EXPECT_EQ(feature(scene, MapKind::boundary, 2).drive, MapDrive::fluxFile);
  EXPECT_EQ(feature(scene, MapKind::boundary, 3).drive, MapDrive::levelSeries);
  EXPECT_THAT(feature(scene, MapKind::boundary, 3).fault, HasSubstr("parallel to neither axis"));
  EXPECT_EQ(feature(scene, MapKind::boundary, 4).drive, MapDrive::ratingCurve);
  EXPECT_EQ(feature(scene, MapKind::boundary, 4).fault,
            "Point (19,40) lies outside the grid of area 1, which has 20 x 16 points");
}

TEST_F(MapSceneTest, SourcesStandOnTheirAreas) {
  makeTwoAreas();
  using Source = CSourceSinkObjectKvs;
  root().sourceSink->SetNoSources(4);
  Source& pair = root().sourceSink->at(1);
  pair.type = Source::kPair;
  pair.source = {1, 2};
  pair.sink = {3, 3};
  pair.sinkArea = 2;
  root().sourceSink->at(2).type = Source::kIsolatedSink;
  root().sourceSink->at(2).sink = {2, 2};
  root().sourceSink->at(3).source = {6, 5};  // under area 2
  root().sourceSink->at(4).sourceArea = 3;
  const MapScene& scene = this->scene();
  EXPECT_EQ(text(*feature(scene, MapKind::source, 1).points), "500030,6000060 500180,6000150");
  EXPECT_EQ(feature(scene, MapKind::source, 1).drive, MapDrive::pair);
  EXPECT_EQ(feature(scene, MapKind::source, 2).drive, MapDrive::sink);
  EXPECT_EQ(text(*feature(scene, MapKind::source, 2).points), "500060,6000060");
  EXPECT_EQ(feature(scene, MapKind::source, 3).fault, "Point (6,5) of area 1 is covered by area 2");
  EXPECT_EQ(feature(scene, MapKind::source, 4).fault, "There is no area 3");
  EXPECT_THAT(*feature(scene, MapKind::source, 4).points, IsEmpty());
}

TEST_F(MapSceneTest, OutputsPolygonsLinesAndBoxes) {
  makeTwoAreas();
  auto& outputs = root().nhdResult->outputs;
  outputs.SetCount(3);
  outputs.at(1).part = {{1, 4, 1}, {2, 6, 1}};
  outputs.at(2).part = {{1, 4, 1}, {2, 2, 1}};
  outputs.at(2).title = "Across";
  outputs.at(3).type = CNhdResultObjectKvs::kPoints;
  outputs.at(3).pointsJ = {1, 2, 30};
  outputs.at(3).pointsK = {1, 2, 3};
  EXPECT_EQ(text(*feature(scene(), MapKind::outputMap, 1).points),
            "500030,6000060 500120,6000060 500120,6000180 500030,6000180");
  EXPECT_TRUE(feature(scene(), MapKind::outputMap, 1).closed);
  EXPECT_EQ(feature(scene(), MapKind::outputLine, 2).label, "Across");
  EXPECT_EQ(text(*feature(scene(), MapKind::outputLine, 2).points), "500030,6000060 500120,6000060");
  EXPECT_EQ(feature(scene(), MapKind::outputPoints, 3).points->size(), 3U);
  EXPECT_FALSE(feature(scene(), MapKind::outputPoints, 3).joined);
  EXPECT_THAT(feature(scene(), MapKind::outputPoints, 3).fault, HasSubstr("(30,3) lies outside the grid"));
  // Of modules only what is chosen.
  root().massBudget->SetNoPolygons(1);
  root().massBudget->at(1).associatedArea = 2;
  root().massBudget->at(1).corners = {{1, 1}, {5, 1}, {5, 12}};
  root().nadLineDischarge->SetCount(1);
  root().nadBoxSummation->SetCount(1);
  for (const MapFeature& each : scene().features) EXPECT_EQ(each.id.page, 38);
  root().moduleSelection->simulationType = module::kAdvectionDispersion;
  root().nadLineDischarge->at(1).first = {2, 8};
  root().nadLineDischarge->at(1).last = {6, 3};
  root().nadBoxSummation->at(1).areaNumber = 2;
  root().nadBoxSummation->at(1).first = {0, 0};
  root().nadBoxSummation->at(1).last = {3, 3};
  root().nadResult->outputs.SetCount(1);
  root().nadResult->outputs.at(1).part = {{5, 5, 1}, {5, 5, 1}};
  const MapFeature& polygon = feature(scene(), MapKind::massBudget);
  EXPECT_THAT(polygon.fault, HasSubstr("Point (5,12) lies outside, or on the border of, the grid of area 2"));
  EXPECT_EQ(polygon.row, 0);
  EXPECT_EQ(polygon.column, 1);
  EXPECT_EQ(text(*feature(scene(), MapKind::discharge).points), "500060,6000240 500180,6000090");
  EXPECT_EQ(text(*feature(scene(), MapKind::box).points),
            "500150,6000120 500180,6000120 500180,6000150 500150,6000150");
  EXPECT_EQ(feature(scene(), MapKind::outputPoints, 1).id.page, 23);
}

TEST_F(MapSceneTest, StructuresComeFromTheirOwnProjections) {
  makeTwoAreas();
  const MapPoint wanted{500100, 6000100};
  const TsbGeography place = placeAt(wanted.east, wanted.north);
  const TsbGeography end = placeAt(500200, 6000200);
  root().nhdDike->SetCount(2);
  CNhdDikeObjectKvs& dike = root().nhdDike->at(1);
  dike.name = "Sea wall";
  dike.coordinateType = "EPSG:4326";
  dike.points.push_back({place.longitude, place.latitude, 3});
  dike.points.push_back({end.longitude, end.latitude, 3});
  root().nhdDike->at(2).include = 0;
  root().nhdDike->at(2).coordinateType = "no projection";
  root().nhdWeir->SetCount(2);
  CNhdWeirObjectKvs& weir = root().nhdWeir->at(1);
  weir.coordinateType = "UTM-33";
  weir.x = {0, 0};
  weir.y = {0, 0};
  CVdMapProjection("UTM-33").Geo2Proj(place.longitude, place.latitude, weir.x.data(), weir.y.data());
  CVdMapProjection("UTM-33").Geo2Proj(end.longitude, end.latitude, &weir.x[1], &weir.y[1]);
  CNhdWeirObjectKvs& far = root().nhdWeir->at(2);
  far.coordinateType = "UTM-32";
  far.x = {400000, 400100};
  far.y = {6000000, 6000000};
  root().nhdCulvert->SetCount(1);
  root().nhdCulvert->at(1).coordinateType = "Local Coordinates";
  root().nhdCulvert->at(1).x = {1, 2};
  root().nhdCulvert->at(1).y = {1, 2};
  EXPECT_EQ(text(*feature(scene(), MapKind::dike).points), "500100,6000100 500200,6000200");
  EXPECT_EQ(feature(scene(), MapKind::dike).label, "Sea wall");
  EXPECT_THAT(feature(scene(), MapKind::dike).fault, IsEmpty());
  EXPECT_EQ(feature(scene(), MapKind::dike, 2).drive, MapDrive::off);
  EXPECT_THAT(feature(scene(), MapKind::dike, 2).fault, HasSubstr("has a projection that is not known"));
  EXPECT_EQ(text(*feature(scene(), MapKind::weir).points), "500100,6000100 500200,6000200");
  EXPECT_THAT(feature(scene(), MapKind::weir, 2).fault, HasSubstr("lies outside all areas"));
  EXPECT_THAT(feature(scene(), MapKind::culvert).fault, HasSubstr("has local coordinates"));
  // Kept as long as nothing changes, and made anew when it does.
  const MapLine before = feature(scene(), MapKind::weir).points;
  EXPECT_EQ(feature(scene(), MapKind::weir).points, before);
  weir.x.pop_back();
  weir.y.pop_back();
  EXPECT_THAT(feature(scene(), MapKind::weir).fault, HasSubstr("fewer than two points"));
  far.x = {500000, 500100};
  EXPECT_THAT(feature(scene(), MapKind::weir, 2).fault, IsEmpty());
  // Across Area 1, with both ends outside; past its corner, with its box over it.
  far.x = {499900, 500700};
  far.y = {6000100, 6000300};
  EXPECT_THAT(feature(scene(), MapKind::weir, 2).fault, IsEmpty());
  far.x = {499900, 500100};
  far.y = {6000400, 6000800};
  EXPECT_THAT(feature(scene(), MapKind::weir, 2).fault, HasSubstr("lies outside all areas"));
  far.x = {500000, 500000};
  far.y = {5999000, 6001000};
  EXPECT_THAT(feature(scene(), MapKind::weir, 2).fault, IsEmpty());
  setFile(1, {.noJ = 20, .noK = 16, .geography = placeAt(700000, 6000000)});
  EXPECT_THAT(feature(scene(), MapKind::weir, 2).fault, HasSubstr("lies outside all areas"));
}

TEST_F(MapSceneTest, WithoutAProjectionTheMapHasLocalCoordinates) {
  makeTwoAreas();
  setFile(1, {.noJ = 20, .noK = 16});
  root().nhdWeir->SetCount(2);
  for (int number : {1, 2}) {
    root().nhdWeir->at(number).x = {30, 60};
    root().nhdWeir->at(number).y = {30, 60};
  }
  root().nhdWeir->at(1).coordinateType = "Local Coordinates";
  root().nhdWeir->at(2).coordinateType = "UTM-32";
  EXPECT_EQ(scene().projection, "Local Coordinates");
  EXPECT_THAT(scene().projectionText, IsEmpty());
  EXPECT_EQ(text(scene().area(2)->grid.first), "150,120");
  EXPECT_EQ(text(*feature(scene(), MapKind::weir).points), "30,30 60,60");
  EXPECT_THAT(feature(scene(), MapKind::weir, 2).fault, HasSubstr("the grid of Area 1 has none"));
  EXPECT_FALSE(map.geographic({1, 1}).has_value());
}

TEST_F(MapSceneTest, ASetupWithoutAreasHasNothingToPlace) {
  root().bathymetry->SetNoAreas(0);
  root().sourceSink->SetNoSources(1);
  EXPECT_THAT(scene().areas, IsEmpty());
  EXPECT_EQ(feature(scene(), MapKind::source).fault, "There is no area 1");
  EXPECT_FALSE(map.pick({0, 0}, 0).has_value());
  EXPECT_FALSE(map.pick({0, 0}, 5).has_value());
}

}  // namespace map_scene_test
}  // namespace gridbay
