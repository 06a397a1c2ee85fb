#include <gmock/gmock.h>
#include <netcdf.h>
#include <sys/stat.h>

#include <cmath>
#include <filesystem>
#include <fstream>
#include <nlohmann/json.hpp>
#include <numbers>
#include <random>
#include <utility>

#include "platform/cartography/cartography.h"
#include "platform/tsb/stored_grid.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_operations.h"
#include "platform/tsb/tsb_writer.h"
#include "tests/support/grids.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace platform_tsb_test {

using ::testing::AllOf;
using ::testing::AnyOf;
using ::testing::HasSubstr;
using ::testing::Not;

class Tsb : public ::testing::Test {
 protected:
  std::string openError() {
    const Result<TsbFile> file = TsbFile::open(path);
    return file ? "" : file.error();
  }
  test::TemporaryFolder folder;
  std::string path = folder.file("f ö.tsb2");
};

// A definition with all that there can be, of so many dimensions.
TsbDefinition full(std::size_t dimensions, TsbTimeAxisType type) {
  TsbDefinition definition;
  definition.title = "A title";
  definition.dataType = 3;
  definition.time.type = type;
  definition.time.start = {2007, 6, 8, 1, 2, 3};
  definition.time.unit = "min";
  definition.time.first = 5;
  definition.time.step = 2.5;
  definition.time.count = 3;
  if (!definition.time.isEquidistant()) definition.time.values = {0, 1, 10};
  if (dimensions > 0) definition.axes.push_back({4, 100, 0.5, "m"});
  if (dimensions > 1) definition.axes.push_back({3, -7, 2, "m"});
  definition.items = {{"Surface", 100078, "m"}, {"Surface", 100001, "m3 s-1", true, -999}};
  definition.customBlocks = {{"V27_Misc", {1, 2, 3, 4}}, {"Other block", {5}}};
  definition.geography = TsbGeography{"UTM-32", 9.5, 55.25, 12};
  return definition;
}

float valueAt(std::size_t item, std::size_t step, std::size_t i) {
  return static_cast<float>(item * 1000 + step * 100 + i) + 0.25F;
}

TEST_F(Tsb, EveryShapeAndTimeAxisComesBack) {
  for (const std::size_t dimensions : {0U, 1U, 2U}) {
    for (const int type : {1, 2, 3, 4}) {
      SCOPED_TRACE(std::to_string(dimensions) + " dimensions, time axis " + std::to_string(type));
      const TsbDefinition wanted = full(dimensions, static_cast<TsbTimeAxisType>(type));
      {
        Result<TsbWriter> writer = TsbWriter::create(path, wanted);
        ASSERT_TRUE(writer) << writer.error();
        for (std::size_t item = 1; item <= 2; ++item) {
          for (std::size_t step = 0; step < 3; ++step) {
            std::vector<float> values;
            for (std::size_t i = 0; i < wanted.pointCount(); ++i) values.push_back(valueAt(item, step, i));
            ASSERT_TRUE(writer->write(item, step, std::span<const float>(values)));
          }
        }
        ASSERT_TRUE(writer->commit());
      }
      const Result<TsbFile> file = TsbFile::open(path);
      ASSERT_TRUE(file) << file.error();
      const TsbDefinition& got = file->definition();
      EXPECT_EQ(got.title, wanted.title);
      EXPECT_EQ(got.dataType, 3);
      EXPECT_EQ(got.time.type, wanted.time.type);
      EXPECT_EQ(got.time.unit, "min");
      EXPECT_EQ(got.time.count, 3U);
      for (std::size_t i = 0; i < 3; ++i) EXPECT_EQ(got.time.at(i), wanted.time.at(i));
      if (wanted.time.isCalendar()) EXPECT_EQ(got.time.start, wanted.time.start);
      ASSERT_EQ(got.axes.size(), dimensions);
      for (std::size_t i = 0; i < dimensions; ++i) {
        EXPECT_EQ(got.axes[i].points, wanted.axes[i].points);
        EXPECT_EQ(got.axes[i].first, wanted.axes[i].first);
        EXPECT_EQ(got.axes[i].spacing, wanted.axes[i].spacing);
        EXPECT_EQ(got.axes[i].unit, "m");
      }
      ASSERT_EQ(got.items.size(), 2U);
      EXPECT_EQ(got.items[1].name, "Surface");
      EXPECT_EQ(got.items[1].type, 100001);
      EXPECT_EQ(got.items[1].unit, "m3 s-1");
      EXPECT_TRUE(got.items[1].isDouble);
      EXPECT_EQ(got.items[1].deleteValue, -999);
      EXPECT_EQ(static_cast<float>(got.items[0].deleteValue), -1e-35F);
      ASSERT_EQ(got.customBlocks.size(), 2U);
      EXPECT_EQ(got.customBlocks[1].name, "Other block");
      EXPECT_EQ(got.customBlocks[0].values, (std::vector<float>{1, 2, 3, 4}));
      ASSERT_TRUE(got.geography);
      EXPECT_EQ(got.geography->projection, "UTM-32");
      EXPECT_EQ(got.geography->longitude, 9.5);
      EXPECT_EQ(got.geography->latitude, 55.25);
      EXPECT_EQ(got.geography->rotation, 12);
      for (std::size_t item = 1; item <= 2; ++item) {
        for (std::size_t step = 0; step < 3; ++step) {
          std::vector<float> values(got.pointCount());
          ASSERT_TRUE(file->read(item, step, std::span<float>(values)));
          for (std::size_t i = 0; i < values.size(); ++i) ASSERT_EQ(values[i], valueAt(item, step, i));
        }
      }
    }
  }
}

