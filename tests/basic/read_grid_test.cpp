#include <gmock/gmock.h>
#include <netcdf.h>

#include <filesystem>
#include <fstream>

#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace basic_read_grid_test {

using test::GridSpec;
using test::Model;

const std::string kLandBelowZero = "True land defined in the bathymetry is less than zero";

class ReadGridTest : public ::testing::Test {
 protected:
  test::TemporaryFolder folder;
  std::string path = folder.file("grid ä.tsb2");
  std::string notValid = "Data file  \" " + path + "\"  is not valid";

  // Reads the file as area 1 and returns the texts; the count is that of the last read.
  std::vector<std::string> read(int areaNumber = 1) {
    area().fileName = path;
    ValidationList messages;
    errors = area().ReadGrid(messages, areaNumber);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::bathymetry);
      EXPECT_EQ(message.severity, Severity::dependedUpon);
    }
    if (errors > 0) expectEmpty();
    return test::textsOf(messages);
  }
  void expectEmpty() {
    EXPECT_TRUE(area().grid.empty());
    EXPECT_EQ(area().noJ, 0);
    EXPECT_EQ(area().noK, 0);
    EXPECT_EQ(area().dx, 0);
    EXPECT_EQ(area().dy, 0);
  }
  CBathymetryObjectKvs& area() { return *model.root.bathymetry->GetArea(1); }

  Model model;
  unsigned errors = 0;
};

TEST_F(ReadGridTest, TheFileGivesDimensionsSpacingLandAndDepths) {
  test::writeGrid(path, {.noJ = 5, .noK = 4, .dx = 20, .dy = 25, .land = 7.5F},
                  [](int j, int k) { return static_cast<float>(10 * j + k) - 30; });
  EXPECT_EQ(read(), std::vector<std::string>{});
  EXPECT_EQ(errors, 0U);
  EXPECT_EQ(area().noJ, 5);
  EXPECT_EQ(area().noK, 4);
  EXPECT_EQ(area().dx, 20.0F);
  EXPECT_EQ(area().dy, 25.0F);
  EXPECT_EQ(area().landValue, 7.5F);
  EXPECT_EQ(area().grid(4, 3), 13.0F);
  EXPECT_EQ(area().grid(1, 0), -20.0F);
  EXPECT_EQ(area().grid(-1, 0), -30.0F);  // out of range: the first element
  EXPECT_EQ(area().grid(5, 0), -30.0F);
  EXPECT_TRUE(area().isLand(4, 3));
  EXPECT_FALSE(area().contains(5, 0));
}

TEST_F(ReadGridTest, AFileThatIsMissingOrOfAnotherKind) {
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
  EXPECT_EQ(errors, 1U);
  std::ofstream(path) << "not a data file";
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
  std::ofstream(path) << "";
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
  std::filesystem::remove(path);
  std::filesystem::create_directory(path);
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
}

TEST_F(ReadGridTest, AFileOfAnotherShapeOrQuantity) {
  test::writeGrid(path, {.itemType = 100078});
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
  EXPECT_EQ(errors, 1U);
  test::writeGrid(path, {.items = 2});
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
  test::writeGrid(path, {.unit = "ft"});
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
  test::writeGrid(path, {.axisUnit = "km"});
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
  test::writeSeries(path, {}, 100079, "m");
  EXPECT_EQ(read(), (std::vector<std::string>{notValid, kLandBelowZero}));
  EXPECT_EQ(errors, 2U);
}

TEST_F(ReadGridTest, AGridThatIsTooSmall) {
  test::writeGrid(path, {.noJ = 2, .land = {}});
  EXPECT_EQ(read(), (std::vector<std::string>{notValid, kLandBelowZero}));
  EXPECT_EQ(errors, 2U);
  test::writeGrid(path, {.noK = 2});
  EXPECT_EQ(read(), (std::vector<std::string>{notValid, kLandBelowZero}));
  test::writeGrid(path, {.noJ = 3, .noK = 3});
  EXPECT_EQ(read(), std::vector<std::string>{});
  for (const double spacing : {0.0, -1.0}) {
    test::writeGrid(path, {.dx = spacing});
    EXPECT_EQ(read(), (std::vector<std::string>{notValid, kLandBelowZero}));
    test::writeGrid(path, {.dy = spacing});
    EXPECT_EQ(read(), (std::vector<std::string>{notValid, kLandBelowZero}));
  }
}

