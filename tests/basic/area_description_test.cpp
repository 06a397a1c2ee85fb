#include "basic/area_description.h"

#include <gtest/gtest.h>

#include "tests/support/model.h"

namespace gridbay {
namespace basic_area_description_test {

using test::load;
using test::messagesOf;
using test::savedText;
using test::textsOf;

constexpr const char* kAbove = "Drying depth must be smaller that flooding depth";
constexpr const char* kPositive = "Drying depth must be positive";

std::vector<std::string> faultsOf(float drying, float flooding, int enabled = 1) {
  CAreaDescriptionKvs area(nullptr);
  area.dryingDepth = drying;
  area.floodingDepth = flooding;
  area.enableFloodAndDryChecking = enabled;
  const ValidationList messages = messagesOf(area);
  for (const CMessage& message : messages) {
    EXPECT_EQ(message.page, PageId::floodAndDry);
    EXPECT_EQ(message.severity, Severity::fault);
  }
  return textsOf(messages);
}

TEST(AreaDescription, DefaultsInFileOrder) {
  CAreaDescriptionKvs area(nullptr);
  EXPECT_EQ(savedText(area),
            "FLOOD_AND_DRY {\n    Enable_Flood_And_Dry_Checking 1\n    Drying_Depth 0.02\n    Flooding_Depth "
            "0.05\n}\n");
}

TEST(AreaDescription, Checks) {
  EXPECT_EQ(faultsOf(0.05F, 0.05F), std::vector<std::string>{});
  EXPECT_EQ(faultsOf(0.0F, 0.05F), std::vector<std::string>{kPositive});
  EXPECT_EQ(faultsOf(-1.0F, 0.05F), std::vector<std::string>{kPositive});
  EXPECT_EQ(faultsOf(0.1F, -0.05F), std::vector<std::string>{kAbove});
  EXPECT_EQ(faultsOf(0.0F, -1.0F), (std::vector<std::string>{kAbove, kPositive}));
  EXPECT_EQ(faultsOf(-1.0F, -2.0F, 0), std::vector<std::string>{});
}

TEST(AreaDescription, AFileWithoutItKeepsTheDefaults) {
  CAreaDescriptionKvs area(nullptr);
  load(area, "OTHER { Drying_Depth 9.0 }");
  EXPECT_EQ(area.dryingDepth, 0.02F);
  EXPECT_EQ(area.floodingDepth, 0.05F);
  EXPECT_EQ(area.enableFloodAndDryChecking, 1);
}

TEST(AreaDescription, LoadsAndCopies) {
  CAreaDescriptionKvs area(nullptr);
  load(area, "flood_and_dry { DRYING_DEPTH 1; Enable_Flood_And_Dry_Checking 0 }");
  EXPECT_EQ(area.dryingDepth, 1.0F);
  EXPECT_EQ(area.floodingDepth, 0.05F);
  CAreaDescriptionKvs copy(nullptr);
  copy.CopyFrom(area);
  EXPECT_EQ(savedText(copy), savedText(area));
}

}  // namespace basic_area_description_test
}  // namespace gridbay