TEST_F(Tsb, TheOperations) {
  TsbHeader header;
  std::string error;
  EXPECT_NE(tsbFileRead(path, &header, &error), 0);
  EXPECT_THAT(error, HasSubstr("there is no such file"));
  test::GridSpec spec{.noJ = 5, .noK = 4, .dx = 20, .dy = 25, .items = 2, .steps = 2};
  spec.geography = TsbGeography{"UTM-32", 9, 55, 1};
  spec.time.step = 2;
  spec.time.unit = "h";
  test::writeGrid(path, spec);
  ASSERT_EQ(tsbFileRead(path, &header), 0);
  EXPECT_EQ(tsbGetNoOfItems(header), 2);
  int type = 0;
  std::string name;
  std::string unit;
  EXPECT_EQ(tsbGetItemInfo(header, 2, &type, &name, &unit), 0);
  EXPECT_EQ(type, 100079);
  EXPECT_EQ(name, "Item 2");
  EXPECT_EQ(unit, "m");
  EXPECT_NE(tsbGetItemInfo(header, 3, &type, &name, &unit), 0);
  EXPECT_EQ(tsbItemD(header, 0), nullptr);
  EXPECT_EQ(tsbItemD(header, 1)->name, "Item 1");
  EXPECT_EQ(static_cast<int>(tsbGetItemAxisType(header, 1)), 5);
  int noJ = 0;
  int noK = 0;
  float dx = 0;
  float dy = 0;
  EXPECT_EQ(tsbGetItemAxisEqD2(header, 1, &noJ, &noK, &dx, &dy), 0);
  EXPECT_EQ(noJ, 5);
  EXPECT_EQ(noK, 4);
  EXPECT_EQ(dx, 20.0F);
  EXPECT_EQ(dy, 25.0F);
  std::vector<float> values(20);
  EXPECT_EQ(tsbFindBlockDynamic(&header), 0);
  EXPECT_EQ(tsbReadItemTimeStep(header, values), 0);
  EXPECT_EQ(tsbFindItemDynamic(&header, 1, 2), 0);
  EXPECT_NE(tsbFindItemDynamic(&header, 2, 1), 0);
  EXPECT_NE(tsbFindItemDynamic(&header, -1, 1), 0);
  EXPECT_NE(tsbFindItemDynamic(&header, 0, 3), 0);
  values.resize(19);
  EXPECT_NE(tsbReadItemTimeStep(header, values), 0);
  std::string date;
  std::string time;
  double step = 0;
  EXPECT_EQ(tsbGetEqCalendarAxis(header, &date, &time, &step), 0);
  EXPECT_EQ(date, "1990-1-1");
  EXPECT_EQ(time, "12:0:0");
  EXPECT_EQ(step, 7200);
  EXPECT_EQ(tsbGetGeoInfoType(header), 1);
  double longitude = 0;
  double latitude = 0;
  double rotation = 0;
  EXPECT_EQ(tsbGetGeoInfoUTMProj(header, &name, &longitude, &latitude, &rotation), 0);
  EXPECT_EQ(name, "UTM-32");
  EXPECT_EQ(rotation, 1);
  const TsbCustomBlock* block = nullptr;
  std::span<const float> numbers;
  EXPECT_EQ(tsbGetCustomBlockRef(header, &block), 0);
  EXPECT_EQ(tsbGetCustomBlock(header, &block, &name, &numbers), 0);
  EXPECT_EQ(name, "V27_Misc");
  EXPECT_EQ(numbers[3], 10.0F);
  EXPECT_EQ(block, nullptr);
  EXPECT_NE(tsbGetCustomBlock(header, &block, &name, &numbers), 0);
  tsbFileClose(&header);
  tsbHeaderDestroy(&header);
  EXPECT_EQ(header.file, nullptr);

  test::writeGrid(path, {});
  ASSERT_EQ(tsbFileRead(path, &header), 0);
  EXPECT_EQ(tsbGetGeoInfoType(header), 0);
  EXPECT_NE(tsbGetGeoInfoUTMProj(header, &name, &longitude, &latitude, &rotation), 0);
}

