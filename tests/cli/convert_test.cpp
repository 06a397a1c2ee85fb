#include <fmt/format.h>
#include <gmock/gmock.h>
#include <sys/stat.h>

#include <array>
#include <cmath>
#include <filesystem>
#include <map>
#include <nlohmann/json.hpp>
#include <numbers>
#include <tuple>

#include "core/edition.h"
#include "platform/cartography/cartography.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"
#include "tests/support/grids.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace cli_convert_test {

namespace fs = std::filesystem;
using test::ProgramRun;
using test::runTool;
using test::textOf;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;
using ::testing::Truly;

// A raster of 4 x 3 points with one missing value, row 0 in the north.
constexpr std::string_view kRaster =
    "ncols 4\nnrows 3\nxllcorner 100\nyllcorner 200\ncellsize 10\nNODATA_value -99\n"
    "8 9 10 11\n4 5 6 -99\n0 1 2 3\n";

class ConvertRaster : public ::testing::Test {
 protected:
  nlohmann::json convert(std::vector<std::string> options) {
    std::vector<std::string> words{"convert", "raster", folder.write("r.asc", kRaster), out, "--force",
                                   "--land",  "60"};
    words.insert(words.end(), options.begin(), options.end());
    run = runTool(words);
    EXPECT_EQ(run.status, 0) << run.err;
    return info();
  }
  std::vector<float> values(std::size_t count) {
    std::vector<float> all(count);
    Result<TsbFile> file = TsbFile::open(out);
    EXPECT_TRUE(file->read(1, 0, std::span<float>(all)));
    return all;
  }
  // The error of a conversion that must not be.
  std::string refused(std::vector<std::string> words) {
    words.insert(words.begin(), {"convert", "raster"});
    const ProgramRun refusal = runTool(words);
    EXPECT_EQ(refusal.status, 2);
    EXPECT_FALSE(fs::exists(out));
    return refusal.err;
  }
  nlohmann::json info() { return nlohmann::json::parse(runTool({"info", out, "--json"}).out); }
  test::TemporaryFolder folder;
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
  EXPECT_THAT(refused({folder.file("none.asc"), out, "--land", "1"}), HasSubstr("none.asc"));
  EXPECT_THAT(refused({folder.write("junk.asc", "junk"), out, "--land", "1"}), HasSubstr("junk.asc"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--crs", "nonsense"}),
              HasSubstr("\"nonsense\" is no projection that is known"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--crs", "EPSG:4326"}),
              HasSubstr("\"WGS 84\" is in degrees: a grid wants a projection in metres"));
  for (const char* option : {"--crs", "--reproject"})
    EXPECT_THAT(refused({raster, out, "--land", "1", option, "EPSG:2263"}),
                HasSubstr("has a unit of 0.304801 m: a grid wants a projection in metres"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--item-type", "7"}),
              HasSubstr("There is no item type 7"));
  for (const char* land : {"nan", "inf", "-0.1", "1e39", "high"})
    EXPECT_THAT(refused({raster, out, "--land", land}), HasSubstr("--land: ")) << land;
  for (const char* option : {"--nodata-as", "--origin-x", "--origin-y"})
    EXPECT_THAT(refused({raster, out, "--land", "1", option, "nan"}), HasSubstr(std::string(option) + ": "));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--band", "2"}),
              HasSubstr("The raster has no band 2. It has 1:"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--band", "0"}), HasSubstr("--band"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--subdataset", "1"}), HasSubstr("holds one raster only"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--window", "0,0,4,2"}), HasSubstr("which goes to 3,2"));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--coarsen", "0"}), HasSubstr("--coarsen"));
  EXPECT_THAT(refused({raster, folder.file("no/r.tsb2"), "--land", "1"}),
              HasSubstr("No such file or directory"));
  ASSERT_EQ(
      test::runProgram("gdal_translate", {"-q", "-a_srs", "EPSG:4326", raster, folder.file("d.tif")}).status,
      0);
  EXPECT_THAT(refused({folder.file("d.tif"), out, "--land", "1"}), HasSubstr("The raster is in degrees"));
}

// By its size, and with nothing that is left where it was going to be.
TEST_F(ConvertRaster, WhatTheDiskHasNoRoomForIsRefusedBefore) {
  if (fs::space(fs::path(out).parent_path()).available > 1'900'000'000'000U)
    GTEST_SKIP() << "the disk has room for it";
  const std::string raster = folder.write("r.asc", kRaster);
  EXPECT_THAT(refused({raster, out, "--land", "60", "--crs", "UTM-32", "--resample", "0.00005"}),
              HasSubstr("take 1.92e+03 GB, and the disk has "));
  EXPECT_THAT(refused({raster, out, "--land", "60", "--crs", "UTM-32", "--resample", "0.000001"}),
              HasSubstr("points 1e-06 apart would be 4e+07 x 3e+07 of them"));
  EXPECT_EQ(std::distance(fs::directory_iterator(fs::path(out).parent_path()), {}), 1);
}

