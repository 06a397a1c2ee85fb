#include <fmt/format.h>
#include <gmock/gmock.h>

#include <cmath>
#include <filesystem>
#include <functional>

#include "conversion/point_file.h"
#include "conversion/raster_conversion.h"
#include "conversion/raster_preview.h"
#include "platform/tsb/tsb_file.h"
#include "tests/support/grids.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace conversion_points_test {

namespace fs = std::filesystem;
using ::testing::ElementsAre;
using ::testing::HasSubstr;

// Takes what it is told, and stops where it is asked to.
class Host final : public ConversionHost {
 public:
  bool reached(std::size_t, std::size_t) override { return ++told != stopAt; }
  std::string option(std::string_view name, std::string_view) const override {
    return "option " + std::string(name);
  }
  std::string itemTypeList() const override { return "a list"; }

  int told = 0;
  int stopAt = 0;
};

class Points : public ::testing::Test {
 protected:
  // 900 points that lie anywhere in 1000 x 800 m, of a plane.
  std::string plane(const std::string& name) const {
    std::string text = "x y z\n";
    for (int i = 0; i < 900; ++i) {
      const double x = 500000 + std::fmod(i * 618.033988749, 1000);
      const double y = 6000000 + std::fmod(i * 414.213562373, 800);
      text += fmt::format("{:.3f} {:.3f} {:.5f}\n", x, y, planeAt(x, y));
    }
    return folder.write(name, text);
  }
  static double planeAt(double x, double y) { return 0.01 * (x - 500000) - 0.02 * (y - 6000000); }
  std::vector<float> values() const {
    const Result<TsbFile> map = TsbFile::open(out);
    EXPECT_TRUE(map) << map.error();
    std::vector<float> all(map->definition().pointCount());
    EXPECT_TRUE(map->read(1, 0, std::span<float>(all)));
    return all;
  }
  std::string refused(const RasterConversion& conversion) {
    const Result<ConvertedRaster> made = convertRaster(conversion, host);
    EXPECT_FALSE(made);
    EXPECT_FALSE(fs::exists(out));
    return made ? std::string() : made.error();
  }

  test::TemporaryFolder folder;
  std::string out = folder.file("p.tsb2");
  Host host;
};

TEST_F(Points, TextsOfManyForms) {
  for (const std::string_view text :
       {"1 2 3\n4 5 -6.5\n7 8 9\n", "1,2,3\n4,5,-6.5\n7,8,9", "1, 2, 3\n4, 5, -6.5\n7, 8, 9\n",
        "1;2;3\r\n4;5;-6.5\r\n7;8;9\r\n", "1;2;3,0\n4;5;-6,5\n7;8;9\n", "1\t2\t3\n4\t5\t-6.5\n7\t8\t9\n",
        "1,0 2,0 3,0\n4 5 -6,5\n7 8 9\n", "1 2 3\n4 5 -6,5\n7 8 9\n",
        "East North Level\n  1   2   3 station A\n4 5 -65e-1\n+7 8 9\n",
        "# survey\n\nz,id,y,x\n3,a,2,1\n-6.5,b,5,4\n\n9,c,8,7\n",
        "Height (m);Easting (m);Northing (m)\n3;1;2\n-6.5;4;5\nNaN;0;0\n9;7;8\n"}) {
    const std::string path = folder.write("p.xyz", text);
    EXPECT_TRUE(holdsPoints(path)) << text;
    const Result<PointSet> points = readPoints(path);
    ASSERT_TRUE(points) << text << points.error();
    EXPECT_THAT(points->x, ElementsAre(1, 4, 7)) << text;
    EXPECT_THAT(points->y, ElementsAre(2, 5, 8)) << text;
    EXPECT_THAT(points->z, ElementsAre(3, -6.5, 9)) << text;
  }
}