TEST_F(Tsb, WritingByRows) {
  Result<TsbWriter> writer = TsbWriter::create(path, test::definitionOf({.noJ = 3, .noK = 4}));
  ASSERT_TRUE(writer);
  const std::vector<float> two{1, 2, 3, 4, 5, 6};
  ASSERT_TRUE(writer->writeRows(1, 0, 2, two));
  ASSERT_TRUE(writer->writeRows(1, 0, 0, two));
  EXPECT_FALSE(writer->writeRows(1, 0, 3, two));
  EXPECT_FALSE(writer->write(2, 0, std::span<const float>(two)));
  EXPECT_FALSE(writer->write(1, 1, std::span<const float>(two)));
  ASSERT_TRUE(writer->commit());
  std::vector<float> values(12);
  ASSERT_TRUE(TsbFile::open(path)->read(1, 0, std::span<float>(values)));
  EXPECT_EQ(values, (std::vector<float>{1, 2, 3, 4, 5, 6, 1, 2, 3, 4, 5, 6}));
}

TEST_F(Tsb, DefinitionsThatCannotBe) {
  const auto errorOf = [this](auto change) {
    TsbDefinition definition = test::definitionOf({});
    change(definition);
    const Result<TsbWriter> writer = TsbWriter::create(path, definition);
    return writer ? "" : writer.error();
  };
  EXPECT_THAT(errorOf([](auto& d) { d.items.clear(); }), HasSubstr("no items are defined"));
  EXPECT_THAT(errorOf([](auto& d) { d.axes[0].points = 0; }), HasSubstr("an axis has no points"));
  EXPECT_THAT(errorOf([](auto& d) { d.axes.push_back({}); }), HasSubstr("at most two directions"));
  EXPECT_THAT(errorOf([](auto& d) { d.time.type = TsbTimeAxisType::calendar; }),
              HasSubstr("another number of values"));
  path = folder.file("no/f.tsb2");
  EXPECT_THAT(errorOf([](auto&) {}), HasSubstr("No such file or directory"));
}

TEST_F(Tsb, AWriterThatIsNotCommittedLeavesTheOldFile) {
  test::writeGrid(path, {.noJ = 5});
  { const Result<TsbWriter> writer = TsbWriter::create(path, test::definitionOf({.noJ = 7})); }
  EXPECT_EQ(TsbFile::open(path)->definition().axes[0].points, 5U);
  EXPECT_EQ(std::distance(std::filesystem::directory_iterator(folder.path()), {}), 1);
}

// Makes a file with the library alone, as a stranger would.
void foreign(const std::string& path, const std::function<void(int)>& fill) {
  int file = 0;
  ASSERT_EQ(nc_create(path.c_str(), NC_NETCDF4 | NC_CLOBBER, &file), NC_NOERR);
  fill(file);
  ASSERT_EQ(nc_close(file), NC_NOERR);
}

int timeAxis(int file, std::size_t count, int type) {
  int dimension = 0;
  int variable = 0;
  const double one = 1;
  nc_def_dim(file, "time", count, &dimension);
  nc_def_var(file, "time", NC_DOUBLE, 1, &dimension, &variable);
  nc_put_att_text(file, variable, "units", 1, "s");
  nc_put_att_int(file, variable, "axis_type", NC_INT, 1, &type);
  nc_put_att_double(file, variable, "first_value", NC_DOUBLE, 1, &one);
  nc_put_att_double(file, variable, "step", NC_DOUBLE, 1, &one);
  return dimension;
}

void axis(int file, const char* name, std::size_t count) {
  int dimension = 0;
  int variable = 0;
  const double one = 1;
  nc_def_dim(file, name, count, &dimension);
  nc_def_var(file, name, NC_FLOAT, 1, &dimension, &variable);
  nc_def_var_chunking(file, variable, NC_CHUNKED, std::array<std::size_t, 1>{1024}.data());
  nc_put_att_double(file, variable, "first_value", NC_DOUBLE, 1, &one);
  nc_put_att_double(file, variable, "step", NC_DOUBLE, 1, &one);
}

