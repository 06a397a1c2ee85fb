#include "mud_transport/starting_conditions.h"

#include <gmock/gmock.h>

#include <cmath>
#include <limits>

#include "mud_transport/boundary.h"
#include "mud_transport/initial_concentration.h"
#include "mud_transport/result.h"
#include "mud_transport/task_selection.h"
#include "tests/support/pages.h"
#include "tests/support/starting_conditions.h"

namespace gridbay {
namespace mud_transport_starting_conditions_test {

using test::hotSpec;
using test::Model;
using test::savedText;
using Texts = std::vector<std::string>;
using Floats = std::vector<float>;

// The module's block in a hot start file.
std::vector<TsbCustomBlock> blockOf(const Floats& values) {
  return {{"V27_Misc", values}};
}

class MudStart
    : public test::StartingConditions<CNmtStartingConditionsKvs, &CGlobalKvs::nmtStartingConditions,
                                      PageId::mtStartingConditions> {
 protected:
  std::string state() const {
    return std::string(task.multiFraction ? "fractions " : "layers ") + std::to_string(task.fractions) + " " +
           std::to_string(task.layers) + (task.includeSalinity ? " salt " : " ") +
           std::to_string(root.nmtResult->netSedimentationInMm);
  }

  CNmtTaskSelectionKvs& task = *root.nmtTaskSelection;
};

TEST_F(MudStart, ANewOneIsColdAndHasNoFault) {
  EXPECT_FALSE(start.hotStart);
  EXPECT_TRUE(faults().empty());
}

TEST_F(MudStart, IsReadBackInAHotModelAndCopied) {
  const std::string text =
      "STARTING_CONDITIONS {\n"
      "    Hot_Start #true\n"
      "    Start_MT_at_HD_Time_Step 3\n"
      "    End_MT_at_HD_Time_Step 77\n"
      "    Integration_period_start 5\n"
      "    Integration_period_end 66\n"
      "    AREA_1 {\n"
      "        DATA_FILE {\n"
      "            File_Name (file)\"hot1.tsb2\"\n"
      "        }\n"
      "    }\n"
      "    AREA_2 {\n"
      "        DATA_FILE {\n"
      "            File_Name (file)\"hot2.tsb2\"\n"
      "        }\n"
      "    }\n"
      "}\n"
      "CALCULATION_METHOD {\n"
      "    Max_rel_decrease_in_conc_pr_step 0.25\n"
      "}\n";
  model.root.bathymetry->SetNoAreas(2);
  test::load(start, text);
  EXPECT_FALSE(start.hotStart);  // in a cold model
  model.root.bathymetry->hotStart = 1;
  test::load(start, text);
  EXPECT_EQ(savedText(start), text);
  Model other;
  other.root.nmtStartingConditions->CopyFrom(start);
  EXPECT_EQ(savedText(*other.root.nmtStartingConditions), text);
}

TEST_F(MudStart, WhatTheFileLacksStays) {
  start.maximumDecrease = 0.5F;
  start.GetItem(1)->file = "old.tsb2";
  for (const char* text : {"OTHER {}", "STARTING_CONDITIONS { AREA_1 {} }", "CALCULATION_METHOD {}"}) {
    test::load(start, text);
    EXPECT_EQ(start.maximumDecrease, 0.5F) << text;
    EXPECT_EQ(start.integrationEnd, 100) << text;
    EXPECT_EQ(start.GetItem(1)->file.text(), "old.tsb2") << text;
  }
  Model fresh;
  test::load(*fresh.root.nmtStartingConditions, "STARTING_CONDITIONS { Start_MT_at_HD_Time_Step 1 }");
  EXPECT_EQ(fresh.root.nmtStartingConditions->maximumDecrease, 0.1F);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(MudStart, AnIntegrationPeriodAtTheMethodOverrides) {
  test::load(start,
             "STARTING_CONDITIONS { Integration_period_start 1; Integration_period_end 2 }\n"
             "CALCULATION_METHOD { Integration_period_end 40; Integration_period_start 30 }");
  EXPECT_EQ(start.integrationStart, 30);
  EXPECT_EQ(start.integrationEnd, 40);
  test::load(start,
             "CALCULATION_METHOD { Integration_period_end 41 }\n"
             "STARTING_CONDITIONS { Integration_period_start 1; Integration_period_end 2 }");
  EXPECT_EQ(start.integrationStart, 1);
  EXPECT_EQ(start.integrationEnd, 41);
}

TEST_F(MudStart, TheTimeSteps) {
  start.integrationStart = -7;  // not tested
  start.integrationEnd = -9;
  checkTimeSteps();
}

TEST_F(MudStart, TheFileOfArea1TellsTheTask) {
  begin();
  const auto read = [this](const Floats& block) {
    test::writeGrid(path, hotSpec(blockOf(block)));
    EXPECT_EQ(faults(), Texts{});
    return state();
  };
  EXPECT_EQ(read({0, 0, 0, 5, 0}), "fractions 5 1 0");
  EXPECT_EQ(model.root.nmtInitialConcentration->GetCount(), 5);
  EXPECT_EQ(read({1, 1, 1, 5, 4}), "layers 1 4 salt 1");
  EXPECT_EQ(model.root.nmtInitialConcentration->GetCount(), 6);
  EXPECT_EQ(read({-2.5F, 0, 0.5F, 5, 2.9F, 77}), "layers 1 2 1");
  EXPECT_EQ(read({0, 3, 0, 1, -5}), "fractions 1 1 salt 0");
  EXPECT_EQ(model.root.nmtInitialConcentration->GetCount(), 2);
}

TEST_F(MudStart, AFileWithoutTheBlockLeavesTheTask) {
  begin();
  task.SetLayers(4);
  for (const std::vector<TsbCustomBlock>& blocks :
       {std::vector<TsbCustomBlock>{}, {{"Other", {0, 1, 1, 7, 7}}}}) {
    test::GridSpec spec = hotSpec({});
    spec.blocks = blocks;
    test::writeGrid(path, spec);
    EXPECT_EQ(faults(), Texts{});
    EXPECT_EQ(state(), "layers 1 4 1");
  }
  test::GridSpec spec = hotSpec({});
  spec.blocks = {{"Other", {1}}, {"v27_MISC", {0, 0, 1, 2, 0}}, {"V27_Misc", {0, 0, 1, 6, 0}}};
  test::writeGrid(path, spec);
  EXPECT_EQ(faults(), Texts{});
  EXPECT_EQ(state(), "fractions 2 1 1");
}

TEST_F(MudStart, ABlockThatMakesNoSenseChangesNothing) {
  begin();
  const float nan = std::numeric_limits<float>::quiet_NaN();
  const float infinity = std::numeric_limits<float>::infinity();
  const float large = 2147483647.0F;
  for (const Floats& block :
       {Floats{0}, Floats{0, 1, 0, 2}, Floats{0, 1, 0, -1, 2}, Floats{1, 1, 0, 2, -1},
        Floats{0, 1, 0, large, 2}, Floats{1, 1, 0, 2, large}, Floats{0, 1, 0, 257, 2},
        Floats{0, 1, 0, nan, 2}, Floats{1, 1, 0, 2, infinity}, Floats{0, 1, 0, 3e38F, 2},
        Floats{nan, 1, 0, 2, 2}, Floats{0, nan, 0, 2, 2}, Floats{0, 1, infinity, 2, 2}}) {
    test::writeGrid(path, hotSpec(blockOf(block)));
    EXPECT_EQ(messages(),
              (ValidationList{{PageId::mtStartingConditions, notValid(path), Severity::dependedUpon}}))
        << ::testing::PrintToString(block);
    EXPECT_EQ(state(), "fractions 3 1 1");
  }
}

TEST_F(MudStart, ABadFileLeavesTheTask) {
  checkBadFiles(hotSpec(blockOf({1, 1, 0, 0, 4})),
                [this](const std::string& why) { EXPECT_EQ(state(), "fractions 3 1 1") << why; });
}

TEST_F(MudStart, OtherAreasAreCheckedAndTellNothing) {
  model.root.bathymetry->SetNoAreas(2);
  setArea(2, 7, 7, 50);
  begin();
  const std::string second = folder.file("second.tsb2");
  start.GetItem(2)->file = second;
  test::writeGrid(path, hotSpec(blockOf({1, 0, 0, 0, 4})));
  EXPECT_EQ(faults(), Texts{notValid(second)});
  test::GridSpec inner = hotSpec(blockOf({0, 1, 1, 8, 8}));
  inner.noJ = inner.noK = 7;
  inner.dx = inner.dy = 50;
  inner.items = 5;  // how many is not asked
  test::writeGrid(second, inner);
  EXPECT_EQ(faults(), Texts{});
  EXPECT_EQ(state(), "layers 1 4 0");
  start.GetItem(1)->file = "h.tsb2";
  start.firstStep = -5;
  EXPECT_EQ(faults(), (Texts{"First time step can not be negative", notValid("h.tsb2")}));
  start.hotStart = false;
  EXPECT_EQ(faults(), Texts{"First time step can not be negative"});
  start.hotStart = true;
  EXPECT_EQ(faults(0), Texts{"First time step can not be negative"});
}

// What the check changes is one step that can be taken back.
class MudHotStartInADocument : public test::PageTest {
 protected:
  test::TemporaryFolder folder;
};

TEST_F(MudHotStartInADocument, TheNewTaskIsAStepOfItsOwn) {
  const std::string path = folder.file("hot.tsb2");
  test::writeGrid(path, hotSpec(blockOf({1, 1, 0, 0, 4})));
  root().moduleSelection->simulationType = module::kMudTransport;
  root().bathymetry->GetArea(1)->noJ = 12;
  root().bathymetry->GetArea(1)->noK = 10;
  root().bathymetry->GetArea(1)->dx = root().bathymetry->GetArea(1)->dy = 100;
  root().nmtStartingConditions->hotStart = true;
  root().nmtStartingConditions->GetItem(1)->file = path;
  document.RecordEdit(PageId::mtStartingConditions, "before");
  open("CNmtInitialConcentrationDlg");
  EXPECT_EQ(grid().GetRowCount(), 6);
  ValidationList messages;
  document.ValidateData(messages);
  EXPECT_EQ(grid().GetRowCount(), 12);
  EXPECT_EQ(cell(1, 1), "Component :   Salinity");
  ASSERT_NE(document.UndoStep(), nullptr);
  EXPECT_EQ(document.UndoStep()->name, "Validation");
  document.Undo();
  EXPECT_EQ(grid().GetRowCount(), 6);
  EXPECT_TRUE(root().nmtTaskSelection->multiFraction);
  EXPECT_EQ(root().nmtResult->netSedimentationInMm, 1);
  EXPECT_EQ(document.UndoStep()->name, "before");
  document.Redo();
  EXPECT_EQ(root().nmtTaskSelection->layers, 4);
  EXPECT_EQ(grid().GetRowCount(), 12);
  document.ValidateData(messages);
  document.Undo();
  EXPECT_EQ(document.UndoStep()->name, "before");
}

}  // namespace mud_transport_starting_conditions_test
}  // namespace gridbay
