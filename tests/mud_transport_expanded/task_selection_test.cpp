#include "mud_transport_expanded/task_selection.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/initial_conditions.h"
#include "mud_transport_expanded/line_discharge.h"
#include "mud_transport_expanded/result.h"
#include "mud_transport_expanded/sources.h"
#include "mud_transport_expanded/transported.h"
#include "platform/units/units.h"
#include "tests/support/model.h"

namespace gridbay {
namespace mud_transport_expanded_task_selection_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::SizeIs;
using Percentages = std::vector<std::int32_t>;

class ExpandedCounts : public ::testing::Test {
 protected:
  ExpandedCounts() {
    root.boundary->SetNoBoundaries(1);
    root.sourceSink->SetNoSources(1);
  }
  std::vector<float>& boundary() { return root.nmtExpBoundary->at(1).constants; }
  std::vector<float>& source() { return root.nmtExpSources->at(1).constants; }
  CNmtExpInitialConditionsKvs& initial() { return *root.nmtExpInitialConditions; }

  test::Model model;
  CGlobalKvs& root = model.root;
  CNmtExpTaskSelectionKvs& task = *root.nmtExpTaskSelection;
};

TEST_F(ExpandedCounts, OfANewModel) {
  EXPECT_EQ(savedText(task),
            "TASK_SELECTION {\n"
            "    Number_of_layers 1\n"
            "    Number_of_fractions 1\n"
            "    Include_salinity #false\n"
            "    Include_xenobiotics #false\n"
            "}\n");
  EXPECT_EQ(initial().components.GetCount(), 1);
  EXPECT_EQ(initial().components.at(1).GetCount(), 1);
  EXPECT_EQ(initial().thicknesses.GetCount(), 1);
  EXPECT_EQ(initial().distribution.GetCount(), 1);
  EXPECT_EQ(initial().distribution.at(1).percentages, Percentages{100});
  EXPECT_THAT(boundary(), ElementsAre(0.01F));
  EXPECT_THAT(source(), ElementsAre(0.01F));
}

TEST_F(ExpandedCounts, ReachAllThatHasAnEntryForEach) {
  root.nmtExpResult->outputs.SetCount(1);
  root.nmtExpLineDischarge->SetCount(1);
  boundary() = {5};
  task.SetCounts(2, 3, true);
  EXPECT_EQ(initial().components.GetCount(), 4);
  EXPECT_EQ(initial().thicknesses.GetCount(), 2);
  EXPECT_EQ(initial().distribution.at(2).percentages, (Percentages{34, 33, 33}));
  EXPECT_THAT(boundary(), ElementsAre(0.01F, 5, 0.01F, 0.01F));
  EXPECT_THAT(source(), ElementsAre(20, 0.01F, 0.01F, 0.01F));
  EXPECT_EQ(root.nmtExpResult->outputs.at(1).items.size(), expOutputItems(2, 3).size());
  // Lines do not follow; a new one has a flag for each entry.
  EXPECT_THAT(root.nmtExpLineDischarge->at(1).entries, SizeIs(1));
  root.nmtExpLineDischarge->SetCount(2);
  EXPECT_THAT(root.nmtExpLineDischarge->at(2).entries, ElementsAre(1, 1, 1, 1));
}

TEST_F(ExpandedCounts, ANewPlaceHasAConstantForEachEntry) {
  task.SetCounts(1, 2, true);
  root.boundary->SetNoBoundaries(2);
  root.sourceSink->SetNoSources(2);
  EXPECT_THAT(root.nmtExpBoundary->at(2).constants, ElementsAre(0.01F, 0.01F, 0.01F));
  EXPECT_THAT(root.nmtExpSources->at(2).constants, ElementsAre(20, 0.01F, 0.01F));
  root.boundary->SetNoBoundaries(0);
  root.sourceSink->SetNoSources(0);
  EXPECT_EQ(root.nmtExpBoundary->GetCount() + root.nmtExpSources->GetCount(), 0);
}

TEST_F(ExpandedCounts, SalinityComesAndGoesAtTheHead) {
  task.SetCounts(1, 2, false);
  boundary() = {1, 2};
  source() = {3, 4};
  initial().components.at(1).at(1).value = 7;
  task.SetSalinity(true);
  EXPECT_THAT(boundary(), ElementsAre(0.01F, 1, 2));
  EXPECT_THAT(source(), ElementsAre(20, 3, 4));
  EXPECT_EQ(initial().components.GetCount(), 3);
  EXPECT_EQ(initial().components.at(1).at(1).value, 40);
  EXPECT_EQ(initial().components.at(2).at(1).value, 7);
  task.SetSalinity(true);
  EXPECT_EQ(initial().components.GetCount(), 3);
  // An area that comes later has the salinity too.
  root.bathymetry->SetNoAreas(2);
  EXPECT_EQ(initial().components.at(1).at(2).value, 40);
  EXPECT_EQ(initial().components.at(2).at(2).value, 0);
  task.SetSalinity(false);
  EXPECT_THAT(boundary(), ElementsAre(1, 2));
  EXPECT_THAT(source(), ElementsAre(3, 4));
  EXPECT_EQ(initial().components.at(1).at(1).value, 7);
}

TEST_F(ExpandedCounts, ComeAndGoAtTheTail) {
  task.SetCounts(3, 3, false);
  boundary() = {1, 2, 3};
  initial().thicknesses.at(1).at(1).value = 9;
  initial().distribution.at(1).percentages = {50, 25, 25};
  task.SetCounts(3, 3, false);
  EXPECT_EQ(initial().distribution.at(1).percentages, (Percentages{50, 25, 25}));
  task.SetCounts(2, 2, false);
  EXPECT_THAT(boundary(), ElementsAre(1, 2));
  EXPECT_EQ(initial().thicknesses.at(1).at(1).value, 9);
  EXPECT_EQ(initial().distribution.at(1).percentages, (Percentages{50, 50}));
  task.SetCounts(-1, 3, false);
  EXPECT_EQ(task.layers, 2);
  EXPECT_THAT(boundary(), ElementsAre(1, 2, 0.01F));
  // Another count of layers alone shares all of them anew.
  initial().distribution.at(1).percentages = {100, 0, 0};
  task.SetCounts(3, 3, false);
  EXPECT_EQ(initial().distribution.at(1).percentages, (Percentages{34, 33, 33}));
  task.SetCounts(0, 0, false);
  EXPECT_THAT(boundary(), IsEmpty());
  EXPECT_EQ(initial().components.GetCount() + initial().distribution.GetCount(), 0);
}

TEST_F(ExpandedCounts, AreReadBack) {
  boundary() = {6};
  test::load(task,
             "TASK_SELECTION { Number_of_layers 3; Number_of_fractions 2; Include_salinity #true;"
             " Include_xenobiotics #true }");
  EXPECT_EQ(savedText(task),
            "TASK_SELECTION {\n"
            "    Number_of_layers 3\n"
            "    Number_of_fractions 2\n"
            "    Include_salinity #true\n"
            "    Include_xenobiotics #true\n"
            "}\n");
  EXPECT_THAT(boundary(), ElementsAre(0.01F, 6, 0.01F));
  EXPECT_EQ(initial().components.GetCount(), 3);
  test::load(task, "TASK_SELECTION { Number_of_layers 1 }");
  EXPECT_EQ(task.fractions, 2);
  EXPECT_TRUE(task.includeSalinity);
  test::load(task, "OTHER {}");
  EXPECT_EQ(task.layers, 1);
}

TEST_F(ExpandedCounts, ThatNoModelHasAreNotTaken) {
  test::load(task, "TASK_SELECTION { Number_of_layers -4; Number_of_fractions 2147483647 }");
  EXPECT_EQ(task.layers, 1);
  EXPECT_EQ(task.fractions, 100);
  EXPECT_THAT(model.host.texts, SizeIs(1));
  test::load(task, "TASK_SELECTION { Number_of_layers \"x\"; Number_of_fractions 3 }");
  EXPECT_EQ(task.layers, 1);
  EXPECT_EQ(task.fractions, 3);
}

TEST_F(ExpandedCounts, AreSetByTheirPaths) {
  const auto set = [this](std::string_view path, std::string_view text) {
    const KvsHandle file = test::fileOf(text);
    const std::string documentPath;
    PathAccess access{
        .what = PathAccess::What::set, .in = &file->tree().root(), .documentPath = &documentPath};
    EXPECT_TRUE(task.AccessPath(path, access)) << path;
  };
  set("TASK_SELECTION/Number_of_fractions", "Number_of_fractions 4");
  set("TASK_SELECTION/Number_of_layers", "Number_of_layers 2");
  set("TASK_SELECTION/Include_salinity", "Include_salinity #true");
  EXPECT_THAT(boundary(), SizeIs(5));
  EXPECT_EQ(initial().thicknesses.GetCount(), 2);
  set("TASK_SELECTION/Number_of_fractions", "Number_of_fractions 101");
  EXPECT_EQ(task.fractions, 4);
  PathAccess look{.what = PathAccess::What::look};
  EXPECT_FALSE(task.AccessPath("TASK_SELECTION/Other", look));
}

TEST_F(ExpandedCounts, NamesAndQuantitiesByPosition) {
  using E = ExpandedMudEntries;
  task.SetCounts(2, 2, true);
  EXPECT_EQ(E::count(root), 3);
  std::vector<std::string> names;
  std::vector<int> quantities;
  for (int position = 1; position <= 5; ++position) {
    names.push_back(E::name(root, position));
    quantities.push_back(E::quantity(root, position));
  }
  EXPECT_THAT(names,
              ElementsAre("Salinity", "Fraction no. 1", "Fraction no. 2", "Layer no. 1", "Layer no. 2"));
  EXPECT_THAT(quantities, ElementsAre(100024, 100403, 100403, 100272, 100272));
  task.SetSalinity(false);
  EXPECT_EQ(E::name(root, 1), "Fraction no. 1");
  EXPECT_EQ(E::name(root, 3), "Layer no. 1");
  EXPECT_EQ(E::quantity(root, 1), 100403);
  EXPECT_EQ(E::quantity(root, 3), 100272);
  EXPECT_THAT(expandedEntryNames(root), ElementsAre("Fraction no. 1", "Fraction no. 2"));
}

TEST_F(ExpandedCounts, ACopyTakesTheCountsAlone) {
  test::Model other;
  other.root.nmtExpTaskSelection->SetCounts(2, 4, true);
  task.CopyFrom(*other.root.nmtExpTaskSelection);
  EXPECT_EQ(savedText(task), savedText(*other.root.nmtExpTaskSelection));
  EXPECT_THAT(boundary(), SizeIs(1));
}

}  // namespace mud_transport_expanded_task_selection_test
}  // namespace gridbay
