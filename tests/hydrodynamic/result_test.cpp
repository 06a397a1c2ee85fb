#include "hydrodynamic/result.h"

#include <gmock/gmock.h>

#include <limits>

#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/resistance.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/pages.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_result_test {

using test::Model;
using test::savedText;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using Items = std::vector<std::int32_t>;
using Points = std::vector<double>;
using Texts = std::vector<std::string>;

// A model of one area of 12 by 10 points.
class HdResult : public ::testing::Test {
 protected:
  HdResult() {
    area().noJ = 12;
    area().noK = 10;
  }
  CBathymetryObjectKvs& area() { return *model.root.bathymetry->GetArea(1); }
  CNhdResultKvs& results() { return *model.root.nhdResult; }
  CNhdResultObjectKvs& output(int number = 1) {
    if (results().outputs.GetCount() < number) results().outputs.SetCount(number);
    return results().outputs.at(number);
  }
  // A map of all, with a file name that fits.
  CNhdResultObjectKvs& cleanMap() {
    output().file = "a.tsb2";
    return output();
  }
  void load(const std::string& keywords) {
    test::load(results(),
               "OUTPUT_SPECIFICATION {\nNumber_Of_Output_areas 1\nOUTPUT_AREA_1 {\n" + keywords + "\n}\n}");
  }
  Texts faults() {
    ValidationList messages;
    const unsigned count = results().Validate(messages, 1);
    EXPECT_EQ(count, messages.size());
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::hdResult);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  // The items after a save of these.
  Items itemsSaved(Items items, std::int32_t infiltration, std::int32_t formulation = 0) {
    model.root.nhdInfiltration->infiltrationType = infiltration;
    model.root.nhdResistance->formulation = formulation;
    output().items = std::move(items);
    savedText(results());
    return output().items;
  }

  Model model;
};

const std::string kNewTail =
    "    Generate_Hotstart #false\n"
    "    HOTSTART_FILES {\n"
    "        AREA_1 {\n"
    "            Title \"\"\n"
    "            File_Name (result)\"\"\n"
    "        }\n"
    "    }\n"
    "    INUNDATION_STATISTICS {\n"
    "        IncludeInundationStatistics #false\n"
    "        InundationFileName (result)\"\"\n"
    "        InundationFileStoreStep 0\n"
    "        DurationAboveThreshold #false\n"
    "        ThresholdHeight 0.0\n"
    "    }\n"
    "}\n";

const std::string kFilled =
    "OUTPUT_SPECIFICATION {\n"
    "    Number_Of_Output_areas 2\n"
    "    OUTPUT_AREA_1 {\n"
    "        Type 1\n"
    "        X_Range_And_Interval 1 10 2\n"
    "        Y_Range_And_Interval 4 4 3\n"
    "        Area_no 1\n"
    "        First_Time_Step 5\n"
    "        Last_Time_Step 95\n"
    "        Time_Step_interval 10\n"
    "        Output_item 2\n"
    "        ITEM_NUMBERS 13 4\n"
    "        Title \"flood\"\n"
    "        File_Name (result)\"out/flood.tsb1\"\n"
    "    }\n"
    "    OUTPUT_AREA_2 {\n"
    "        Type 0\n"
    "        Number_Of_Points 2\n"
    "        X_Range_And_Interval 1.0 2.5\n"
    "        Y_Range_And_Interval 4.0 6.0625\n"
    "        Area_no 1\n"
    "        First_Time_Step 0\n"
    "        Last_Time_Step 100\n"
    "        Time_Step_interval 1\n"
    "        Output_item 3\n"
    "        ITEM_NUMBERS 1 2 3\n"
    "        Title \"gauges\"\n"
    "        File_Name (result)\"gauges.tsb0\"\n"
    "    }\n"
    "    Generate_Hotstart #true\n"
    "    HOTSTART_FILES {\n"
    "        AREA_1 {\n"
    "            Title \"outer\"\n"
    "            File_Name (result)\"hot1.tsb2\"\n"
    "        }\n"
    "        AREA_2 {\n"
    "            Title \"inner\"\n"
    "            File_Name (result)\"hot/2.tsb2\"\n"
    "        }\n"
    "    }\n"
    "    INUNDATION_STATISTICS {\n"
    "        IncludeInundationStatistics #true\n"
    "        InundationFileName (result)\"max.tsb2\"\n"
    "        InundationFileStoreStep 12\n"
    "        DurationAboveThreshold #true\n"
    "        ThresholdHeight 0.25\n"
    "    }\n"
    "}\n";