TEST_F(Tsb, FilesOfStrangers) {
  foreign(path, [](int) {});
  EXPECT_THAT(openError(), HasSubstr("it has no time axis"));
  foreign(path, [](int file) { timeAxis(file, 2, 1); });
  EXPECT_THAT(openError(), HasSubstr("it has no items (variables with an item type)"));
  foreign(path, [](int file) { timeAxis(file, 2, 9); });
  EXPECT_THAT(openError(), HasSubstr("its time axis is of an unknown kind"));
  foreign(path, [](int file) { timeAxis(file, NC_UNLIMITED, 1); });
  EXPECT_THAT(openError(), HasSubstr("its time axis has no steps"));
  foreign(path, [](int file) { timeAxis(file, 2, 3); });
  EXPECT_THAT(openError(), HasSubstr("its time axis has no start date"));
  foreign(path, [](int file) {
    timeAxis(file, 2, 1);
    axis(file, "x", NC_UNLIMITED);
  });
  EXPECT_THAT(openError(), HasSubstr("its axis x has no points"));
  foreign(path, [](int file) {
    const int dimension = timeAxis(file, 2, 1);
    axis(file, "x", 3);
    int variable = 0;
    const int number = 1;
    nc_def_var(file, "item", NC_FLOAT, 1, &dimension, &variable);
    nc_put_att_int(file, variable, "item_number", NC_INT, 1, &number);
  });
  EXPECT_THAT(openError(), HasSubstr("does not have the shape of its axes"));
}

TEST_F(Tsb, TextsWhereNumbersShouldBe) {
  test::writeGrid(path, {.noJ = 4, .noK = 4});
  int file = 0;
  int group = 0;
  int dimension = 0;
  int variable = 0;
  ASSERT_EQ(nc_open(path.c_str(), NC_WRITE, &file), NC_NOERR);
  ASSERT_EQ(nc_inq_ncid(file, "custom_blocks", &group), NC_NOERR);
  ASSERT_EQ(nc_def_dim(group, "texts", 1000, &dimension), NC_NOERR);
  ASSERT_EQ(nc_def_var(group, "of_text", NC_STRING, 1, &dimension, &variable), NC_NOERR);
  ASSERT_EQ(nc_def_var(group, "of_letters", NC_CHAR, 1, &dimension, &variable), NC_NOERR);
  ASSERT_EQ(nc_close(file), NC_NOERR);
  const Result<TsbFile> opened = TsbFile::open(path);
  ASSERT_TRUE(opened) << opened.error();
  const std::vector<TsbCustomBlock>& blocks = opened->definition().customBlocks;
  ASSERT_EQ(blocks.size(), 3U);
  EXPECT_TRUE(blocks[0].readable);
  EXPECT_FALSE(blocks[1].readable);
  EXPECT_FALSE(blocks[2].readable);
}

TEST_F(Tsb, AxesThatClaimMoreThanTheFileCanHold) {
  foreign(path, [](int file) {
    timeAxis(file, 1, 1);
    axis(file, "x", 2000000000);
    axis(file, "y", 2000000000);
  });
  EXPECT_THAT(openError(), HasSubstr("its axes say more points than the file can hold"));
}

// Opens a file and reads it as far as it goes; either must do or tell why. Whether it opened.
bool opensOrTells(const std::string& path) {
  const Result<TsbFile> file = TsbFile::open(path);
  if (!file) {
    EXPECT_THAT(file.error(), HasSubstr(path));
    return false;
  }
  constexpr std::size_t kManyPoints = 100000;
  if (file->definition().pointCount() > kManyPoints) return true;
  std::vector<float> values(file->definition().pointCount());
  const Outcome read = file->read(1, 0, std::span<float>(values));
  EXPECT_TRUE(read || !read.error().empty());
  return true;
}

TEST_F(Tsb, DamagedFilesAreRefusedOrRead) {
  test::writeGrid(path, {.noJ = 20, .noK = 20});
  const std::string whole = test::textOf(path);
  std::mt19937 random(5);
  int opened = 0;
  for (int i = 0; i < 300; ++i) {
    std::string damaged = whole;
    damaged[random() % damaged.size()] = static_cast<char>(random());
    opened += opensOrTells(folder.write("d.tsb2", damaged)) ? 1 : 0;
  }
  EXPECT_GT(opened, 0);
  EXPECT_LT(opened, 300);
}

