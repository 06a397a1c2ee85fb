#include "mud_transport_expanded/starting_conditions.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <limits>

#include "basic/bathymetry.h"
#include "mud_transport_expanded/initial_conditions.h"
#include "mud_transport_expanded/task_selection.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace {

using test::savedText;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

// A model of one area, 12 by 10 points, with two fractions over three layers.
class ExpandedStart : public ::testing::Test {
 protected:
  ExpandedStart() {
    setArea(1, 12, 10, 100);
    task.SetCounts(3, 2, false);
  }
  void setArea(int number, int noJ, int noK, float spacing) {
    CBathymetryObjectKvs& area = *root.bathymetry->GetArea(number);
    area.noJ = noJ;
    area.noK = noK;
    area.dx = area.dy = spacing;
  }
  // A hot start file of area 1 with such blocks.
  static test::GridSpec fileWith(std::vector<TsbCustomBlock> blocks) {
    return {.noJ = 12,
            .noK = 10,
            .dx = 100,
            .dy = 100,
            .land = {},
            .itemType = 100403,
            .dataType = 2,
            .unit = "kg m-3",
            .blocks = std::move(blocks)};
  }
  void begin(std::vector<TsbCustomBlock> blocks) {
    test::writeGrid(path, fileWith(std::move(blocks)));
    start.hotStart = true;
    start.at(1).file = path;
  }
  ValidationList messages(int deep = 1) { return test::messagesOf(start, deep); }
  Texts faults() { return test::textsOf(messages()); }
  std::vector<int> counts() const { return {task.layers, task.fractions, task.includeSalinity ? 1 : 0}; }
  using Counts = std::vector<int>;

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  CNmtExpStartingConditionsKvs& start = *root.nmtExpStartingConditions;
  CNmtExpTaskSelectionKvs& task = *root.nmtExpTaskSelection;
  std::string path = folder.file("hot.tsb2");
  const std::string invalid = "Data file  \" " + path + "\"  is not valid";
};

TEST_F(ExpandedStart, ANewOneIsColdAndCoversTheSimulation) {
  EXPECT_EQ(savedText(start),
            "STARTING_CONDITIONS {\n"
            "    Hot_Start #false\n"
            "    Start_MT_at_HD_Time_Step 0\n"
            "    End_MT_at_HD_Time_Step 100\n"
            "    Integration_period_start 0\n"
            "    Integration_period_end 100\n"
            "    AREA_1 {\n"
            "        DATA_FILE {\n"
            "            File_Name (file)\"\"\n"
            "        }\n"
            "    }\n"
            "}\n");
}

TEST_F(ExpandedStart, AFilledOneComesBack) {
  root.bathymetry->SetNoAreas(2);
  root.bathymetry->hotStart = 1;
  start.hotStart = true;
  start.firstStep = 2;
  start.lastStep = 30;
  start.integrationStart = 4;
  start.integrationEnd = 20;
  start.at(2).file = "/case/h.tsb2";
  const std::string text = savedText(start);
  EXPECT_EQ(text,
            "STARTING_CONDITIONS {\n"
            "    Hot_Start #true\n"
            "    Start_MT_at_HD_Time_Step 2\n"
            "    End_MT_at_HD_Time_Step 30\n"
            "    Integration_period_start 4\n"
            "    Integration_period_end 20\n"
            "    AREA_1 {\n"
            "        DATA_FILE {\n"
            "            File_Name (file)\"\"\n"
            "        }\n"
            "    }\n"
            "    AREA_2 {\n"
            "        DATA_FILE {\n"
            "            File_Name (file)\"h.tsb2\"\n"
            "        }\n"
            "    }\n"
            "}\n");
  test::Model other;
  other.root.bathymetry->SetNoAreas(2);
  other.root.bathymetry->hotStart = 1;
  test::load(*other.root.nmtExpStartingConditions, text);
  EXPECT_EQ(savedText(*other.root.nmtExpStartingConditions), text);
}

TEST_F(ExpandedStart, AModelThatBeginsColdHasNoHotStart) {
  test::load(start, "STARTING_CONDITIONS { Hot_Start #true }");
  EXPECT_FALSE(start.hotStart);
}

TEST_F(ExpandedStart, TheSectionBesideHasTheLastWordOnTheIntegration) {
  test::load(start,
             "STARTING_CONDITIONS { Integration_period_start 3; Integration_period_end 9 }\n"
             "CALCULATION_METHOD { Integration_period_end 8 }");
  EXPECT_EQ(start.integrationStart, 3);
  EXPECT_EQ(start.integrationEnd, 8);
}