TEST_F(HdResult, ANewOneHasAllSectionsAndNoOutput) {
  EXPECT_EQ(savedText(results()), "OUTPUT_SPECIFICATION {\n    Number_Of_Output_areas 0\n" + kNewTail);
}

TEST_F(HdResult, ANewOutputIsOfAllThereIs) {
  output();
  EXPECT_EQ(savedText(results()),
            "OUTPUT_SPECIFICATION {\n"
            "    Number_Of_Output_areas 1\n"
            "    OUTPUT_AREA_1 {\n"
            "        Type 2\n"
            "        X_Range_And_Interval 0 11 1\n"
            "        Y_Range_And_Interval 0 9 1\n"
            "        Area_no 1\n"
            "        First_Time_Step 0\n"
            "        Last_Time_Step 100\n"
            "        Time_Step_interval 1\n"
            "        Output_item 3\n"
            "        ITEM_NUMBERS 1 2 3\n"
            "        Title \"\"\n"
            "        File_Name (result)\"\"\n"
            "    }\n" +
                kNewTail);
  EXPECT_EQ(output().pointsJ, Points{0});
  EXPECT_EQ(output().pointsK, Points{0});
}

TEST_F(HdResult, WhatIsWrittenIsRead) {
  model.root.bathymetry->SetCount(2);
  test::load(results(), kFilled);
  EXPECT_EQ(savedText(results()), kFilled);
  EXPECT_EQ(output(1).part, (USubArea{{1, 10, 2}, {4, 4, 3}}));
  EXPECT_EQ(output(2).pointsK, (Points{4, 6.0625}));
  EXPECT_EQ(output(2).part, (USubArea{{0, 11, 1}, {0, 9, 1}}));
  EXPECT_TRUE(results().durationAboveThreshold);
  EXPECT_EQ(results().thresholdHeight, 0.25F);
}

TEST_F(HdResult, ACopyAndTheExactStateHoldAll) {
  model.root.bathymetry->SetCount(2);
  test::load(results(), kFilled);
  Model other;
  other.root.nhdResult->CopyFrom(results());
  EXPECT_EQ(savedText(*other.root.nhdResult), kFilled);
  EXPECT_TRUE(other.root.nhdResult->SameState(results()));
  other.root.nhdResult->outputs.at(1).pointsJ = {7};  // not on file with a range
  EXPECT_FALSE(other.root.nhdResult->SameState(results()));
  other.root.nhdResult->AssignState(results());
  EXPECT_TRUE(other.root.nhdResult->SameState(results()));
}

TEST_F(HdResult, HotStartsFollowTheAreas) {
  results().hotStarts.at(1).title = "outer";
  model.root.bathymetry->SetCount(3);
  ASSERT_EQ(results().hotStarts.GetCount(), 3);
  EXPECT_EQ(results().hotStarts.at(1).title, "outer");
  EXPECT_EQ(results().hotStarts.at(3).title, "");
  EXPECT_TRUE(results().hotStarts.at(3).file.empty());
  model.root.bathymetry->SetCount(0);
  EXPECT_EQ(results().hotStarts.GetCount(), 0);
}

TEST_F(HdResult, ALoadDropsTheOutputsThereWere) {
  output(2);
  test::load(results(), "OTHER {}");
  EXPECT_EQ(results().outputs.GetCount(), 0);
  output(2);
  test::load(results(), "OUTPUT_SPECIFICATION { Generate_Hotstart #true }");
  EXPECT_EQ(results().outputs.GetCount(), 0);
  EXPECT_TRUE(results().generateHotStart);
}