// Such texts lie apart from what holds them, and the library stumbles over them at the end when one is lost.
TEST_F(Tsb, TextsOfOtherProgramsThatAreDamaged) {
  test::writeGrid(path, {.noJ = 4, .noK = 4});
  int file = 0;
  ASSERT_EQ(nc_open(path.c_str(), NC_WRITE, &file), NC_NOERR);
  const char* texts[] = {"a text of another program", "and one more"};
  nc_put_att_string(file, NC_GLOBAL, "history", 2, texts);
  nc_put_att_string(file, NC_GLOBAL, "title", 1, texts);
  ASSERT_EQ(nc_close(file), NC_NOERR);
  EXPECT_EQ(openError(), "");
  const std::string whole = test::textOf(path);
  const std::size_t heap = whole.find("GCOL");
  ASSERT_NE(heap, whole.npos);
  int opened = 0;
  for (std::size_t i = 0; i < 120; i += 3) {
    std::string damaged = whole;
    damaged[heap + i] = static_cast<char>(~damaged[heap + i]);
    opened += opensOrTells(folder.write("d.tsb2", damaged)) ? 1 : 0;
  }
  EXPECT_GT(opened, 0);
  EXPECT_LT(opened, 40);
}

TEST_F(Tsb, AnOlderKindOfFileIsRefused) {
  int file = 0;
  int dimension = 0;
  ASSERT_EQ(nc_create(path.c_str(), NC_64BIT_DATA, &file), NC_NOERR);
  nc_def_dim(file, "time", 3, &dimension);
  ASSERT_EQ(nc_close(file), NC_NOERR);
  EXPECT_THAT(openError(), HasSubstr("it is no data file, or it is damaged"));
}

// Another program may put a whole file where a damaged one was, without a new file taking its place.
TEST_F(Tsb, AFileThatIsMendedInPlaceOpens) {
  test::writeGrid(path, {.noJ = 20, .noK = 20});
  const std::string whole = test::textOf(path);
  const std::string place = folder.write("d.tsb2", whole);
  std::mt19937 random(7);
  int refused = 0;
  for (int i = 0; i < 100; ++i) {
    std::string damaged = whole;
    damaged[random() % 2000] = static_cast<char>(random());
    folder.write("d.tsb2", damaged);
    refused += TsbFile::open(place) ? 0 : 1;
    folder.write("d.tsb2", whole);
    const Result<TsbFile> mended = TsbFile::open(place);
    ASSERT_TRUE(mended) << i << ": " << mended.error();
  }
  EXPECT_GT(refused, 10);
}

TEST_F(Tsb, LookingAheadWaitsForNothingAndChangesNothing) {
  const std::string pipe = folder.file("pipe");
  ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
  const std::string broken = folder.write("broken.tsb2", "not a data file");
  test::writeGrid(path);
  TsbFile::lookAhead({});
  TsbFile::lookAhead(
      std::vector<std::string>{"", folder.file("none"), pipe, folder.path(), broken, path, path});
  EXPECT_EQ(openError(), "");
  for (const std::string& bad : {pipe, broken, folder.file("none")}) EXPECT_FALSE(TsbFile::open(bad)) << bad;
}

// What other programs read in the files.
TEST_F(Tsb, OtherProgramsReadAxesUnitsAndProjection) {
  test::GridSpec spec{.noJ = 5, .noK = 4, .dx = 20, .dy = 25};
  spec.geography = TsbGeography{"UTM-32", 9, 55, 0};
  test::writeGrid(path, spec, [](int j, int k) { return static_cast<float>(10 * j + k); });
  const test::ProgramRun dump = test::runProgram("ncdump", {"-h", path});
  EXPECT_EQ(dump.status, 0) << dump.err;
  EXPECT_THAT(dump.out,
              AllOf(HasSubstr("float item_1(time, y, x)"), HasSubstr("item_1:units = \"m\""),
                    HasSubstr("item_1:item_type = 100079"), HasSubstr("item_1:grid_mapping = \"projection\""),
                    HasSubstr("time:units = \"s since 1990-01-01 12:00:00\""), HasSubstr("x:units = \"m\"")));
  // The raster library has the file opened by its plain HDF5 reader unless it is told.
  const test::ProgramRun gdal = test::runProgram("gdalinfo", {"NETCDF:" + path});
  EXPECT_EQ(gdal.status, 0) << gdal.err;
  EXPECT_THAT(gdal.out, AllOf(HasSubstr("Size is 5, 4"), HasSubstr("WGS 84 / UTM zone 32N"),
                              HasSubstr("Origin = (-10.000000000000000,87.500000000000000)"),
                              HasSubstr("Pixel Size = (20.000000000000000,-25.000000000000000)")));
  const test::ProgramRun xarray = test::runProgram(
      "/usr/bin/python3",
      {"-c",
       "import sys, xarray\n"
       "d = xarray.open_dataset(sys.argv[1])\n"
       "v = d['item_1']\n"
       "print(v.dims, v.attrs['units'], list(d['x'].values), list(d['y'].values), d['time'].values[0],\n"
       "      float(v[0, 3, 4]), d['projection'].attrs['crs_wkt'][:6])",
       path});
  EXPECT_EQ(xarray.status, 0) << xarray.err;
  EXPECT_EQ(xarray.out,
            "('time', 'y', 'x') m [0.0, 20.0, 40.0, 60.0, 80.0] [0.0, 25.0, 50.0, 75.0] "
            "1990-01-01T12:00:00.000000000 43.0 "
            "PROJCR\n");
}