TEST_F(Points, WhatIsNoPointIsToldWithItsLine) {
  for (const auto& [text, error] :
       {std::pair{"1 2 3\n4 5\n", "line 2: a point has three numbers, x, y and z"},
        {"x y z\n1 2 3\n# deep\n4 five 6\n", "line 4: \"five\" is no number for y"},
        {"1;2;3\n4;;6\n", "line 2: \"\" is no number for y"},
        {"1 2 3\n4 5 inf\n", "line 2: \"inf\" is no number for z"},
        {"1 2 3\n4 5 1e999\n", "line 2: \"1e999\" is no number for z"},
        {"a b\nc d\n", "line 2: \"c\" is no number for x"},
        {"1 2 3\n4 5 6\n", "holds 2 points; a grid needs at least 3"},
        {"", "holds 0 points"}}) {
    const Result<PointSet> points = readPoints(folder.write("p.xyz", text));
    ASSERT_FALSE(points) << text;
    EXPECT_THAT(points.error(), HasSubstr(error)) << text;
  }
  EXPECT_THAT(readPoints(folder.file("none.xyz")).error(), HasSubstr("none.xyz"));
  EXPECT_FALSE(readPoints(folder.path().string()));
  for (const std::string_view text : {"a b\nc d e\n1 2 3\n", "", "1 2\n3 4\n"})
    EXPECT_FALSE(holdsPoints(folder.write("p.xyz", text))) << text;
  EXPECT_FALSE(holdsPoints(folder.path().string()));
}

TEST_F(Points, BecomeAGridInEachWay) {
  const std::string in = plane("p.xyz");
  struct Case {
    Gridding gridding;
    double tolerance;  // in metres; neighbours lie about 30 m apart
  };
  for (const Case& each :
       {Case{Gridding::linear, 1e-3}, {Gridding::nearest, 1.2}, {Gridding::inverseDistance, 1.2}}) {
    const Result<ConvertedRaster> made = convertRaster({.in = in,
                                                        .out = out,
                                                        .land = 60.0F,
                                                        .crs = "UTM-32S",
                                                        .resample = 25,
                                                        .gridding = each.gridding,
                                                        .force = true},
                                                       host);
    ASSERT_TRUE(made) << made.error();
    EXPECT_EQ(made->spacing, (std::array{25.0, 25.0}));
    EXPECT_EQ(std::fmod(made->first[0], 25), 0);
    EXPECT_EQ(std::fmod(made->first[1], 25), 0);
    const std::vector<float> grid = values();
    std::size_t missing = 0;
    for (std::size_t i = 0; i < grid.size(); ++i) {
      const auto columns = static_cast<std::size_t>(made->points[0]);
      const double x = made->first[0] + 25 * static_cast<double>(i % columns);
      const double y = made->first[1] + 25 * static_cast<double>(i / columns);
      if (grid[i] == 60) {
        ++missing;
      } else {
        ASSERT_NEAR(grid[i], planeAt(x, y), each.tolerance) << x << " " << y;
      }
    }
    EXPECT_EQ(missing, made->missing);
    EXPECT_LT(missing, grid.size() / 10);
  }
  EXPECT_GT(host.told, 1);
}

TEST_F(Points, AreBroughtToAProjectionBeforeTheyAreGridded) {
  std::string text;
  for (int i = 0; i < 100; ++i)
    text += fmt::format("{:.6f},{:.6f},{}\n", 151.7 + i % 10 * 0.001, -32.9 + i / 10 * 0.001, i % 10);
  RasterConversion wanted{.in = folder.write("p.csv", text),
                          .out = out,
                          .land = 60.0F,
                          .crs = "EPSG:4326",
                          .reproject = "UTM-56S",
                          .resample = 50,
                          .gridding = Gridding::linear};
  const Result<ConvertedRaster> made = convertRaster(wanted, host);
  ASSERT_TRUE(made) << made.error();
  EXPECT_NEAR(made->first[0], 378400, 300);
  EXPECT_NEAR(made->first[1], 6359000, 600);
  EXPECT_NEAR(made->points[0] * 50, 840, 60);
  const Result<TsbFile> map = TsbFile::open(out);
  EXPECT_NEAR(map->definition().geography->latitude, -32.9, 0.01);
  fs::remove(out);
  wanted.crs.clear();
  EXPECT_THAT(refused(wanted), HasSubstr("do not say in which projection they are: say so with option crs"));
  wanted.crs = "EPSG:4326";
  wanted.reproject.clear();
  EXPECT_THAT(refused(wanted), HasSubstr("is in degrees: a grid wants a projection in metres"));
  // Looked at they are what they are.
  wanted.resample = std::nullopt;
  EXPECT_EQ(previewRaster(wanted, 100, host)->unit, "degrees");
}

