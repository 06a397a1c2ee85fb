// Whole setups, one of each kind of model with something in every section: each comes back as the text that
// it was.

#include <gtest/gtest.h>

#include <fstream>
#include <sstream>

#include "core/edition.h"
#include "core/parameter_tree.h"
#include "tests/support/model.h"

namespace gridbay {
namespace main_job_whole_setups_test {

std::string pathOf(const std::string& name) {
  return std::string(GRIDBAY_TESTS) + "/main_job/setups/" + name;
}

std::string textIn(const std::string& name) {
  std::ifstream file(pathOf(name));
  std::ostringstream text;
  text << file.rdbuf();
  return text.str();
}

std::string savedAgain(const std::string& name) {
  const KvsHandle file = kvsLoadFile(pathOf(name), 0);
  if (kvsGetErrorGlb() != kKvsNoError) return kvsGetErrorText();
  test::Model model;
  model.root.Load(&file->tree().root(), pathOf(name));
  EXPECT_EQ(model.host.texts, std::vector<std::string>());
  model.root.SetSourceFile(file.get());
  KvsFile saved;
  model.root.Save(saved, pathOf(name));
  return *saved.text();
}

class WholeSetups : public ::testing::TestWithParam<const char*> {};

TEST_P(WholeSetups, ComesBackAsItWas) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition keeps one area and no module";
  EXPECT_EQ(savedAgain(GetParam()), textIn(GetParam()));
}

INSTANTIATE_TEST_SUITE_P(Of, WholeSetups,
                         ::testing::Values("flood.v27", "salinity.v27", "mud_fractions.v27", "mud_layers.v27",
                                           "expanded_mud.v27", "oxygen.v27"));

// What the Wetland Sweep Kit leaves of the flood model.
TEST(WholeSetup, OfTheWetlandSweepKit) {
  if (!theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition keeps it whole";
  EXPECT_EQ(savedAgain("flood.v27"), textIn("flood.v27wsk"));
  EXPECT_EQ(savedAgain("flood.v27wsk"), textIn("flood.v27wsk"));
}

}  // namespace main_job_whole_setups_test
}  // namespace gridbay
