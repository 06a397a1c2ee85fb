// Names of files that move with a setup, and outputs that find room.

#include "advection_dispersion/result.h"
#include "basic/module_selection.h"
#include "ecology/results.h"
#include "hydrodynamic/result.h"
#include "mud_transport_expanded/result.h"
#include "tests/advice/advice_fixture.h"

namespace gridbay {
namespace advice_files_test {

using ::testing::HasSubstr;

class FileFixTest : public test::AdviceTest {
 protected:
  test::TemporaryFolder elsewhere;
};

TEST_F(FileFixTest, WhatCantBeReadIsLeftToTheCheck) {
  std::filesystem::create_directory(elsewhere.file("folder.tsb2"));
  for (const std::string& name :
       {std::string("/elsewhere/fine.tsb2"), elsewhere.file("folder.tsb2"), std::string("/"),
        elsewhere.path().string() + "/", folder.path().string() + "/../.."}) {
    SCOPED_TRACE(name);
    isSilent({[&] { model->bathymetry->overlandFile = name; },
              [&] {
                model->nhdResult->outputs.SetCount(1);
                model->nhdResult->outputs.GetItem(1)->file = name.ends_with("tsb2") ? "" : name;
              }});
  }
}

TEST_F(FileFixTest, WhatIsWrittenAndReadStaysOneFile) {
  const auto both = [&] {
    model->nhdResult->outputs.SetCount(1);
    model->nhdResult->outputs.GetItem(1)->file = elsewhere.file("both.tsb2");
    model->bathymetry->overlandFile = elsewhere.file("both.tsb2");
  };
  const std::string outside = "both.tsb2 lies outside of the setup's folder. It is named 1 more time.";
  speaks({{"file-name", outside, "Write and read both.tsb2 in the setup's folder", both}});
  // With what it holds by now.
  elsewhere.write("both.tsb2", "held");
  speaks({{"file-name", outside, "Copy both.tsb2 into the setup's folder, and write it there", both}});
  folder.write("both.tsb2", "other");
  speaks({{"file-name", outside, "Copy both.tsb2 into the setup's folder as both_2.tsb2, and write it there",
           both}});
  clean();
  both();
  ASSERT_TRUE(makeFix(*model, look().at(0).fix, path));
  EXPECT_EQ(model->nhdResult->outputs.GetItem(1)->file.text(), "both_2.tsb2");
  EXPECT_EQ(model->bathymetry->overlandFile.text(), "both_2.tsb2");
  EXPECT_EQ(test::textOf(folder.file("both_2.tsb2")), "held");
}

TEST_F(FileFixTest, ACopyForWhichThereIsNoRoomChangesNothing) {
  std::filesystem::create_directory(folder.file("small"));
  const test::SmallDisk disk(folder.file("small"), 16384);
  if (!disk.mounted()) GTEST_SKIP() << "no file system can be mounted here";
  path = folder.file("small/setup.v27");
  model->bathymetry->SetNoAreas(0);
  elsewhere.write("fine.tsb2", std::string(1 << 20, 'x'));
  model->bathymetry->overlandFile = elsewhere.file("fine.tsb2");
  for (const Advice& advice : look()) {
    if (advice.kind != "file-name") continue;
    EXPECT_EQ(advice.fix.name, "Copy fine.tsb2 into the setup's folder");
    const std::string before = saved();
    const Outcome made = makeFix(*model, advice.fix, path);
    ASSERT_FALSE(made);
    EXPECT_THAT(made.error(), HasSubstr("No space left on device"));
    EXPECT_EQ(saved(), before);
    EXPECT_TRUE(std::filesystem::is_empty(folder.file("small")));
    return;
  }
  FAIL() << "no advice on the file";
}

class OutputFixTest : public test::AdviceTest {
 protected:
  OutputFixTest() { fixesByTool = false; }  // which asks the disk itself

