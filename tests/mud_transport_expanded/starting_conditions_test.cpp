#include "mud_transport_expanded/starting_conditions.h"

#include <gmock/gmock.h>

#include <limits>

#include "mud_transport_expanded/initial_conditions.h"
#include "mud_transport_expanded/task_selection.h"
#include "tests/support/starting_conditions.h"

namespace gridbay {
namespace mud_transport_expanded_starting_conditions_test {

using test::hotSpec;
using test::savedText;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

// With two fractions over three layers.
class ExpandedStart
    : public test::StartingConditions<CNmtExpStartingConditionsKvs, &CGlobalKvs::nmtExpStartingConditions,
                                      PageId::mtExpStartingConditions> {
 protected:
  ExpandedStart() { task.SetCounts(3, 2, false); }
  void begin(std::vector<TsbCustomBlock> blocks) {
    test::writeGrid(path, hotSpec(std::move(blocks)));
    StartingConditions::begin();
  }
  std::vector<int> counts() const { return {task.layers, task.fractions, task.includeSalinity ? 1 : 0}; }
  using Counts = std::vector<int>;

  CNmtExpTaskSelectionKvs& task = *root.nmtExpTaskSelection;
};

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

TEST_F(ExpandedStart, TheTimeSteps) {
  start.integrationEnd = 900;  // not tested
  checkTimeSteps();
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
    EXPECT_EQ(messages(),
              (ValidationList{{PageId::mtStartingConditions, notValid(path), Severity::dependedUpon}}))
        << ::testing::PrintToString(values);
    EXPECT_EQ(counts(), (Counts{3, 2, 0}));
  }
}

TEST_F(ExpandedStart, FilesThatDoNotFit) {
  const std::vector<TsbCustomBlock> block{{"V27_Misc", {1, 5, 5}}};
  checkBadFiles(hotSpec(block), [this](const std::string& why) {
    EXPECT_EQ(counts(), (Counts{3, 2, 0})) << why;
  });
  test::GridSpec spec = hotSpec(block);
  spec.steps = 2;
  test::writeGrid(path, spec);
  start.at(1).file = path;
  EXPECT_EQ(messages(), refusal(path)) << "two time steps";
  EXPECT_EQ(counts(), (Counts{3, 2, 0}));
}

TEST_F(ExpandedStart, FilesOfOtherAreasBringNothing) {
  root.bathymetry->SetNoAreas(2);
  setArea(2, 12, 10, 100);
  begin({{"V27_Misc", {0, 2, 3}}});
  const std::string second = folder.file("second.tsb2");
  start.at(2).file = second;
  test::writeGrid(second, hotSpec({{"V27_Misc", {1, 7, -7}}}));
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(counts(), (Counts{3, 2, 0}));
  start.at(1).file = "none.tsb2";
  start.at(2).file = "";
  EXPECT_EQ(faults(), (Texts{notValid("none.tsb2"), notValid("")}));
}

}  // namespace mud_transport_expanded_starting_conditions_test
}  // namespace gridbay
