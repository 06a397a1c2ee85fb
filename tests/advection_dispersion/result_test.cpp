#include "advection_dispersion/result.h"

#include <gtest/gtest.h>

#include "advection_dispersion/component.h"
#include "basic/bathymetry.h"
#include "basic/module_selection.h"
#include "hydrodynamic/result.h"
#include "tests/support/model.h"

namespace gridbay {
namespace advection_dispersion_result_test {

using test::load;
using test::Model;
using test::savedText;

class AdResult : public ::testing::Test {
 protected:
  AdResult() {
    areas.GetArea(1)->noJ = 12;
    areas.GetArea(1)->noK = 10;
    areas.GetArea(1)->grid = CVdArray2D<float>(12, 10);
  }
  // An output that is right.
  TransportOutput& newOutput() {
    results.outputs.SetCount(results.outputs.GetCount() + 1);
    TransportOutput& output = results.outputs.at(results.outputs.GetCount());
    output.file = "r.tsb2";
    return output;
  }
  Model model;
  CBathymetryKvs& areas = *model.root.bathymetry;
  CNadResultKvs& results = *model.root.nadResult;
};

TEST_F(AdResult, ANewOutputTakesAnAreaInTurnAsAWhole) {
  areas.SetNoAreas(2);
  results.outputs.SetCount(3);
  const TransportOutput& first = results.outputs.at(1);
  EXPECT_EQ(first.areaNumber, 1);
  EXPECT_EQ(first.part, (USubArea{{0, 11, 1}, {0, 9, 1}}));
  EXPECT_EQ(first.steps, (USubLine{0, 100, 1}));
  EXPECT_TRUE(first.title.empty());
  EXPECT_TRUE(first.file.empty());
  EXPECT_EQ(results.outputs.at(2).areaNumber, 2);
  EXPECT_EQ(results.outputs.at(2).part, (USubArea{{0, -1, 1}, {0, -1, 1}}));  // not read yet
  EXPECT_EQ(results.outputs.at(3).areaNumber, 1);
  EXPECT_FALSE(results.generateHotStart);
}

TEST_F(AdResult, IsWrittenInFileOrder) {
  areas.SetNoAreas(2);
  EXPECT_EQ(savedText(results),
            "OUTPUT_SPECIFICATION {\n"
            "    Number_Of_Output_areas 0\n"
            "    Generate_Hotstart #false\n"
            "    HOTSTART_FILES {\n"
            "        AREA_1 {\n"
            "            Title \"\"\n"
            "            File_Name (result)\"\"\n"
            "        }\n"
            "        AREA_2 {\n"
            "            Title \"\"\n"
            "            File_Name (result)\"\"\n"
            "        }\n"
            "    }\n"
            "}\n");
  areas.SetNoAreas(1);
  TransportOutput& output = newOutput();
  output.areaNumber = 3;
  output.part = {{1, 9, 2}, {2, 8, 3}};
  output.steps = {5, 60, 4};
  output.title = "bay";
  output.file.Set("out/bay.tsb2", "/case/setup.v27");
  results.hotStarts.at(1).title = "h1";
  results.hotStarts.at(1).file.Set("h1.tsb2", "/case/setup.v27");
  results.generateHotStart = true;
  model.root.nhdResult->generateHotStart = true;
  const std::string whole =
      "OUTPUT_SPECIFICATION {\n"
      "    Number_Of_Output_areas 1\n"
      "    OUTPUT_AREA_1 {\n"
      "        X_Range_And_Interval 1 9 2\n"
      "        Y_Range_And_Interval 2 8 3\n"
      "        Area_no 3\n"
      "        First_Time_Step 5\n"
      "        Last_Time_Step 60\n"
      "        Time_Step_Interval 4\n"
      "        Title \"bay\"\n"
      "        File_Name (result)\"out/bay.tsb2\"\n"
      "    }\n"
      "    Generate_Hotstart #true\n"
      "    HOTSTART_FILES {\n"
      "        AREA_1 {\n"
      "            Title \"h1\"\n"
      "            File_Name (result)\"h1.tsb2\"\n"
      "        }\n"
      "    }\n"
      "}\n";
  EXPECT_EQ(savedText(results), whole);
  Model other;
  other.root.nhdResult->generateHotStart = true;
  load(*other.root.nadResult, whole);
  EXPECT_EQ(savedText(*other.root.nadResult), whole);
  other.root.nadResult->outputs.SetCount(0);
  other.root.nadResult->CopyFrom(results);
  EXPECT_EQ(savedText(*other.root.nadResult), whole);
}

TEST_F(AdResult, HotStartIsWrittenOnlyWithThatOfHydrodynamics) {
  results.generateHotStart = true;
  EXPECT_NE(savedText(results).find("Generate_Hotstart #false"), std::string::npos);
  EXPECT_TRUE(results.generateHotStart);
  model.root.nhdResult->generateHotStart = true;
  EXPECT_NE(savedText(results).find("Generate_Hotstart #true"), std::string::npos);
  results.generateHotStart = false;
  EXPECT_NE(savedText(results).find("Generate_Hotstart #false"), std::string::npos);
}

TEST_F(AdResult, ALoadBeginsWithNoOutput) {
  newOutput().title = "old";
  load(results, "OUTPUT_SPECIFICATION { Number_Of_Output_areas 2; OUTPUT_AREA_2 { Title \"b\" } }");
  ASSERT_EQ(results.outputs.GetCount(), 2);
  EXPECT_EQ(results.outputs.at(1).title, "");
  EXPECT_EQ(results.outputs.at(1).part, (USubArea{{0, 11, 1}, {0, 9, 1}}));
  EXPECT_EQ(results.outputs.at(2).title, "b");
  EXPECT_TRUE(model.host.texts.empty());
  load(results, "OTHER {}");
  EXPECT_EQ(results.outputs.GetCount(), 0);
}

TEST_F(AdResult, ACountIsBelievedAsFarAsItIsBorneOut) {
  const auto read = [this](const std::string& count) {
    load(results, "OUTPUT_SPECIFICATION { Number_Of_Output_areas " + count + " }");
    return results.outputs.GetCount();
  };
  EXPECT_EQ(read("17"), 17);
  EXPECT_EQ(read("-1"), 0);
  EXPECT_EQ(read("0"), 0);
  EXPECT_EQ(read("2147483647"), kCountSlack);
  EXPECT_EQ(model.host.texts.size(), 1U);
}

TEST_F(AdResult, HotStartFilesFollowTheAreas) {
  results.hotStarts.at(1).title = "first";
  areas.SetNoAreas(3);
  EXPECT_EQ(results.hotStarts.GetCount(), 3);
  areas.SetNoAreas(2);
  EXPECT_EQ(results.hotStarts.GetCount(), 2);
  EXPECT_EQ(results.hotStarts.at(1).title, "first");
}

TEST_F(AdResult, Sizes) {
  model.root.nadComponent->SetCount(3);
  EXPECT_EQ(results.OutputSizeMB(), 0);
  TransportOutput& output = newOutput();
  output.part = {{0, 10, 2}, {0, 9, 3}};
  output.steps = {0, 100, 30};
  // 6 x 4 points, 3 intervals: 4 steps of 3 components, and 1.
  EXPECT_FLOAT_EQ(results.OutputSizeMB(), static_cast<float>(6 * 4 * (4 * 3 + 1) * 4 / 1048576.0));
  newOutput() = output;
  EXPECT_FLOAT_EQ(results.OutputSizeMB(), static_cast<float>(2 * 6 * 4 * (4 * 3 + 1) * 4 / 1048576.0));
  EXPECT_EQ(results.HotStartSizeMB(), 0);
  results.generateHotStart = true;
  // An area counts one point more each way.
  EXPECT_DOUBLE_EQ(results.HotStartSizeMB(), 13 * 11 * 3 * 4 / 1048576.0);
}

TEST_F(AdResult, ASizeIsANumberForAnyRange) {
  using Limits = std::numeric_limits<std::int32_t>;
  TransportOutput& output = newOutput();
  output.part = {{Limits::min(), Limits::max(), 0}, {Limits::max(), Limits::min(), -1}};
  output.steps = {0, 10, 0};
  EXPECT_TRUE(std::isfinite(results.OutputSizeMB()));
}

TEST_F(AdResult, CountsIntoAllThatAModelWrites) {
  newOutput();
  results.generateHotStart = true;
  model.root.nhdResult->generateHotStart = true;
  const double alone = model.root.nhdResult->TotalSizeMB();
  model.root.moduleSelection->simulationType = module::kAdvectionDispersion;
  EXPECT_DOUBLE_EQ(model.root.nhdResult->TotalSizeMB(),
                   alone + double{results.OutputSizeMB()} + 13 * 11 * 4 / 1048576.0);
}

class AdResultChecks : public AdResult {
 protected:
  std::vector<std::string> faults() {
    const ValidationList messages = test::messagesOf(results, 0);
    EXPECT_EQ(test::messagesOf(results, 1), messages);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::adResult);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  using Texts = std::vector<std::string>;
  TransportOutput& output = newOutput();
  const std::string outside = "Grid point out of range";
  const std::string negative = "First point coordinates can not be negative";
  const std::string behind = "The first point is greater than the last";
  const std::string interval = "Intervals must be greater or equal to 1";
};

TEST_F(AdResultChecks, AnOutputThatIsRight) {
  EXPECT_EQ(faults(), Texts{});
}

TEST_F(AdResultChecks, ItsFileName) {
  output.file = "";
  EXPECT_EQ(faults(), (Texts{"Filename:  is not valid", "Wrong dimension of output file"}));
}

TEST_F(AdResultChecks, ItsArea) {
  output.areaNumber = 2;
  EXPECT_EQ(faults(), (Texts{"Assostiated area is does not exist", outside, outside}));
}

TEST_F(AdResultChecks, ItsRanges) {
  output.part = {{0, 12, 1}, {0, 9, 1}};
  EXPECT_EQ(faults(), Texts{outside});
  output.part = {{0, 11, 1}, {0, 10, 1}};
  EXPECT_EQ(faults(), Texts{outside});
  output.part = {{-1, 11, 1}, {-1, 9, 1}};
  EXPECT_EQ(faults(), (Texts{negative, negative}));
  output.part = {{0, 11, 0}, {0, 9, -1}};
  EXPECT_EQ(faults(), (Texts{interval, interval}));
  output.part = {{6, 5, 1}, {6, 5, 1}};
  EXPECT_EQ(faults(), (Texts{behind, behind}));
}

TEST_F(AdResultChecks, ItsTimeSteps) {
  output.steps = {-1, 100, 1};
  EXPECT_EQ(faults(), Texts{"First time step can not be negative"});
  output.steps = {0, 100, 0};
  EXPECT_EQ(faults(), Texts{"Time step interval must be greater or equal to 1"});
  output.steps = {6, 5, 1};
  EXPECT_EQ(faults(), Texts{"The first time step is greater than the last"});
  output.steps = {0, 101, 1};
  EXPECT_EQ(faults(), Texts{"Last timestep out of range"});
}

TEST_F(AdResultChecks, TheKindOfTheFileFollowsFromTheExtent) {
  const auto fits = [this](const USubArea& part, const char* file) {
    output.part = part;
    output.file = file;
    const Texts found = faults();
    if (!found.empty()) EXPECT_EQ(found, Texts{"Wrong dimension of output file"});
    return found.empty();
  };
  const USubArea point{{5, 5, 1}, {3, 3, 1}};
  const USubArea lineInX{{0, 11, 1}, {3, 3, 1}};
  const USubArea lineInY{{5, 5, 1}, {0, 9, 1}};
  const USubArea map{{0, 11, 1}, {0, 9, 1}};
  for (const char* extension : {"a.tsb0", "a.tb0"}) {
    EXPECT_TRUE(fits(point, extension));
    EXPECT_FALSE(fits(lineInX, extension));
    EXPECT_FALSE(fits(map, extension));
  }
  for (const char* extension : {"a.tsb1", "a.tb1"}) {
    EXPECT_TRUE(fits(lineInX, extension));
    EXPECT_TRUE(fits(lineInY, extension));
    EXPECT_FALSE(fits(point, extension));
    EXPECT_FALSE(fits(map, extension));
  }
  for (const char* extension : {"a.tsb2", "a.tb2"}) {
    EXPECT_TRUE(fits(map, extension));
    EXPECT_FALSE(fits(point, extension));
    EXPECT_FALSE(fits(lineInY, extension));
  }
  EXPECT_FALSE(fits(map, "a.dat"));
}

TEST_F(AdResultChecks, SeventeenAreTooMany) {
  while (results.outputs.GetCount() < 16) newOutput();
  EXPECT_EQ(faults(), Texts{});
  for (const int count : {17, 18}) {
    newOutput();
    ASSERT_EQ(results.outputs.GetCount(), count);
    EXPECT_EQ(faults(), Texts{"Illegal number of output areas, should be between 0 and 18"});
  }
}

TEST_F(AdResultChecks, HotStartFilesAreCheckedWhereTheyAreWritten) {
  areas.SetNoAreas(2);
  results.hotStarts.at(1).file = "h.tsb2";
  EXPECT_EQ(faults(), Texts{});
  results.generateHotStart = true;
  output.file = "a.dat";
  EXPECT_EQ(faults(), (Texts{"Wrong dimension of output file", "Filename:  is not valid"}));
}

}  // namespace advection_dispersion_result_test
}  // namespace gridbay
