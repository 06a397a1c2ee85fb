#include "mud_transport/task_selection.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "mud_transport/boundary.h"
#include "mud_transport/box_summation.h"
#include "mud_transport/dispersion_coef.h"
#include "mud_transport/initial_concentration.h"
#include "mud_transport/line_discharge.h"
#include "mud_transport/result.h"
#include "mud_transport/source_sink.h"
#include "mud_transport/starting_conditions.h"
#include "mud_transport/transported.h"
#include "platform/units/units.h"
#include "tests/support/model.h"

namespace gridbay {
namespace mud_transport_task_selection_test {

using test::savedText;
using Texts = std::vector<std::string>;
using Floats = std::vector<float>;

class MudTask : public ::testing::Test {
 protected:
  MudTask() {
    root.boundary->SetNoBoundaries(2);
    root.sourceSink->SetNoSources(1);
    root.nmtLineDischarge->SetCount(1);
    root.nmtBoxSummation->SetCount(1);
  }
  Floats& boundary() { return root.nmtBoundary->at(2).constants; }
  Floats& source() { return root.nmtSourceSink->at(1).constants; }
  EntryFlags& line() { return root.nmtLineDischarge->at(1).entries; }
  EntryFlags& box() { return root.nmtBoxSummation->at(1).entries; }
  CNmtInitialConcentrationKvs& initial() { return *root.nmtInitialConcentration; }
  // Task, fractions, layers, salinity.
  std::string state() const {
    return std::string(task.multiFraction ? "fractions " : "layers ") + std::to_string(task.fractions) + " " +
           std::to_string(task.layers) + (task.includeSalinity ? " salt" : "");
  }
  Texts names() {
    Texts all;
    for (int entry = 1; entry <= task.EntryCount(); ++entry) all.push_back(task.EntryName(entry));
    return all;
  }
  bool set(std::string_view keyword, std::string_view value, bool* isWrittenOnly = nullptr) {
    const KvsHandle file = test::fileOf(std::string(keyword) + " " + std::string(value));
    const std::string documentPath;
    PathAccess access{PathAccess::What::set, nullptr, &file->tree().root(), &documentPath};
    const bool found = task.AccessPath("TASK_SELECTION/" + std::string(keyword), access);
    if (isWrittenOnly != nullptr) *isWrittenOnly = access.isWrittenOnly;
    return found;
  }

