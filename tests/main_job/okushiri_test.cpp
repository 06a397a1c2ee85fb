// The main job on a measured basin: a small laboratory valley with an incident wave.

#include <gmock/gmock.h>

#include <cmath>
#include <filesystem>
#include <nlohmann/json.hpp>

#include "core/edition.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace main_job_okushiri_test {

using test::runTool;
using ::testing::HasSubstr;

TEST(Okushiri, FromRasterAndSeriesToACheckedSetup) {
  const std::string data = GRIDBAY_SHARED_DATA;
  if (!std::filesystem::exists(data)) GTEST_SKIP() << "the measurements are not here";
  const test::TemporaryFolder folder;
  const std::string grid = folder.file("basin.tsb2");
  const std::string wave = folder.file("wave.tsb0");
  const std::string setup = folder.file("okushiri." + std::string(theEdition.fileKind));

  test::ProgramRun run =
      runTool({"convert", "raster", data + "/okushiri_bathymetry.asc", grid, "--land", "0.1"});
  ASSERT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.out, HasSubstr("393 x 244 points, 0.014 x 0.014 m apart"));
  run = runTool({"convert", "series", data + "/okushiri_input_wave.txt", wave, "--item-type", "100078",
                 "--start", "1993-07-12 13:17:00", "--skip-lines", "1"});
  ASSERT_EQ(run.status, 0) << run.err;
  const auto series = nlohmann::json::parse(runTool({"info", wave, "--json"}).out);
  EXPECT_EQ(series["time"]["steps"], 451);
  EXPECT_EQ(series["time"]["step"], 0.05);
  EXPECT_EQ(series["time"]["start"], "1993-07-12 13:17:00");
  EXPECT_EQ(series["items"][0]["name"], "water surface(m)");

  run = runTool(
      {"new", setup, "--area", grid, "--start", "1993-07-12 13:17:00", "--step", "0.05", "--steps", "450"});
  ASSERT_EQ(run.status, 0) << run.err;
  run = runTool({"boundaries", setup, "--detect"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(run.out, "1 (0,0) - (0,243)\n2 (0,243) - (353,243)\n3 (392,0) - (392,103)\n4 (0,0) - (392,0)\n");
  EXPECT_EQ(runTool({"boundaries", setup}).out, run.out);
  run = runTool({"validate", setup});
  EXPECT_EQ(run.status, 0) << run.out;
  EXPECT_EQ(run.out, "0 faults\n");

  const auto report = nlohmann::json::parse(runTool({"info", setup, "--json"}).out);
  EXPECT_EQ(report["start"], "1993-07-12 13:17:00");
  EXPECT_EQ(report["steps"], 450);
  EXPECT_EQ(report["areas"][0]["points"], nlohmann::json({393, 244}));
  EXPECT_EQ(report["greatest_courant_number"]["area"], 1);
  EXPECT_NEAR(report["greatest_courant_number"]["value"], 0.05 * std::sqrt(0.13535 * 9.82 / (0.014 * 0.014)),
              1e-6);
}

}  // namespace main_job_okushiri_test
}  // namespace gridbay