TEST_F(ExpandedStart, TimeStepsOutsideOfTheSimulation) {
  start.firstStep = -1;
  start.lastStep = -2;
  EXPECT_EQ(faults(),
            (Texts{"First time step can not be negative", "The first time step is greater than the last"}));
  start.firstStep = 0;
  start.lastStep = 101;
  start.integrationEnd = 900;  // not tested
  const ValidationList list = messages(0);
  EXPECT_EQ(list, (ValidationList{{PageId::mtExpStartingConditions, "Last timestep out of range"}}));
}

TEST_F(ExpandedStart, TheFileOfArea1BringsTheCounts) {
  begin({{"Other", {9, 9, 9}}, {"v27_MISC", {1, 4.9F, 2}}});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(counts(), (Counts{2, 4, 1}));
  EXPECT_EQ(root.nmtExpInitialConditions->components.GetCount(), 5);
  EXPECT_EQ(root.nmtExpInitialConditions->thicknesses.GetCount(), 2);
}

TEST_F(ExpandedStart, TheSameCountsChangeNothing) {
  root.nmtExpInitialConditions->distribution.at(1).percentages = {90, 10};
  begin({{"V27_Misc", {0, 2, 3}}});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(root.nmtExpInitialConditions->distribution.at(1).percentages,
            (std::vector<std::int32_t>{90, 10}));
}

TEST_F(ExpandedStart, AFileWithoutSalinityTakesNoneAway) {
  task.SetSalinity(true);
  root.nmtExpInitialConditions->components.at(1).at(1).value = 31;
  begin({{"V27_Misc", {0, 3, 2}}});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(counts(), (Counts{2, 3, 1}));
  EXPECT_EQ(root.nmtExpInitialConditions->components.GetCount(), 4);
  EXPECT_EQ(root.nmtExpInitialConditions->components.at(1).at(1).value, 31);
}

TEST_F(ExpandedStart, WithoutTheBlockTheCountsStay) {
  begin({{"Other", {1, 5, 5}}});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(counts(), (Counts{3, 2, 0}));
  begin({});
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(ExpandedStart, ABlockThatCannotBeIsToldOfTheOlderPageAndChangesNothing) {
  constexpr float kNaN = std::numeric_limits<float>::quiet_NaN();
  constexpr float kInfinity = std::numeric_limits<float>::infinity();
  const std::vector<std::vector<float>> bad{{0, 2, -1},    {0, -1, 3},
                                            {0, 2},        {},
                                            {0, 2, kNaN},  {0, kNaN, 2},
                                            {kNaN, 2, 3},  {0, 2, kInfinity},
                                            {1, 0, 3},     {0, 2147483647.0F, 3},
                                            {0, 3, 1e30F}, {0, 101, 3}};
  for (const std::vector<float>& values : bad) {
    if (values.empty()) continue;
    begin({{"V27_Misc", values}});
    EXPECT_EQ(messages(), (ValidationList{{PageId::mtStartingConditions, invalid, Severity::dependedUpon}}))
        << ::testing::PrintToString(values);
    EXPECT_EQ(counts(), (Counts{3, 2, 0}));
  }
}

TEST_F(ExpandedStart, FilesThatDoNotFit) {
  const auto refused = [this](const char* what) {
    EXPECT_EQ(messages(),
              (ValidationList{{PageId::mtExpStartingConditions, invalid, Severity::dependedUpon}}))
        << what;
    EXPECT_EQ(counts(), (Counts{3, 2, 0})) << what;
  };
  const std::vector<TsbCustomBlock> block{{"V27_Misc", {1, 5, 5}}};
  begin(block);
  std::filesystem::remove(path);
  refused("missing");
  test::GridSpec spec = fileWith(block);
  spec.noJ = 11;
  test::writeGrid(path, spec);
  refused("another extent");
  spec = fileWith(block);
  spec.dataType = 11;
  test::writeGrid(path, spec);
  refused("another data type");
  spec = fileWith(block);
  spec.steps = 2;
  test::writeGrid(path, spec);
  refused("two time steps");
  test::writeGrid(path, fileWith(block));
  std::filesystem::resize_file(path, std::filesystem::file_size(path) / 2);
  refused("cut short");
  folder.write("hot.tsb2", "");
  refused("empty");
}

TEST_F(ExpandedStart, FilesOfOtherAreasBringNothing) {
  root.bathymetry->SetNoAreas(2);
  setArea(2, 12, 10, 100);
  begin({{"V27_Misc", {0, 2, 3}}});
  const std::string second = folder.file("second.tsb2");
  start.at(2).file = second;
  test::writeGrid(second, fileWith({{"V27_Misc", {1, 7, -7}}}));
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(counts(), (Counts{3, 2, 0}));
  start.at(1).file = "none.tsb2";
  start.at(2).file = "";
  EXPECT_EQ(faults(), (Texts{"Data file  \" none.tsb2\"  is not valid", "Data file  \" \"  is not valid"}));
}

}  // namespace
}  // namespace gridbay