TEST_F(HdResult, AnOutputWithoutASectionIsAsNew) {
  test::load(results(),
             "OUTPUT_SPECIFICATION { Number_Of_Output_areas 2; OUTPUT_AREA_1 { Type 1; Title \"a\" } }");
  ASSERT_EQ(results().outputs.GetCount(), 2);
  EXPECT_EQ(output(1).title, "a");
  CNhdResultObjectKvs fresh(&results());
  fresh.TakeWhole();
  EXPECT_TRUE(output(2).SameState(fresh));
  EXPECT_THAT(model.host.texts, IsEmpty());
}

TEST_F(HdResult, CountsThatAreNone) {
  test::load(results(), "OUTPUT_SPECIFICATION { Number_Of_Output_areas -3; OUTPUT_AREA_1 {} }");
  EXPECT_EQ(results().outputs.GetCount(), 0);
  test::load(results(), "OUTPUT_SPECIFICATION { Number_Of_Output_areas \"2\"; OUTPUT_AREA_1 {} }");
  EXPECT_EQ(results().outputs.GetCount(), 0);
  EXPECT_THAT(model.host.texts, IsEmpty());
  test::load(results(), "OUTPUT_SPECIFICATION { Number_Of_Output_areas 2000000000; OUTPUT_AREA_1 {} }");
  EXPECT_EQ(results().outputs.GetCount(), 1 + kCountSlack);
  ASSERT_EQ(model.host.texts.size(), 1U);
  EXPECT_THAT(model.host.texts[0], HasSubstr("2000000000"));
}

TEST_F(HdResult, HotStartFilesBeyondTheAreasAreLeftOut) {
  results().hotStarts.at(1).title = "kept";
  test::load(results(), "OUTPUT_SPECIFICATION { HOTSTART_FILES { AREA_2 { Title \"b\" } } }");
  ASSERT_EQ(results().hotStarts.GetCount(), 1);
  EXPECT_EQ(results().hotStarts.at(1).title, "kept");
}

TEST_F(HdResult, AreaIsAlwaysTheFirst) {
  load("Type 2\nArea_no 3");
  EXPECT_THAT(savedText(results()), HasSubstr("Area_no 1\n"));
}

TEST_F(HdResult, ATypeThatIsMissingIsToldFromTheRanges) {
  load("X_Range_And_Interval 5 5 1\nY_Range_And_Interval 3 3 1");
  EXPECT_EQ(output().type, 0);
  EXPECT_EQ(output().pointsJ, Points{5});
  EXPECT_EQ(output().pointsK, Points{3});
  load("X_Range_And_Interval 5 5 1\nY_Range_And_Interval 3 4 1");
  EXPECT_EQ(output().type, 1);
  load("X_Range_And_Interval 5 7 2\nY_Range_And_Interval 3 4 1");
  EXPECT_EQ(output().type, 2);
  EXPECT_EQ(output().part, (USubArea{{5, 7, 2}, {3, 4, 1}}));
  EXPECT_EQ(output().pointsJ, Points{0});
}

TEST_F(HdResult, PointsKeepAListThatIsMissing) {
  load("Type 0\nY_Range_And_Interval 4.0 7.25");
  EXPECT_EQ(output().pointsJ, Points{0});
  EXPECT_EQ(output().pointsK, (Points{4, 7.25}));
  EXPECT_EQ(output().PointCount(), 1);
}