// Attributes as the Python reader gives them, of a variable ("" for the whole file), one a line.
std::string attributesOf(const std::string& path, const std::string& variable) {
  const test::ProgramRun run =
      test::runProgram("/usr/bin/python3", {"-c",
                                            "import sys, netCDF4\n"
                                            "d = netCDF4.Dataset(sys.argv[1])\n"
                                            "v = d.variables[sys.argv[2]] if sys.argv[2] else d\n"
                                            "for name in v.ncattrs(): print(name, '=', v.getncattr(name))\n",
                                            path, variable});
  EXPECT_EQ(run.status, 0) << run.err;
  return run.out;
}

TEST_F(Tsb, ReadersOfTheConventionsFindProjectionNamesAndHistory) {
  TsbDefinition definition = test::definitionOf({.noJ = 5, .noK = 4, .dx = 20, .dy = 25});
  definition.title = "A bay";
  definition.history = "2026-01-02T03:04:05Z: made";
  definition.items = {{"Level", 100078, "m"},
                      {"Wind X-component", 100274, "m s-1"},
                      {"Wind speed", 100274, "m s-1"},
                      {"Rain in a wrong unit", 100431, "m"},
                      {"Elevation", 100079, "m"}};
  definition.geography = TsbGeography{"UTM-32", 9, 55, 0};
  test::writeFile(path, definition);
  EXPECT_THAT(attributesOf(path, ""), AllOf(HasSubstr("Conventions = CF-1.8\ntitle = A bay\n"),
                                            HasSubstr("history = 2026-01-02T03:04:05Z: made\n")));
  EXPECT_EQ(TsbFile::open(path)->definition().history, "2026-01-02T03:04:05Z: made");
  EXPECT_THAT(attributesOf(path, "level"),
              HasSubstr("standard_name = water_surface_height_above_reference_datum\n"));
  EXPECT_THAT(attributesOf(path, "wind_speed"), HasSubstr("standard_name = wind_speed\n"));
  for (const char* variable : {"wind_x_component", "rain_in_a_wrong_unit", "elevation"})
    EXPECT_THAT(attributesOf(path, variable), Not(HasSubstr("standard_name")));
  EXPECT_THAT(attributesOf(path, "x"), HasSubstr("standard_name = projection_x_coordinate\n"));
  EXPECT_THAT(
      attributesOf(path, "projection"),
      AllOf(HasSubstr("grid_mapping_name = transverse_mercator\n"),
            HasSubstr("latitude_of_projection_origin = 0.0\n"),
            HasSubstr("longitude_of_central_meridian = 9.0\n"),
            HasSubstr("scale_factor_at_central_meridian = 0.9996\n"), HasSubstr("false_easting = 500000.0\n"),
            HasSubstr("false_northing = 0.0\n"), HasSubstr("semi_major_axis = 6378137.0\n"),
            HasSubstr("inverse_flattening = 298.257223563\n"), HasSubstr("crs_wkt = PROJCRS["),
            HasSubstr("spatial_ref = PROJCS[")));
}

TEST_F(Tsb, ProjectionsWithAndWithoutAGridMappingAreFoundByOtherPrograms) {
  const auto written = [&](const std::string& projection) {
    TsbDefinition definition = test::definitionOf({});
    definition.geography = TsbGeography{projection, 9, 55, 0};
    test::writeFile(path, definition);
    return attributesOf(path, "projection");
  };
  EXPECT_THAT(written("EPSG:3034"), AllOf(HasSubstr("grid_mapping_name = lambert_conformal_conic\n"),
                                          HasSubstr("standard_parallel = [35. 65.]\n")));
  EXPECT_THAT(written("EPSG:3035"), HasSubstr("grid_mapping_name = lambert_azimuthal_equal_area\n"));
  // A grid mapping that the conventions don't have has its full text alone.
  EXPECT_THAT(written("EPSG:2056"),
              AllOf(HasSubstr("crs_wkt = PROJCRS["), Not(HasSubstr("grid_mapping_name"))));
  const test::ProgramRun gdal = test::runProgram("gdalinfo", {"NETCDF:" + path});
  EXPECT_THAT(gdal.out, HasSubstr("CH1903+ / LV95"));
  EXPECT_THAT(written("Local Coordinates"), Not(AnyOf(HasSubstr("crs_wkt"), HasSubstr("grid_mapping_name"))));
  EXPECT_THAT(attributesOf(path, "x"), Not(HasSubstr("standard_name")));
}

