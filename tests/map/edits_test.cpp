#include <filesystem>
#include <fstream>

#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/result.h"
#include "map/document_map.h"
#include "platform/tsb/tsb_file.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"
#include "tests/map/map_fixture.h"
#include "tests/support/programs.h"

namespace gridbay {
namespace map_edits_test {

using ::testing::AllOf;
using ::testing::Each;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class MapEdits : public test::MapFixture {
 protected:
  // A place by J and K of Area 1, which is not turned.
  static MapPoint at(double j, double k) { return {500000 + 30 * j, 6000000 + 30 * k}; }
  static MapFeatureId id(MapKind kind, int number, std::int32_t page = 0) { return {kind, number, page}; }
  std::string lastStep() { return document.UndoStep() == nullptr ? "" : document.UndoStep()->name; }
  std::vector<float> values(const std::string& path, std::size_t count) {
    std::vector<float> all(count);
    Result<TsbFile> file = TsbFile::open(path);
    EXPECT_TRUE(file) << (file ? "" : file.error());
    if (file) EXPECT_TRUE(file->read(1, 0, std::span<float>(all)));
    return all;
  }

  std::unique_ptr<MapEditor> map = makeMapEditor(document);
};

TEST_F(MapEdits, AnAreaSnapsToThePointsAroundIt) {
  makeTwoAreas();
  const std::uint64_t before = document.ModelState();
  const AreaPlace shown = map->previewMoveArea(2, at(8.4, 6.6));
  EXPECT_EQ(shown.origin, (GridPoint{8, 7}));
  EXPECT_EQ(text(shown.grid.first), text(at(8, 7)));
  EXPECT_THAT(shown.fault, IsEmpty());
  EXPECT_EQ(area(2).origin, (GridPoint{5, 4}));
  EXPECT_EQ(document.ModelState(), before);

  EXPECT_THAT(map->moveArea(2, at(8.4, 6.6)), IsEmpty());
  EXPECT_EQ(area(2).origin, (GridPoint{8, 7}));
  EXPECT_EQ(lastStep(), "Area 2, Origin");
  EXPECT_TRUE(document.IsModified());
  document.Undo();
  EXPECT_EQ(area(2).origin, (GridPoint{5, 4}));
  // It stays inside: from (1,1) to the last but one less its extent of 4 x 3.
  EXPECT_THAT(map->moveArea(2, at(-100, 500)), IsEmpty());
  EXPECT_EQ(area(2).origin, (GridPoint{1, 11}));
  EXPECT_THAT(map->moveArea(2, at(500, -100)), IsEmpty());
  EXPECT_EQ(area(2).origin, (GridPoint{14, 1}));
  EXPECT_THAT(map->scene().area(2)->fault, IsEmpty());
}

TEST_F(MapEdits, AreasThatCanNotBeMoved) {
  makeTwoAreas();
  const std::uint64_t before = document.ModelState();
  EXPECT_EQ(map->moveArea(1, at(1, 1)), "Area 1 lies where its file says");
  EXPECT_EQ(map->moveArea(3, at(1, 1)), "Area 3 has no place on the map");
  EXPECT_EQ(map->moveArea(-1, at(1, 1)), "Area -1 has no place on the map");
  area(2).fileName = folder.file("none.tsb2");
  document.RecordEdit(PageId::bathymetry, "x");
  EXPECT_EQ(map->moveArea(2, at(1, 1)), "Area 2 has no place on the map");
  document.Undo();
  root().bathymetry->hotStart = 1;
  EXPECT_THAT(map->moveArea(2, at(1, 1)), HasSubstr("hot start"));
  if (!theEdition.wetlandSweepKit)
    EXPECT_THAT(map->addNestedArea(at(11, 9), at(13, 10), "r.tif", "n.tsb2"), HasSubstr("hot start"));
  root().bathymetry->hotStart = 0;
  EXPECT_EQ(document.ModelState(), before);
}

TEST_F(MapEdits, ARectangleBecomesANestedArea) {
  makeTwoAreas();
  // Steps of Area 1 that rise with J and K, and land beyond J 12.
  const auto surface = [](int j, int k) { return j > 12 ? 10.0F : static_cast<float>(-100 + 3 * j + 2 * k); };
  setFile(1, {.noJ = 20, .noK = 16, .geography = placeAt(500000, 6000000)}, surface);
  const AreaPlace shown = map->previewNestedArea(at(13.8, 10.2), at(10.6, 8.9));
  EXPECT_EQ(shown.enclosing, 1);
  EXPECT_EQ(shown.origin, (GridPoint{11, 9}));
  EXPECT_EQ(shown.nx, 10);
  EXPECT_EQ(shown.ny, 4);
  EXPECT_THAT(shown.fault, IsEmpty());
  const std::string made = folder.file("new.tsb2");
  const std::string fault =
      map->addNestedArea(at(13.8, 10.2), at(10.6, 8.9), area(1).fileName.absolute(), made);
  if (theEdition.wetlandSweepKit) {
    EXPECT_EQ(fault, "This edition has one area");
    EXPECT_FALSE(std::filesystem::exists(made));
    return;
  }
  ASSERT_THAT(fault, IsEmpty());
  EXPECT_EQ(lastStep(), "New area 3");
  ASSERT_EQ(root().bathymetry->GetCount(), 3);
  EXPECT_EQ(area(3).origin, (GridPoint{11, 9}));
  EXPECT_EQ(area(3).enclosingArea, 1);
  EXPECT_EQ(host.titles.back(), "Cutting the grid of the new area");
  EXPECT_EQ(host.progress.back(), 1);
  EXPECT_THAT(map->scene().area(3)->fault, IsEmpty());
  EXPECT_NEAR(map->scene().area(3)->dx, 10, 1e-9);
  EXPECT_EQ(map->scene().area(3)->landValue, 10.0F);
  EXPECT_NEAR(*map->scene().area(3)->offBy, 0, 1e-3);
  // Between points the values are interpolated; next to land the nearest one counts.
  const std::vector<float> got = values(made, 40);
  EXPECT_FLOAT_EQ(got[0], -100 + 33 + 18);
  EXPECT_NEAR(got[1], -48, 1e-3);
  EXPECT_NEAR(got[10], -49 + 2.0 / 3, 1e-3);
  EXPECT_FLOAT_EQ(got[3], -46);
  EXPECT_FLOAT_EQ(got[4], -46);
  EXPECT_FLOAT_EQ(got[5], 10);
  document.Undo();
  EXPECT_EQ(root().bathymetry->GetCount(), 2);
}

TEST_F(MapEdits, ANestedAreaIsCutFromARasterOfAnotherKind) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one area";
  makeTwoAreas();
  // A plain of 7 in the west half of the rectangle; the rest of it is that of Area 1.
  std::string rows =
      "ncols 40\nnrows 100\nxllcorner 500330\nyllcorner 6000200\ncellsize 3\nNODATA_value -99\n";
  for (int row = 0; row < 100; ++row) {
    for (int column = 0; column < 40; ++column) rows += column < 20 ? "7 " : "-99 ";
    rows += "\n";
  }
  const std::string raster = folder.file("r.tif");
  const std::string plain = folder.write("r.asc", rows);
  ASSERT_EQ(test::runProgram("gdal_translate", {"-q", "-a_srs", "EPSG:32632", plain, raster}).status, 0);
  const std::string made = folder.file("new.tsb2");
  ASSERT_THAT(map->addNestedArea(at(12, 9), at(16, 12), raster, made), IsEmpty());
  const std::vector<float> got = values(made, 13 * 10);
  EXPECT_FLOAT_EQ(got[0], 7);
  EXPECT_FLOAT_EQ(got[2], 7);
  EXPECT_FLOAT_EQ(got[5], -5);
  EXPECT_FLOAT_EQ(got[12], -5);
  // The same where the file names no projection: it lies in that of the map.
  document.Undo();
  ASSERT_THAT(map->addNestedArea(at(12, 9), at(16, 12), plain, folder.file("plain.tsb2")), IsEmpty());
  EXPECT_EQ(values(folder.file("plain.tsb2"), 13 * 10), got);
  // In another projection it is brought to that of Area 1, here with a turn of the grid as well.
  setFile(1, {.noJ = 20, .noK = 16, .geography = placeAt(500000, 6000000, 20)});
  const std::string other = folder.file("o.tif");
  ASSERT_EQ(test::runProgram("gdalwarp", {"-q", "-t_srs", "EPSG:4326", raster, other}).status, 0);
  const MapGrid grid = map->scene().area(1)->grid;
  const auto [j, k] = grid.pointOf({500372, 6000230});
  document.Undo();
  ASSERT_THAT(map->addNestedArea(grid.at(j - 2, k - 2), grid.at(j + 2, k + 2), other, folder.file("t.tsb2")),
              IsEmpty());
  const MapArea& turned = map->scene().areas.back();
  const std::vector<float> all =
      values(turned.file, static_cast<std::size_t>(turned.nx) * static_cast<std::size_t>(turned.ny));
  const auto point = map->pick({500372, 6000230}, turned.number)->point;
  EXPECT_FLOAT_EQ(all[static_cast<std::size_t>(point.k * turned.nx + point.j)], 7);
  EXPECT_THAT(all, testing::Contains(-5.0F));
}

TEST_F(MapEdits, LandOfALowerValueStaysLand) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one area";
  makeTwoAreas();
  const auto surface = [](int j, int) { return j > 12 ? 4.0F : j == 12 ? 3.5F : -2.0F; };
  const std::string low = folder.file("low.tsb2");
  test::writeGrid(low, {.noJ = 20, .noK = 16, .land = 4.0F, .geography = placeAt(500000, 6000000)}, surface);
  ASSERT_THAT(map->addNestedArea(at(11, 9), at(14, 10), low, folder.file("new.tsb2")), IsEmpty());
  const std::vector<float> got = values(folder.file("new.tsb2"), 10 * 4);
  EXPECT_EQ(map->scene().areas.back().landValue, 10.0F);
  EXPECT_FLOAT_EQ(got[0], -2);
  EXPECT_FLOAT_EQ(got[3], 3.5F);  // wet, though it is higher than all that is beside it
  EXPECT_FLOAT_EQ(got[4], 3.5F);
  EXPECT_THAT(std::vector(got.begin() + 5, got.begin() + 10), Each(10.0F));
}