  test::Model model;
  CGlobalKvs& root = model.root;
  CNmtTaskSelectionKvs& task = *root.nmtTaskSelection;
};

TEST_F(MudTask, ANewModelHasThreeFractions) {
  EXPECT_EQ(savedText(task),
            "TASK_SELECTION {\n"
            "    Multifraction #true\n"
            "    MultiLayer #false\n"
            "    Number_of_layers 1\n"
            "    Number_of_fractions 3\n"
            "    Include_salinity_component_for_flocculation #false\n"
            "}\n");
  EXPECT_EQ(initial().GetCount(), 3);
  EXPECT_EQ(boundary(), (Floats{0, 0, 0}));
  EXPECT_EQ(source(), (Floats{0, 0, 0}));
  EXPECT_EQ(line(), (EntryFlags{1, 1, 1}));
  EXPECT_EQ(box(), (EntryFlags{1, 1, 1}));
  EXPECT_EQ(names(), (Texts{"Fraction no. 1", "Fraction no. 2", "Fraction no. 3"}));
  EXPECT_TRUE(test::messagesOf(task).empty());
}

TEST_F(MudTask, FractionsLeadWhatHasAnEntryForEach) {
  boundary() = {1, 2, 3};
  line() = {0, 1, 0};
  task.SetFractions(5);
  EXPECT_EQ(initial().GetCount(), 5);
  EXPECT_EQ(boundary(), (Floats{1, 2, 3, 0, 0}));
  EXPECT_EQ(source(), (Floats{0, 0, 0, 0, 0}));
  EXPECT_EQ(line(), (EntryFlags{0, 1, 0, 1, 1}));
  EXPECT_EQ(box(), (EntryFlags{1, 1, 1, 1, 1}));
  task.SetFractions(2);
  EXPECT_EQ(initial().GetCount(), 2);
  EXPECT_EQ(boundary(), (Floats{1, 2}));
  EXPECT_EQ(source(), (Floats{0, 0}));
  EXPECT_EQ(line(), (EntryFlags{0, 1}));
  EXPECT_EQ(box(), (EntryFlags{1, 1}));
  EXPECT_EQ(state(), "fractions 2 1");
  task.SetFractions(0);
  EXPECT_EQ(initial().GetCount(), 0);
  EXPECT_EQ(boundary(), Floats{});
}

TEST_F(MudTask, LayersLeaveSourcesLinesAndBoxesAlone) {
  source() = {1, 2, 3};
  task.SetLayers(3);
  EXPECT_EQ(state(), "layers 1 3");
  EXPECT_EQ(initial().GetCount(), 4);
  EXPECT_EQ(boundary(), Floats{0});
  EXPECT_EQ(source(), (Floats{1, 2, 3}));
  EXPECT_EQ(line(), (EntryFlags{1, 1, 1}));
  EXPECT_EQ(box(), (EntryFlags{1, 1, 1}));
  EXPECT_EQ(names(),
            (Texts{"Fraction", "Thickness layer no. 1", "Thickness layer no. 2", "Thickness layer no. 3"}));
  task.SetFractions(2);
  EXPECT_EQ(state(), "fractions 2 1");
  EXPECT_EQ(source(), (Floats{1, 2}));
}

TEST_F(MudTask, SalinityComesAndGoesAtTheHead) {
  boundary() = {1, 2, 3};
  source() = {4, 5, 6};
  initial().at(1).at(1).value = 7;
  root.bathymetry->SetNoAreas(2);
  task.SetSalinity(true);
  EXPECT_EQ(state(), "fractions 3 1 salt");
  EXPECT_EQ(initial().GetCount(), 4);
  EXPECT_EQ(initial().at(1).GetCount(), 2);
  EXPECT_EQ(initial().at(1).at(1).value, 0);
  EXPECT_EQ(initial().at(2).at(1).value, 7);
  EXPECT_EQ(boundary(), (Floats{0, 1, 2, 3}));
  EXPECT_EQ(source(), (Floats{4, 5, 6}));
  EXPECT_EQ(line(), (EntryFlags{1, 1, 1}));
  initial().at(1).at(1).value = 35;
  boundary()[0] = 30;
  task.SetSalinity(true);  // as it is
  EXPECT_EQ(boundary(), (Floats{30, 1, 2, 3}));
  task.SetSalinity(false);
  EXPECT_EQ(initial().GetCount(), 3);
  EXPECT_EQ(initial().at(1).at(1).value, 7);
  EXPECT_EQ(boundary(), (Floats{1, 2, 3}));
  task.SetSalinity(false);
  EXPECT_EQ(boundary(), (Floats{1, 2, 3}));
  task.SetFractions(0);
  task.SetSalinity(true);
  EXPECT_EQ(boundary(), Floats{0});
}

TEST_F(MudTask, SalinityCountsInBothTasks) {
  task.SetSalinity(true);
  task.SetFractions(2);
  EXPECT_EQ(initial().GetCount(), 3);
  EXPECT_EQ(boundary().size(), 3U);
  EXPECT_EQ(source().size(), 3U);
  EXPECT_EQ(line().size(), 3U);
  task.SetLayers(2);
  EXPECT_EQ(initial().GetCount(), 4);
  EXPECT_EQ(boundary().size(), 2U);
  EXPECT_EQ(source().size(), 3U);
  EXPECT_EQ(names(), (Texts{"Salinity", "Fraction", "Thickness layer no. 1", "Thickness layer no. 2"}));
  const auto quantities = [this] {
    std::vector<int> all;
    for (int entry = 1; entry <= task.EntryCount(); ++entry) all.push_back(task.EntryQuantity(entry));
    return all;
  };
  EXPECT_EQ(quantities(), (std::vector<int>{item::kSalinity, item::kConcentration, item::kLayerThickness,
                                            item::kLayerThickness}));
  task.SetFractions(1);
  EXPECT_EQ(quantities(), (std::vector<int>{item::kSalinity, item::kConcentration}));
  EXPECT_EQ(names(), (Texts{"Fraction no. 1", "Fraction no. 2"}));
}

TEST_F(MudTask, NewPlacesHaveWhatTheTaskHas) {
  task.SetLayers(2);
  task.SetSalinity(true);
  root.boundary->SetNoBoundaries(3);
  root.sourceSink->SetNoSources(2);
  root.nmtLineDischarge->SetCount(2);
  root.nmtBoxSummation->SetCount(2);
  EXPECT_EQ(root.nmtBoundary->at(3).constants, (Floats{0, 0}));
  EXPECT_EQ(root.nmtSourceSink->at(2).constants, (Floats{0, 0}));
  EXPECT_EQ(root.nmtLineDischarge->at(2).entries, (EntryFlags{1, 1}));
  EXPECT_EQ(root.nmtBoxSummation->at(2).entries, (EntryFlags{1, 1}));
  EXPECT_EQ(source().size(), 3U);
  EXPECT_EQ(line().size(), 3U);
}

TEST_F(MudTask, AreasBoundariesAndSourcesAreFollowed) {
  root.bathymetry->SetNoAreas(3);
  EXPECT_EQ(root.nmtStartingConditions->GetCount(), 3);
  EXPECT_EQ(initial().at(2).GetCount(), 3);
  EXPECT_EQ(root.nmtDispersionCoef->filesX.GetCount(), 3);
  EXPECT_EQ(root.nmtDispersionCoef->filesY.GetCount(), 3);
  EXPECT_EQ(root.nmtResult->hotStarts.GetCount(), 3);
  task.SetFractions(4);
  EXPECT_EQ(initial().at(4).GetCount(), 3);
  root.bathymetry->SetNoAreas(1);
  EXPECT_EQ(initial().at(4).GetCount(), 1);
  root.boundary->SetNoBoundaries(0);
  root.sourceSink->SetNoSources(0);
  EXPECT_EQ(root.nmtBoundary->GetCount(), 0);
  EXPECT_EQ(root.nmtSourceSink->GetCount(), 0);
}

TEST_F(MudTask, NegativeCountsDoNothing) {
  task.SetFractions(-1);
  task.SetLayers(-1);
  EXPECT_EQ(state(), "fractions 3 1");
  EXPECT_EQ(initial().GetCount(), 3);
  EXPECT_EQ(line().size(), 3U);
}

TEST_F(MudTask, IsReadByItsFirstKeyword) {
  const auto read = [this](const std::string& rows) {
    task.SetFractions(3);
    task.SetSalinity(false);
    test::load(task, "TASK_SELECTION { " + rows + " }");
    return state();
  };
  EXPECT_EQ(read(""), "fractions 3 1");
  EXPECT_EQ(read("Multifraction #false; MultiLayer #false; Number_of_layers 4"), "layers 1 4");
  EXPECT_EQ(initial().GetCount(), 5);
  EXPECT_EQ(read("Multifraction #true; MultiLayer #true; Number_of_layers 4; Number_of_fractions 2"),
            "fractions 2 1");
  EXPECT_EQ(read("Multifraction #false"), "layers 1 1");
  EXPECT_EQ(read("Multifraction #false; Number_of_layers 0; Number_of_fractions 5"), "layers 1 0");
  EXPECT_EQ(read("Number_of_fractions 2; Include_salinity_component_for_flocculation #true"),
            "fractions 2 1 salt");
  EXPECT_EQ(boundary().size(), 3U);
  EXPECT_EQ(source().size(), 2U);
  EXPECT_EQ(read("Number_of_fractions -4"), "fractions 3 1");
  EXPECT_EQ(read("Multifraction #false; Number_of_layers -2147483648"), "layers 1 1");
  EXPECT_TRUE(model.host.texts.empty());
  EXPECT_EQ(read("Number_of_fractions 2147483647"), "fractions 256 1");
  EXPECT_EQ(read("Multifraction #false; Number_of_layers 257"), "layers 1 256");
  EXPECT_EQ(model.host.texts.size(), 2U);
  test::load(task, "OTHER {}");
  EXPECT_EQ(state(), "layers 1 256");
}

TEST_F(MudTask, IsReadBack) {
  task.SetLayers(5);
  task.SetSalinity(true);
  const std::string text = savedText(task);
  test::Model other;
  test::load(*other.root.nmtTaskSelection, text);
  EXPECT_EQ(savedText(*other.root.nmtTaskSelection), text);
  EXPECT_EQ(other.root.nmtInitialConcentration->GetCount(), 7);
  CNmtTaskSelectionKvs copy(nullptr);
  copy.CopyFrom(task);
  EXPECT_EQ(savedText(copy), text);
  EXPECT_TRUE(copy.SameState(task));
  copy.includeSalinity = false;
  EXPECT_FALSE(copy.SameState(task));
}

TEST_F(MudTask, IsSetByItsPaths) {
  bool isWrittenOnly = false;
  EXPECT_TRUE(set("Number_of_fractions", "4"));
  EXPECT_EQ(initial().GetCount(), 4);
  EXPECT_TRUE(set("Number_of_layers", "4", &isWrittenOnly));
  EXPECT_TRUE(isWrittenOnly);
  EXPECT_TRUE(set("MultiLayer", "#true", &isWrittenOnly));
  EXPECT_TRUE(isWrittenOnly);
  EXPECT_EQ(state(), "fractions 4 1");
  EXPECT_TRUE(set("Multifraction", "#false", &isWrittenOnly));
  EXPECT_FALSE(isWrittenOnly);
  EXPECT_EQ(state(), "layers 1 1");
  EXPECT_TRUE(set("number_of_layers", "6"));
  EXPECT_TRUE(set("Number_of_fractions", "6", &isWrittenOnly));
  EXPECT_TRUE(isWrittenOnly);
  EXPECT_TRUE(set("Include_salinity_component_for_flocculation", "#true"));
  EXPECT_EQ(state(), "layers 1 6 salt");
  EXPECT_EQ(initial().GetCount(), 8);
  EXPECT_TRUE(set("Number_of_layers", "2147483647"));
  EXPECT_EQ(state(), "layers 1 6 salt");
  EXPECT_TRUE(set("Multifraction", "#true"));
  EXPECT_EQ(state(), "fractions 1 1 salt");
  EXPECT_FALSE(set("Other", "1"));
  const KvsHandle out = kvsCreate();
  const std::string documentPath;
  for (const char* keyword : {"Multifraction", "MultiLayer", "Number_of_layers", "Number_of_fractions",
                              "Include_salinity_component_for_flocculation"}) {
    PathAccess access{PathAccess::What::write, out.get(), nullptr, &documentPath};
    EXPECT_TRUE(task.AccessPath(std::string("TASK_SELECTION/") + keyword, access));
  }
  EXPECT_EQ(*out->text(),
            "Multifraction #true\nMultiLayer #false\nNumber_of_layers 1\nNumber_of_fractions 1\n"
            "Include_salinity_component_for_flocculation #true\n");
}

TEST_F(MudTask, AloneItHasNoModel) {
  CNmtTaskSelectionKvs alone(nullptr);
  alone.SetLayers(2);
  alone.SetSalinity(true);
  EXPECT_EQ(alone.EntryCount(), 4);
  EXPECT_EQ(MudFractions::count(alone), 0);
  EXPECT_EQ(MudFractions::name(alone, 1), "");
  EXPECT_TRUE(mudFractionNames(alone).empty());
}

}  // namespace mud_transport_task_selection_test
}  // namespace gridbay