TEST_F(HdResult, ListsOfUnequalLengthAreKeptWhole) {
  load("Type 0\nNumber_Of_Points 9\nX_Range_And_Interval 1.0 2.0 99.0\nY_Range_And_Interval 4.0");
  EXPECT_EQ(output().PointCount(), 1);
  EXPECT_THAT(savedText(results()),
              HasSubstr("Number_Of_Points 1\n        X_Range_And_Interval 1.0 2.0 99.0\n"
                        "        Y_Range_And_Interval 4.0\n"));
  output().file = "a.tsb0";
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(HdResult, ATypeBelow0ReadsNoRangeAndWritesPoints) {
  load("Type -1\nX_Range_And_Interval 5 7 1\nY_Range_And_Interval 3 4 1");
  EXPECT_EQ(output().part, (USubArea{{0, 11, 1}, {0, 9, 1}}));
  EXPECT_THAT(savedText(results()),
              HasSubstr("Type -1\n        Number_Of_Points 1\n        X_Range_And_Interval 0.0\n"
                        "        Y_Range_And_Interval 0.0\n        Area_no 1\n"));
}

TEST_F(HdResult, ItemsAreAsManyAsCounted) {
  load("Output_item 3\nITEM_NUMBERS 4");
  EXPECT_EQ(output().items, (Items{4, 2, 3}));
  load("Output_item 2\nItem_Numbers 4 5 6");
  EXPECT_EQ(output().items, (Items{4, 5}));
  load("Output_item 5\nITEM_NUMBERS 9");
  EXPECT_EQ(output().items, (Items{9, 2, 3, 4, 5}));
  load("Output_item 4");
  EXPECT_EQ(output().items, (Items{1, 2, 3, 4}));
  load("Output_item 0\nITEM_NUMBERS 4 5");
  EXPECT_THAT(output().items, IsEmpty());
  load("ITEM_NUMBERS 4 5");
  EXPECT_EQ(output().items, (Items{1, 2, 3}));
  load("Output_item -2\nITEM_NUMBERS 4 5");
  EXPECT_EQ(output().items, (Items{1, 2, 3}));
  load("Output_item 2000000000\nITEM_NUMBERS 4 5");
  EXPECT_EQ(output().items.size(), 2U + kCountSlack);
  load("Output_item \"3\"\nITEM_NUMBERS \"x\" 5");
  EXPECT_EQ(output().items, (Items{1, 2, 3}));
}

TEST_F(HdResult, ManningNumbersAreForWaveInducedResistanceAlone) {
  const Items items{1, 14, 2, 14};
  EXPECT_EQ(itemsSaved(items, 2, 2), items);
  EXPECT_EQ(itemsSaved(items, 2, 0), (Items{1, 2, 14})) << "one at a time";
  EXPECT_EQ(itemsSaved(items, 2, 1), (Items{1, 2, 14}));
  EXPECT_EQ(itemsSaved({14}, 2, 0), Items{});
}

TEST_F(HdResult, WithoutInfiltrationItsItemsGo) {
  EXPECT_EQ(itemsSaved({15, 16, 1}, 0), Items{1});
  EXPECT_EQ(itemsSaved({15, 1, 16}, 0), Items{1});
  EXPECT_EQ(itemsSaved({1, 16}, 0), Items{1});
  EXPECT_EQ(itemsSaved({16}, 0), Items{});
  EXPECT_EQ(itemsSaved({1, 16, 15}, 0), (Items{1, 15})) << "what takes the place of another is passed over";
  EXPECT_EQ(itemsSaved({15, 15}, 0), Items{15});
  EXPECT_EQ(itemsSaved({1, 15, 2}, 0), (Items{1, 2}));
  EXPECT_EQ(itemsSaved({}, 0), Items{});
}

TEST_F(HdResult, ANetRateHasNoSaturation) {
  EXPECT_EQ(itemsSaved({15, 16, 1, 15}, 1), (Items{16, 1}));
  EXPECT_EQ(itemsSaved({15, 15, 1}, 1), (Items{15, 1}));
  EXPECT_EQ(itemsSaved({1, 15}, 1), Items{1});
  EXPECT_EQ(itemsSaved({15, 16, 1}, 2), (Items{15, 16, 1}));
}

TEST_F(HdResult, SaturationThatIsLastCannotBeSavedWithoutInfiltration) {
  for (const Items& items : {Items{1, 15}, Items{15}, Items{2, 15, 15, 15}}) {
    if (items.size() < 4) EXPECT_THROW(itemsSaved(items, 0), std::invalid_argument);
  }
  EXPECT_EQ(output().items, Items{}) << "that of the last of them is gone";
  EXPECT_NO_THROW(itemsSaved({1, 15}, 1));
  EXPECT_NO_THROW(itemsSaved({1, 15}, 2));
}

TEST_F(HdResult, AnObjectOutsideOfAModelKeepsItsItems) {
  CNhdResultObjectKvs alone(nullptr);
  alone.items = {14, 15};
  EXPECT_THAT(savedText(alone), HasSubstr("ITEM_NUMBERS 14 15\n"));
}

// One document, from the edit to the disk.
class SavedResult : public ::testing::Test {
 protected:
  Items& items() { return document.root().nhdResult->outputs.at(1).items; }
  void hold(Items wanted) {
    document.root().nhdResult->outputs.SetCount(1);
    items() = std::move(wanted);
    document.RecordEdit(PageId::hdResult, "items");
  }
  test::TemporaryFolder folder;
  test::TestHost host;
  CV27SetupDoc document{host};
  std::string path = folder.file("s.v27");
};

TEST_F(SavedResult, WhatASaveLeavesOutCanBeTakenBack) {
  hold({1, 14, 2});
  ASSERT_TRUE(document.OnSaveDocument(path));
  EXPECT_EQ(items(), (Items{1, 2}));
  ASSERT_NE(document.UndoStep(), nullptr);
  EXPECT_EQ(document.UndoStep()->name, "Save");
  const std::string text = test::textOf(path);
  EXPECT_THAT(text, HasSubstr("Output_item 2\n"));
  ASSERT_TRUE(document.OnSaveDocument(path));
  EXPECT_EQ(test::textOf(path), text);
  document.Undo();
  EXPECT_EQ(items(), (Items{1, 14, 2}));
}

TEST_F(SavedResult, ASaveThatCannotBeMadeLeavesTheFileWhole) {
  ASSERT_TRUE(document.OnSaveDocument(path));
  const std::string text = test::textOf(path);
  hold({1, 15});
  document.root().nhdResult->outputs.at(1).file = "wet.tsb2";
  EXPECT_FALSE(document.OnSaveDocument(path));
  EXPECT_EQ(test::textOf(path), text);
  ASSERT_EQ(host.texts.size(), 1U);
  EXPECT_EQ(
      host.texts[0],
      "The setup cannot be written: Saturation is the last item of the output \"wet.tsb2\", and there is "
      "no infiltration: such a list can't be saved. Without the item it can.");
  EXPECT_TRUE(document.IsModified());
  EXPECT_EQ(document.UndoStep()->name, "Save");  // without the item, as the model is now
  ASSERT_TRUE(document.OnSaveDocument(path));
  EXPECT_EQ(items(), Items{1});
}

TEST_F(SavedResult, TheCommandLineTellsItToo) {
  const std::string setup = folder.write(
      "c." + std::string(theEdition.fileKind),
      "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE { OUTPUT_SPECIFICATION { Number_Of_Output_areas 1; "
      "OUTPUT_AREA_1 { Output_item 2; ITEM_NUMBERS 1 15; File_Name (result)\"wet.tsb2\" } } } }");
  const std::string before = test::textOf(setup);
  const std::string output = "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/OUTPUT_AREA_1/";
  const test::ProgramRun failed = test::runTool({"set", setup, output + "Title=wet"});
  EXPECT_EQ(failed.status, 2);
  EXPECT_THAT(failed.err, HasSubstr("The setup cannot be written: Saturation is the last item"));
  EXPECT_EQ(test::textOf(setup), before);
  EXPECT_EQ(test::runTool({"set", setup, output + "ITEM_NUMBERS=1"}).status, 0);
  EXPECT_EQ(test::runTool({"get", setup, output + "Output_item"}).out, "1\n");
}

TEST_F(SavedResult, KeywordsByTheirPaths) {
  const std::string setup = folder.write("c." + std::string(theEdition.fileKind),
                                         "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE { OUTPUT_SPECIFICATION { "
                                         "Number_Of_Output_areas 1; OUTPUT_AREA_1 { Type 2 } } } }");
  const std::string output = "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/OUTPUT_AREA_1/";
  const auto set = [&](const std::string& setting) {
    return test::runTool({"set", setup, output + setting}).status;
  };
  const auto get = [&](const std::string& keyword) {
    return test::runTool({"get", setup, output + keyword}).out;
  };
  EXPECT_EQ(set("X_Range_And_Interval=2,8,3"), 0);
  EXPECT_EQ(get("X_Range_And_Interval"), "2 8 3\n");
  EXPECT_NE(set("Area_no=2"), 0);
  EXPECT_NE(set("Number_Of_Points=2"), 0) << "a map has none";
  EXPECT_EQ(set("Type=0"), 0);
  EXPECT_EQ(set("X_Range_And_Interval=2,8.5,3"), 0);
  EXPECT_EQ(set("Y_Range_And_Interval=1,2"), 0);
  EXPECT_EQ(get("X_Range_And_Interval"), "2.0 8.5 3.0\n");
  EXPECT_EQ(get("Number_Of_Points"), "2\n");
  EXPECT_NE(set("Number_Of_Points=3"), 0) << "it follows from the lists";
  EXPECT_EQ(set("Output_item=5"), 0);
  EXPECT_EQ(get("ITEM_NUMBERS"), "1 2 3 4 5\n");
  EXPECT_EQ(set("ITEM_NUMBERS=7"), 0);
  EXPECT_EQ(get("Output_item"), "1\n");
  EXPECT_NE(set("Output_item=2000000000"), 0);
}

TEST_F(HdResult, OutputsThatFit) {
  EXPECT_THAT(faults(), IsEmpty());
  cleanMap();
  EXPECT_THAT(faults(), IsEmpty());
  output().file = "a.tb2";
  EXPECT_THAT(faults(), IsEmpty());
  output().file = "atb2";
  EXPECT_THAT(faults(), IsEmpty());
  output().part.x.first = 11;
  output().file = "a.tb1";
  EXPECT_THAT(faults(), IsEmpty());
  output().part.y = {3, 3, 1};
  output().file = "a.tsb0";
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(HdResult, EachTestOfARange) {
  const std::string outside = "Grid point out of range";
  const std::string negative = "First point coordinates can not be negative";
  const std::string interval = "Intervals must be greater or equal to 1";
  const std::string backwards = "The first point is greater than the last";
  struct Case {
    std::function<void(CNhdResultObjectKvs&)> change;
    Texts expected;
  };
  const std::vector<Case> cases{
      {[](auto& o) { o.file = ""; }, {"Filename:  is not valid", "Wrong dimension of output file"}},
      {[](auto& o) { o.file = "out/"; }, {"Filename: out/ is not valid", "Wrong dimension of output file"}},
      {[](auto& o) { o.part.x.last = 12; }, {outside}},
      {[](auto& o) { o.part.y.last = 10; }, {outside}},
      {[](auto& o) { o.part.x.first = -1; }, {negative}},
      {[](auto& o) { o.part.y.first = -1; }, {negative}},
      {[](auto& o) { o.part.x.interval = 0; }, {interval}},
      {[](auto& o) { o.part.y.interval = -2; }, {interval}},
      {[](auto& o) {
         o.part.x = {5, 4, 1};
       },
       {backwards}},
      {[](auto& o) {
         o.part.y = {5, 4, 1};
       },
       {backwards}},
      {[](auto& o) { o.steps.first = -1; }, {"First time step can not be negative"}},
      {[](auto& o) { o.steps.interval = 0; }, {"Time step interval must be greater or equal to 1"}},
      {[](auto& o) {
         o.steps = {50, 49, 1};
       },
       {"The first time step is greater than the last"}},
      {[](auto& o) { o.steps.last = 101; }, {"Last timestep out of range"}},
      {[](auto& o) { o.file = "a.TSB2"; }, {"Wrong dimension of output file"}},
      {[](auto& o) {
         o.part.x = {3, 3, 1};
       },
       {"Wrong dimension of output file"}},
      {[](auto& o) {
         o.part = {{3, 3, 1}, {3, 3, 1}};
       },
       {"Wrong dimension of output file"}},
      {[](auto& o) { o.type = -1; }, {}},
  };
  for (std::size_t i = 0; i < cases.size(); ++i) {
    results().outputs.SetCount(0);
    cases[i].change(cleanMap());
    EXPECT_EQ(faults(), cases[i].expected) << i;
  }
}

TEST_F(HdResult, TestsComeInTheirOrder) {
  CNhdResultObjectKvs& all = cleanMap();
  all.file = "";
  all.part = {{13, 12, 0}, {-1, 10, 0}};
  all.steps = {2000, 1500, 0};
  EXPECT_EQ(faults(),
            (Texts{"Filename:  is not valid", "Grid point out of range", "Grid point out of range",
                   "First point coordinates can not be negative", "Intervals must be greater or equal to 1",
                   "Intervals must be greater or equal to 1", "The first point is greater than the last",
                   "Time step interval must be greater or equal to 1",
                   "The first time step is greater than the last", "Last timestep out of range",
                   "Wrong dimension of output file"}));
}

TEST_F(HdResult, WithoutAnAreaThereIsNoGridToBeIn) {
  cleanMap();
  model.root.bathymetry->SetCount(0);
  EXPECT_EQ(faults(), (Texts{"Assostiated area is does not exist", "Grid point out of range",
                             "Grid point out of range"}));
}

TEST_F(HdResult, AnAreaThatHasNotBeenReadHasNoPoints) {
  area().noJ = 0;
  area().noK = 0;
  cleanMap();
  EXPECT_EQ(output().part, (USubArea{{0, -1, 1}, {0, -1, 1}}));
  const std::string backwards = "The first point is greater than the last";
  EXPECT_EQ(faults(), (Texts{backwards, backwards}));
}

TEST_F(HdResult, PointsHaveTheirOwnTests) {
  CNhdResultObjectKvs& points = cleanMap();
  points.type = 0;
  points.steps = {5, -9, 0};
  points.pointsJ = {};
  points.pointsK = {};
  EXPECT_THAT(faults(), IsEmpty());
  points.pointsJ = {0, 11, 11.5, -0.5};
  points.pointsK = {9, 0, 10, 3};
  EXPECT_EQ(faults(),
            (Texts{"Grid point out of range", "Grid point out of range", "Grid point out of range"}));
  points.file = "";
  points.pointsJ = {0};
  EXPECT_EQ(faults(), Texts{"Filename:  is not valid"});
}

TEST_F(HdResult, HotStartFilesAreCheckedWhereTheyAreWritten) {
  model.root.bathymetry->SetCount(2);
  results().hotStarts.at(1).file = "hot.tsb2";
  results().hotStarts.at(2).file = "hot/";
  EXPECT_THAT(faults(), IsEmpty());
  results().generateHotStart = true;
  EXPECT_EQ(faults(), Texts{"Filename: hot/ is not valid"});
  output().file = "";
  EXPECT_EQ(faults().front(), "Filename:  is not valid") << "outputs come first";
  ValidationList messages;
  EXPECT_EQ(results().Validate(messages, 0), 3U) << "with and without depth";
}

// Megabytes of so many values of 4 bytes.
double megabytes(double values) {
  return values * 4 * 9.536743e-7;
}

TEST_F(HdResult, SizeOfAMap) {
  EXPECT_EQ(results().OutputSizeMB(), 0);
  cleanMap();
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), megabytes((3 * 101 + 1) * 12 * 10));
  output().part = {{0, 11, 5}, {2, 9, 3}};
  output().steps = {10, 90, 20};
  output().items = {1};
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), megabytes((1 * 4 + 1) * 2 * 2));
  output().part.x.interval = 0;
  output().part.y.interval = 0;
  output().steps.interval = 0;
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), megabytes((1 * 81 + 1) * 12 * 8));
}