TEST_F(MapEdits, NestedAreasThatCanNotBe) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one area";
  makeTwoAreas();
  const std::string source = area(1).fileName.absolute();
  const std::string out = folder.file("new.tsb2");
  const auto add = [&](MapPoint a, MapPoint b, const std::string& raster, const std::string& file) {
    return map->addNestedArea(a, b, raster, file);
  };
  EXPECT_EQ(add(at(-3, 2), at(4, 4), source, out), "No area holds the whole rectangle");
  EXPECT_EQ(add(at(2, 2), at(2.1, 4), source, out),
            "The rectangle is smaller than a cell of the area around it");
  EXPECT_THAT(add(at(8, 5), at(12, 9), source, out), HasSubstr("Overlap"));
  EXPECT_THAT(add(at(12, 9), at(16, 12), folder.file("none.tif"), out), HasSubstr("none.tif"));
  EXPECT_THAT(add(at(12, 9), at(16, 12), folder.write("bad.tif", "no raster"), out), HasSubstr("bad.tif"));
  EXPECT_THAT(add(at(12, 9), at(16, 12), source, source), HasSubstr("a1.tsb2"));
  EXPECT_THAT(add(at(12, 9), at(16, 12), source, folder.file("no/such/new.tsb2")), HasSubstr("new.tsb2"));
  host.stopAt = 0;
  EXPECT_THAT(add(at(12, 9), at(16, 12), source, out), HasSubstr("nothing is written"));
  host.stopAt = 2;
  test::writeGrid(folder.file("far.tsb2"), {.geography = placeAt(300000, 5000000)});
  EXPECT_THAT(add(at(12, 9), at(16, 12), folder.file("far.tsb2"), out), HasSubstr("has no values"));
  EXPECT_FALSE(std::filesystem::exists(out));
  EXPECT_EQ(root().bathymetry->GetCount(), 2);
  EXPECT_EQ(lastStep(), "made");
}

