#include "advection_dispersion/starting_conditions.h"

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "core/edition.h"
#include "platform/tsb/tsb_writer.h"
#include "tests/support/pages.h"
#include "tests/support/starting_conditions.h"

namespace gridbay {
namespace advection_dispersion_starting_conditions_test {

using test::hotSpec;
using test::Model;
using test::savedText;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

// A hot start file: the named components, and behind them an item whose cells from the second on are the
// types.
struct HotFileSpec {
  Texts names = {"Salt", "Coli", "Heat"};
  std::vector<float> types = {0, 1, 2};
  bool hasTypeItem = true;
  std::size_t noJ = 12;
  std::size_t noK = 10;
  double spacing = 100;
  int dataType = 2;
  std::size_t steps = 1;
};

void writeHotFile(const std::string& path, const HotFileSpec& spec) {
  TsbDefinition definition;
  definition.dataType = spec.dataType;
  definition.time.count = spec.steps;
  definition.axes = {{spec.noJ, 0, spec.spacing, "m"}, {spec.noK, 0, spec.spacing, "m"}};
  for (const std::string& name : spec.names) definition.items.push_back({name, 100201, "mg l-1"});
  if (spec.hasTypeItem) definition.items.push_back({"Types"});
  Result<TsbWriter> writer = TsbWriter::create(path, definition);
  ASSERT_TRUE(writer) << writer.error();
  for (std::size_t step = 0; step < spec.steps; ++step) {
    for (std::size_t item = 1; item <= definition.items.size(); ++item) {
      // The first cell of the types is not used; other items and steps hold what is no type.
      std::vector<float> values(definition.pointCount(), 35.5F);
      if (item > spec.names.size() && step == 0) std::ranges::copy(spec.types, values.begin() + 1);
      ASSERT_TRUE(writer->write(item, step, std::span<const float>(values)));
    }
  }
  const Outcome written = writer->commit();
  ASSERT_TRUE(written) << written.error();
}

class AdStart : public test::StartingConditions<CNadStartingConditionsKvs, &CGlobalKvs::nadStartingConditions,
                                                PageId::adStartingConditions> {
 protected:
  Texts names() {
    Texts all;
    for (int number = 1; number <= components.GetCount(); ++number) all.push_back(components.at(number).name);
    return all;
  }
  std::vector<int> types() {
    std::vector<int> all;
    for (int number = 1; number <= components.GetCount(); ++number) all.push_back(components.at(number).type);
    return all;
  }

  CNadComponentKvs& components = *root.nadComponent;
};

TEST_F(AdStart, ANewOneIsColdAndHasNoFault) {
  EXPECT_FALSE(start.hotStart);
  EXPECT_TRUE(faults().empty());
}

TEST_F(AdStart, IsReadBackInAHotModel) {
  const std::string text =
      "STARTING_CONDITIONS {\n"
      "    Hot_Start #true\n"
      "    Start_AD_at_HD_Time_Step 3\n"
      "    End_AD_at_HD_Time_Step 77\n"
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
      "}\n";
  model.root.bathymetry->SetNoAreas(2);
  model.root.bathymetry->hotStart = 1;
  test::load(start, text);
  EXPECT_TRUE(start.hotStart);
  EXPECT_EQ(start.firstStep, 3);
  EXPECT_EQ(start.lastStep, 77);
  EXPECT_EQ(savedText(start), text);
}

TEST_F(AdStart, InAColdModelAFileLoadsCold) {
  start.hotStart = true;
  test::load(start, "STARTING_CONDITIONS { Hot_Start #true; Start_AD_at_HD_Time_Step 4 }");
  EXPECT_FALSE(start.hotStart);
  EXPECT_EQ(start.firstStep, 4);
  model.root.bathymetry->hotStart = 1;
  test::load(start, "STARTING_CONDITIONS { Hot_Start #true }");
  EXPECT_TRUE(start.hotStart);
  test::load(start, "STARTING_CONDITIONS { Start_AD_at_HD_Time_Step 5 }");
  EXPECT_TRUE(start.hotStart);
  test::load(start, "STARTING_CONDITIONS { Hot_Start #false }");
  EXPECT_FALSE(start.hotStart);
}

TEST_F(AdStart, WhatTheFileLacksStays) {
  start.GetItem(1)->file = "old.tsb2";
  start.lastStep = 7;
  model.root.bathymetry->hotStart = 1;
  start.hotStart = true;
  test::load(start, "OTHER {}");
  EXPECT_TRUE(start.hotStart);
  for (const char* text : {"STARTING_CONDITIONS {}", "STARTING_CONDITIONS { AREA_1 {} }",
                           "STARTING_CONDITIONS { AREA_1 { DATA_FILE {} }; AREA_2 { DATA_FILE {} } }"}) {
    test::load(start, text);
    EXPECT_EQ(start.GetItem(1)->file.text(), "old.tsb2") << text;
    EXPECT_EQ(start.lastStep, 7) << text;
    EXPECT_EQ(start.GetCount(), 1) << text;
  }
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(AdStart, FollowsTheAreas) {
  start.GetItem(1)->file = "a.tsb2";
  model.root.bathymetry->SetNoAreas(3);
  EXPECT_EQ(start.GetCount(), 3);
  EXPECT_EQ(start.GetItem(1)->file.text(), "a.tsb2");
  EXPECT_TRUE(start.GetItem(3)->file.empty());
  model.root.bathymetry->SetNoAreas(1);
  EXPECT_EQ(start.GetCount(), 1);
}

TEST_F(AdStart, TheTimeSteps) {
  checkTimeSteps();
}

TEST_F(AdStart, AColdStartAsksForNoFile) {
  start.GetItem(1)->file = "none.tsb2";
  EXPECT_TRUE(faults().empty());
  start.hotStart = true;
  EXPECT_TRUE(faults(0).empty());
  EXPECT_EQ(faults(), Texts{notValid("none.tsb2")});
}

TEST_F(AdStart, TheFileOfArea1TellsTheComponents) {
  begin();
  components.at(1).type = -2;
  writeHotFile(path, {});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(names(), (Texts{"Salt", "Coli", "Heat"}));
  EXPECT_EQ(types(), (std::vector{0, 1, 2}));
  EXPECT_THAT(faults(), IsEmpty());
  writeHotFile(path, {.names = {"Only"}, .types = {1}});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(names(), Texts{"Only"});
  EXPECT_EQ(types(), std::vector{1});
}

TEST_F(AdStart, TheFirstTimeStepAloneIsRead) {
  begin();
  writeHotFile(path, {.steps = 3});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(types(), (std::vector{0, 1, 2}));
}

TEST_F(AdStart, ACellThatIsNoTypeLeavesTheTypeAsItWas) {
  begin();
  components.SetCount(2);
  components.at(2).type = -2;
  writeHotFile(path, {.types = {0, 3, 2}});
  const ValidationList told = messages();
  EXPECT_EQ(told, (ValidationList{{PageId::adStartingConditions,
                                   "Component 2 in file " + path + " is not a valid type",
                                   Severity::dependedUpon}}));
  EXPECT_EQ(names(), (Texts{"Salt", "Coli", "Heat"}));
  EXPECT_EQ(types(), (std::vector{0, -2, 2}));
}

TEST_F(AdStart, TypesAreCutToWholeNumbers) {
  begin();
  writeHotFile(path, {.names = {"A", "B", "C", "D"}, .types = {0.9F, 1.99F, 2.5F, -0.5F}});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(types(), (std::vector{0, 1, 2, 0}));
  const float nan = std::numeric_limits<float>::quiet_NaN();
  const float infinity = std::numeric_limits<float>::infinity();
  for (const float bad : {3.0F, -1.0F, -2.0F, 1e30F, nan, infinity, -infinity}) {
    writeHotFile(path, {.names = {"A", "B"}, .types = {1, bad}});
    EXPECT_EQ(faults(), Texts{"Component 2 in file " + path + " is not a valid type"}) << bad;
    EXPECT_EQ(types(), (std::vector{1, 1})) << bad;
  }
}

TEST_F(AdStart, AFileWithoutTheTypesHasItsLastComponentForThem) {
  begin();
  writeHotFile(path, {.hasTypeItem = false});
  EXPECT_EQ(faults(), (Texts{"Component 1 in file " + path + " is not a valid type",
                             "Component 2 in file " + path + " is not a valid type"}));
  EXPECT_EQ(names(), (Texts{"Salt", "Coli"}));
}

TEST_F(AdStart, FewerCellsThanComponents) {
  begin();
  setArea(1, 3, 3, 100);
  HotFileSpec spec{.types = {0, 0, 0, 0, 0, 0, 0, 0}, .noJ = 3, .noK = 3};
  for (int i = 3; i < 10; ++i) spec.names.push_back("More");
  writeHotFile(path, spec);
  EXPECT_EQ(faults(), (Texts{"Component 9 in file " + path + " is not a valid type",
                             "Component 10 in file " + path + " is not a valid type"}));
  EXPECT_EQ(components.GetCount(), 10);
}

TEST_F(AdStart, ABadFileLeavesTheListUntouched) {
  components.at(1).name = "Mine";
  test::GridSpec good = hotSpec({});
  good.items = 3;
  checkBadFiles(good, [this](const std::string& why) { EXPECT_EQ(names(), Texts{"Mine"}) << why; });
  begin();
  writeHotFile(path, {.names = {"Salt"}, .hasTypeItem = false});
  EXPECT_EQ(messages(), refusal(path)) << "a single item";
  EXPECT_EQ(names(), Texts{"Mine"});
}

TEST_F(AdStart, OtherAreasMustHaveWhatArea1Tells) {
  model.root.bathymetry->SetNoAreas(2);
  setArea(2, 7, 7, 50);
  begin();
  const std::string second = folder.file("second.tsb2");
  start.GetItem(2)->file = second;
  writeHotFile(path, {});
  const HotFileSpec inner{.noJ = 7, .noK = 7, .spacing = 50};
  writeHotFile(second, inner);
  // One component before, three behind the check of area 1.
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(names(), (Texts{"Salt", "Coli", "Heat"}));

  HotFileSpec other = inner;
  other.names = {"X", "Y"};
  other.types = {2, 2};
  writeHotFile(second, other);
  EXPECT_EQ(faults(), Texts{notValid(second)});
  other.names = {"X", "Y", "Z"};
  writeHotFile(second, other);
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(names(), (Texts{"Salt", "Coli", "Heat"}));  // of area 1 alone
  EXPECT_EQ(types(), (std::vector{0, 1, 2}));

  start.GetItem(1)->file = "none.tsb2";
  EXPECT_EQ(faults(), Texts{notValid("none.tsb2")});
}

TEST_F(AdStart, HotFilesComeBehindTheTimeStepsAndInAreaOrder) {
  model.root.bathymetry->SetNoAreas(2);
  start.hotStart = true;
  start.GetItem(1)->file = "hot1.tsb2";
  start.firstStep = -5;
  start.lastStep = -9;
  EXPECT_EQ(faults(),
            (Texts{"First time step can not be negative", "The first time step is greater than the last",
                   notValid("hot1.tsb2"), notValid("")}));
}

TEST_F(AdStart, WhileTheGridIsUnknownAnyExtentWillDo) {
  begin();
  setArea(1, 0, 0, 0);
  writeHotFile(path, {.noJ = 5, .noK = 4});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_EQ(names(), (Texts{"Salt", "Coli", "Heat"}));
}

TEST_F(AdStart, TheCheckOfTheModelSetsTheComponentsBeforeTheyAreChecked) {
  model.root.moduleSelection->simulationType = module::kAdvectionDispersion;
  test::writeGrid(folder.file("a.tsb2"), {.noJ = 12, .noK = 10, .dx = 100, .dy = 100});
  model.root.bathymetry->GetArea(1)->fileName = folder.file("a.tsb2");
  components.SetCount(17);
  begin();
  writeHotFile(path, {});
  const Texts told = test::textsOf(test::messagesOf(model.root));
  EXPECT_THAT(told, testing::Not(testing::Contains(HasSubstr("Components"))));
  EXPECT_EQ(names(), (Texts{"Salt", "Coli", "Heat"}));
}

TEST_F(AdStart, CopyingTakesFlagStepsAndFiles) {
  start.hotStart = true;
  start.firstStep = 3;
  start.GetItem(1)->file = "/x/y.tsb2";
  Model other;
  other.root.nadStartingConditions->CopyFrom(start);
  EXPECT_EQ(savedText(*other.root.nadStartingConditions), savedText(start));
}

// What the check changes is announced, and can be taken back.
class AdHotStartInADocument : public test::PageTest {
 protected:
  test::TemporaryFolder folder;
};

TEST_F(AdHotStartInADocument, TheNewListIsShownAndIsAStepOfItsOwn) {
  const std::string path = folder.file("hot.tsb2");
  writeHotFile(path, {});
  root().moduleSelection->simulationType = module::kAdvectionDispersion;
  root().nadStartingConditions->hotStart = true;
  root().nadStartingConditions->GetItem(1)->file = path;
  document.RecordEdit(PageId::adStartingConditions, "before");
  open("CNadComponentDlg");
  EXPECT_EQ(grid().GetRowCount(), 1);
  ValidationList messages;
  document.ValidateData(messages);
  EXPECT_EQ(grid().GetRowCount(), 3);
  EXPECT_EQ(cell(2, 1), "Coli");
  EXPECT_EQ(cell(2, 2), "Decaying");
  EXPECT_EQ(text("Number of Components"), "3");
  ASSERT_NE(document.UndoStep(), nullptr);
  EXPECT_EQ(document.UndoStep()->name, "Validation");
  document.Undo();
  EXPECT_EQ(grid().GetRowCount(), 1);
  EXPECT_EQ(cell(1, 1), "Component 1");
  EXPECT_EQ(document.UndoStep()->name, "before");
  document.Redo();
  EXPECT_EQ(grid().GetRowCount(), 3);
  document.ValidateData(messages);
  document.Undo();
  EXPECT_EQ(document.UndoStep()->name, "before");  // a check that changes nothing is no step
}

}  // namespace advection_dispersion_starting_conditions_test
}  // namespace gridbay