TEST_F(ReadGridTest, TheLandValueIsTheFourthOfItsBlock) {
  test::writeGrid(path, {.land = {}});
  EXPECT_EQ(read(), std::vector<std::string>{kLandBelowZero});
  EXPECT_EQ(errors, 1U);
  test::writeGrid(path, {.land = -1.0F});
  EXPECT_EQ(read(), std::vector<std::string>{kLandBelowZero});
  test::writeGrid(path, {.land = {}, .blocks = {{"Other", {1, 2, 3, 4}}, {"v27_MISC", {0, 0, 0, 3, 9}}}});
  EXPECT_EQ(read(), std::vector<std::string>{});
  EXPECT_EQ(area().landValue, 3.0F);
  test::writeGrid(path, {.land = {}, .blocks = {{"V27_Misc", {0, 0, 3}}}});
  EXPECT_EQ(read(), std::vector<std::string>{kLandBelowZero});
}

TEST_F(ReadGridTest, ABlockThatCannotBeReadIsReportedWithoutBeingCounted) {
  test::writeGrid(path, {.land = {}});
  int file = 0;
  int group = 0;
  int dimensions[2];
  int variable = 0;
  ASSERT_EQ(nc_open(path.c_str(), NC_WRITE, &file), NC_NOERR);
  nc_redef(file);
  ASSERT_EQ(nc_def_grp(file, "custom_blocks", &group), NC_NOERR);
  nc_def_dim(group, "a", 2, &dimensions[0]);
  nc_def_dim(group, "b", 2, &dimensions[1]);
  ASSERT_EQ(nc_def_var(group, "odd", NC_FLOAT, 2, dimensions, &variable), NC_NOERR);
  ASSERT_EQ(nc_close(file), NC_NOERR);
  EXPECT_EQ(read(), (std::vector<std::string>{notValid, kLandBelowZero}));
  EXPECT_EQ(errors, 1U);
}

TEST_F(ReadGridTest, AFailureEmptiesWhatWasReadBefore) {
  test::writeGrid(path, {});
  read();
  std::filesystem::remove(path);
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
  EXPECT_EQ(area().landValue, 10.0F);  // the land value stays
}

TEST_F(ReadGridTest, ATruncatedFileIsNotValid) {
  test::writeGrid(path, {.noJ = 200, .noK = 200});
  const auto whole = std::filesystem::file_size(path);
  for (const auto size : {whole - 1, whole / 2, std::uintmax_t{4000}, std::uintmax_t{100}}) {
    std::filesystem::resize_file(path, size);
    EXPECT_THAT(read(), ::testing::Contains(notValid)) << size;
  }
}

TEST_F(ReadGridTest, AHotStartFileSetsPlacePeriodAndStep) {
  model.root.bathymetry->hotStart = 1;
  GridSpec spec;
  spec.time.start = {2007, 6, 8, 1, 2, 3};
  spec.time.step = 5;
  spec.time.unit = "min";
  test::writeHotStart(path, spec, test::flat, 4, 12, 7);
  EXPECT_EQ(read(), std::vector<std::string>{});
  EXPECT_EQ(area().enclosingArea, 4);
  EXPECT_EQ(area().origin, (GridPoint{12, 7}));
  EXPECT_EQ(area().grid(0, 0), -5.0F);
  EXPECT_EQ(dateTimeText(model.root.simulationPeriod->start), "2007-06-08 01:02:03");
  EXPECT_EQ(model.root.simulationPeriod->start.status, 0);
  EXPECT_EQ(model.root.simulationPeriod->timeStepInterval, 300.0F);
}

TEST_F(ReadGridTest, AHotStartFileOfAnotherAreaLeavesThePeriod) {
  model.root.bathymetry->hotStart = 1;
  test::writeHotStart(path, {}, test::flat, 1, 5, 6);
  EXPECT_EQ(read(2), std::vector<std::string>{});
  EXPECT_EQ(area().origin, (GridPoint{5, 6}));
  EXPECT_EQ(dateTimeText(model.root.simulationPeriod->start), "1990-01-01 12:00:00");
  EXPECT_EQ(model.root.simulationPeriod->timeStepInterval, 30.0F);
}

TEST_F(ReadGridTest, HotStartWantsItsDataTypeAndTwoItems) {
  model.root.bathymetry->hotStart = 1;
  test::writeGrid(path, {.items = 2});
  EXPECT_EQ(read(), std::vector<std::string>{notValid});
  EXPECT_EQ(errors, 1U);
  test::writeGrid(path, {.dataType = 11, .items = 1});
  EXPECT_EQ(read(), (std::vector<std::string>{notValid, kLandBelowZero}));
  EXPECT_EQ(errors, 3U);  // the library's status and one, and the land value that was not reached
}

TEST_F(ReadGridTest, AColdStartTakesAnyDataTypeAndLeavesThePlace) {
  test::writeGrid(path, {.dataType = 5});
  area().origin = {8, 9};
  EXPECT_EQ(read(), std::vector<std::string>{});
  EXPECT_EQ(area().origin, (GridPoint{8, 9}));
}

}  // namespace basic_read_grid_test
}  // namespace gridbay