TEST_F(MapEdits, EndsOfBoundariesSlideAlongTheBorder) {
  makeTwoAreas();
  root().boundary->SetNoBoundaries(1);
  root().boundary->at(1).Set(0, 2, 0, 9);
  EXPECT_THAT(map->moveVertex(id(MapKind::boundary, 1), 1, at(0, 5)), HasSubstr("User specified"));
  EXPECT_THAT(map->previewVertex(id(MapKind::boundary, 1), 1, at(0, 5)).fault, HasSubstr("User specified"));
  root().boundary->defaultPosition = 0;
  const VertexPlace shown = map->previewVertex(id(MapKind::boundary, 1), 1, at(3, 12.4));
  EXPECT_EQ(shown.point, (GridPoint{0, 12}));
  EXPECT_EQ(text(shown.place), text(at(0, 12)));
  EXPECT_THAT(map->moveVertex(id(MapKind::boundary, 1, 28), 1, at(3, 12.4)), IsEmpty());
  EXPECT_EQ(root().boundary->at(1).last, (GridPoint{0, 12}));
  EXPECT_EQ(lastStep(), "Boundary 1, Last point");
  EXPECT_THAT(map->moveVertex(id(MapKind::boundary, 1, 28), 0, at(-7, -90)), IsEmpty());
  EXPECT_EQ(root().boundary->at(1).first, (GridPoint{0, 0}));
  // From a corner it may go either way.
  EXPECT_THAT(map->moveVertex(id(MapKind::boundary, 1, 28), 1, at(9, 1)), IsEmpty());
  EXPECT_EQ(root().boundary->at(1).last, (GridPoint{9, 0}));
  EXPECT_THAT(map->addFeature(MapKind::boundary, {at(18, 4), at(17, 11)}), IsEmpty());
  EXPECT_EQ(root().boundary->at(2).Text(), "(19,4) - (19,11)");
  EXPECT_EQ(lastStep(), "New boundary");
  EXPECT_THAT(map->removeFeature(id(MapKind::boundary, 1)), HasSubstr("Only the last one, 2"));
  EXPECT_THAT(map->removeFeature(id(MapKind::boundary, 2)), IsEmpty());
  EXPECT_EQ(root().boundary->GetCount(), 1);
  EXPECT_THAT(map->moveVertex(id(MapKind::boundary, 5), 1, at(0, 5)), HasSubstr("has no point"));
  EXPECT_THAT(map->insertVertex(id(MapKind::boundary, 1), 1, at(0, 5)), HasSubstr("no further points"));
}

