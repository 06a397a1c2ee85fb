// Outputs with their items, lines and mass files.

#include "mud_transport_expanded/result.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/mass_budget.h"
#include "hydrodynamic/result.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/line_discharge.h"
#include "mud_transport_expanded/mass_budget.h"
#include "mud_transport_expanded/task_selection.h"
#include "tests/support/model.h"

namespace gridbay {
namespace mud_transport_expanded_result_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

class ExpandedResult : public ::testing::Test {
 protected:
  ExpandedResult() {
    CBathymetryObjectKvs& area = *root.bathymetry->GetArea(1);
    area.noJ = 12;
    area.noK = 10;
    area.grid = CVdArray2D<float>(12, 10);
  }
  CNmtExpResultObjectKvs& output() { return results.outputs.at(1); }
  void choose(const std::string& keyword, bool on = true) {
    const std::vector<ExpOutputItem> items = expOutputItems(output().layers, output().fractions);
    for (std::size_t i = 0; i < items.size(); ++i) {
      if (items[i].keyword == keyword) {
        output().items[i] = on ? 1 : 0;
        return;
      }
    }
    ADD_FAILURE() << keyword;
  }
  Texts chosen() {
    Texts keywords;
    const std::vector<ExpOutputItem> items = expOutputItems(output().layers, output().fractions);
    for (std::size_t i = 0; i < items.size(); ++i) {
      if (output().items[i] != 0) keywords.push_back(items[i].keyword);
    }
    return keywords;
  }