TEST_F(HdResult, SizeOfPoints) {
  cleanMap().type = 0;
  output().pointsJ = {1, 2, 3};
  output().pointsK = {1, 2};
  output().steps = {10, 90, 20};
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), megabytes((3 * 5 + 1) * 2));
  output().steps.interval = 0;
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), megabytes((3 * 81 + 1) * 2));
  output(2).items = {1};
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), megabytes((3 * 81 + 1) * 2) + megabytes((1 * 101 + 1) * 120));
}

TEST_F(HdResult, SizesOfExtremeNumbersAreNoError) {
  using Limits = std::numeric_limits<std::int32_t>;
  for (const std::int32_t type : {0, 2}) {
    output().type = type;
    for (const std::int32_t interval : {-1, 0, 1, Limits::min()}) {
      const USubLine line{Limits::min(), Limits::max(), interval};
      output().part = {line, line};
      output().steps = line;
      EXPECT_TRUE(std::isfinite(results().OutputSizeMB()));
    }
  }
}

TEST_F(HdResult, TheOverlandGridCountsWhereEveryPointIsWritten) {
  test::TemporaryFolder folder;
  test::GridSpec fine;
  fine.noJ = 24;
  fine.noK = 30;
  fine.dx = 15;
  fine.dy = 10;
  test::writeGrid(folder.file("fine.tsb2"), fine);
  area().dx = 30;
  area().dy = 30;
  cleanMap().items = {1};
  output().steps = {0, 0, 1};
  const double coarse = megabytes(2 * 120);
  model.root.bathymetry->overlandFile = folder.file("fine.tsb2");
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), coarse);
  model.root.bathymetry->overlandSolver = true;
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), 6 * coarse);
  output().part.x.interval = 2;
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), coarse / 2);
  output().part.x.interval = 1;
  model.root.bathymetry->overlandFile = folder.file("none.tsb2");
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), coarse);
  test::writeSeries(folder.file("series.tsb0"), {}, 100000, "m");
  model.root.bathymetry->overlandFile = folder.file("series.tsb0");
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), coarse);
  model.root.bathymetry->overlandFile = folder.file("fine.tsb2");
  model.root.bathymetry->SetCount(0);
  EXPECT_DOUBLE_EQ(results().OutputSizeMB(), coarse);
}