TEST_F(MapEdits, ABoundaryHasTwoEndsThatDiffer) {
  makeTwoAreas();
  root().boundary->defaultPosition = 0;
  root().boundary->SetNoBoundaries(1);
  root().boundary->at(1).Set(0, 2, 0, 9);
  const std::uint64_t before = document.ModelState();
  EXPECT_THAT(map->addFeature(MapKind::boundary, {at(10, 0), at(10.2, 0.3)}), HasSubstr("shorter than"));
  EXPECT_THAT(map->previewVertex(id(MapKind::boundary, 1), 1, at(0, 2.3)).fault,
              HasSubstr("ends that differ"));
  EXPECT_THAT(map->moveVertex(id(MapKind::boundary, 1, 28), 1, at(0, 2.3)), HasSubstr("ends that differ"));
  EXPECT_EQ(document.ModelState(), before);
  EXPECT_EQ(lastStep(), "made");
}

TEST_F(MapEdits, ABoundaryTakesThePlaceOfTheOneThatItIsDrawnOver) {
  makeTwoAreas();
  root().boundary->SetNoBoundaries(2);
  root().boundary->at(1).Set(0, 0, 0, 15);
  root().boundary->at(2).Set(1, 0, 8, 0);
  root().nhdBoundary->GetItem(1)->value = 1.5F;
  document.RecordEdit(PageId::boundary, "found");
  // What the program found becomes the user's, in the same step.
  ASSERT_THAT(map->addFeature(MapKind::boundary, {at(0, 4), at(0, 9)}), IsEmpty());
  EXPECT_EQ(lastStep(), "Boundary 1, both ends");
  EXPECT_TRUE(root().boundary->isUserSpecified());
  EXPECT_EQ(root().boundary->GetCount(), 2);
  EXPECT_EQ(root().boundary->at(1).Text(), "(0,4) - (0,9)");
  EXPECT_EQ(root().nhdBoundary->GetItem(1)->value, 1.5F);
  document.Undo();
  EXPECT_FALSE(root().boundary->isUserSpecified());
  EXPECT_EQ(root().boundary->at(1).Text(), "(0,0) - (0,15)");
  EXPECT_EQ(lastStep(), "found");
  document.Redo();
  // Beside it, or from where it ends, another one is made.
  ASSERT_THAT(map->addFeature(MapKind::boundary, {at(0, 9), at(0, 13)}), IsEmpty());
  EXPECT_EQ(lastStep(), "New boundary");
  EXPECT_EQ(root().boundary->at(3).Text(), "(0,9) - (0,13)");
  const std::vector<MapPoint> over{at(0.3, 6), at(-1, 12)};
  EXPECT_EQ(map->previewFeature(MapKind::boundary, over).fault, map->addFeature(MapKind::boundary, over));
  EXPECT_EQ(map->addFeature(MapKind::boundary, over),
            "It lies over boundaries 1 and 3: draw it over one of them at most");
  EXPECT_EQ(root().boundary->GetCount(), 3);
}

