#include "advection_dispersion/line_discharge.h"

#include <gtest/gtest.h>

#include "advection_dispersion/component.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "tests/support/model.h"

namespace gridbay {
namespace advection_dispersion_line_discharge_test {

using test::load;
using test::Model;
using test::savedText;

class AdLineDischarge : public ::testing::Test {
 protected:
  AdLineDischarge() {
    areas.GetArea(1)->noJ = 12;
    areas.GetArea(1)->noK = 10;
    model.root.nadComponent->SetCount(3);
  }
  // A line that is right.
  LineOrBox& newLine() {
    list.SetCount(list.GetCount() + 1);
    LineOrBox& line = *list.GetItem(list.GetCount());
    line.file = "l.tsb0";
    return line;
  }
  Model model;
  CBathymetryKvs& areas = *model.root.bathymetry;
  CNadLineDischargeKvs& list = *model.root.nadLineDischarge;
};

TEST_F(AdLineDischarge, ANewLineTakesTheWholeAreaAndTheWholeSimulation) {
  list.SetCount(1);
  const CNadLineDischargeObjectKvs& line = *list.GetItem(1);
  EXPECT_EQ(line.areaNumber, 1);
  EXPECT_EQ(line.first, (GridPoint{0, 0}));
  EXPECT_EQ(line.last, (GridPoint{11, 9}));
  EXPECT_EQ(line.steps, (USubLine{0, 100, 1}));
  EXPECT_TRUE(line.file.empty());
  EXPECT_TRUE(line.title.empty());
  EXPECT_EQ(line.entries, (EntryFlags{1, 1, 1}));
}

TEST_F(AdLineDischarge, NewLinesTakeTheAreasInTurn) {
  areas.SetNoAreas(2);
  list.SetCount(3);
  EXPECT_EQ(list.GetItem(1)->areaNumber, 1);
  EXPECT_EQ(list.GetItem(2)->areaNumber, 2);
  EXPECT_EQ(list.GetItem(2)->last, (GridPoint{-1, -1}));  // not read yet
  EXPECT_EQ(list.GetItem(3)->areaNumber, 1);
  areas.SetNoAreas(0);
  list.SetCount(4);
  EXPECT_EQ(list.GetItem(4)->areaNumber, 0);
  EXPECT_EQ(list.GetItem(4)->last, (GridPoint{9, 9}));
}

TEST_F(AdLineDischarge, IsWrittenInFileOrder) {
  EXPECT_EQ(savedText(list), "AD_LINE_DISCHARGE_CALCULATIONS {\n    No_Of_AD_Discharge_Lines 0\n}\n");
  list.SetCount(2);
  LineOrBox& line = *list.GetItem(2);
  line = {3, {1, 2}, {3, 4}, {5, 6, 1}, line.file, "north", {1, 0, 1}};
  line.file.Set("out/l.tsb0", "/case/setup.v27");
  EXPECT_EQ(savedText(list),
            "AD_LINE_DISCHARGE_CALCULATIONS {\n"
            "    No_Of_AD_Discharge_Lines 2\n"
            "    AD_DISCHARGE_LINE_1 {\n"
            "        Area_Number 1\n"
            "        Start_Coordinate 0 0\n"
            "        End_Coordinate 11 9\n"
            "        Start_Time_Step 0\n"
            "        End_Time_Step 100\n"
            "        File_Name (result)\"\"\n"
            "        Title \"\"\n"
            "        Component_Numbers 1 2 3\n"
            "        No_of_Components_in_Calc 3\n"
            "    }\n"
            "    AD_DISCHARGE_LINE_2 {\n"
            "        Area_Number 3\n"
            "        Start_Coordinate 1 2\n"
            "        End_Coordinate 3 4\n"
            "        Start_Time_Step 5\n"
            "        End_Time_Step 6\n"
            "        File_Name (result)\"out/l.tsb0\"\n"
            "        Title \"north\"\n"
            "        Component_Numbers 1 3\n"
            "        No_of_Components_in_Calc 2\n"
            "    }\n"
            "}\n");
  list.GetItem(2)->entries = {0, 0, 0};
  EXPECT_NE(savedText(list).find("        Component_Numbers\n        No_of_Components_in_Calc 0\n"),
            std::string::npos);
}

TEST_F(AdLineDischarge, ASavedPeriodIsNotReadBack) {
  LineOrBox& line = newLine();
  line.steps = {5, 6, 1};
  line.title = "north";
  Model other;
  load(*other.root.nadLineDischarge, savedText(list));
  const LineOrBox& read = *other.root.nadLineDischarge->GetItem(1);
  EXPECT_EQ(read.title, "north");
  EXPECT_EQ(read.steps, (USubLine{0, 100, 1}));
  EXPECT_EQ(read.entries, EntryFlags{1});
  load(list,
       "AD_LINE_DISCHARGE_CALCULATIONS { No_Of_AD_Discharge_Lines 1; AD_DISCHARGE_LINE_1 {\n"
       "First_Time_Step 7; Last_Time_Step 8 } }");
  EXPECT_EQ(list.GetItem(1)->steps, (USubLine{7, 8, 1}));
}

TEST_F(AdLineDischarge, WhatTheFileLacksKeepsItsValueButForTheComponents) {
  load(list,
       "AD_LINE_DISCHARGE_CALCULATIONS { No_Of_AD_Discharge_Lines 2; AD_DISCHARGE_LINE_2 { Title \"b\" } }");
  ASSERT_EQ(list.GetCount(), 2);
  EXPECT_EQ(list.GetItem(1)->entries, (EntryFlags{1, 1, 1}));
  EXPECT_EQ(list.GetItem(2)->title, "b");
  EXPECT_EQ(list.GetItem(2)->last, (GridPoint{11, 9}));
  EXPECT_EQ(list.GetItem(2)->entries, (EntryFlags{0, 0, 0}));
  EXPECT_TRUE(model.host.texts.empty());
  load(list, "OTHER {}");
  EXPECT_EQ(list.GetCount(), 2);
}

TEST_F(AdLineDischarge, NumbersOfNoComponentAndNumbersPastTheCountAreSkipped) {
  const auto read = [this](const std::string& rows) {
    load(list, "AD_LINE_DISCHARGE_CALCULATIONS { No_Of_AD_Discharge_Lines 1; AD_DISCHARGE_LINE_1 { " + rows +
                   " } }");
    return list.GetItem(1)->entries;
  };
  EXPECT_EQ(read("Component_Numbers 7 3 0 2 1; No_of_Components_in_Calc 4"), (EntryFlags{0, 1, 1}));
  EXPECT_EQ(read("Component_Numbers 1 -1 2147483647; No_of_Components_in_Calc 2147483647"),
            (EntryFlags{1, 0, 0}));
  EXPECT_EQ(read("Component_Numbers 1 2; No_of_Components_in_Calc -1"), (EntryFlags{0, 0, 0}));
  EXPECT_EQ(read("No_of_Components_in_Calc 3"), (EntryFlags{0, 0, 0}));
}

TEST_F(AdLineDischarge, ACountIsBelievedAsFarAsItIsBorneOut) {
  const auto read = [this](const std::string& count) {
    load(list, "AD_LINE_DISCHARGE_CALCULATIONS { No_Of_AD_Discharge_Lines " + count + " }");
    return list.GetCount();
  };
  EXPECT_EQ(read("17"), 17);
  EXPECT_EQ(read("-1"), 17);
  EXPECT_EQ(read("0"), 0);
  EXPECT_EQ(read("2147483647"), kCountSlack);
  EXPECT_EQ(model.host.texts.size(), 1U);
}

TEST_F(AdLineDischarge, FlagsFollowTheComponents) {
  list.SetCount(2);
  list.GetItem(1)->entries = {0, 1, 0};
  model.root.nadComponent->SetCount(4);
  EXPECT_EQ(list.GetItem(1)->entries, (EntryFlags{0, 1, 0, 1}));
  EXPECT_EQ(list.GetItem(2)->entries, (EntryFlags{1, 1, 1, 1}));
  model.root.nadComponent->SetCount(1);
  model.root.nadComponent->SetCount(2);
  EXPECT_EQ(list.GetItem(1)->entries, (EntryFlags{0, 1}));
}

TEST_F(AdLineDischarge, ACopyIsWhole) {
  newLine().entries = {0, 1, 0};
  list.GetItem(1)->title = "north";
  Model other;
  other.root.nadLineDischarge->CopyFrom(list);
  EXPECT_EQ(savedText(*other.root.nadLineDischarge), savedText(list));
}

TEST_F(AdLineDischarge, PathsReachTheComponents) {
  newLine().entries = {0, 1, 1};
  const auto set = [this](std::string_view path, std::string_view text) {
    const KvsHandle file = test::fileOf(text);
    const std::string documentPath = "/case/setup.v27";
    PathAccess access{
        .what = PathAccess::What::set, .in = &file->tree().root(), .documentPath = &documentPath};
    EXPECT_TRUE(
        list.AccessPath("AD_LINE_DISCHARGE_CALCULATIONS/AD_DISCHARGE_LINE_1/" + std::string(path), access));
    return access;
  };
  EXPECT_TRUE(set("Component_Numbers", "Component_Numbers 1 3").takesAnyNumber);
  EXPECT_EQ(list.GetItem(1)->entries, (EntryFlags{1, 0, 1}));
  EXPECT_TRUE(set("No_of_Components_in_Calc", "No_of_Components_in_Calc 1").isWrittenOnly);
  EXPECT_EQ(list.GetItem(1)->entries, (EntryFlags{1, 0, 1}));
  set("Start_Time_Step", "Start_Time_Step 4");
  EXPECT_EQ(list.GetItem(1)->steps.first, 4);
}

TEST_F(AdLineDischarge, TheComponentsOfALineCountAgainForTheNext) {
  model.root.nadComponent->SetCount(5);
  EXPECT_EQ(list.size(), 0);
  newLine().entries = {1, 1, 1, 0, 0};
  newLine().entries = {1, 0, 0, 1, 0};
  model.root.simulationPeriod->timeStepInterval = 10;
  // 11 steps, of 3 and then 5 components.
  EXPECT_FLOAT_EQ(list.size(), static_cast<float>((2 * 3 * 11 + 2 * 5 * 11) * 4 / 1048576.0));
  list.GetItem(2)->steps = {10, 30, 1};
  EXPECT_FLOAT_EQ(list.size(), static_cast<float>((2 * 3 * 11 + 2 * 5 * 3) * 4 / 1048576.0));
}

TEST_F(AdLineDischarge, ASizeIsANumberForAnyPeriod) {
  newLine().steps = {std::numeric_limits<std::int32_t>::min(), std::numeric_limits<std::int32_t>::max(), 1};
  EXPECT_GT(list.size(), 0);
  model.root.simulationPeriod->timeStepInterval = 0;
  EXPECT_TRUE(std::isfinite(list.size()));
}

class AdLineDischargeChecks : public AdLineDischarge {
 protected:
  // The texts, of one line unless it is told otherwise; all of the lines' own page.
  std::vector<std::string> faults() {
    const ValidationList messages = test::messagesOf(list);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::adLineDischarge);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  using Texts = std::vector<std::string>;
  LineOrBox& line = newLine();
  const std::string outside = "Grid point out of range";
  const std::string negative = "First point coordinates can not be negative";
  const std::string behind = "The first point is greater than the last";
};

TEST_F(AdLineDischargeChecks, ALineThatIsRight) {
  EXPECT_EQ(faults(), Texts{});
}

TEST_F(AdLineDischargeChecks, TheFile) {
  line.file = "";
  EXPECT_EQ(faults(), Texts{"Data file  \" \"  is not valid"});
  line.file = "out/";
  EXPECT_EQ(faults(), Texts{"Data file  \" out/\"  is not valid"});
}

TEST_F(AdLineDischargeChecks, TheArea) {
  for (const int number : {0, 2, -1}) {
    line.areaNumber = number;
    line.last = {99, 99};  // is not asked for
    EXPECT_EQ(faults(), Texts{"Line is not embedded in a valid area"}) << number;
  }
  line.steps = {1, 0, 1};
  EXPECT_EQ(faults(),
            (Texts{"Line is not embedded in a valid area", "The first time step is greater than the last"}));
}

TEST_F(AdLineDischargeChecks, TheEnds) {
  line.last = {12, 9};
  EXPECT_EQ(faults(), Texts{outside});
  line.last = {11, 10};
  EXPECT_EQ(faults(), Texts{outside});
  line.last = {-1, -1};
  EXPECT_EQ(faults(), (Texts{outside, outside, behind}));
  line.last = {11, 9};
  line.first = {-1, 0};
  EXPECT_EQ(faults(), Texts{negative});
  line.first = {0, -1};
  EXPECT_EQ(faults(), Texts{negative});
  line.first = {12, 10};
  EXPECT_EQ(faults(), (Texts{negative, negative, behind}));
  line.first = {5, 5};
  line.last = {4, 5};
  EXPECT_EQ(faults(), Texts{behind});
  line.last = {5, 4};  // is not held against the first
  EXPECT_EQ(faults(), Texts{});
}

TEST_F(AdLineDischargeChecks, ThePeriod) {
  line.steps = {7, 6, 1};
  EXPECT_EQ(faults(), Texts{"The first time step is greater than the last"});
  line.steps = {-5, 100, 1};
  EXPECT_EQ(faults(), Texts{});
  line.steps.last = 101;
  EXPECT_EQ(faults(), Texts{"Last timestep out of range"});
}

TEST_F(AdLineDischargeChecks, InTheirOrder) {
  line.file = "";
  line.first = {12, -1};
  line.last = {11, 10};
  line.steps = {300, 200, 1};
  EXPECT_EQ(faults(), (Texts{"Data file  \" \"  is not valid", outside, negative, negative, behind,
                             "The first time step is greater than the last", "Last timestep out of range"}));
}

TEST_F(AdLineDischargeChecks, MoreThanTenAreToldOnTheResultPage) {
  while (list.GetCount() < 10) newLine();
  EXPECT_EQ(faults(), Texts{});
  list.SetCount(11);
  ValidationList messages;
  EXPECT_EQ(list.Validate(messages, 0), 1U);  // lines are checked only deep
  EXPECT_EQ(messages,
            (ValidationList{
                {PageId::adResult, "Illegal number of line discharge lines, should be between 0 and 10"}}));
  EXPECT_EQ(test::messagesOf(list).size(), 2U);  // line 11 has no file
}

}  // namespace advection_dispersion_line_discharge_test
}  // namespace gridbay