// K along the grid's own +y, 30 degrees clockwise of north.
TEST_F(Tsb, OtherProgramsPlaceAGridThatIsTurned) {
  test::GridSpec spec{.noJ = 5, .noK = 4, .dx = 20, .dy = 25};
  spec.geography = TsbGeography{"UTM-32", 9, 55, 30};
  test::writeGrid(path, spec, [](int j, int k) { return static_cast<float>(10 * j + k); });
  const test::ProgramRun info = test::runProgram("gdalinfo", {"-json", "NETCDF:" + path});
  ASSERT_EQ(info.status, 0) << info.err;
  const auto transform = nlohmann::json::parse(info.out)["geoTransform"].get<std::vector<double>>();
  double east = 0;
  double north = 0;
  ASSERT_TRUE(CVdMapProjection("UTM-32").Geo2Proj(9, 55, &east, &north));
  const CVdCartography place("UTM-32", east, north, 30);
  for (const auto& [column, row] : {std::pair(0, 0), {4, 0}, {0, 3}, {4, 3}, {2, 1}}) {
    const test::ProgramRun found = test::runProgram(
        "gdallocationinfo", {"-valonly", "NETCDF:" + path, std::to_string(column), std::to_string(row)});
    ASSERT_EQ(found.status, 0) << found.err;
    const double value = std::stod(found.out);
    double wantedX = 0;
    double wantedY = 0;
    place.Xy2Proj(20 * std::floor(value / 10), 25 * std::fmod(value, 10), &wantedX, &wantedY);
    EXPECT_NEAR(transform[0] + transform[1] * (column + 0.5) + transform[2] * (row + 0.5), wantedX, 1e-3)
        << value;
    EXPECT_NEAR(transform[3] + transform[4] * (column + 0.5) + transform[5] * (row + 0.5), wantedY, 1e-3)
        << value;
  }
  EXPECT_NEAR(transform[1], 20 * std::cos(std::numbers::pi / 6), 1e-6);
  EXPECT_NEAR(transform[4], -10, 1e-6);
}

// A grid that is read past the data file library, as it is or packed.
class StoredGrids : public Tsb {
 protected:
  // The file packed anew by another program.
  std::string packed(const std::vector<std::string>& how) {
    std::vector<std::string> arguments(how);
    const std::string made = folder.file("packed.tsb2");
    arguments.insert(arguments.begin(), {"-M", "1"});  // small pieces too
    arguments.insert(arguments.end(), {path, made});
    EXPECT_EQ(test::runProgram("nccopy", arguments).status, 0);
    return made;
  }
  static float surface(int j, int k) { return static_cast<float>(j * 1000 - k * 7) / 3; }
};

TEST_F(StoredGrids, AreTheSameHoweverTheyArePacked) {
  test::writeGrid(path, {.noJ = 37, .noK = 23, .items = 2, .steps = 2}, surface);
  const std::vector<std::vector<std::string>> ways{{"-d", "0"},
                                                   {"-c", "time/1,y/23,x/37"},
                                                   {"-d", "5", "-c", "time/1,y/10,x/8"},
                                                   {"-d", "1", "-s", "-c", "time/1,y/7,x/37"},
                                                   {"-d", "9", "-s", "-c", "time/2,y/5,x/6"}};
  for (const auto& way : ways) {
    SCOPED_TRACE(way.back());
    Result<StoredGrid> grid = StoredGrid::open(packed(way), 2);
    ASSERT_TRUE(grid) << grid.error();
    EXPECT_EQ(grid->columns(), 37U);
    EXPECT_EQ(grid->rows(), 23U);
    std::vector<float> row(30);
    for (std::size_t k = 0; k < 23; ++k) {
      ASSERT_TRUE(grid->read(k, 5, row));
      for (int i = 0; i < 30; ++i)
        ASSERT_EQ(row[static_cast<std::size_t>(i)], surface(i + 5, static_cast<int>(k)));
    }
    EXPECT_FALSE(grid->read(23, 0, row));
    EXPECT_FALSE(grid->read(0, 8, row));
  }
  EXPECT_FALSE(StoredGrid::open(path, 3));
  EXPECT_FALSE(StoredGrid::find(path, 0));
}