TEST_F(MapEdits, WhatIsDrawnIsShownWhereItWouldLie) {
  makeTwoAreas();
  map->scene();
  const std::uint64_t before = document.ModelState();
  struct Case {
    MapKind kind;
    std::vector<MapPoint> drawn;
    std::string shown;
    std::string fault;
    std::int32_t page = 0;
  };
  const std::vector<Case> cases{
      {MapKind::boundary, {at(1, 7.2)}, text(at(0, 7)), ""},
      {MapKind::boundary, {at(1, 7.2), at(3, 11)}, text(std::vector{at(0, 7), at(0, 11)}), ""},
      {MapKind::boundary, {at(1, 7.2), at(1, 7)}, text(std::vector{at(0, 7), at(0, 7)}), "shorter than"},
      {MapKind::source, {at(6.1, 5)}, text(at(6, 5)), ""},
      {MapKind::source, {at(60, 5)}, text(at(60, 5)), "There is no area"},
      {MapKind::dike, {at(60, 5.3)}, text(at(60, 5.3)), ""},
      {MapKind::outputLine, {at(2, 2.2), at(9, 3)}, text(std::vector{at(2, 2), at(9, 2)}), ""},
      {MapKind::outputLine, {at(2, 2), at(90, 3)}, text(std::vector{at(2, 2), at(90, 3)}), "does not reach"},
      {MapKind::outputMap, {at(2, 2), at(2.2, 9)}, "", "narrower"},
      {MapKind::box,
       {at(6.3, 5), at(8, 6)},
       text(std::vector{at(19.0 / 3, 5), at(8, 5), at(8, 6), at(19.0 / 3, 6)}),
       ""},
      {MapKind::massBudget, {at(2, 2), at(90, 3)}, text(std::vector{at(2, 2), at(90, 3)}), "whole polygon"},
  };
  for (const Case& each : cases) {
    SCOPED_TRACE(each.shown);
    const FeaturePlace place = map->previewFeature(each.kind, each.drawn, each.page);
    if (!each.shown.empty()) EXPECT_EQ(text(place.points), each.shown);
    EXPECT_THAT(place.fault, HasSubstr(each.fault));
    EXPECT_EQ(place.fault.empty(), each.fault.empty());
  }
  EXPECT_EQ(document.ModelState(), before);
}

struct Slide {
  double j, k;
  std::optional<GridPoint> other;
  GridPoint expected;
};

TEST(SlideAlongBorder, GoesToTheNearestEdgeThatHoldsTheOtherEnd) {
  const std::vector<Slide> slides{{4, 1, {}, {4, 0}},
                                  {8.6, 5, {}, {9, 5}},
                                  {4, 1, GridPoint{0, 5}, {0, 1}},
                                  {9, 7, GridPoint{0, 7}, {9, 7}},
                                  {-50, 3, GridPoint{3, 7}, {0, 7}},
                                  {1e12, 1e12, GridPoint{9, 2}, {9, 7}},
                                  {4, 1, GridPoint{5, 5}, {4, 0}}};
  for (const Slide& slide : slides)
    EXPECT_EQ(slideAlongBorder(slide.j, slide.k, 10, 8, slide.other), slide.expected)
        << slide.j << "," << slide.k;
}

TEST_F(MapEdits, AClickPlacesASource) {
  makeTwoAreas();
  EXPECT_THAT(map->addFeature(MapKind::source, {at(2.2, 3)}), IsEmpty());
  EXPECT_THAT(map->addFeature(MapKind::source, {at(2, 3), at(6, 5)}), IsEmpty());
  const CSourceSinkObjectKvs& first = root().sourceSink->at(1);
  const CSourceSinkObjectKvs& pair = root().sourceSink->at(2);
  EXPECT_EQ(first.Text(), "(2,3)->");
  EXPECT_EQ(pair.type, CSourceSinkObjectKvs::kPair);
  EXPECT_EQ(pair.sinkArea, 2);
  EXPECT_EQ(pair.sink, (GridPoint{3, 3}));
  EXPECT_EQ(lastStep(), "New source");
  // It goes to the finest area under it.
  EXPECT_THAT(map->moveVertex(id(MapKind::source, 1, 40), 0, at(7, 5)), IsEmpty());
  EXPECT_EQ(first.sourceArea, 2);
  EXPECT_EQ(first.source, (GridPoint{6, 3}));
  EXPECT_EQ(lastStep(), "Source 1, point 1");
  EXPECT_EQ(map->moveVertex(id(MapKind::source, 1), 0, at(-9, 5)), "There is no area");
  EXPECT_EQ(map->addFeature(MapKind::source, {at(-9, 5)}), "There is no area");
  EXPECT_EQ(map->addFeature(MapKind::source, {}), "There are no points");
  document.Undo();
  EXPECT_EQ(first.Text(), "(2,3)->");
}