TEST_F(Points, WhatCanBeNoGrid) {
  const std::string in = plane("p.xyz");
  EXPECT_THAT(refused({.in = in, .out = out, .land = 1.0F}),
              HasSubstr("Points need the spacing of a grid: option resample (they lie about 30 apart)"));
  EXPECT_THAT(refused({.in = in, .out = out, .land = 1.0F, .resample = 1e-4}),
              HasSubstr("The points can't be gridded: at that spacing their extent has"));
  EXPECT_THAT(refused({.in = in, .out = out, .land = 1.0F, .resample = 5000}),
              HasSubstr("at that spacing their extent has"));
  EXPECT_THAT(refused({.in = in, .out = out, .land = 1.0F, .crs = "nonsense", .resample = 10}),
              HasSubstr("\"nonsense\" is no projection"));
  const std::string line = folder.write("line.xyz", "0 0 1\n10 0 2\n20 0 3\n35 0 3\n");
  EXPECT_THAT(refused({.in = line, .out = out, .land = 1.0F, .resample = 5, .gridding = Gridding::linear}),
              HasSubstr("lie on one line"));
  const std::string slanted = folder.write("slanted.xyz", "0 0 1\n10 10 2\n20 20 3\n35 35 3\n");
  EXPECT_THAT(refused({.in = slanted, .out = out, .land = 1.0F, .resample = 5, .gridding = Gridding::linear}),
              HasSubstr("lie on one line"));
  EXPECT_THAT(refused({.in = folder.write("bad.xyz", "0 0 1\n10 0 2\n20 x 3\n"), .out = out, .land = 1.0F}),
              HasSubstr("line 3: \"x\" is no number for y"));
  // Stopped while it reads, and while it grids.
  host.stopAt = host.told + 1;
  EXPECT_EQ(refused({.in = in, .out = out, .land = 1.0F, .resample = 10}), kConversionStopped);
  host.stopAt = host.told + 2;
  EXPECT_EQ(refused({.in = in, .out = out, .land = 1.0F, .resample = 2}), kConversionStopped);
  EXPECT_EQ(std::distance(fs::directory_iterator(folder.path()), {}), 4);
}

TEST_F(Points, APreviewHasTheGridOfTheConversionAtFewerPoints) {
  const std::string in = plane("p.xyz");
  const Result<RasterPreview> points = previewRaster({.in = in}, 1000, host);
  ASSERT_TRUE(points) << points.error();
  EXPECT_TRUE(points->isOfPoints);
  EXPECT_TRUE(points->isWhole());
  EXPECT_EQ(points->spacing, (std::array{20.0, 20.0}));  // of neighbours 30 m apart, a round one below
  std::string rows = "ncols 60\nnrows 40\nxllcorner 0\nyllcorner 0\ncellsize 10\nNODATA_value -9\n";
  for (int row = 0; row < 40; ++row) {
    for (int column = 0; column < 60; ++column) rows += column == 0 ? "-9 " : std::to_string(row) + " ";
    rows += "\n";
  }
  const std::string raster = folder.write("r.asc", rows);
  const Result<RasterPreview> whole = previewRaster({.in = raster}, 1000, host);
  ASSERT_TRUE(whole);
  EXPECT_EQ(whole->points, (std::array{60, 40}));
  EXPECT_EQ(whole->first, (std::array{5.0, 5.0}));
  EXPECT_EQ(whole->values[1], 39);  // from the south
  EXPECT_TRUE(std::isnan(whole->values[0]));
  const Result<RasterPreview> coarse = previewRaster({.in = raster, .resample = 5}, 20, host);
  ASSERT_TRUE(coarse);
  EXPECT_EQ(coarse->points, (std::array{120, 80}));
  EXPECT_EQ(coarse->columns, 20);
  EXPECT_EQ(coarse->rows, 13);
  EXPECT_NEAR(coarse->values[10], 38.5, 1.5);
  EXPECT_FALSE(previewRaster({.in = folder.file("none.asc")}, 20, host));
}