// Of a plane the values are known wherever a point lies; to be half a point off would be 0.05 there.
TEST_F(ConvertRaster, ToAnotherSpacingAndProjection) {
  const auto plane = [](double east, double north) {
    return 0.01 * (east - 500000) + 0.02 * (north - 6000000);
  };
  std::string rows = "ncols 40\nnrows 30\nxllcorner 500000\nyllcorner 6000000\ncellsize 10\n";
  for (int row = 0; row < 30; ++row) {
    for (int column = 0; column < 40; ++column)
      rows += fmt::format("{:.6f} ", plane(500005 + column * 10, 6000295 - row * 10));
    rows += "\n";
  }
  const std::string plain = folder.write("p.asc", rows);
  const std::string degrees = folder.file("d.tif");
  ASSERT_EQ(test::runProgram("gdalwarp", {"-q", "-r", "bilinear", "-s_srs", "EPSG:32632", "-t_srs",
                                          "EPSG:4326", "-dstnodata", "-9999", plain, degrees})
                .status,
            0);
  struct Case {
    std::vector<std::string> options;
    double spacing;
    double tolerance;
  };
  const std::vector<Case> cases{{{plain, out, "--resample", "25", "--crs", "EPSG:32632"}, 25, 0.01},
                                {{plain, out, "--resample", "4"}, 4, 1e-3},
                                {{degrees, out, "--reproject", "UTM-32", "--resample", "20"}, 20, 0.05},
                                {{plain, out, "--crs", "UTM-32", "--reproject", "EPSG:32632"}, 10, 0.01}};
  for (const Case& each : cases) {
    std::vector<std::string> words{"convert", "raster", "--force", "--land", "60"};
    words.insert(words.end(), each.options.begin(), each.options.end());
    run = runTool(words);
    ASSERT_EQ(run.status, 0) << run.err;
    const nlohmann::json x = info()["axes"][0];
    const nlohmann::json y = info()["axes"][1];
    EXPECT_NEAR(x["spacing"], each.spacing, 1e-6);
    const std::size_t columns = x["points"];
    const std::size_t count = columns * y["points"].get<std::size_t>();
    ASSERT_GT(count, 100U);
    const std::vector<float> got = values(count);
    int inside = 0;
    for (std::size_t i = 0; i < count; ++i) {
      const double east = x["first"].get<double>() + static_cast<double>(i % columns) * each.spacing;
      const double north = y["first"].get<double>() + static_cast<double>(i / columns) * each.spacing;
      if (east < 500050 || east > 500350 || north < 6000050 || north > 6000250) continue;
      ++inside;
      EXPECT_NEAR(got[i], plane(east, north), each.tolerance) << east << " " << north;
    }
    EXPECT_GT(inside, 50);
  }
  fs::remove(out);
  EXPECT_THAT(refused({degrees, out, "--land", "1"}), HasSubstr("--reproject CRS"));
  EXPECT_THAT(refused({degrees, out, "--land", "1", "--reproject", "EPSG:4258"}), HasSubstr("is in degrees"));
  EXPECT_THAT(refused({plain, out, "--land", "1", "--reproject", "nonsense"}), HasSubstr("\"nonsense\""));
  EXPECT_THAT(refused({plain, out, "--land", "1", "--reproject", "UTM-32"}),
              HasSubstr("does not say in which projection it is: say so with --crs CRS"));
  EXPECT_THAT(refused({plain, out, "--land", "1", "--resample", "1e-5"}), HasSubstr("points 1e-05 apart"));
  EXPECT_THAT(refused({plain, out, "--land", "1", "--resample", "0"}), HasSubstr("--resample"));
  EXPECT_THAT(refused({plain, out, "--land", "1", "--resampling", "best"}), HasSubstr("--resampling"));
  EXPECT_THAT(refused({plain, out, "--land", "1", "--extent", "1,2,3"}), HasSubstr("--extent"));
  EXPECT_THAT(refused({plain, out, "--land", "1", "--extent", "1,2,0,4"}),
              HasSubstr("--extent cannot be 1,2,0,4: it is the least easting"));
  EXPECT_THAT(refused({plain, out, "--land", "1", "--gridding", "linear"}),
              HasSubstr("line 2: \"nrows\" is no number for x"));
}

TEST_F(ConvertRaster, WhatWasMeantIsTold) {
  const std::string raster = folder.write("r.asc", kRaster);
  for (const auto& [option, value, why] : std::vector<std::array<std::string, 3>>{
           {"--resample", "0", "--resample: 0 is not above 0"},
           {"--resample", "-3", "--resample: -3 is not above 0"},
           {"--resample", "nan", "is no finite number"},
           {"--band", "0", "--band: 0 is below 1"},
           {"--subdataset", "-1", "--subdataset: -1 is below 1"},
           {"--crs", "utm-56s", "known are EPSG:32756 (WGS 84 / UTM zone 56S)"},
           {"--crs", "UTM56S", "EPSG:32756 (WGS 84 / UTM zone 56S)"},
           {"--reproject", "28355", "EPSG:28355 (GDA94 / MGA zone 55)"},
           {"--resample", "1000", "The grid would have 1 x 1 points, and wants 2 x 2 at least"},
           {"--coarsen", "3", "The grid would have 2 x 1 points, and wants 2 x 2 at least"}})
    EXPECT_THAT(refused({raster, out, "--land", "1", option, value}), HasSubstr(why)) << value;
  EXPECT_THAT(refused({folder.write("pairs.txt", "1 2\n3 4\n"), out, "--land", "1"}),
              HasSubstr("has x, y and z on each line; --gridding HOW takes it for one"));
  EXPECT_THAT(refused({folder.write("one.xyz", "1 2 3\n"), out, "--land", "1", "--resample", "1"}),
              HasSubstr("holds 1 point; a grid needs at least 3"));
}