TEST_F(MapEdits, OutputsAndPolygonsOnTheGrid) {
  makeTwoAreas();
  auto& outputs = root().nhdResult->outputs;
  outputs.SetCount(0);
  EXPECT_THAT(map->addFeature(MapKind::outputPoints, {at(2, 3)}), IsEmpty());
  EXPECT_THAT(map->insertVertex(id(MapKind::outputPoints, 1, 38), 1, at(4, 5)), IsEmpty());
  EXPECT_THAT(map->moveVertex(id(MapKind::outputPoints, 1, 38), 0, at(2, 4)), IsEmpty());
  EXPECT_EQ(lastStep(), "Output 1, point 1");
  EXPECT_THAT(outputs.at(1).pointsJ, ElementsAre(2, 4));
  EXPECT_THAT(outputs.at(1).pointsK, ElementsAre(4, 5));
  outputs.at(1).pointsJ = {2, 4.25};
  EXPECT_THAT(map->moveVertex(id(MapKind::outputPoints, 1, 38), 0, at(3, 4)), IsEmpty());
  EXPECT_THAT(outputs.at(1).pointsJ, ElementsAre(3, 4.25));
  EXPECT_THAT(map->removeVertex(id(MapKind::outputPoints, 1, 38), 0), IsEmpty());
  EXPECT_THAT(map->removeVertex(id(MapKind::outputPoints, 1, 38), 0), HasSubstr("keeps 1 points"));
  EXPECT_THAT(map->addFeature(MapKind::outputMap, {at(9, 8), at(3, 4)}), IsEmpty());
  EXPECT_EQ(outputs.at(2).part, (USubArea{{3, 9, 1}, {4, 8, 1}}));
  EXPECT_THAT(map->moveVertex(id(MapKind::outputMap, 2, 38), 2, at(12, 2)), IsEmpty());
  EXPECT_EQ(outputs.at(2).part, (USubArea{{3, 12, 1}, {2, 4, 1}}));
  EXPECT_THAT(map->addFeature(MapKind::outputLine, {at(3, 4), at(9, 5)}), IsEmpty());
  EXPECT_EQ(outputs.at(3).part, (USubArea{{3, 9, 1}, {4, 4, 1}}));
  EXPECT_EQ(outputs.at(3).type, CNhdResultObjectKvs::kLine);
  EXPECT_THAT(map->addFeature(MapKind::outputMap, {at(3, 4), at(3, 9)}), HasSubstr("narrower"));
  EXPECT_THAT(map->addFeature(MapKind::outputMap, {at(3, 4), at(30, 9)}), HasSubstr("does not reach"));
  EXPECT_THAT(map->addFeature(MapKind::box, {at(3, 4)}), HasSubstr("has no boxes"));

  const std::vector<MapPoint> corners{at(6, 5), at(8, 5), at(8, 6)};
  EXPECT_THAT(map->addFeature(MapKind::massBudget, corners), HasSubstr("need a transport module"));
  root().moduleSelection->simulationType = module::kAdvectionDispersion;
  root().moduleSelection->adScheme = 1;
  EXPECT_THAT(map->addFeature(MapKind::massBudget, corners), IsEmpty());
  CMassBudgetItemKvs& polygon = root().massBudget->at(root().massBudget->GetCount());
  const int number = root().massBudget->GetCount();
  EXPECT_EQ(polygon.associatedArea, 2);
  EXPECT_THAT(polygon.corners, ElementsAre(GridPoint{3, 3}, GridPoint{9, 3}, GridPoint{9, 6}));
  EXPECT_THAT(map->insertVertex(id(MapKind::massBudget, number), 3, at(6, 6)), IsEmpty());
  EXPECT_EQ(polygon.corners.back(), (GridPoint{3, 6}));
  EXPECT_THAT(map->removeVertex(id(MapKind::massBudget, number), 0), IsEmpty());
  EXPECT_THAT(map->removeVertex(id(MapKind::massBudget, number), 0), HasSubstr("keeps 3 points"));
  EXPECT_THAT(map->moveVertex(id(MapKind::massBudget, number), 0, at(15, 12)), HasSubstr("does not reach"));
}

