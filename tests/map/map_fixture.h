#pragma once

#include <gmock/gmock.h>

#include <cmath>

#include "basic/bathymetry.h"
#include "map/setup_map.h"
#include "pages/field_picks.h"
#include "platform/cartography/cartography.h"
#include "setup/setup_doc.h"
#include "tests/support/grids.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay::test {

// A user with a map: a form that he fills can be pointed for.
class UserWithMap final : public TestHost, public MapHost {
 public:
  bool editFormWithPicks(std::string_view title, Form& form, std::span<const FieldPick> offered,
                         const std::function<std::string()>& fault) override {
    picks.assign(offered.begin(), offered.end());
    return editForm(title, form, fault);
  }

  std::vector<FieldPick> picks;  // of the form that is shown
};

// A document with areas of grid files that the test makes, in UTM-32 from (500000,6000000).
class MapFixture : public ::testing::Test {
 protected:
  static TsbGeography placeAt(double east, double north, double rotation = 0,
                              const std::string& projection = "UTM-32") {
    TsbGeography place{projection, 0, 0, rotation};
    EXPECT_TRUE(CVdMapProjection(projection).Proj2Geo(east, north, &place.longitude, &place.latitude));
    return place;
  }
  CGlobalKvs& root() { return document.root(); }
  CBathymetryObjectKvs& area(int number) { return root().bathymetry->at(number); }
  void setFile(int number, const GridSpec& spec, const Surface& surface = flat) {
    const std::string path = folder.file("a" + std::to_string(number) + ".tsb2");
    writeGrid(path, spec, surface);
    area(number).fileName = path;
  }
  // Area 1 of 20 x 16 points 30 m apart; area 2 in it from (5,4), of 13 x 10 points, 4 x 3 steps of area 1.
  void makeTwoAreas(double rotation = 0) {
    root().bathymetry->SetNoAreas(2);
    setFile(1, {.noJ = 20, .noK = 16, .geography = placeAt(500000, 6000000, rotation)});
    setFile(2, {.noJ = 13, .noK = 10, .dx = 10, .dy = 10});
    area(2).enclosingArea = 1;
    area(2).origin = {5, 4};
    document.RecordEdit(PageId::bathymetry, "made");
  }
  const MapFeature& feature(const MapScene& scene, MapKind kind, int number = 1) {
    for (const MapFeature& each : scene.features) {
      if (each.id.kind == kind && each.id.number == number) return each;
    }
    throw std::runtime_error("no such feature");
  }
  static std::string text(MapPoint point) {
    return std::to_string(std::lround(point.east)) + "," + std::to_string(std::lround(point.north));
  }
  static std::string text(std::span<const MapPoint> points) {
    std::string all;
    for (const MapPoint& point : points) all += (all.empty() ? "" : " ") + text(point);
    return all;
  }

  TemporaryFolder folder;
  UserWithMap host;
  CV27SetupDoc document{host};
};

}  // namespace gridbay::test