  test::Model model;
  CGlobalKvs& root = model.root;
  CNmtExpResultKvs& results = *root.nmtExpResult;
  CNmtExpTaskSelectionKvs& task = *root.nmtExpTaskSelection;
};

TEST_F(ExpandedResult, AnOutputInFileOrder) {
  task.SetCounts(2, 1, true);
  root.nmtExpForcings->includeWaves = 1;
  results.outputs.SetCount(1);
  output().title = "bay";
  output().file = "/case/o.tsb2";
  for (const char* item : {"Salinity", "Bed_Mass_Layer_2_Fraction_1", "Total_Ssc", "Wave_Period"})
    choose(item);
  const std::string text = savedText(results);
  EXPECT_EQ(text,
            "OUTPUT_SPECIFICATION {\n"
            "    Number_Of_Output_areas 1\n"
            "    OUTPUT_AREA_1 {\n"
            "        X_Range_And_Interval 0 11 1\n"
            "        Y_Range_And_Interval 0 9 1\n"
            "        Area_no 1\n"
            "        First_Time_Step 0\n"
            "        Last_Time_Step 100\n"
            "        Time_Step_Interval 1\n"
            "        Title \"bay\"\n"
            "        File_Name (result)\"o.tsb2\"\n"
            "        MAIN_OUTPUT_ITEMS {\n"
            "            Salinity #true\n"
            "            SSC_Fraction_1 #false\n"
            "            Bed_Mass_Layer_1_Fraction_1 #false\n"
            "            Bed_Mass_Layer_2_Fraction_1 #true\n"
            "        }\n"
            "        DERIVED_OUTPUT_ITEMS {\n"
            "            Bed_Thickness_Layer_1 #false\n"
            "            Bed_Thickness_Layer_2 #false\n"
            "            Net_Deposition_Fraction_1 #false\n"
            "            Net_Deposition_Accumulated_Fraction_1 #false\n"
            "            Net_Deposition_Accumulated_Total #false\n"
            "            Total_Bed_Thickness_Change #false\n"
            "            Total_Bed_Mass_Change #false\n"
            "            Total_Ssc #true\n"
            "        }\n"
            "        PROCESS_OUTPUT_ITEMS {\n"
            "            Bed_Shear_Stress #false\n"
            "            Fall_Velocity_Fraction_1 #false\n"
            "            Deposition_Fraction_1 #false\n"
            "            Erosion_Fraction_1 #false\n"
            "            U_Velocity #false\n"
            "            V_Velocity #false\n"
            "            Wave_Height #false\n"
            "            Wave_Period #true\n"
            "            Wave_Direction #false\n"
            "        }\n"
            "        NoOfComponents 4\n"
            "    }\n"
            "    Generate_Hotstart #false\n"
            "    HOTSTART_FILES {\n"
            "        AREA_1 {\n"
            "            Title \"\"\n"
            "            File_Name (result)\"\"\n"
            "        }\n"
            "    }\n"
            "}\n");
  test::Model other;
  other.root.nmtExpTaskSelection->SetCounts(2, 1, true);
  other.root.nmtExpForcings->includeWaves = 1;
  test::load(*other.root.nmtExpResult, text);
  EXPECT_EQ(savedText(*other.root.nmtExpResult), text);
}

TEST_F(ExpandedResult, WhatTheModelHasNotIsTheNumber0) {
  results.outputs.SetCount(1);
  choose("Salinity");
  choose("Wave_Height");
  choose("U_Velocity");
  const std::string text = savedText(results);
  EXPECT_THAT(text, HasSubstr("Salinity 0\n"));
  EXPECT_THAT(text, HasSubstr("Wave_Height 0\n            Wave_Period 0\n            Wave_Direction 0\n"));
  EXPECT_THAT(text, HasSubstr("NoOfComponents 1\n"));
  task.SetSalinity(true);
  EXPECT_THAT(savedText(results), HasSubstr("Salinity #true\n"));
}

TEST_F(ExpandedResult, ItemsFollowTheLayersAndFractions) {
  results.outputs.SetCount(1);
  EXPECT_THAT(chosen(), IsEmpty());
  task.SetCounts(2, 2, false);
  choose("SSC_Fraction_2");
  choose("Bed_Mass_Layer_1_Fraction_1");
  choose("Bed_Mass_Layer_2_Fraction_2");
  choose("Wave_Direction");
  task.SetCounts(3, 2, false);
  EXPECT_THAT(chosen(), ElementsAre("SSC_Fraction_2", "Bed_Mass_Layer_1_Fraction_1",
                                    "Bed_Mass_Layer_2_Fraction_2", "Wave_Direction"));
  task.SetCounts(3, 1, false);
  EXPECT_THAT(chosen(), ElementsAre("Bed_Mass_Layer_1_Fraction_1", "Wave_Direction"));
  EXPECT_EQ(output().items.size(), expOutputItems(3, 1).size());
}

TEST_F(ExpandedResult, ItemsByTheirPaths) {
  results.outputs.SetCount(1);
  const auto access = [this](PathAccess::What what, const char* path, const char* text) {
    const KvsHandle file = test::fileOf(text);
    const std::string documentPath;
    PathAccess it{.what = what, .in = &file->tree().root(), .documentPath = &documentPath};
    return results.AccessPath(std::string("OUTPUT_SPECIFICATION/OUTPUT_AREA_1/") + path, it);
  };
  constexpr auto kSet = PathAccess::What::set;
  EXPECT_TRUE(access(kSet, "PROCESS_OUTPUT_ITEMS/U_Velocity", "U_Velocity #true"));
  EXPECT_TRUE(access(kSet, "NoOfComponents", "NoOfComponents 9"));
  EXPECT_THAT(chosen(), ElementsAre("U_Velocity"));
  EXPECT_TRUE(access(PathAccess::What::look, "MAIN_OUTPUT_ITEMS", ""));
  EXPECT_FALSE(access(PathAccess::What::look, "MAIN_OUTPUT_ITEMS/U_Velocity", ""));
}

TEST_F(ExpandedResult, AnOutputIsCheckedAndHasAnItem) {
  results.outputs.SetCount(1);
  ValidationList messages = test::messagesOf(results, 0);
  for (const CMessage& message : messages) EXPECT_EQ(message.page, PageId::mtExpResult);
  EXPECT_EQ(test::textsOf(messages), (Texts{"Filename:  is not valid", "Wrong dimension of output file",
                                            "Number of output components should be different from 0"}));
  output().file = "o.tsb2";
  choose("Wave_Height");  // which it does not have
  EXPECT_EQ(test::textsOf(test::messagesOf(results)),
            Texts{"Number of output components should be different from 0"});
  choose("Total_Ssc");
  EXPECT_THAT(test::messagesOf(results), IsEmpty());
  output().part.x = {5, 99, 0};
  EXPECT_EQ(test::textsOf(test::messagesOf(results)),
            (Texts{"Grid point out of range", "Intervals must be greater or equal to 1"}));
  results.outputs.SetCount(0);
  results.generateHotStart = true;
  messages = test::messagesOf(results);
  EXPECT_EQ(messages, (ValidationList{{PageId::mtExpResult, "Filename:  is not valid"}}));
}

TEST_F(ExpandedResult, TooManyOutputs) {
  results.outputs.SetCount(17);
  EXPECT_EQ(test::messagesOf(results).front(),
            (CMessage{PageId::mtExpResult, "Illegal number of output areas, should be between 0 and 18"}));
}

TEST_F(ExpandedResult, SizesGoByTheChosenItems) {
  results.outputs.SetCount(1);
  EXPECT_FLOAT_EQ(results.OutputSizeMB(), 120.0F * 4 / 1048576);
  choose("Total_Ssc");
  choose("U_Velocity");
  EXPECT_FLOAT_EQ(results.OutputSizeMB(), 120.0F * (101 * 2 + 1) * 4 / 1048576);
  EXPECT_EQ(results.hotStartItems(), 0);
  task.SetCounts(2, 3, true);
  results.generateHotStart = true;
  EXPECT_EQ(results.hotStartItems(), 10);  // salinity, three fractions, and six masses
  root.moduleSelection->simulationType = module::kMudTransportExpanded;
  EXPECT_EQ(root.OutputOfModule().hotStartItems, 0);  // only those of dissolved and of mud transport count
  EXPECT_FLOAT_EQ(static_cast<float>(root.OutputOfModule().megabytes), results.OutputSizeMB());
  task.includeXenobiotics = true;
  EXPECT_FLOAT_EQ(static_cast<float>(root.OutputOfModule().megabytes), 2 * results.OutputSizeMB());
}

TEST_F(ExpandedResult, HotStartOnlyWithThatOfTheFlow) {
  results.generateHotStart = true;
  EXPECT_THAT(savedText(results), HasSubstr("Generate_Hotstart #false\n"));
  root.nhdResult->generateHotStart = true;
  EXPECT_THAT(savedText(results), HasSubstr("Generate_Hotstart #true\n"));
  root.bathymetry->SetNoAreas(3);
  EXPECT_EQ(results.hotStarts.GetCount(), 3);
}

TEST_F(ExpandedResult, ALineInFileOrder) {
  task.SetCounts(1, 2, true);
  CNmtExpLineDischargeKvs& lines = *root.nmtExpLineDischarge;
  lines.SetCount(1);
  lines.at(1).first = {2, 3};
  lines.at(1).steps = {5, 50, 1};
  lines.at(1).file = "/case/l.tsb0";
  lines.at(1).title = "mouth";
  lines.at(1).entries = {1, 0, 1};
  const std::string text = savedText(lines);
  EXPECT_EQ(text,
            "MT_LINE_DISCHARGE_CALCULATIONS {\n"
            "    No_Of_MT_Discharge_Lines 1\n"
            "    MT_DISCHARGE_LINE_1 {\n"
            "        Area_Number 1\n"
            "        Start_Coordinate 2 3\n"
            "        End_Coordinate 11 9\n"
            "        Start_Time_Step 5\n"
            "        End_Time_Step 50\n"
            "        File_Name (result)\"l.tsb0\"\n"
            "        Title \"mouth\"\n"
            "        Component_Numbers 1 3\n"
            "        No_of_Components_in_Calc 2\n"
            "    }\n"
            "}\n");
  lines.SetCount(0);
  test::load(lines, text);
  EXPECT_THAT(lines.at(1).entries, ElementsAre(1, 0, 1));
  EXPECT_EQ(lines.at(1).steps, (USubLine{0, 100, 1}));  // the period is looked for under older names
  test::load(lines,
             "MT_LINE_DISCHARGE_CALCULATIONS { No_Of_MT_Discharge_Lines 1\n"
             " MT_DISCHARGE_LINE_1 { First_Time_Step 3; Last_Time_Step 7 } }");
  EXPECT_EQ(lines.at(1).steps, (USubLine{3, 7, 1}));
}

TEST_F(ExpandedResult, LinesAreCheckedForTheirPages) {
  CNmtExpLineDischargeKvs& lines = *root.nmtExpLineDischarge;
  lines.SetCount(11);
  EXPECT_EQ(test::messagesOf(lines, 0),
            (ValidationList{{PageId::mtExpResult,
                             "Illegal number of line discharge lines, should be between 0 and 10"}}));
  lines.SetCount(1);
  lines.at(1).areaNumber = 2;
  lines.at(1).steps = {9, 8, 1};
  const PageId page = PageId::mtExpLineDischarge;
  EXPECT_EQ(test::messagesOf(lines),
            (ValidationList{{page, "Data file  \" \"  is not valid"},
                            {page, "Line is not embedded in a valid area"},
                            {page, "The first time step is greater than the last"}}));
}

TEST_F(ExpandedResult, AMassFileInFileOrder) {
  task.SetCounts(1, 2, false);
  CNmtExpMassBudgetKvs& masses = *root.nmtExpMassBudget;
  masses.SetCount(1);
  MassFile& file = *masses.GetMassFile(1);
  EXPECT_THAT(file.entries, ElementsAre(1));
  EXPECT_THAT(file.variables, ElementsAre(0, 0, 0));
  file.polygon = 2;
  file.file = "/case/m.tsb0";
  file.title = "basin";
  file.entries = {0, 1};
  file.variables = {1, 0, 1};
  const std::string text = savedText(masses);
  EXPECT_EQ(text,
            "MASS_BUDGET {\n"
            "    NoOfMassFiles 1\n"
            "    MASS_FILE_1 {\n"
            "        AssociatedPolygon 2\n"
            "        TRange 0 100 1\n"
            "        FILE_NAME (result)\"m.tsb0\"\n"
            "        Title \"basin\"\n"
            "        SIMPLE_COMPONENTS {\n"
            "            NoOfSimpleComponents 1\n"
            "            ComponentNumbers 2\n"
            "        }\n"
            "        TotalNoOfComponentsAndVariables 3\n"
            "        BULK_VARIABLES {\n"
            "            Total_Suspended_Mass #true\n"
            "            Total_Bed_Mass #false\n"
            "            Total_Mass #true\n"
            "        }\n"
            "    }\n"
            "}\n");
  masses.SetCount(0);
  test::load(masses, text);
  EXPECT_EQ(savedText(masses), text);
}

TEST_F(ExpandedResult, AMassFileIsCheckedAndHasAnItem) {
  CNmtExpMassBudgetKvs& masses = *root.nmtExpMassBudget;
  masses.SetCount(1);
  MassFile& file = *masses.GetMassFile(1);
  file.entries = {0};
  file.steps = {5, 2, 1};
  const ValidationList messages = test::messagesOf(masses);
  for (const CMessage& message : messages) EXPECT_EQ(message.page, PageId::mtExpMassBudget);
  EXPECT_EQ(test::textsOf(messages), (Texts{"Invalid polygon", "TRange is out of range", "No item selected",
                                            "No output file specified"}));
  root.massBudget->SetNoPolygons(1);
  file.steps = {0, 2, 1};
  file.file = "m.tsb0";
  file.variables[NmtExpMassFile::kTotal] = 1;
  EXPECT_THAT(test::messagesOf(masses), IsEmpty());
  test::load(masses, "MASS_BUDGET { NoOfMassFiles 2; MASS_FILE_1 {} }");
  EXPECT_EQ(
      model.host.texts,
      Texts{"Error in the KVS-FILE\nThe number of Mass Budget Polygons does not correspond to the number "
            "specified"});
}

}  // namespace mud_transport_expanded_result_test
}  // namespace gridbay
