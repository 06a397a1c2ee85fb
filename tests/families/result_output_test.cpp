// What the outputs of all modules have alike.

#include "families/result_output.h"

#include <gmock/gmock.h>

#include <limits>

#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "families/result_pages.h"
#include "tests/support/model.h"

namespace gridbay {
namespace families_result_output_test {

TEST(ResultOutput, ExtentByTheSpans) {
  const USubLine one{3, 3, 1};
  const USubLine some{0, 9, 1};
  const USubLine backwards{5, 4, 1};
  EXPECT_EQ(extentOf({one, one}), Extent::point);
  EXPECT_EQ(extentOf({one, some}), Extent::line);
  EXPECT_EQ(extentOf({backwards, one}), Extent::line);
  EXPECT_EQ(extentOf({some, backwards}), Extent::map);
}

TEST(ResultOutput, ExtensionsOfAnExtent) {
  for (const char* name : {"a.tsb0", "a.tb0", "tb0"}) EXPECT_TRUE(fitsExtent(name, Extent::point)) << name;
  for (const char* name : {"a.tsb1", "a.tb1"}) EXPECT_TRUE(fitsExtent(name, Extent::line)) << name;
  for (const char* name : {"a.tsb2", "a.tb2"}) EXPECT_TRUE(fitsExtent(name, Extent::map)) << name;
  for (const char* name : {"", "2", "a.tsb", "a.TSB2", "a.tsb2 ", "a.tsb0"})
    EXPECT_FALSE(fitsExtent(name, Extent::map)) << name;
  EXPECT_EQ(resultFileKind(Extent::point).extension, "tsb0");
  EXPECT_EQ(resultFileKind(Extent::line).extension, "tsb1");
  EXPECT_EQ(resultFileKind(Extent::map).extension, "tsb2");
}

TEST(ResultOutput, LimitsOfAnArea) {
  test::Model model;
  model.root.bathymetry->SetCount(2);
  model.root.bathymetry->GetArea(2)->noJ = 7;
  model.root.bathymetry->GetArea(2)->noK = 4;
  const ResultLimits second = resultLimits(*model.root.bathymetry, 2);
  EXPECT_TRUE(second.hasArea);
  EXPECT_EQ(second.lastJ, 6);
  EXPECT_EQ(second.lastK, 3);
  EXPECT_EQ(second.lastStep, 100);
  EXPECT_EQ(resultLimits(*model.root.bathymetry, 1).lastJ, -1);
  const ResultLimits none = resultLimits(*model.root.bathymetry, 3);
  EXPECT_FALSE(none.hasArea);
  EXPECT_EQ(none.lastK, -1);
  EXPECT_EQ(none.lastStep, 100);
  model.root.simulationPeriod->noPointsInTime = std::numeric_limits<std::int32_t>::min();
  EXPECT_LT(resultLimits(*model.root.bathymetry, 1).lastStep, 0);
  CBathymetryKvs alone(nullptr);
  EXPECT_FALSE(resultLimits(alone, 1).hasArea);
}

TEST(ResultOutput, TheWholeOfWhatThereIs) {
  USubArea part;
  USubLine steps;
  takeWhole({.lastJ = 6, .lastK = 3, .lastStep = 100, .hasArea = true}, part, steps);
  EXPECT_EQ(part, (USubArea{{0, 6, 1}, {0, 3, 1}}));
  EXPECT_EQ(steps, (USubLine{0, 100, 1}));
}

TEST(ResultOutput, TheCaptionOfHotStarts) {
  EXPECT_EQ(hotStartCaption("Generate", false, 1.5), "Generate");
  EXPECT_EQ(hotStartCaption("Generate", true, 1.5), "Generate (size of output: 1.50 MB)");
}

}  // namespace families_result_output_test
}  // namespace gridbay