TEST_F(HdResult, SizeOfHotStartFiles) {
  EXPECT_EQ(results().HotStartSizeMB(), 0);
  results().generateHotStart = true;
  const double one = model.root.bathymetry->EstimateSizeMB(1);
  ASSERT_GT(one, 0);
  EXPECT_DOUBLE_EQ(results().HotStartSizeMB(), 8 * one);
  model.root.areaDescription->enableFloodAndDryChecking = 0;
  EXPECT_DOUBLE_EQ(results().HotStartSizeMB(), 7 * one);
  cleanMap();
  EXPECT_DOUBLE_EQ(results().TotalSizeMB(), results().OutputSizeMB() + 7 * one);
  results().generateHotStart = false;
  EXPECT_DOUBLE_EQ(results().TotalSizeMB(), results().OutputSizeMB());
}

// A root beside whose hydrodynamics another module runs.
class RootWithModule final : public ModelRoot, public BasicParts, public HydrodynamicParts {
 public:
  RootWithModule() : ModelRoot(nullptr) {
    bathymetry = std::make_unique<CBathymetryKvs>(this);
    simulationPeriod = std::make_unique<CSimulationPeriodKvs>(this);
    areaDescription = std::make_unique<CAreaDescriptionKvs>(this);
    nhdResult = std::make_unique<CNhdResultKvs>(this);
  }
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
  void TellFollowers(const CKvsBase&, std::span<const int>) override {}
  ModuleOutput OutputOfModule() override { return {2.5, 4}; }
};

TEST(TotalSize, HasWhatTheModuleBesideWrites) {
  RootWithModule root;
  root.bathymetry->SetCount(1);
  const double one = root.bathymetry->EstimateSizeMB(1);
  EXPECT_DOUBLE_EQ(root.nhdResult->TotalSizeMB(), 2.5 + 4 * one);
  root.nhdResult->generateHotStart = true;
  EXPECT_DOUBLE_EQ(root.nhdResult->TotalSizeMB(), 2.5 + (8 + 4) * one);
  EXPECT_DOUBLE_EQ(root.nhdResult->HotStartSizeMB(), 8 * one);
}

}  // namespace hydrodynamic_result_test
}  // namespace gridbay