TEST_F(StoredGrids, ALargePackedOneIsReadInPartsAndHasAnOverview) {
  constexpr int kColumns = 4200;
  constexpr int kRows = 4100;
  static_assert(std::size_t{kColumns} * kRows > StoredGrid::kMostAtOnce);
  test::writeGrid(path, {.noJ = kColumns, .noK = kRows}, surface);
  const std::string file = packed({"-d", "1", "-c", "time/1,y/500,x/600"});
  const Result<StoredGrid::Source> source = StoredGrid::find(file, 1);
  ASSERT_TRUE(source);
  int asked = 0;
  const Result<StoredGrid> stopped = StoredGrid::open(*source, [&asked](double done) {
    EXPECT_TRUE(done >= 0 && done < 0.1);
    return ++asked <= 3;
  });
  EXPECT_FALSE(stopped);
  EXPECT_EQ(asked, 4);
  const Result<StoredGrid> grid = StoredGrid::open(*source);
  ASSERT_TRUE(grid) << grid.error();
  std::vector<float> row(kColumns);
  for (const int k : {0, 499, 500, 2222, kRows - 1}) {
    ASSERT_TRUE(grid->read(static_cast<std::size_t>(k), 0, row));
    for (int j = 0; j < kColumns; ++j) ASSERT_EQ(row[static_cast<std::size_t>(j)], surface(j, k));
    // Seen from afar, every value is that of a point not far away.
    ASSERT_TRUE(grid->read(static_cast<std::size_t>(k), 0, row, 50));
    for (int j = 0; j < kColumns; ++j)
      ASSERT_NEAR(row[static_cast<std::size_t>(j)], surface(j, k), 3 * (1000 + 7) / 3.0) << j << "," << k;
  }
}

TEST_F(StoredGrids, ARowOfPiecesThatIsMoreThanIsKeptStaysWhileItIsRead) {
  constexpr int kColumns = 34000;
  constexpr int kPieceRows = 500;
  constexpr int kPieceColumns = 1000;
  static_assert(std::size_t{kColumns} * kPieceRows > PackedGrid::kMostKept);
  test::writeGrid(path, {.noJ = kColumns, .noK = kPieceRows + 2}, surface);
  const Result<StoredGrid> grid = StoredGrid::open(packed({"-d", "1", "-c", "time/1,y/500,x/1000"}), 1);
  ASSERT_TRUE(grid) << grid.error();
  const auto atHand = [&grid](std::size_t row) {
    std::size_t count = 0;
    for (std::size_t j = 0; j < kColumns; j += kPieceColumns) {
      float value = 0;
      if (!grid->readAtOnce(row, j, value)) continue;
      EXPECT_EQ(value, surface(static_cast<int>(j), static_cast<int>(row)));
      ++count;
    }
    return count;
  };
  constexpr std::size_t kPieces = kColumns / kPieceColumns;
  constexpr std::size_t kMost = PackedGrid::kMostKept / (kPieceRows * kPieceColumns);
  EXPECT_LE(atHand(0) + atHand(kPieceRows), kMost);  // opened, and looked at here and there
  std::vector<float> row(kColumns);
  for (const std::size_t k : {0U, 1U, 499U}) {
    ASSERT_TRUE(grid->read(k, 0, row));
    for (int j = 0; j < kColumns; ++j)
      ASSERT_EQ(row[static_cast<std::size_t>(j)], surface(j, static_cast<int>(k)));
    EXPECT_EQ(atHand(k), kPieces);
  }
  ASSERT_TRUE(grid->read(kPieceRows, 0, row));
  EXPECT_EQ(row.back(), surface(kColumns - 1, kPieceRows));
  EXPECT_EQ(atHand(kPieceRows), kPieces);
  EXPECT_EQ(atHand(0), 0U);
  // A part of a row goes back to what is kept.
  ASSERT_TRUE(grid->read(0, 0, std::span(row).first(10)));
  EXPECT_LE(atHand(0) + atHand(kPieceRows), kMost);
}

TEST_F(StoredGrids, WhatIsDamagedIsNotRead) {
  test::writeGrid(path, {.noJ = 300, .noK = 200}, surface);
  const std::string file = packed({"-d", "5", "-c", "time/1,y/20,x/30"});
  const Result<StoredGrid> grid = StoredGrid::open(file, 1);
  ASSERT_TRUE(grid) << grid.error();
  std::vector<float> row(300);
  ASSERT_TRUE(grid->read(0, 0, row));
  // Written over where it lies: what was unpacked before is kept.
  {
    std::fstream damaged(file, std::ios::in | std::ios::out | std::ios::binary);
    damaged << std::string(std::filesystem::file_size(file), '\x55');
  }
  EXPECT_TRUE(grid->read(0, 0, row));
  EXPECT_FALSE(grid->read(199, 0, row));
  std::filesystem::resize_file(file, 100);
  EXPECT_FALSE(grid->read(100, 0, row));
  EXPECT_FALSE(StoredGrid::open(file, 1));
}

}  // namespace platform_tsb_test
}  // namespace gridbay