  void room(double megabytes) {
    advisor.setFreeMegabytes([megabytes](const std::string&) { return megabytes; });
  }
  // A map of 31 by 31 points at each step.
  void flow() {
    model->nhdResult->outputs.SetCount(1);
    CNhdResultObjectKvs& output = *model->nhdResult->outputs.GetItem(1);
    output.part = {{0, 30, 1}, {0, 30, 1}};
    output.steps = {0, 360, 1};
  }
  void both() {
    flow();
    model->moduleSelection->simulationType = module::kAdvectionDispersion;
    model->nadResult->outputs.SetCount(1);
    TransportOutput& output = *model->nadResult->outputs.GetItem(1);
    output.part = {{0, 30, 1}, {0, 30, 1}};
    output.steps = {0, 360, 1};
  }
  void hotStarts() {
    model->nhdResult->generateHotStart = true;
    ValidationList messages;
    for (int number : {1, 2}) model->bathymetry->GetArea(number)->ReadGrid(messages, number);
  }
};

TEST_F(OutputFixTest, EverMoreUntilItFits) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "it has the flow alone";
  both();
  const double whole = model->nhdResult->TotalSizeMB();
  const double ofFlow = model->nhdResult->OutputSizeMB();
  const double ofModule = whole - ofFlow;
  ASSERT_GT(ofModule, 1);
  room(whole - ofFlow / 2);
  speaks({{"output-size", "has room for", "Write less often", [this] { both(); }}});
  room(whole / 4);
  speaks({{"output-size", "has room for", "Write less often, the flow and the module", [this] { both(); }}});
  room(0.024);
  speaks({{"output-size", "has room for", "Write the last time step alone", [this] { both(); }}});
  room(0.01);
  speaks({{"output-size", "has room for", "Write the last time step alone, at fewer points",
           [this] { both(); }}});
  room(0);
  speaks({{"output-size", "has room for", "Write no outputs", [this] { both(); }}});
  clean();
  both();
  room(whole / 4);
  ASSERT_TRUE(makeFix(*model, look().at(0).fix, path));
  EXPECT_EQ(model->nhdResult->outputs.GetItem(1)->steps, (USubLine{0, 360, 5}));
  EXPECT_EQ(model->nadResult->outputs.GetItem(1)->steps, (USubLine{0, 360, 5}));
  clean();
  both();
  room(0.01);
  ASSERT_TRUE(makeFix(*model, look().at(0).fix, path));
  EXPECT_EQ(model->nhdResult->outputs.GetItem(1)->steps, (USubLine{360, 360, 1}));
  EXPECT_EQ(model->nhdResult->outputs.GetItem(1)->part.x, (USubLine{0, 30, 2}));
  // Of the module alone.
  speaks({{"output-size", "has room for", "Write the module less often", [&] {
             both();
             model->nhdResult->outputs.SetCount(0);
             room(ofModule / 2);
           }}});
}

TEST_F(OutputFixTest, HotStartFilesOfAllModules) {
  flow();
  const double outputs = model->nhdResult->TotalSizeMB();
  hotStarts();
  const double whole = model->nhdResult->TotalSizeMB();
  ASSERT_GT(whole, outputs);
  const auto hot = [this] {
    flow();
    hotStarts();
  };
  room(outputs);
  speaks({{"output-size", "has room for", "Write less often", hot}});
  room((whole - outputs) * 0.9);
  speaks({{"output-size", "has room for", "Write no hot start files, and outputs less often", hot}});
  speaks({{"output-size", "has room for", "Write no hot start files", [this] { hotStarts(); }}});
  room(0.001);
  speaks({{"output-size", "has room for",
           "Write the last time step alone, at fewer points, and no hot start files", hot}});
  room(0);
  speaks({{"output-size", "has room for", "Write no outputs, and no hot start files", hot}});
  if (theEdition.wetlandSweepKit) return;
  // Those of modules that the page of results leaves out.
  for (const std::int32_t code : {module::kMudTransportExpanded, module::kEcological}) {
    SCOPED_TRACE(code);
    clean();
    hotStarts();
    model->moduleSelection->simulationType = code;
    model->nmtExpResult->generateHotStart = true;
    model->wqsResults->generateHotStart = true;
    const double further = code == module::kEcological ? model->wqsResults->HotStartSizeMB()
                                                       : model->nmtExpResult->HotStartSizeMB();
    room(model->nhdResult->TotalSizeMB() + further / 2);
    const std::vector<Advice> found = look();
    EXPECT_EQ(std::ranges::count(found, "output-size", &Advice::kind), further > 0 ? 1 : 0);
  }
}

// What goes to another disk stays as it is.
TEST_F(OutputFixTest, EachDiskForItself) {
  const std::string there = folder.file("there");
  std::filesystem::create_directory(there);
  const test::SmallDisk disk(there, 65536);
  if (!disk.mounted()) GTEST_SKIP() << "no file system can be mounted here";
  flow();
  const double size = model->nhdResult->TotalSizeMB();
  advisor.setFreeMegabytes([=](const std::string& where) { return where == there ? size / 3 : 1e9; });
  const auto two = [&] {
    flow();
    model->nhdResult->outputs.SetCount(2);
    model->nhdResult->outputs.GetItem(2)->AssignState(*model->nhdResult->outputs.GetItem(1));
    model->nhdResult->outputs.GetItem(2)->file = there + "/out.tsb2";
  };
  speaks({{"output-size", "MB to " + there + "; the disk has room for", "Write less often", two}});
  clean();
  two();
  const std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].place.thing, "output 2");
  ASSERT_TRUE(makeFix(*model, found[0].fix, path));
  EXPECT_EQ(model->nhdResult->outputs.GetItem(1)->steps.interval, 1);
  EXPECT_EQ(model->nhdResult->outputs.GetItem(2)->steps.interval, 4);
  // Where there is no room at all, what goes elsewhere stays.
  advisor.setFreeMegabytes([=](const std::string& where) { return where == there ? 0 : 1e9; });
  speaks({{"output-size", "MB to " + there, "Output 2 out", two}});
}

}  // namespace advice_files_test
}  // namespace gridbay