TEST_F(Points, AnExtentAndWaysToResample) {
  std::string rows = "ncols 8\nnrows 6\nxllcorner 0\nyllcorner 0\ncellsize 10\n";
  for (int row = 0; row < 6; ++row) {
    for (int column = 0; column < 8; ++column) rows += fmt::format("{} ", 10 * row + column);
    rows += "\n";
  }
  RasterConversion wanted{.in = folder.write("r.asc", rows), .out = out, .land = 90.0F, .force = true};
  wanted.extent = {15, 20, 35.1, 44};
  ASSERT_TRUE(convertRaster(wanted, host));
  EXPECT_THAT(values(), ElementsAre(31, 32, 33, 21, 22, 23));
  wanted.extent = std::nullopt;
  wanted.resample = 20;
  for (const auto& [resampling, first] :
       {std::pair{Resampling::least, 40.0F}, {Resampling::greatest, 51.0F}, {Resampling::mean, 45.5F}}) {
    wanted.resampling = resampling;
    ASSERT_TRUE(convertRaster(wanted, host));
    EXPECT_EQ(values().size(), 12U);
    EXPECT_EQ(values()[0], first);
  }
  fs::remove(out);
  wanted.resample = std::nullopt;
  for (const auto& [extent, error] :
       {std::pair<std::array<double, 4>, const char*>{{200, 0, 300, 10}, "holds no point of the raster"},
        {{30, 0, 10, 10}, "option extent cannot be 30,0,10,10"},
        {{NAN, 0, 10, 10}, "option extent cannot be"},
        {{0, 0, INFINITY, 10}, "option extent cannot be"}}) {
    wanted.extent = extent;
    EXPECT_THAT(refused(wanted), HasSubstr(error));
  }
  wanted.extent = {0, 0, 50, 50};
  wanted.window = {0, 0, 1, 1};
  EXPECT_THAT(refused(wanted), HasSubstr("don't go together"));
}

// Land is no height: none of it spreads to the sea, and the other way round.
TEST_F(Points, AMapOfOursIsBroughtToAnotherSpacing) {
  std::string rows = "ncols 8\nnrows 6\nxllcorner 500000\nyllcorner 6000000\ncellsize 10\n";
  for (int row = 0; row < 6; ++row) rows += "-8 -8 -8 -8 20 20 20 20\n";
  const std::string own = folder.file("own.tsb2");
  ASSERT_TRUE(
      convertRaster({.in = folder.write("r.asc", rows), .out = own, .land = 20.0F, .crs = "UTM-32"}, host));
  RasterConversion wanted{.in = own, .out = out, .land = 20.0F, .resample = 5, .force = true};
  ASSERT_TRUE(convertRaster(wanted, host));
  std::vector<float> row = values();
  row.resize(16);
  EXPECT_THAT(row, ElementsAre(-8, -8, -8, -8, -8, -8, -8, -8, 20, 20, 20, 20, 20, 20, 20, 20));
  // With a higher land value it is a height like any other.
  wanted.land = 30.0F;
  ASSERT_TRUE(convertRaster(wanted, host));
  EXPECT_NEAR(values()[7], -1, 1e-3);
  wanted.reproject = "UTM-33";
  const Result<ConvertedRaster> made = convertRaster(wanted, host);
  EXPECT_TRUE(made) << made.error();
}

}  // namespace conversion_points_test
}  // namespace gridbay
