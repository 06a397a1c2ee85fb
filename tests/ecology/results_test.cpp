#include "ecology/results.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "hydrodynamic/result.h"
#include "tests/ecology/carried_model.h"
#include "tests/support/model.h"

namespace gridbay {
namespace ecology_results_test {

using test::load;
using test::savedText;
using Texts = std::vector<std::string>;

class WqsResults : public ::testing::Test {
 protected:
  WqsResults() {
    root.bathymetry->GetArea(1)->noJ = 12;
    root.bathymetry->GetArea(1)->noK = 10;
    root.bathymetry->GetArea(1)->grid = CVdArray2D<float>(12, 10);
    test::define(root, folder, test::kCarriedModel);
    results.outputs.SetCount(1);
  }
  CWQSResultsItemKvs& output() { return results.outputs.at(1); }
  // An output without a fault.
  void makeSound() {
    output().part = {{0, 11, 1}, {0, 9, 1}};
    output().steps = {0, 50, 10};
    output().file = "/case/out.tsb2";
    output().stateVariables = {1, 0, 0};
  }
  // The texts of the check, which gives this count.
  Texts faults(unsigned count) {
    ValidationList messages;
    EXPECT_EQ(results.Validate(messages, 1), count);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::ecoResults);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  CWQSResultsKvs& results = *root.wqsResults;
};

constexpr const char* kAdditional =
    "    ADDITIONAL_OPTIONAL_OUTPUT {\n"
    "        No_Of_Items 3\n"
    "        ADDITIONAL_ITEM_1 {\n"
    "            ID 1\n"
    "            Description \"Light\"\n"
    "            Unit \"W/m2\"\n"
    "            Dimension 2\n"
    "        }\n"
    "        ADDITIONAL_ITEM_2 {\n"
    "            ID 4\n"
    "            Description \"Growth\"\n"
    "            Unit \"g/m3/d\"\n"
    "            Dimension 0\n"
    "        }\n"
    "        ADDITIONAL_ITEM_3 {\n"
    "            ID 6\n"
    "            Description \"All\"\n"
    "            Unit \"g/m3\"\n"
    "            Dimension 2\n"
    "        }\n"
    "    }\n";

TEST_F(WqsResults, InFileOrder) {
  const std::string hotStarts =
      "    Generate_Hotstart #false\n"
      "    HOTSTART_FILES {\n"
      "        AREA_1 {\n"
      "            Title \"\"\n"
      "            File_Name (result)\"\"\n"
      "        }\n"
      "    }\n"
      "}\n";
  EXPECT_EQ(savedText(results), std::string("OUTPUT_SPECIFICATION {\n") + kAdditional +
                                    "    Number_Of_Output_areas 1\n"
                                    "    OUTPUT_AREA_1 {\n"
                                    "        Area_no 1\n"
                                    "        X_Range_And_Interval 0 11 1\n"
                                    "        Y_Range_And_Interval 0 9 1\n"
                                    "        First_Time_Step 0\n"
                                    "        Last_Time_Step 100\n"
                                    "        Time_Step_Interval 1\n"
                                    "        TimeAveragedOutput #false\n"
                                    "        File_Name (result)\"\"\n"
                                    "        Title \"\"\n"
                                    "        State_Variables 0 0 0\n"
                                    "        Additional_Items 0 0 0\n"
                                    "    }\n" +
                                    hotStarts);
  CWQSResultsItemKvs& it = output();
  it.areaNumber = 2;
  it.part = {{2, 8, 2}, {1, 7, 3}};
  it.steps = {5, 95, 10};
  it.timeAveraged = true;
  it.file = "/case/eco.tsb2";
  it.title = "Out";
  it.stateVariables = {0, 1, 1};
  it.additionalItems = {1, 0, 1};
  const std::string text = std::string("OUTPUT_SPECIFICATION {\n") + kAdditional +
                           "    Number_Of_Output_areas 1\n"
                           "    OUTPUT_AREA_1 {\n"
                           "        Area_no 2\n"
                           "        X_Range_And_Interval 2 8 2\n"
                           "        Y_Range_And_Interval 1 7 3\n"
                           "        First_Time_Step 5\n"
                           "        Last_Time_Step 95\n"
                           "        Time_Step_Interval 10\n"
                           "        TimeAveragedOutput #true\n"
                           "        File_Name (result)\"eco.tsb2\"\n"
                           "        Title \"Out\"\n"
                           "        State_Variables 0 1 1\n"
                           "        Additional_Items 1 0 1\n"
                           "    }\n" +
                           hotStarts;
  EXPECT_EQ(savedText(results), text);
  results.outputs.SetCount(3);
  load(results, text);
  EXPECT_EQ(savedText(results), text);
  CWQSResultsItemKvs copy(nullptr);
  copy.CopyFrom(output());
  EXPECT_EQ(savedText(copy), savedText(output()));
  EXPECT_TRUE(copy.SameState(output()));
  copy.additionalItems[1] = 1;
  EXPECT_FALSE(copy.SameState(output()));
}

TEST_F(WqsResults, NewOutputsTakeTheAreasInTurn) {
  root.bathymetry->SetNoAreas(2);
  results.outputs.SetCount(3);
  EXPECT_EQ(results.outputs.at(2).areaNumber, 2);
  EXPECT_EQ(results.outputs.at(3).areaNumber, 1);
  EXPECT_EQ(results.hotStarts.GetCount(), 2);
}

TEST_F(WqsResults, FlagsAsTheFileHasThem) {
  load(results,
       "OUTPUT_SPECIFICATION { Number_Of_Output_areas 2; OUTPUT_AREA_1 { State_Variables 0 1\n"
       "Additional_Items 5 0 -1 1 1 } }");
  ASSERT_EQ(results.outputs.GetCount(), 2);
  EXPECT_EQ(output().stateVariables, (EntryFlags{0, 1, 0}));
  EXPECT_EQ(output().additionalItems, (EntryFlags{1, 0, 1}));
  EXPECT_EQ(results.outputs.at(2).stateVariables, (EntryFlags{0, 0, 0}));
  load(results, "OTHER {}");
  EXPECT_EQ(results.outputs.GetCount(), 0);
}

TEST_F(WqsResults, AnotherDefinitionClearsAllFlags) {
  makeSound();
  output().additionalItems = {1, 1, 1};
  output().title = "Out";
  test::define(root, folder, test::kModelWithoutLimits);
  EXPECT_EQ(output().stateVariables, EntryFlags{0});
  EXPECT_TRUE(output().additionalItems.empty());
  EXPECT_EQ(output().title, "Out");
  EXPECT_EQ(output().steps, (USubLine{0, 50, 10}));
  test::define(root, folder, test::kCarriedModel);
  EXPECT_EQ(output().stateVariables, (EntryFlags{0, 0, 0}));
  EXPECT_EQ(output().additionalItems, (EntryFlags{0, 0, 0}));
}

TEST_F(WqsResults, TheHotStartNeedsThatOfTheFlow) {
  results.generateHotStart = true;
  EXPECT_THAT(savedText(results), ::testing::HasSubstr("Generate_Hotstart #false\n"));
  root.nhdResult->generateHotStart = true;
  EXPECT_THAT(savedText(results), ::testing::HasSubstr("Generate_Hotstart #true\n"));
  results.generateHotStart = false;
  EXPECT_THAT(savedText(results), ::testing::HasSubstr("Generate_Hotstart #false\n"));
}

TEST_F(WqsResults, ASoundOutputAndOneInNoArea) {
  makeSound();
  EXPECT_TRUE(faults(0).empty());
  output().part = {{5, 2, 0}, {-1, 99, 1}};
  output().steps = {9, 2, 0};
  output().stateVariables = {0, 0, 0};
  for (const int area : {0, 2, -1}) {
    output().areaNumber = area;
    EXPECT_EQ(faults(1), Texts{"Assostiated area is does not exist"}) << area;
  }
  ValidationList messages;
  EXPECT_EQ(results.Validate(messages, 0), 0U);
  EXPECT_TRUE(messages.empty());
}

TEST_F(WqsResults, Limits) {
  makeSound();
  const Texts outside{"Invalid output area limits"};
  output().part.x = {0, 12, 1};  // the size itself passes
  output().part.y = {0, 10, 1};
  EXPECT_TRUE(faults(0).empty());
  output().part.x = {0, 13, 1};
  EXPECT_EQ(faults(1), outside);
  output().part = {{-1, 5, 1}, {0, 11, 1}};
  EXPECT_EQ(faults(1), outside);
  output().part = {{0, 11, 1}, {-1, 9, 1}};
  EXPECT_EQ(faults(1), outside);
}

TEST_F(WqsResults, Intervals) {
  makeSound();
  const std::string step = "Invalid output area step";
  output().part = {{0, 5, 0}, {0, 5, 0}};
  EXPECT_EQ(faults(1), Texts{step});
  output().part = {{0, 11, 1}, {0, 5, 6}};
  EXPECT_EQ(faults(1), Texts{step});
  output().part.y.interval = 5;
  EXPECT_TRUE(faults(0).empty());
  output().part.y = {5, 2, 3};  // backwards, and no more than that
  EXPECT_EQ(faults(1), Texts{step});
  output().part = {{5, 2, 0}, {0, 5, 1}};
  EXPECT_EQ(faults(2), (Texts{step, step}));
  output().part = {{3, 3, 7}, {0, 5, 1}};  // an empty range has any interval
  output().file = "/case/out.tsb1";
  EXPECT_TRUE(faults(0).empty());
}

TEST_F(WqsResults, WrongStepsEndTheChecksAndCountForNothing) {
  makeSound();
  const Texts wrong{"Invalid output time steps"};
  for (const USubLine& steps : {USubLine{0, 50, 0},
                                {0, 50, 102},
                                {102, 102, 1},
                                {0, 102, 1},
                                {0, -1, 1},
                                {-1, 50, 1},
                                {9, 2, 1},
                                {50, 50, 2}}) {
    output().steps = steps;
    EXPECT_EQ(faults(0), wrong) << steps.first << ' ' << steps.last << ' ' << steps.interval;
  }
  for (const USubLine& steps : {USubLine{0, 101, 1}, {0, 100, 101}, {50, 50, 1}}) {
    output().steps = steps;
    EXPECT_TRUE(faults(0).empty()) << steps.last;
  }
  output().steps = {9, 2, 1};
  output().part = {{0, 99, 1}, {5, 2, 0}};
  output().stateVariables = {0, 0, 0};
  EXPECT_EQ(faults(0), (Texts{"Invalid output area limits", "Invalid output area step",
                              "Invalid output area step", "Invalid output time steps"}));
}

TEST_F(WqsResults, AveragesOfSingleStepsEndTheChecks) {
  makeSound();
  output().timeAveraged = true;
  EXPECT_TRUE(faults(0).empty());
  output().steps.interval = 1;
  output().file = "/case/out.doc";
  output().stateVariables = {0, 0, 0};
  EXPECT_EQ(faults(0), Texts{"Time averaged output not possible with frequency = 1"});
}

TEST_F(WqsResults, TheExtensionFollowsTheExtent) {
  makeSound();
  struct Extents {
    USubArea part;
    std::array<const char*, 2> extensions;
  };
  const std::array<Extents, 4> extents{{{{{3, 3, 1}, {4, 4, 1}}, {"tsb0", "tb0"}},
                                        {{{3, 3, 1}, {0, 4, 1}}, {"tsb1", "tb1"}},
                                        {{{0, 4, 1}, {3, 3, 1}}, {"tsb1", "tb1"}},
                                        {{{0, 4, 1}, {0, 4, 1}}, {"tsb2", "tb2"}}}};
  for (const Extents& own : extents) {
    output().part = own.part;
    for (const Extents& other : extents) {
      for (const char* extension : other.extensions) {
        output().file = std::string("/case/a.") + extension;
        const bool fits =
            own.extensions == other.extensions || std::string_view(own.extensions[0]) == other.extensions[0];
        EXPECT_EQ(faults(fits ? 0 : 1), fits ? Texts{} : Texts{"Wrong dimension of output file"})
            << extension;
      }
    }
  }
  for (const char* name : {"", "/case/tsb2", "/case.tsb2/out", "/case/a.xtsb2", "/case/a.tsb2.bak"}) {
    output().file = name;
    EXPECT_EQ(faults(1), Texts{"Wrong dimension of output file"}) << name;
  }
  output().file = "";
  output().stateVariables = {0, 0, 0};
  EXPECT_EQ(faults(2), (Texts{"Wrong dimension of output file", "Please choose at least one output item"}));
  output().additionalItems = {0, 0, 1};
  output().file = "/case.d/a.b.tb2";
  EXPECT_TRUE(faults(0).empty());
}

TEST_F(WqsResults, HotStartFilesNeedNames) {
  makeSound();
  EXPECT_TRUE(faults(0).empty());
  results.generateHotStart = true;
  EXPECT_EQ(faults(1), Texts{"Filename:  is not valid"});
  results.hotStarts.at(1).file = "/case/h.tsb2";
  EXPECT_TRUE(faults(0).empty());
}

TEST_F(WqsResults, AnyNumberOfOutputs) {
  results.outputs.SetCount(17);
  for (int number = 1; number <= 17; ++number) {
    makeSound();
    results.outputs.at(number).CopyFrom(output());
  }
  EXPECT_TRUE(faults(0).empty());
}

// 12 by 10 points, 6 frames of what is chosen, and the first value of each point.
TEST_F(WqsResults, Sizes) {
  makeSound();
  output().stateVariables = {1, 0, 1};
  output().additionalItems = {0, 1, 0};
  EXPECT_FLOAT_EQ(results.OutputSizeMB(), 12 * 10 * (6 * 3 + 1) * 4 / 1048576.0F);
  EXPECT_EQ(results.hotStartItems(), 0);
  results.generateHotStart = true;
  EXPECT_EQ(results.hotStartItems(), 3);
  root.moduleSelection->simulationType = module::kEcological;
  EXPECT_EQ(root.OutputOfModule().hotStartItems, 0);  // as with expanded mud
  EXPECT_FLOAT_EQ(static_cast<float>(root.OutputOfModule().megabytes), results.OutputSizeMB());
}

TEST_F(WqsResults, ByPath) {
  const auto set = [this](std::string_view path, std::string_view text) {
    const KvsHandle file = test::fileOf(text);
    const std::string documentPath;
    PathAccess access{PathAccess::What::set, nullptr, &file->tree().root(), &documentPath};
    return results.AccessPath(path, access);
  };
  EXPECT_TRUE(set("OUTPUT_SPECIFICATION/OUTPUT_AREA_1/State_Variables", "State_Variables 1 0 1"));
  EXPECT_EQ(output().stateVariables, (EntryFlags{1, 0, 1}));
  EXPECT_FALSE(set("OUTPUT_SPECIFICATION/ADDITIONAL_OPTIONAL_OUTPUT/No_Of_Items", "No_Of_Items 9"));
}

}  // namespace ecology_results_test
}  // namespace gridbay