TEST_F(ConvertRaster, ANorthernZoneForTheSouthIsTold) {
  std::string south(kRaster);
  south.replace(south.find("yllcorner 200"), 13, "yllcorner 6300000");
  south.replace(south.find("xllcorner 100"), 13, "xllcorner 500000");
  const auto converted = [&](const std::string& projection) {
    return runTool({"convert", "raster", folder.write("r.asc", south), out, "--land", "60", "--crs",
                    "UTM-56S", "--reproject", projection, "--force"});
  };
  const ProgramRun north = converted("UTM-56");
  EXPECT_EQ(north.status, 0) << north.err;
  EXPECT_THAT(north.err, HasSubstr("lies south of the equator, from northing -3699995"));
  EXPECT_THAT(north.err, HasSubstr("its southern zone is \"WGS 84 / UTM zone 56S\", EPSG:32756"));
  EXPECT_THAT(converted("UTM-56S").err, Not(HasSubstr("equator")));
}

TEST_F(ConvertRaster, PointsAndAnExtent) {
  const std::string points = folder.write("p.xyz", "x;y;z\n0;0;1\n40;0;5\n0;33;1\n41,5;30;5,15\n20;20;3\n");
  EXPECT_THAT(refused({points, out, "--land", "60"}), HasSubstr("--resample DX (they lie about 17 apart)"));
  run = runTool({"convert", "raster", points, out, "--land", "60", "--resample", "10", "--gridding", "linear",
                 "--extent", "10,10,30,20"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(values(6), (std::vector<float>{2, 3, 4, 2, 3, 4}));
  run = runTool({"convert", "raster", folder.write("r.asc", kRaster), out, "--land", "60", "--resample", "15",
                 "--resampling", "greatest", "--force"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(values(4), (std::vector<float>{1, 3, 9, 11}));
}

// Points beyond the edge of the raster would be a border of land, which closes it.
TEST_F(ConvertRaster, AnotherSpacingHasNoBorderOfNothing) {
  std::string rows = "ncols 41\nnrows 31\nxllcorner 500003\nyllcorner 6000007\ncellsize 1\n";
  for (int row = 0; row < 31; ++row) {
    for (int column = 0; column < 41; ++column) rows += "-2 ";
    rows += "\n";
  }
  const std::string raster = folder.write("s.asc", rows);
  for (const char* resampling : {"nearest", "bilinear", "cubic", "mean"}) {
    for (const double spacing : {0.7, 2.0, 3.0, 5.0}) {
      SCOPED_TRACE(fmt::format("{} {}", resampling, spacing));
      run = runTool({"convert", "raster", raster, out, "--force", "--land", "60", "--crs", "UTM-32",
                     "--resample", fmt::format("{}", spacing), "--resampling", resampling});
      ASSERT_EQ(run.status, 0) << run.err;
      const std::size_t columns = info()["axes"][0]["points"];
      const std::size_t count = columns * info()["axes"][1]["points"].get<std::size_t>();
      EXPECT_GE(static_cast<double>(columns), 41 / spacing - 1);
      EXPECT_THAT(values(count), ::testing::Each(::testing::FloatNear(-2, 1e-5F)));
      const double first = info()["axes"][0]["first"];
      EXPECT_GE(first, 500003);
      EXPECT_LE(first, 500003 + spacing);
    }
  }
}

// A pipe, as any device, would be lost for all who use it.
TEST_F(ConvertRaster, APipeIsNotReplaced) {
  const std::string raster = folder.write("r.asc", kRaster);
  ASSERT_EQ(::mkfifo(out.c_str(), 0600), 0);
  const ProgramRun refusal =
      runTool({"convert", "raster", raster, out, "--land", "60", "--crs", "UTM-32", "--force"});
  EXPECT_EQ(refusal.status, 2);
  EXPECT_THAT(refusal.err, HasSubstr("is a device or a pipe"));
  EXPECT_TRUE(fs::is_fifo(out));
}

TEST_F(ConvertRaster, WhatIsThereIsReplacedOnlyWhenAsked) {
  const std::string raster = folder.write("r.asc", kRaster);
  folder.write("r.tsb2", "of old");
  const ProgramRun refusal = runTool({"convert", "raster", raster, out, "--land", "60"});
  EXPECT_EQ(refusal.status, 2);
  EXPECT_THAT(refusal.err, HasSubstr("r.tsb2\" is there already; --force replaces it"));
  EXPECT_EQ(textOf(out), "of old");
  EXPECT_EQ(runTool({"convert", "raster", raster, out, "--land", "60", "--force"}).status, 0);
  EXPECT_EQ(values(12)[0], 0);
  EXPECT_THAT(runTool({"convert", "raster", raster, folder.path().string(), "--land", "60", "--force"}).err,
              HasSubstr("is a folder"));
}

TEST_F(ConvertRaster, ItsOwnInputIsNeverReplaced) {
  const std::string raster = folder.write("r.asc", kRaster);
  fs::create_symlink(raster, folder.file("soft.tsb2"));
  fs::create_hard_link(raster, folder.file("hard.tsb2"));
  for (const std::string& same :
       {raster, folder.file("./r.asc"), folder.file("soft.tsb2"), folder.file("hard.tsb2")}) {
    const ProgramRun refusal = runTool({"convert", "raster", raster, same, "--land", "60", "--force"});
    EXPECT_EQ(refusal.status, 2);
    EXPECT_THAT(refusal.err, HasSubstr("is a file that is read here"));
    EXPECT_EQ(textOf(raster), kRaster);
  }
  // Nor one that the raster is read from by way of another, or by a name of the raster library.
  ASSERT_EQ(test::runProgram("gdal_translate", {"-q", "-of", "VRT", raster, folder.file("v.vrt")}).status, 0);
  EXPECT_EQ(runTool({"convert", "raster", folder.file("v.vrt"), raster, "--land", "60", "--force"}).status,
            2);
  EXPECT_EQ(textOf(raster), kRaster);
  test::writeGrid(out);
  const std::string before = textOf(out);
  for (const std::string& name : {"NETCDF:" + out, "NETCDF:\"" + out + "\":item_1", out}) {
    EXPECT_EQ(runTool({"convert", "raster", name, out, "--land", "60", "--force"}).status, 2) << name;
    EXPECT_EQ(textOf(out), before);
  }
}

TEST_F(ConvertRaster, ADataFileIsARaster) {
  const std::string raster = folder.write("r.asc", kRaster);
  const std::string first = folder.file("first.tsb2");
  ASSERT_EQ(runTool({"convert", "raster", raster, first, "--land", "60", "--crs", "UTM-32", "--item-type",
                     "surface elevation"})
                .status,
            0);
  run = runTool({"convert", "raster", first, out, "--land", "50"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(values(12), (std::vector<float>{0, 1, 2, 3, 4, 5, 6, 60, 8, 9, 10, 11}));
  const auto report = info();
  EXPECT_EQ(report["axes"][1],
            (nlohmann::json{{"points", 3}, {"first", 205}, {"spacing", 10}, {"unit", "m"}}));
  EXPECT_EQ(report["items"][0]["type"], 100078);
  EXPECT_EQ(report["geography"]["projection"], "WGS 84 / UTM zone 32N");
  const std::string history = TsbFile::open(out)->definition().history;
  EXPECT_THAT(history, HasSubstr("raster " + raster + " "));
  EXPECT_THAT(history,
              HasSubstr("Z: " + std::string(theEdition.wetlandSweepKit ? "v27setup-wsk" : "v27setup") +
                        " convert raster " + first + " " + out + " --land 50"));
  fs::remove(out);
  test::writeGrid(folder.file("feet.tsb2"), {.unit = "ft"});
  EXPECT_THAT(refused({folder.file("feet.tsb2"), out, "--land", "1"}),
              HasSubstr("The values are in ft, and those of Bathymetry are to be in m"));
  test::writeSeries(folder.file("s.tsb0"), {}, 100000, "m");
  EXPECT_THAT(refused({folder.file("s.tsb0"), out, "--land", "1"}), HasSubstr("it holds no map"));
  EXPECT_THAT(refused({folder.write("broken.tsb2", "\x89HDF"), out, "--land", "1"}),
              HasSubstr("it is no data file, or it is damaged"));
}

TEST_F(ConvertRaster, ItemsAndStepsOfADataFileAreChosen) {
  const std::string file = folder.file("many.tsb2");
  test::GridSpec spec{.noJ = 4, .noK = 3, .items = 2, .steps = 3};
  spec.time.step = 0.5;
  Result<TsbWriter> writer = TsbWriter::create(file, test::definitionOf(spec));
  for (std::size_t item = 1; item <= 2; ++item) {
    for (std::size_t step = 0; step < 3; ++step) {
      const std::vector<float> all(12, static_cast<float>(10 * item + step));
      ASSERT_TRUE(writer->write(item, step, std::span<const float>(all)));
    }
  }
  ASSERT_TRUE(writer->commit());
  EXPECT_THAT(
      refused({file, out, "--land", "60"}),
      HasSubstr(
          "holds several rasters; choose one with --subdataset N:\n  1  Item 1 [m]\n  2  Item 2 [m]\n"));
  EXPECT_THAT(refused({file, out, "--land", "60", "--subdataset", "3"}),
              HasSubstr("has no raster 3. It holds\n  1  Item 1"));
  EXPECT_THAT(
      refused({file, out, "--land", "60", "--subdataset", "2", "--band", "4"}),
      HasSubstr(
          "The raster has no band 4. It has 3:\n  1  1990-01-01 12:00:00\n  2  1990-01-01 12:00:00.5\n"));
  run = runTool({"convert", "raster", file, out, "--land", "60", "--subdataset", "2"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(
      run.err,
      HasSubstr("The raster has 3 bands, of which the first is taken; --band N takes another:\n  1  "));
  EXPECT_EQ(values(12)[5], 20);
  run = runTool(
      {"convert", "raster", file, out, "--land", "60", "--subdataset", "1", "--band", "3", "--force"});
  EXPECT_THAT(run.err, IsEmpty());
  EXPECT_EQ(values(12)[5], 12);
}

TEST_F(ConvertRaster, BandsOfARaster) {
  folder.write("r.asc", kRaster);
  ASSERT_EQ(test::runProgram("gdal_translate", {"-q", "-b", "1", "-b", "1", "-scale_2", "0", "10", "0", "20",
                                                folder.file("r.asc"), folder.file("b.tif")})
                .status,
            0);
  run = runTool({"convert", "raster", folder.file("b.tif"), out, "--land", "60"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.err, HasSubstr("The raster has 2 bands, of which the first is taken"));
  EXPECT_EQ(values(12)[1], 1);
  run = runTool({"convert", "raster", folder.file("b.tif"), out, "--land", "60", "--band", "2", "--force"});
  EXPECT_THAT(run.err, IsEmpty());
  EXPECT_EQ(values(12)[1], 2);
}

TEST_F(ConvertRaster, RastersInAFileAreListedAndChosen) {
  // A netCDF file with two variables, by another program.
  const std::string file = folder.file("two.nc");
  ASSERT_EQ(test::runProgram(
                "/usr/bin/python3",
                {"-c",
                 "import sys, netCDF4\n"
                 "d = netCDF4.Dataset(sys.argv[1], 'w')\n"
                 "for n in 'yx': d.createDimension(n, 3); v = d.createVariable(n, 'f8', (n,)); v[:] = "
                 "[0, 10, 20]\n"
                 "for i, n in enumerate(['depth', 'speed']): v = d.createVariable(n, 'f4', ('y', 'x')); "
                 "v[:] = i + 1\n"
                 "d.close()\n",
                 file})
                .status,
            0);
  const std::string errors = refused({file, out, "--land", "60"});
  EXPECT_THAT(errors, HasSubstr("holds several rasters; choose one with --subdataset N:\n  1  "));
  EXPECT_THAT(errors, HasSubstr("depth"));
  EXPECT_THAT(errors, HasSubstr(":speed)\n"));
  EXPECT_THAT(errors, Not(HasSubstr("no raster band")));
  EXPECT_THAT(refused({folder.file("gone.asc"), out, "--land", "60"}), HasSubstr("No such file"));
  ASSERT_EQ(runTool({"convert", "raster", file, out, "--land", "60", "--subdataset", "2"}).status, 0);
  EXPECT_EQ(values(9)[4], 2);
  ASSERT_EQ(
      runTool({"convert", "raster", "NETCDF:\"" + file + "\":depth", out, "--land", "60", "--force"}).status,
      0);
  EXPECT_EQ(values(9)[4], 1);
}

// A raster file of 4 x 3 points whose point (0,0), and steps along rows and from row to row, are given.
std::string turnedRaster(const test::TemporaryFolder& folder, std::string_view transform,
                         bool projected = true) {
  folder.write("r.asc", kRaster);
  EXPECT_EQ(
      test::runProgram("gdal_translate", {"-q", "-of", "VRT", folder.file("r.asc"), folder.file("r.vrt")})
          .status,
      0);
  std::string text = textOf(folder.file("r.vrt"));
  const std::size_t start = text.find("<GeoTransform>");
  const std::size_t end = text.find("</GeoTransform>");
  EXPECT_NE(end, text.npos);
  text.replace(start, end - start, "<GeoTransform>" + std::string(transform));
  if (projected) text.insert(start, "<SRS>EPSG:32632</SRS>");
  return folder.write("turned.vrt", text);
}

// The points of a map with their values, placed by the rules of the platform.
std::map<float, std::array<double, 2>> placesOf(const std::string& path) {
  const Result<TsbFile> file = TsbFile::open(path);
  EXPECT_TRUE(file);
  const TsbDefinition& definition = file->definition();
  const TsbGeography& place = *definition.geography;
  double east = 0;
  double north = 0;
  EXPECT_TRUE(CVdMapProjection(place.projection).Geo2Proj(place.longitude, place.latitude, &east, &north));
  const CVdCartography grid(place.projection, east, north, place.rotation);
  std::vector<float> values(definition.pointCount());
  EXPECT_TRUE(file->read(1, 0, std::span<float>(values)));
  std::map<float, std::array<double, 2>> places;
  const std::size_t noJ = definition.axes[0].points;
  for (std::size_t i = 0; i < values.size(); ++i) {
    grid.Xy2Proj(static_cast<double>(i % noJ) * definition.axes[0].spacing,
                 static_cast<double>(i / noJ) * definition.axes[1].spacing, &places[values[i]][0],
                 &places[values[i]][1]);
  }
  return places;
}

// Each value stays at its place on the map, and K runs northwards.
TEST_F(ConvertRaster, ARasterThatIsTurnedKeepsItsTurn) {
  constexpr double kStep = 20;
  const double c = kStep * std::cos(std::numbers::pi / 6);
  const double s = kStep / 2;
  const auto transform = [](double xc, double xr, double yc, double yr) {
    return fmt::format("500000,{:.15g},{:.15g},6100000,{:.15g},{:.15g}", xc, xr, yc, yr);
  };
  const std::vector<std::tuple<std::array<double, 4>, double>> turns{
      {{c, -s, -s, -c}, 30},  // 30 degrees clockwise, rows southwards
      {{c, s, -s, c}, 30},    // rows northwards
      {{c, s, s, -c}, -30},   // counter-clockwise
      {{-c, s, s, c}, 30},    // upside down: columns and rows run backwards
      {{kStep, 0, 0, -kStep}, 0}, {{-kStep, 0, 0, -kStep}, 0},
      {{-kStep, 0, 0, kStep}, 0}, {{0, kStep, kStep, 0}, -90},  // columns north, rows east
      {{0, kStep, -kStep, 0}, 90}};
  for (const auto& [steps, rotation] : turns) {
    const auto [xc, xr, yc, yr] = steps;
    const std::string raster = turnedRaster(folder, transform(xc, xr, yc, yr));
    SCOPED_TRACE(transform(xc, xr, yc, yr));
    run = runTool({"convert", "raster", raster, out, "--land", "60", "--force"});
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_NEAR(info()["geography"]["rotation"].get<double>(), rotation, 1e-9);
    EXPECT_NEAR(info()["axes"][0]["spacing"].get<double>(), kStep, 1e-9);
    const auto places = placesOf(out);
    ASSERT_EQ(places.size(), 12U);
    for (int row = 0; row < 3; ++row) {
      for (int column = 0; column < 4; ++column) {
        const float value = row == 1 && column == 3 ? 60 : static_cast<float>(8 - 4 * row + column);
        EXPECT_NEAR(places.at(value)[0], 500000 + xc * (column + 0.5) + xr * (row + 0.5), 1e-3) << value;
        EXPECT_NEAR(places.at(value)[1], 6100000 + yc * (column + 0.5) + yr * (row + 0.5), 1e-3) << value;
      }
    }
    // The same once more, by way of the raster library's own reading of the file and of ours.
    for (const std::string& again : {out, "NETCDF:" + out}) {
      const std::string second = folder.file("second.tsb2");
      run = runTool({"convert", "raster", again, second, "--land", "60", "--force"});
      ASSERT_EQ(run.status, 0) << run.err;
      for (const auto& [value, place] : placesOf(second)) {
        EXPECT_NEAR(place[0], places.at(value)[0], 1e-3) << again;
        EXPECT_NEAR(place[1], places.at(value)[1], 1e-3) << again;
      }
    }
  }
  EXPECT_THAT(runTool({"info", out}).out, HasSubstr("Rotation     90 degrees clockwise\n"));
}

TEST_F(ConvertRaster, WindowAndOriginOfARasterThatIsTurned) {
  const std::string raster = turnedRaster(folder, "500000,16,-12,6100000,-12,-16");  // 20 m apart
  run = runTool({"convert", "raster", raster, out, "--land", "60", "--window", "1,1,2,2"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(values(4), (std::vector<float>{5, 6, 9, 10}));
  const auto places = placesOf(out);
  EXPECT_NEAR(places.at(5)[0], 500000 + 16 * 1.5 - 12 * 1.5, 1e-3);
  EXPECT_NEAR(places.at(5)[1], 6100000 - 12 * 1.5 - 16 * 1.5, 1e-3);
  run = runTool({"convert", "raster", raster, out, "--land", "60", "--force", "--origin-x", "510000",
                 "--origin-y", "6200000"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.out, HasSubstr("from 510000, 6200000, turned 36.8699 degrees clockwise;"));
  EXPECT_NEAR(placesOf(out).at(0)[0], 510000, 1e-3);
}

TEST_F(ConvertRaster, ATurnThatCannotBeKeptIsTold) {
  EXPECT_THAT(
      refused({turnedRaster(folder, "0,20,5,0,0,-20"), out, "--land", "60"}),
      HasSubstr(
          "slanted on the map: its rows and columns are not square to each other. Turn it north up first"));
  run =
      runTool({"convert", "raster", turnedRaster(folder, "0,16,-12,0,-12,-16", false), out, "--land", "60"});
  EXPECT_EQ(run.status, 0);
  EXPECT_THAT(run.err,
              HasSubstr("turned by 36.8699 degrees, which a grid without a projection (--crs) cannot tell"));
  EXPECT_FALSE(info().contains("geography"));
}

TEST_F(ConvertRaster, ItemTypesByName) {
  const auto typeOf = [&](const std::string& text) {
    return convert({"--item-type", text})["items"][0]["type"];
  };
  EXPECT_EQ(typeOf("100000"), 100000);
  EXPECT_EQ(typeOf("Water level"), 100000);
  EXPECT_EQ(typeOf("wATER lEVEL"), 100000);
  EXPECT_EQ(typeOf("chezy"), 100032);
  EXPECT_EQ(typeOf("Level"), 100142);  // whole, though other names begin so
  fs::remove(out);
  const std::string raster = folder.file("r.asc");
  EXPECT_THAT(refused({raster, out, "--land", "1", "--item-type", "Water levl"}),
              HasSubstr("There is no item type \"Water levl\"; did you mean \"Water level\"? "));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--item-type", "wave"}),
              HasSubstr("Several item types begin with \"wave\": \"Wave height\", \"Wave period\""));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--item-type", "qqqq"}), Not(HasSubstr("did you mean")));
  EXPECT_THAT(refused({raster, out, "--land", "1", "--item-type", ""}),
              HasSubstr("There is no item type \"\""));
}

TEST_F(ConvertRaster, OnlyABathymetryNeedsALandValue) {
  const std::string whole = folder.write(
      "n.asc", "ncols 2\nnrows 2\nxllcorner 0\nyllcorner 0\ncellsize 1\nNODATA_value -9\n32 40\n32 40\n");
  EXPECT_THAT(refused({whole, out}), HasSubstr("A bathymetry needs a land value"));
  const std::string gaps = folder.write(
      "g.asc", "ncols 2\nnrows 2\nxllcorner 0\nyllcorner 0\ncellsize 1\nNODATA_value -9\n32 -9\n32 40\n");
  EXPECT_THAT(refused({gaps, out, "--item-type", "100030"}), HasSubstr("--nodata-as"));
  run = runTool({"convert", "raster", whole, out, "--item-type", "100030"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.out, Not(HasSubstr("land at")));
  EXPECT_TRUE(info()["custom_blocks"].empty());
  EXPECT_EQ(runTool({"convert", "raster", gaps, out, "--force", "--item-type", "100030", "--nodata-as", "30"})
                .status,
            0);
}

TEST(ConvertTypes, ListsEveryItemType) {
  EXPECT_THAT(runTool({"convert", "types"}).out,
              HasSubstr("\n100030  Manning number                      m^⅓/s\n"));
  const auto list = nlohmann::json::parse(runTool({"convert", "types", "--json"}).out);
  EXPECT_EQ(list.size(), qunItems().size());
  EXPECT_EQ(list[1], (nlohmann::json{{"code", 100000}, {"name", "Water level"}, {"unit", "m"}}));
}

class ConvertSeries : public ::testing::Test {
 protected:
  ProgramRun convert(std::string_view text, std::vector<std::string> options = {}) {
    std::vector<std::string> words{"convert", "series",  folder.write("s.txt", text), out,      "--item-type",
                                   "100000",  "--start", "2000-01-01 00:00:00",       "--force"};
    words.insert(words.end(), options.begin(), options.end());
    return runTool(words);
  }
  nlohmann::json info() { return nlohmann::json::parse(runTool({"info", out, "--json"}).out); }
  test::TemporaryFolder folder;
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

TEST_F(ConvertSeries, EachColumnMayHaveAnItemType) {
  const std::string text = folder.write("q.txt", "t,Discharge,Speed\n0,100,0.5\n60,120,0.6\n");
  const auto convertAs = [&](std::vector<std::string> types) {
    std::vector<std::string> words{"convert", "series",  "--skip-lines",
                                   "1",       "--start", "2020-01-01 00:00:00"};
    for (std::string& type : types) words.insert(words.end(), {"--item-type", std::move(type)});
    words.insert(words.end(), {text, out, "--force"});
    return runTool(words);
  };
  ASSERT_EQ(convertAs({"100001", "100242"}).status, 0);
  EXPECT_EQ(info()["items"][0]["name"], "Discharge");
  EXPECT_EQ(info()["items"][0]["type"], 100001);
  EXPECT_EQ(info()["items"][1]["type"], 100242);
  ASSERT_EQ(convertAs({"100001"}).status, 0);
  EXPECT_EQ(info()["items"][1]["type"], 100001);
  const ProgramRun refusal = convertAs({"100001", "100001", "100001"});
  EXPECT_EQ(refusal.status, 2);
  EXPECT_THAT(refusal.err, HasSubstr("There are 3 item types for 2 columns of values"));
}

TEST_F(ConvertSeries, UnevenTimesAreKept) {
  ASSERT_EQ(convert("0 1\n1 2\n5 3\n").status, 0);
  EXPECT_EQ(info()["time"]["equidistant"], false);
  EXPECT_EQ(info()["time"]["last"], 5);
}

TEST_F(ConvertSeries, TellsTheFirstAndTheLastMoment) {
  EXPECT_EQ(
      convert("3 1\n4 2\n5 3\n", {"--time-unit", "h"}).out,
      out + ": Water level of 3 time steps, 1 h apart, from 2000-01-01 03:00:00 to 2000-01-01 05:00:00\n");
  EXPECT_EQ(convert("-0.5 1\n0.25 2\n9 3\n").out,
            out + ": Water level of 3 time steps from 1999-12-31 23:59:59.5 to 2000-01-01 00:00:09\n");
  EXPECT_EQ(convert("0 1\n").out,
            out + ": Water level of 1 time step from 2000-01-01 00:00:00 to 2000-01-01 00:00:00\n");
}

TEST_F(ConvertSeries, WhatIsThereIsReplacedOnlyWhenAskedAndItsInputNever) {
  const std::string in = folder.write("in.txt", "0 1\n");
  folder.write("s.tsb0", "of old");
  const std::vector<std::string> words{"convert",     "series",      in,        out,
                                       "--item-type", "water level", "--start", "2000-01-01"};
  const ProgramRun run = runTool(words);
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("is there already; --force replaces it"));
  EXPECT_EQ(textOf(out), "of old");
  fs::create_symlink(in, folder.file("soft"));
  fs::create_hard_link(in, folder.file("hard"));
  for (const std::string& same : {in, folder.file("soft"), folder.file("hard")}) {
    std::vector<std::string> onItself = words;
    onItself[3] = same;
    onItself.push_back("--force");
    EXPECT_THAT(runTool(onItself).err, HasSubstr("is a file that is read here"));
    EXPECT_EQ(textOf(in), "0 1\n");
  }
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
  EXPECT_THAT(convert("0 1\nnan 2\n").err, HasSubstr("line 2: \"nan\" is no moment"));
  EXPECT_THAT(convert("0 1\ninf 2\n").err, HasSubstr("line 2: \"inf\" is no moment"));
  EXPECT_THAT(
      convert("0 1\n1 nan\n").err,
      HasSubstr("line 2: \"nan\" is no value that can stand in a series; leave out lines without a value"));
  EXPECT_EQ(convert("0 1\n9e5 2\n", {"--time-unit", "d"}).status, 0);
  fs::remove(out);
  EXPECT_THAT(convert("0 1\n9e6 2\n", {"--time-unit", "d"}).err, HasSubstr("lead out of the calendar"));
  EXPECT_THAT(convert("0 1\n1e300 2\n", {"--time-unit", "d"}).err, HasSubstr("lead out of the calendar"));
  EXPECT_FALSE(fs::exists(out));
}

TEST_F(ConvertSeries, WithoutAStartTheTableTellsWhatItHolds) {
  const std::string text = folder.write(
      "q.csv", "Datum;Pegel (cm);Q [m3/s]\n01.02.2020 00:00;125;10,5\n01.02.2020 01:00;-9999;11\n");
  const ProgramRun run = runTool({"convert", "series", text, out});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.err, HasSubstr("-9999 stands once for a value: it is taken for a missing one"));
  EXPECT_EQ(run.out, out +
                         ": Pegel of 2 time steps, 3600 s apart, from 2020-02-01 00:00:00 to 2020-02-01 "
                         "01:00:00\n");
  EXPECT_EQ(info()["items"][0]["type"], 100000);
  EXPECT_EQ(info()["items"][1]["type"], 100001);
  const Result<TsbFile> file = TsbFile::open(out);
  double level = 0;
  ASSERT_TRUE(file->read(1, 0, std::span<double>(&level, 1)));
  EXPECT_DOUBLE_EQ(level, 1.25);  // in its base unit
  ASSERT_TRUE(file->read(1, 1, std::span<double>(&level, 1)));
  EXPECT_EQ(level, file->definition().items[0].deleteValue);

  // What is given counts.
  ASSERT_EQ(runTool({"convert", "series", text, out, "--force", "--item-type", "surface elevation",
                     "--item-type", "100001"})
                .status,
            0);
  EXPECT_EQ(info()["items"][0]["type"], 100078);
  const std::string open = folder.write("d.csv", "d,Q\n1/2/2020,1\n2/2/2020,2\n");
  EXPECT_THAT(runTool({"convert", "series", open, out, "--force"}).err,
              HasSubstr("may be day/month/year or month/day/year: the first is meant"));
  EXPECT_THAT(runTool({"convert", "series", open, out, "--force", "--dates", "mdy"}).out,
              HasSubstr("from 2020-01-02 00:00:00 to 2020-02-02 00:00:00"));
}

TEST_F(ConvertSeries, TheOrderOfDatesIsOneOfThree) {
  const ProgramRun run = runTool({"convert", "series", "a.csv", out, "--dates", "yes"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("--dates: yes not in {dmy,mdy,ymd}"));
  const std::string text = folder.write("d.csv", "d,Q\n1/2/2020,1\n2/2/2020,2\n");
  EXPECT_THAT(runTool({"convert", "series", text, out, "--dates", "MDY"}).out,
              HasSubstr("from 2020-01-02 00:00:00 to 2020-02-02 00:00:00"));
  EXPECT_THAT(runTool({"convert", "series", "--help"}).out, Not(HasSubstr("ENUM")));
}

TEST_F(ConvertSeries, MissingValuesAreTold) {
  const auto values = [this] {
    const Result<TsbFile> file = TsbFile::open(out);
    std::vector<double> read(file->definition().time.count);
    for (std::size_t step = 0; step < read.size(); ++step)
      EXPECT_TRUE(file->read(1, step, std::span<double>(&read[step], 1)));
    for (double& value : read) value = value == file->definition().items[0].deleteValue ? NAN : value;
    return read;
  };
  const auto isGone = [](double value) { return std::isnan(value); };
  // In place of those that are recognised, and with a start as well.
  const std::string text =
      folder.write("q.csv", "d,Q\n2020-01-01,-9999\n2020-01-02,-5\n2020-01-03,1e3\n2020-01-04,\n");
  const ProgramRun run = runTool({"convert", "series", text, out, "--missing", "-5", "--missing", "1000"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.err, Not(HasSubstr("-9999")));
  EXPECT_THAT(values(), ElementsAre(-9999, Truly(isGone), Truly(isGone), Truly(isGone)));
  fs::remove(out);
  EXPECT_EQ(convert("0,1\n1,-5\n2,\n", {"--missing", "-5"}).status, 0);
  EXPECT_THAT(values(), ElementsAre(1, Truly(isGone), Truly(isGone)));
  fs::remove(out);
  EXPECT_THAT(convert("0,1\n1,\n").err, HasSubstr("line 2: \"\" is no number"));
  EXPECT_THAT(convert("0,1\n1,2\n", {"--missing", "nan"}).err,
              HasSubstr("--missing cannot be nan: it is a finite number"));
  EXPECT_THAT(convert("0,1\n1,2\n", {"--missing", "none"}).err, HasSubstr("--missing"));
  EXPECT_FALSE(fs::exists(out));
}

TEST_F(ConvertSeries, TextsInOtherCharacters) {
  std::string wide("\xff\xfe");
  for (const char c : std::string("d;Q (m\xb3/s)\r\n2020-01-01;1,5\r\n2020-01-02;2\r\n")) wide += {c, '\0'};
  for (const std::string& text :
       {wide, wide.substr(2), std::string("d;Q (m\xb3/s)\n2020-01-01;1,5\n2020-01-02;2\n")}) {
    const ProgramRun run = runTool({"convert", "series", folder.write("q.csv", text), out, "--force"});
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_THAT(run.out, HasSubstr("Q of 2 time steps"));
    EXPECT_EQ(info()["items"][0]["type"], 100001);
  }
  fs::remove(out);
  EXPECT_THAT(runTool({"convert", "series", folder.write("q.csv", std::string("a\0b\0\0\1", 6)), out}).err,
              HasSubstr("q.csv\": it is no text"));
}

TEST_F(ConvertSeries, WhatTheTableDoesNotTellIsAskedFor) {
  const auto fails = [this](std::string_view text) {
    const ProgramRun run = runTool({"convert", "series", folder.write("s.txt", text), out});
    EXPECT_EQ(run.status, 2);
    EXPECT_FALSE(fs::exists(out));
    return run.err;
  };
  EXPECT_THAT(fails("t,Q\n0,1\n1,2\n"), HasSubstr("are numbers: --start gives the moment of time 0"));
  EXPECT_THAT(
      fails("d,what\n2020-01-01,1\n2020-01-02,2\n"),
      HasSubstr("What \"what\" holds is not seen from its name and unit: --item-type gives its item type"));
  EXPECT_THAT(fails("words\n"), HasSubstr("no table of times and values is seen in it"));
  EXPECT_THAT(fails("d,Q\n2020-01-01,1\n2020-01-02,2\n2020-01-03,3\n2020-01-04,x\n"),
              HasSubstr("line 5: \"x\" is no number"));
  EXPECT_THAT(fails("a,Q\n3,1\n2,2\n"), HasSubstr("There is no column of times"));
}

}  // namespace cli_convert_test
}  // namespace gridbay
