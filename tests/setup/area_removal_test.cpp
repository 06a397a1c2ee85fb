// An area is taken out of the middle with all that every module says of it.

#include <gmock/gmock.h>

#include <filesystem>
#include <map>

#include "advection_dispersion/result.h"
#include "basic/bathymetry.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "mud_transport/line_discharge.h"
#include "setup/entry_removal.h"
#include "setup/setting.h"
#include "setup/setup_path.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace setup_area_removal_test {

struct Setup {
  const char* name;
  std::int32_t module;
  std::size_t least;  // keywords of an area
};
std::ostream& operator<<(std::ostream& out, const Setup& setup) {
  return out << setup.name;
}

class AreaRemoval : public ::testing::TestWithParam<Setup> {
 protected:
  void SetUp() override {
    if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one area";
  }
  // What a save writes of an area, by its paths from there: "…/AREA_#/Constant_Value".
  static std::map<std::string, std::string> of(SetupFile& setup, const std::string& path, int area) {
    std::map<std::string, std::string> found;
    const KvsHandle tree = setup.tree(path);
    collect(*tree->tree().root().first(), "", "AREA_" + std::to_string(area), found);
    return found;
  }
  static void collect(const Node& section, const std::string& path, const std::string& area,
                      std::map<std::string, std::string>& found) {
    for (const Node* node = section.first(); node != nullptr; node = node->next()) {
      const bool isArea = node->isSection() && node->name() == area;
      const std::string below =
          path + (path.empty() ? "" : "/") + (isArea ? "AREA_#" : std::string(node->name()));
      if (node->isSection()) {
        collect(*node, below, area, found);
      } else if (below.find("AREA_#/") != below.npos) {
        found[below] = shownValues(*node);
      }
    }
  }
  static std::string withArea(std::string path, int area) {
    for (std::size_t at = 0; (at = path.find('#')) != path.npos;) path.replace(at, 1, std::to_string(area));
    return path;
  }
  test::TemporaryFolder folder;
};

TEST_P(AreaRemoval, TheNextOneTakesItsPlaceEverywhere) {
  const std::string path = folder.file("s.v27");
  std::filesystem::copy_file(std::string(GRIDBAY_TESTS) + "/main_job/setups/" + GetParam().name, path);
  CollectingMessageHost host;
  Result<SetupFile> setup = SetupFile::open(path, &host);
  ASSERT_TRUE(setup) << setup.error();
  CGlobalKvs& root = setup->model();
  root.moduleSelection->simulationType = GetParam().module;
  root.bathymetry->SetNoAreas(3);
  root.bathymetry->at(3).enclosingArea = 1;
  // Another value in each keyword of area 3, so that it is told from area 2.
  int made = 0;
  std::size_t changed = 0;
  for (const auto& [keyword, value] : of(*setup, path, 3)) {
    if (keyword.ends_with("/Enclosing_Area")) continue;
    const std::string number = std::to_string(20 + ++made);
    for (const std::string& other : {number, number + " " + number, "third_" + number + ".tsb2"}) {
      if (!applySetting(root, {withArea(keyword, 3), other}, path)) continue;
      ++changed;
      break;
    }
  }
  EXPECT_GE(changed, GetParam().least);
  const auto third = of(*setup, path, 3);
  ASSERT_NE(third, of(*setup, path, 2));

  removeArea(root, 2);
  EXPECT_EQ(root.bathymetry->GetCount(), 2);
  EXPECT_EQ(of(*setup, path, 2), third);
  EXPECT_THAT(of(*setup, path, 3), ::testing::IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Of, AreaRemoval,
                         ::testing::Values(Setup{"flood.v27", module::kHydrodynamic, 8},
                                           Setup{"salinity.v27", module::kAdvectionDispersion, 15},
                                           Setup{"mud_fractions.v27", module::kMudTransport, 15},
                                           Setup{"mud_layers.v27", module::kMudTransport, 15},
                                           Setup{"expanded_mud.v27", module::kMudTransportExpanded, 15},
                                           Setup{"oxygen.v27", module::kEcological, 15}));

TEST(AreaRemovalNumbers, WhatStandsOnAnAreaGoesByItsNewNumber) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one area";
  test::Model model;
  CGlobalKvs& root = model.root;
  root.bathymetry->SetNoAreas(4);
  const auto stand = [&root](std::int32_t area) {
    root.bathymetry->at(4).enclosingArea = area;
    root.sourceSink->SetNoSources(1);
    root.sourceSink->at(1).sourceArea = root.sourceSink->at(1).sinkArea = area;
    root.massBudget->SetNoPolygons(1);
    root.massBudget->at(1).associatedArea = area;
    root.nadResult->outputs.SetCount(1);
    root.nadResult->outputs.at(1).areaNumber = area;
    root.nmtLineDischarge->SetCount(1);
    root.nmtLineDischarge->GetLineOrBox(1)->areaNumber = area;
  };
  const auto stands = [&root](std::int32_t area) {
    EXPECT_EQ(root.bathymetry->at(root.bathymetry->GetCount()).enclosingArea, area);
    EXPECT_EQ(root.sourceSink->at(1).sourceArea, area);
    EXPECT_EQ(root.sourceSink->at(1).sinkArea, area);
    EXPECT_EQ(root.massBudget->at(1).associatedArea, area);
    EXPECT_EQ(root.nadResult->outputs.at(1).areaNumber, area);
    EXPECT_EQ(root.nmtLineDischarge->GetLineOrBox(1)->areaNumber, area);
  };
  stand(3);
  removeArea(root, 2);  // three are left
  stands(2);
  root.bathymetry->SetNoAreas(4);
  stand(1);
  removeArea(root, 2);
  stands(1);
  // On the area itself: on none that is there.
  root.bathymetry->SetNoAreas(4);
  stand(2);
  removeArea(root, 2);
  stands(4);
}

}  // namespace setup_area_removal_test
}  // namespace gridbay