TEST_F(MapEdits, OutputsLinesAndBoxesOfTheModuleThatIsChosen) {
  makeTwoAreas();
  const MapScene& before = map->scene();
  EXPECT_EQ(before.moduleOutputs + before.moduleLines + before.moduleBoxes, 0);
  EXPECT_THAT(map->addFeature(MapKind::outputMap, {at(2, 2), at(4, 4)}, 23), HasSubstr("No module"));
  EXPECT_THAT(map->addFeature(MapKind::discharge, {at(2, 2), at(4, 4)}), HasSubstr("has no discharge lines"));
  struct Module {
    std::int32_t number;
    std::int32_t outputs;
    std::int32_t lines;
    std::int32_t boxes;
  };
  for (const Module& each : {Module{module::kAdvectionDispersion, 23, 20, 10},
                             {module::kMudTransport, 99, 94, 49},
                             {module::kMudTransportExpanded, 79, 75, 0},
                             {module::kEcological, 121, 0, 0}}) {
    SCOPED_TRACE(each.number);
    root().moduleSelection->simulationType = each.number;
    const MapScene& scene = map->scene();
    EXPECT_EQ(scene.moduleOutputs, each.outputs);
    EXPECT_EQ(scene.moduleLines, each.lines);
    EXPECT_EQ(scene.moduleBoxes, each.boxes);
    const auto last = [&](MapKind kind) {
      int number = 0;
      for (const MapFeature& feature : map->scene().features) {
        if (feature.id.kind == kind && feature.id.page != 38) number = feature.id.number;
      }
      return number;
    };
    // Area 2 has three points for each of Area 1, from (5,4).
    ASSERT_THAT(map->addFeature(MapKind::outputMap, {at(8, 6), at(6, 5)}, each.outputs), IsEmpty());
    EXPECT_EQ(lastStep(), "New output");
    const MapFeatureId output = id(MapKind::outputMap, last(MapKind::outputMap), each.outputs);
    const MapFeature made = feature(map->scene(), MapKind::outputMap, output.number);
    EXPECT_EQ(made.area, 2);
    EXPECT_EQ(text(*made.points), text(std::vector{at(6, 5), at(8, 5), at(8, 6), at(6, 6)}));
    ASSERT_THAT(map->addFeature(MapKind::outputLine, {at(2, 2), at(10, 3)}, each.outputs), IsEmpty());
    EXPECT_EQ(feature(map->scene(), MapKind::outputLine, output.number + 1).area, 1);
    ASSERT_THAT(map->addFeature(MapKind::outputPoints, {at(2, 3)}, each.outputs), IsEmpty());
    EXPECT_THAT(map->addFeature(MapKind::outputMap, {at(2, 3), at(2, 9)}, each.outputs),
                HasSubstr("narrower"));
    EXPECT_THAT(map->addFeature(MapKind::outputMap, {at(2, 3), at(30, 9)}, each.outputs),
                HasSubstr("No area"));
    EXPECT_THAT(map->removeFeature(output), HasSubstr("Only the last one"));
    EXPECT_THAT(map->removeFeature(id(MapKind::outputPoints, output.number + 2, each.outputs)), IsEmpty());
    EXPECT_EQ(last(MapKind::outputPoints), 0);
    for (const bool isLine : {true, false}) {
      const std::int32_t page = isLine ? each.lines : each.boxes;
      const MapKind kind = isLine ? MapKind::discharge : MapKind::box;
      const std::string fault = map->addFeature(kind, {at(12, 9), at(6, 5)});
      if (page == 0) {
        EXPECT_THAT(fault, HasSubstr("has no"));
        continue;
      }
      ASSERT_THAT(fault, IsEmpty());
      EXPECT_EQ(lastStep(), isLine ? "New discharge line" : "New box");
      const int number = last(kind);
      EXPECT_EQ(feature(map->scene(), kind, number).area, 1);
      EXPECT_EQ(feature(map->scene(), kind, number).points->front(), at(6, 5));
      EXPECT_THAT(map->addFeature(kind, {at(2, 2), at(2, 2)}), HasSubstr("cells"));
      EXPECT_THAT(map->removeFeature(id(kind, number, page)), IsEmpty());
      EXPECT_EQ(last(kind), number - 1);
    }
  }
}

TEST_F(MapEdits, ATurnedRasterIsCutInParts) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one area";
  makeTwoAreas();
  // A plane over all of Area 1, turned against it, so that each row of the new grid crosses most of its rows.
  const TsbGeography corner = placeAt(500000, 6000000 - 500, -30);
  const std::string raster = folder.file("turned.tsb2");
  test::writeGrid(raster, {.noJ = 3000, .noK = 3000, .dx = 0.5, .dy = 0.5, .geography = corner},
                  [](int j, int k) { return static_cast<float>(-j - 2 * k); });
  const std::string made = folder.file("new.tsb2");
  ASSERT_THAT(map->addNestedArea(at(9, 9), at(18, 14), raster, made), IsEmpty());
  const MapArea area = map->scene().areas.back();
  const std::vector<float> all =
      values(made, static_cast<std::size_t>(area.nx) * static_cast<std::size_t>(area.ny));
  const CVdCartography turned("UTM-32", 500000, 6000000 - 500, -30);
  for (const auto& [j, k] :
       {std::pair{0, 0}, {area.nx - 1, 0}, {5, area.ny - 1}, {area.nx - 1, area.ny - 1}}) {
    const MapPoint place = area.grid.at(j, k);
    double x = 0;
    double y = 0;
    turned.Proj2Xy(place.east, place.north, &x, &y);
    const float got = all[static_cast<std::size_t>(k * area.nx + j)];
    const bool isInside = x >= 0 && y >= 0 && x <= 1499 && y <= 1499;
    EXPECT_NEAR(got, isInside ? -x / 0.5 - 2 * y / 0.5 : -5, 0.05) << j << "," << k;
  }
}

TEST_F(MapEdits, AZoneThatAFileLeavesOutIsThatOfItsLongitude) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one area";
  makeTwoAreas();
  TsbGeography place = placeAt(500000, 6000000);
  place.projection = "UTM";
  setFile(1, {.noJ = 20, .noK = 16, .geography = place},
          [](int j, int k) { return static_cast<float>(-j - 100 * k); });
  EXPECT_EQ(text(map->scene().area(1)->grid.first), "500000,6000000");
  const std::string made = folder.file("new.tsb2");
  ASSERT_THAT(map->addNestedArea(at(11, 9), at(13, 10), area(1).fileName.absolute(), made), IsEmpty());
  EXPECT_NEAR(values(made, 28)[0], -911, 1e-3);
  root().nhdWeir->SetCount(1);
  root().nhdWeir->at(1).coordinateType = "UTM";
  root().nhdWeir->at(1).x = {500100, 500200};
  root().nhdWeir->at(1).y = {6000100, 6000100};
  EXPECT_THAT(feature(map->scene(), MapKind::weir).fault, HasSubstr("without a zone"));
}

TEST_F(MapEdits, LinesOfStructuresPointByPoint) {
  makeTwoAreas();
  EXPECT_THAT(map->addFeature(MapKind::dike, {at(1, 1), at(2, 2), at(3, 2)}), IsEmpty());
  EXPECT_EQ(lastStep(), "New Dike");
  CNhdDikeObjectKvs& dike = root().nhdDike->at(root().nhdDike->GetCount());
  const int number = root().nhdDike->GetCount();
  ASSERT_EQ(dike.points.size(), 3U);
  dike.points.edit(1).z = 4.5;
  EXPECT_THAT(map->insertVertex(id(MapKind::dike, number, 31), 2, at(2.5, 2)), IsEmpty());
  EXPECT_NEAR(dike.points[2].x, 500075, 1e-6);
  EXPECT_EQ(dike.points[2].z, 4.5);  // as the point before it
  EXPECT_EQ(lastStep(), "Dike 1, new point");
  EXPECT_THAT(map->removeVertex(id(MapKind::dike, number, 31), 0), IsEmpty());
  EXPECT_EQ(dike.points.size(), 3U);
  EXPECT_NEAR(dike.points[0].x, 500060, 1e-6);
  // A weir in a projection of its own gets its points in that.
  EXPECT_THAT(map->addFeature(MapKind::weir, {at(1, 1), at(2, 2)}), IsEmpty());
  CNhdWeirObjectKvs& weir = root().nhdWeir->at(1);
  weir.coordinateType = "UTM-33";
  const TsbGeography place = placeAt(500090, 6000090);
  double x = 0;
  double y = 0;
  CVdMapProjection("UTM-33").Geo2Proj(place.longitude, place.latitude, &x, &y);
  EXPECT_THAT(map->moveVertex(id(MapKind::weir, 1, 33), 1, at(3, 3)), IsEmpty());
  EXPECT_NEAR(weir.x[1], x, 1e-3);
  EXPECT_NEAR(weir.y[1], y, 1e-3);
  EXPECT_THAT(map->removeVertex(id(MapKind::weir, 1, 33), 0), HasSubstr("keeps 2 points"));
  weir.coordinateType = "Local Coordinates";
  EXPECT_THAT(map->moveVertex(id(MapKind::weir, 1, 33), 1, at(3, 3)), HasSubstr("has local coordinates"));
  EXPECT_THAT(map->moveVertex(id(MapKind::weir, 1, 33), 9, at(3, 3)), HasSubstr("has no point 10"));
  EXPECT_THAT(map->moveVertex(id(MapKind::culvert, 1), 0, at(3, 3)), HasSubstr("There is no Culvert 1"));
  EXPECT_THAT(map->addFeature(MapKind::culvert, {at(1, 1)}), HasSubstr("two points at least"));
  EXPECT_THAT(map->addFeature(MapKind::dike, {at(5, 5), at(6, 6)}), IsEmpty());
  EXPECT_THAT(map->removeFeature(id(MapKind::dike, number)), IsEmpty());
  EXPECT_EQ(root().nhdDike->GetCount(), number);
  EXPECT_NEAR(root().nhdDike->at(number).points[0].x, 500150, 1e-6);
  document.Undo();
  EXPECT_EQ(root().nhdDike->GetCount(), number + 1);
}

}  // namespace map_edits_test
}  // namespace gridbay
