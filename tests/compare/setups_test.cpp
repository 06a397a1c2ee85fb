// Whole setups beside each other: what differs in the words of the pages, merges, the commands, and a setup
// beside an open document.

#include <fmt/format.h>
#include <gmock/gmock.h>

#include <filesystem>
#include <functional>
#include <map>
#include <nlohmann/json.hpp>
#include <set>

#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "compare/document_comparison.h"
#include "compare/setup_merge.h"
#include "core/edition.h"
#include "setup/setting.h"
#include "setup/setup_path.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/pages.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace compare_setups_test {

namespace fs = std::filesystem;
using test::ProgramRun;
using test::runTool;
using ::testing::AllOf;
using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;

constexpr const char* kNames[] = {"flood.v27",      "salinity.v27",     "mud_fractions.v27",
                                  "mud_layers.v27", "expanded_mud.v27", "oxygen.v27"};
const std::string kDrying = "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth";
const std::string kFlooding = "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Flooding_Depth";
const std::string kSources = "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources";

std::string textOf(const std::optional<std::string>& value) {
  return value ? "<" + *value + ">" : "none";
}
std::string lineOf(const Difference& difference) {
  return fmt::format("{}|{}|{} {}", difference.pageName, difference.thing, textOf(difference.own),
                     textOf(difference.other));
}
std::vector<std::string> linesOf(const std::vector<Difference>& differences) {
  std::vector<std::string> lines;
  for (const Difference& difference : differences) lines.push_back(lineOf(difference));
  return lines;
}

class CompareSetups : public ::testing::Test {
 protected:
  void SetUp() override {
    test::writeGrid(folder.file("estuary.tsb2"), {.noJ = 121, .noK = 91, .dx = 90, .dy = 90});
    test::writeGrid(folder.file("inlet.tsb2"), {.noJ = 40, .noK = 31});
  }
  // A copy of a filled setup with other values.
  std::string make(const std::string& name, const std::string& from,
                   const std::vector<std::string>& settings = {}) {
    const std::string path = folder.file(name);
    fs::create_directories(fs::path(path).parent_path());
    fs::copy_file(std::string(GRIDBAY_TESTS) + "/main_job/setups/" + from, path,
                  fs::copy_options::overwrite_existing);
    SetupOnDisk setup = open(path);
    for (const std::string& text : settings) {
      const Outcome set = applySetting(setup.setup, *settingOf(text), path);
      EXPECT_TRUE(set) << set.error();
    }
    EXPECT_TRUE(setup.setup.save(path));
    return path;
  }
  static SetupOnDisk open(const std::string& path) {
    Result<SetupFile> setup = SetupFile::open(path, nullptr);
    if (!setup) throw std::runtime_error(setup.error());
    return {std::move(*setup), path};
  }
  static SetupDifference compare(const std::string& own, const std::string& other) {
    SetupOnDisk a = open(own);
    SetupOnDisk b = open(other);
    return compareSetups(a, b);
  }

  test::TemporaryFolder folder;
};

TEST_F(CompareSetups, ASetupIsTheSameAsItself) {
  for (const char* name : kNames) {
    const std::string path = make("a.v27", name);
    EXPECT_TRUE(compare(path, path).isSame()) << name;
    // Twice as a text, with file names that lead to the same files from elsewhere.
    SetupOnDisk moved = open(path);
    fs::create_directories(folder.file("deep/down"));
    ASSERT_TRUE(moved.setup.save(folder.file("deep/down/b.v27")));
    EXPECT_THAT(linesOf(compare(path, folder.file("deep/down/b.v27")).differences), IsEmpty()) << name;
  }
}

// What is taken keyword by keyword is in the end the other setup, whatever the two are.
TEST_F(CompareSetups, AllThatDiffersMakesTheOther) {
  for (const char* name : kNames) {
    const std::string own = make("a.v27", "flood.v27");
    const std::string other = make("b.v27", name);
    SetupOnDisk a = open(own);
    SetupOnDisk b = open(other);
    const KvsHandle ownFile = a.setup.tree(own);
    const KvsHandle otherFile = b.setup.tree(own);
    const SetupDifference found = compareFiles(*ownFile, *otherFile, own);
    std::set<std::string> paths;
    for (const KeywordDifference& keyword : found.keywords) paths.insert(keyword.path);
    const KvsHandle taken =
        withTaken(*ownFile, *otherFile, [&](const std::string& path) { return paths.contains(path); });
    SetupFile result = SetupFile::fromTree(test::fileOf(*taken->text()), own, nullptr);
    EXPECT_TRUE(sameNode(kvsTargetByNameNum(*result.tree(own), CGlobalKvs::kTarget, 1),
                         kvsTargetByNameNum(*otherFile, CGlobalKvs::kTarget, 1)))
        << name;
  }
}

struct WordsCase {
  const char* from;
  std::vector<std::string> settings;
  std::vector<std::string> lines;
};

TEST_F(CompareSetups, DifferencesAreTold) {
  const WordsCase cases[] = {
      {"flood.v27", {kDrying + "=0.05"}, {"Basic Parameters, Flood and Dry|Drying depth|<0.1 m> <0.05 m>"}},
      {"flood.v27",
       {"NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Enable_Flood_And_Dry_Checking=0"},
       {"|NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Enable_Flood_And_Dry_Checking|<1> <0>"}},
      {"flood.v27",
       {"NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Start_Time=2026,3,22,6,0,0"},
       {"Basic Parameters, Simulation Period|Simulation start date|<2026-03-21 06:00:00> <2026-03-22 "
        "06:00:00>"}},
      // A value that only the choice beside it shows comes with that.
      {"flood.v27",
       {"HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_3/Data_Format=1",
        "HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_3/Value=150"},
       {"Hydrodynamic Parameters, Boundary|Boundary 3, data|<Type 0 data file> <Constant>",
        "Hydrodynamic Parameters, Boundary|Boundary 3, data|<river.tsb0> <150.000000>"}},
  };
  for (const WordsCase& each : cases) {
    SCOPED_TRACE(each.settings[0]);
    const std::string own = make("a.v27", each.from);
    EXPECT_EQ(linesOf(compare(own, make("b.v27", each.from, each.settings)).differences), each.lines);
  }
}

// Entries of a list come with their count, and with what other pages say of them.
TEST_F(CompareSetups, AnEntryIsOneDifferenceOfEachPage) {
  const std::string own = make("a.v27", "flood.v27");
  const std::string other = make("b.v27", "flood.v27", {kSources + "=2"});
  const SetupDifference found = compare(own, other);
  std::vector<std::string> paths;
  for (const KeywordDifference& keyword : found.keywords) paths.push_back(keyword.path);
  EXPECT_THAT(paths, ElementsAre(kSources, "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_2",
                                 "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/SOURCE_SINK_2"));
  ASSERT_THAT(found.differences, ::testing::SizeIs(::testing::Ge(2U)));
  for (const Difference& difference : found.differences) {
    EXPECT_NE(difference.page, 0) << difference.thing;
    EXPECT_THAT(difference.keywords, Contains(kSources)) << difference.thing;
    if (difference.column == 0 && difference.row > 0)
      EXPECT_THAT(difference.keywords, ::testing::SizeIs(3)) << difference.thing;
  }
}

TEST_F(CompareSetups, VeryManyEntriesAreOneDifference) {
  const std::string own = make("a.v27", "flood.v27");
  const SetupDifference found = compare(own, make("b.v27", "flood.v27", {kSources + "=60"}));
  EXPECT_THAT(linesOf(found.differences),
              Contains("Basic Parameters, Source and Sink|Rows 2 to 60|none <59 rows>"));
}

// The text of a setup with other values of a keyword: the n-th becomes `value(n)`.
std::string withEach(std::string text, const std::string& keyword,
                     const std::function<std::string(int)>& value) {
  int n = 0;
  for (std::size_t at = text.find(keyword + ' '); at != text.npos; at = text.find(keyword + ' ', at + 1)) {
    const std::size_t from = at + keyword.size() + 1;
    text.replace(from, text.find('\n', from) - from, value(++n));
  }
  return text;
}

// Values in long lists, some with the format that shows them: each is told once, and made by its own
// keywords.
TEST_F(CompareSetups, EachOfVeryManyDifferencesIsToldOnce) {
  constexpr int kMany = 700;
  const std::string own = make("a.v27", "flood.v27", {kSources + "=" + std::to_string(kMany)});
  std::string text =
      withEach(test::textOf(own), "Constant_Magnitude", [](int n) { return fmt::format("{}.25", n); });
  text = withEach(text, "Sink_Point", [](int n) { return fmt::format("{} {}", n, n + 1); });
  text = withEach(text, "Drying_Depth", [](int) { return "0.05"; });
  const SetupDifference found = compare(own, folder.write("b.v27", text));
  EXPECT_EQ(found.keywords.size(), 2U * kMany + 1);
  std::map<std::string, int> told;
  for (const Difference& difference : found.differences) {
    EXPECT_NE(difference.page, 0) << difference.thing;
    ASSERT_FALSE(difference.keywords.empty()) << difference.thing;
    for (const std::string& path : difference.keywords) ++told[path];
    if (difference.page == 41 && difference.thing.starts_with("Magnitude"))
      EXPECT_THAT(difference.keywords,
                  ElementsAre(fmt::format("HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/SOURCE_SINK_{}/"
                                          "Constant_Magnitude",
                                          difference.row)));
  }
  EXPECT_EQ(told.size(), found.keywords.size());
  EXPECT_EQ(told[kDrying], 1);
}

// What was found before an edit spares work, and changes nothing of what is found.
TEST_F(CompareSetups, AFormerLookChangesNothing) {
  const std::string other =
      make("b.v27", "flood.v27",
           {kDrying + "=0.05", kSources + "=2", "HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_3/Value=150",
            "HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_3/Data_Format=1"});
  const SetupDifference before = compare(make("a.v27", "flood.v27"), other);
  const KvsHandle otherFile = open(other).setup.tree(other);
  for (const std::vector<std::string>& edits : std::vector<std::vector<std::string>>{
           {},
           {kFlooding + "=0.4"},
           {kDrying + "=0.05"},
           {kSources + "=2"},
           {kSources + "=3"},
           {"HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_3/Value=150"},
           {"HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_3/Data_Format=1"}}) {
    SCOPED_TRACE(::testing::PrintToString(edits));
    const std::string edited = make("c.v27", "flood.v27", edits);
    const KvsHandle own = open(edited).setup.tree(other);
    const SetupDifference whole = compareFiles(*own, *otherFile, other);
    const SetupDifference spared = compareFiles(*own, *otherFile, other, {}, &before);
    EXPECT_EQ(spared.keywords, whole.keywords);
    EXPECT_EQ(linesOf(spared.differences), linesOf(whole.differences));
    for (std::size_t i = 0; i < whole.differences.size(); ++i)
      EXPECT_EQ(spared.differences.at(i).keywords, whole.differences[i].keywords)
          << whole.differences[i].thing;
  }
}

TEST_F(CompareSetups, AFileIsWhereItLeads) {
  const std::string own = make("a.v27", "flood.v27");
  const std::string elsewhere = make("deep/b.v27", "flood.v27");
  const std::vector<std::string> lines = linesOf(compare(own, elsewhere).differences);
  EXPECT_THAT(lines, Contains(HasSubstr("<estuary.tsb2> <deep/estuary.tsb2>")));
  // As written they are the same.
  EXPECT_EQ(runTool({"diff", own, elsewhere, "--as-written"}).status, 0);
}

TEST_F(CompareSetups, OptionsAndWhatIsUnknownAreCompared) {
  const std::string own = make("a.v27", "flood.v27");
  std::string text = test::textOf(own);
  const auto put = [&](const std::string& before, const std::string& what) {
    text.replace(text.find(before), before.size(), what);
  };
  put("OPTION_PARAMETERS {}", "OPTION_PARAMETERS {\nmode 2\n}");
  put("MODULE_SELECTION {", "LATER_PART {\na 1\n}\nMODULE_SELECTION {");
  const std::string other = folder.write("b.v27", text);
  EXPECT_THAT(linesOf(compare(own, other).differences),
              ElementsAre("|NESTED_MODEL_GLOBALS/OPTION_PARAMETERS/mode|none <2>",
                          "|NESTED_MODEL_GLOBALS/LATER_PART|none <>"));
  text.replace(text.find("a 1"), 3, "a 2");
  EXPECT_THAT(linesOf(compare(other, folder.write("c.v27", text)).differences),
              ElementsAre("|NESTED_MODEL_GLOBALS/LATER_PART/a|<1> <2>"));
}

TEST_F(CompareSetups, AnotherModuleHasOtherPages) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one module";
  const SetupDifference found = compare(make("a.v27", "flood.v27"), make("b.v27", "salinity.v27"));
  const auto page = std::ranges::find_if(found.differences, [](const Difference& difference) {
    return difference.pageName == "Advection Dispersion Parameters, Component";
  });
  ASSERT_NE(page, found.differences.end()) << ::testing::PrintToString(linesOf(found.differences));
  EXPECT_EQ(lineOf(*page), page->pageName + "||none <>");
  EXPECT_THAT(page->keywords, AllOf(Contains("NESTED_MODEL_GLOBALS/MODULE_SELECTION/Simulation_Type"),
                                    Contains("ADVECTION_DISPERSION_MODULE/COMPONENT_SPECIFICATIONS")));
}

// Each keyword of a setup that a user can change is found on its page, or told by its path.
TEST_F(CompareSetups, NoDifferenceIsLost) {
  for (const char* name : kNames) {
    const std::string own = make("a.v27", "flood.v27");
    const std::string other = make("b.v27", name);
    const SetupDifference found = compare(own, other);
    std::set<std::string> told;
    for (const Difference& difference : found.differences)
      told.insert(difference.keywords.begin(), difference.keywords.end());
    for (const KeywordDifference& keyword : found.keywords)
      EXPECT_TRUE(told.contains(keyword.path)) << keyword.path;
  }
}

TEST_F(CompareSetups, TwoMakeOneOfEachModule) {
  for (const char* name : kNames) {
    MergeSources sources{open(make("base.v27", name)), open(make("a.v27", name, {kDrying + "=0.05"})),
                         open(make("b.v27", name, {kFlooding + "=0.3", kSources + "=2"}))};
    const std::string out = folder.file("out/merged.v27");
    fs::create_directories(folder.file("out"));
    const MergedTree merged = mergeSetups(sources, out, [](const MergeConflict&) { return MergeSide::own; });
    EXPECT_THAT(merged.conflicts, IsEmpty()) << name;
    // The same as a setup with all three edits, saved there.
    SetupOnDisk wanted = open(make("w.v27", name, {kDrying + "=0.05", kFlooding + "=0.3", kSources + "=2"}));
    const KvsHandle wantedFile = wanted.setup.tree(out);
    SetupFile result = SetupFile::fromTree(test::fileOf(*merged.file->text()), out, nullptr);
    EXPECT_EQ(*result.tree(out)->text(), *wantedFile->text()) << name;
  }
}

TEST_F(CompareSetups, ConflictsAreAskedInWords) {
  MergeSources sources{open(make("base.v27", "flood.v27")),
                       open(make("a.v27", "flood.v27", {kDrying + "=0.05"})),
                       open(make("b.v27", "flood.v27", {kDrying + "=0.02"}))};
  const std::string out = folder.file("out.v27");
  const MergedTree merged = mergeSetups(sources, out, [](const MergeConflict&) { return MergeSide::own; });
  const std::vector<MergeQuestion> questions =
      questionsOf(merged.conflicts, *sources.base.setup.tree(out), *sources.own.setup.tree(out),
                  *sources.other.setup.tree(out), out);
  ASSERT_EQ(questions.size(), 1U);
  EXPECT_EQ(questions[0].path, kDrying);
  EXPECT_EQ(questions[0].page, 26);
  EXPECT_EQ(questions[0].pageName, "Basic Parameters, Flood and Dry");
  EXPECT_EQ(questions[0].thing, "Drying depth");
  EXPECT_EQ(questions[0].base, "0.1 m");
  EXPECT_EQ(questions[0].own, "0.05 m");
  EXPECT_EQ(questions[0].other, "0.02 m");
}

class CompareCommands : public CompareSetups {};

TEST_F(CompareCommands, DiffSaysWhatDiffers) {
  const std::string own = make("a.v27", "flood.v27");
  const std::string other = make("b.v27", "flood.v27", {kDrying + "=0.05"});
  ProgramRun run = runTool({"diff", own, own});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(run.out, "");
  run = runTool({"diff", own, other});
  EXPECT_EQ(run.status, 1) << run.err;
  EXPECT_EQ(run.out,
            fmt::format("A: {}\nB: {}\nBasic Parameters, Flood and Dry\n  Drying depth: 0.1 m in A, 0.05 m "
                        "in B\n",
                        own, other));
  run = runTool({"diff", own, other, "--keywords"});
  EXPECT_EQ(run.out, kDrying + ": 0.1 in A, 0.05 in B\n");
  run = runTool({"diff", own, other, "--json"});
  EXPECT_EQ(run.status, 1);
  const nlohmann::json report = nlohmann::json::parse(run.out);
  EXPECT_EQ(report["keywords"],
            nlohmann::json({{{"path", kDrying}, {"section", false}, {"a", "0.1"}, {"b", "0.05"}}}));
  EXPECT_EQ(report["differences"][0]["keywords"][0], kDrying);
  EXPECT_EQ(report["differences"][0]["page"], 26);
}

TEST_F(CompareCommands, DiffTellsBadInput) {
  const std::string own = make("a.v27", "flood.v27");
  const std::string text = test::textOf(own);
  const struct {
    std::string file;
    const char* fault;
  } cases[] = {
      {folder.file("none.v27"), "none.v27"},
      {folder.write("other.v27", "SOMETHING_ELSE {}\n"), "is not a setup"},
      {folder.write("cut.v27", text.substr(0, text.size() / 2)), "cut.v27"},
      {folder.path().string(), ""},
      {folder.write("bytes.v27", std::string("\0\xff\x01", 3)), "bytes.v27"},
  };
  for (const auto& each : cases) {
    for (const std::vector<std::string>& words :
         {std::vector<std::string>{"diff", own, each.file},
          {"diff", each.file, own},
          {"merge", own, own, each.file, "-o", folder.file("out.v27")}}) {
      const ProgramRun run = runTool(words);
      EXPECT_EQ(run.status, 2) << each.file;
      EXPECT_THAT(run.err, AllOf(HasSubstr(each.fault), Not(IsEmpty())));
      EXPECT_FALSE(fs::exists(folder.file("out.v27")));
    }
  }
}

// The same, whatever its names of files are written like: by a link, a folder, or in full.
TEST_F(CompareCommands, DiffKnowsTheSame) {
  const std::string own = make("a.v27", "flood.v27");
  fs::create_directories(folder.file("deep/down"));
  SetupOnDisk moved = open(own);
  ASSERT_TRUE(moved.setup.save(folder.file("deep/down/b.v27")));
  std::string text = test::textOf(own);
  const auto put = [&](const std::string& before, const std::string& what) {
    text.replace(text.find(before), before.size(), what);
  };
  put("\"estuary.tsb2\"", '"' + folder.file("estuary.tsb2") + '"');
  fs::create_symlink(own, folder.file("link.v27"));
  for (const std::string& other : {own, folder.file("link.v27"), folder.file("deep/../a.v27"),
                                   folder.file("deep/down/b.v27"), folder.write("full.v27", text)}) {
    SCOPED_TRACE(other);
    for (const char* form : {"--json", "--keywords"}) {
      const ProgramRun run = runTool({"diff", own, other, form});
      EXPECT_EQ(run.status, 0) << run.out << run.err;
      if (std::string_view(form) == "--keywords") {
        EXPECT_EQ(run.out, "");
      } else {
        EXPECT_THAT(nlohmann::json::parse(run.out)["differences"], IsEmpty());
      }
    }
  }
}

TEST_F(CompareCommands, DiffTellsAnotherModule) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one module";
  const ProgramRun run = runTool({"diff", make("a.v27", "flood.v27"), make("b.v27", "oxygen.v27"), "--json"});
  EXPECT_EQ(run.status, 1) << run.err;
  const nlohmann::json report = nlohmann::json::parse(run.out);
  const ProgramRun plain = runTool({"diff", folder.file("a.v27"), folder.file("b.v27")});
  EXPECT_EQ(plain.status, 1);
  // What the text has stands in the report.
  for (const nlohmann::json& difference : report["differences"]) {
    const std::string thing = difference["thing"];
    EXPECT_THAT(plain.out, HasSubstr(thing.empty() ? "the page is only in" : thing));
    EXPECT_THAT(plain.out, HasSubstr(difference["page"] == 0 ? "On no page" : difference["pageName"]));
  }
  EXPECT_EQ(
      static_cast<std::size_t>(
          std::ranges::count_if(std::string_view(plain.out), [](char c) { return c == '\n'; })),
      report["differences"].size() + 2 + [&] {
        std::size_t pages = 0;
        std::string last = "none";
        for (const nlohmann::json& difference : report["differences"]) {
          const std::string name = difference["page"] == 0 ? "On no page" : difference["pageName"];
          pages += name == last ? 0 : 1;
          last = name;
        }
        return pages;
      }());
}

TEST_F(CompareCommands, DiffTellsAnotherEdition) {
  const std::string own = make("a.v27", "flood.v27");
  fs::copy_file(own, folder.file("a.v27wsk"));
  const ProgramRun run = runTool({"diff", own, folder.file("a.v27wsk")});
  EXPECT_EQ(run.status, 1);
  EXPECT_THAT(run.out, HasSubstr("Edition: v27 in A, v27wsk in B"));
}

TEST_F(CompareCommands, EditionsAreNotMerged) {
  const std::string own = make("a.v27", "flood.v27");
  const std::string other = folder.file("b.v27wsk");
  fs::copy_file(own, other);
  for (const auto& [base, b, out] : {std::tuple{own, other, "out.v27"}, std::tuple{other, own, "out.v27"},
                                     std::tuple{own, own, "out.v27wsk"}}) {
    const ProgramRun run = runTool({"merge", base, own, b, "-o", folder.file(out)});
    EXPECT_EQ(run.status, 2);
    EXPECT_THAT(run.err, HasSubstr("are setups of two editions"));
    EXPECT_FALSE(fs::exists(folder.file(out)));
  }
}

TEST_F(CompareCommands, MergeWritesWhatIsClean) {
  const std::string base = make("base.v27", "flood.v27");
  const std::string own = make("a.v27", "flood.v27", {kDrying + "=0.05"});
  const std::string other = make("b.v27", "flood.v27", {kFlooding + "=0.3"});
  const std::string out = folder.file("out.v27");
  ProgramRun run = runTool({"merge", base, own, other, "-o", out});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_THAT(run.out, HasSubstr("1 change taken from B, 0 conflicts"));
  EXPECT_EQ(test::textOf(out),
            test::textOf(make("w.v27", "flood.v27", {kDrying + "=0.05", kFlooding + "=0.3"})));
  // The check's faults are told, on the other stream.
  EXPECT_THAT(run.err, HasSubstr("severity"));
  run = runTool({"merge", base, own, other, "-o", out});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("--force"));
  EXPECT_EQ(runTool({"merge", base, own, other, "-o", out, "--force", "--json"}).status, 0);
}

TEST_F(CompareCommands, MergeWritesConflictsOnlyWhenToldHow) {
  const std::string base = make("base.v27", "flood.v27");
  const std::string own = make("a.v27", "flood.v27", {kDrying + "=0.05"});
  const std::string other = make("b.v27", "flood.v27", {kDrying + "=0.02"});
  const std::string out = folder.file("out.v27");
  ProgramRun run = runTool({"merge", base, own, other, "-o", out});
  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.out,
            "Basic Parameters, Flood and Dry: Drying depth: 0.05 m in A, 0.02 m in B, 0.1 m in the base\n");
  EXPECT_THAT(run.err, HasSubstr("1 conflict; nothing is written"));
  EXPECT_FALSE(fs::exists(out));
  run = runTool({"merge", base, own, other, "-o", out, "--json"});
  EXPECT_EQ(run.status, 1);
  const nlohmann::json report = nlohmann::json::parse(run.out);
  EXPECT_EQ(report["conflicts"], nlohmann::json({{{"path", kDrying},
                                                  {"page", 26},
                                                  {"pageName", "Basic Parameters, Flood and Dry"},
                                                  {"thing", "Drying depth"},
                                                  {"base", "0.1 m"},
                                                  {"a", "0.05 m"},
                                                  {"b", "0.02 m"}}}));
  EXPECT_EQ(report["written"], false);
  EXPECT_EQ(report["out"], out);
  for (const fs::directory_entry& file : fs::directory_iterator(folder.path()))
    EXPECT_THAT(file.path().filename().string(), Not(HasSubstr("out")));
  run = runTool({"merge", base, own, other, "-o", out, "--theirs"});
  EXPECT_EQ(run.status, 1);
  EXPECT_THAT(run.out, HasSubstr("1 change taken from B, 1 conflict,"));
  EXPECT_EQ(test::textOf(out), test::textOf(other));
  EXPECT_EQ(runTool({"merge", base, own, other, "-o", out, "--ours", "--force"}).status, 1);
  EXPECT_EQ(test::textOf(out), test::textOf(own));
  EXPECT_EQ(runTool({"merge", base, own, other, "-o", out, "--ours", "--theirs"}).status, 2);
}

// Setup and result in folders of their own: each file is named from the folder of the result.
TEST_F(CompareCommands, MergeKeepsFilesWhereTheyLead) {
  const std::string base = make("base.v27", "flood.v27");
  const std::string own = make("a.v27", "flood.v27", {kDrying + "=0.05"});
  fs::create_directories(folder.file("results"));
  const std::string out = folder.file("results/out.v27");
  ASSERT_EQ(runTool({"merge", base, own, base, "-o", out}).status, 0);
  EXPECT_EQ(runTool({"diff", own, out}).status, 0);
  EXPECT_THAT(test::textOf(out), HasSubstr("\"../estuary.tsb2\""));
}

class BesideDocument : public CompareSetups {
 protected:
  void SetUp() override {
    CompareSetups::SetUp();
    own = make("a.v27", "flood.v27");
    ASSERT_TRUE(document.OnOpenDocument(own));
    comparison = makeSetupComparison(document);
  }
  std::string beside(const std::string& path) { return comparison->open(path, comparison->read(path)); }
  SetupMerging& merging() { return comparison->merging(); }
  std::string startMerge(const std::string& base, const std::string& first, const std::string& second) {
    return merging().start(merging().read(base, first, second));
  }
  std::string finishMerge() { return merging().finish(merging().make()); }
  const std::vector<Difference>& differences() {
    EXPECT_EQ(comparison->take(comparison->compare()), comparison->isOpen());
    return comparison->differences();
  }
  std::vector<std::string> lines() { return linesOf(differences()); }
  std::size_t placeOf(std::string_view thing) {
    const std::vector<Difference>& all = differences();
    const auto found = std::ranges::find(all, thing, &Difference::thing);
    EXPECT_NE(found, all.end()) << thing;
    return static_cast<std::size_t>(found - all.begin());
  }
  std::string textNow() { return test::savedText(document.root(), own); }

  std::string own;
  test::TestHost host;
  CV27SetupDoc document{host};
  std::unique_ptr<SetupComparison> comparison;
};

TEST_F(BesideDocument, ItLooksAgainAfterAnEdit) {
  EXPECT_THAT(differences(), IsEmpty());
  EXPECT_EQ(beside(make("b.v27", "flood.v27", {kDrying + "=0.05"})), "");
  EXPECT_THAT(lines(), ElementsAre("Basic Parameters, Flood and Dry|Drying depth|<0.1 m> <0.05 m>"));
  document.root().areaDescription->floodingDepth = 0.4F;
  document.RecordEdit(PageId::floodAndDry, "Flooding depth");
  EXPECT_THAT(lines(), ElementsAre("Basic Parameters, Flood and Dry|Drying depth|<0.1 m> <0.05 m>",
                                   "Basic Parameters, Flood and Dry|Flooding depth|<0.4 m> <0.2 m>"));
  document.Undo();
  EXPECT_THAT(lines(), ::testing::SizeIs(1));
}

TEST_F(BesideDocument, ADifferenceIsTakenOverAsOneStep) {
  const std::string before = textNow();
  const std::string other = make("b.v27", "flood.v27", {kDrying + "=0.05", kFlooding + "=0.3"});
  ASSERT_EQ(beside(other), "");
  EXPECT_EQ(comparison->takeOver(placeOf("Drying depth")), "");
  EXPECT_FLOAT_EQ(document.root().areaDescription->dryingDepth, 0.05F);
  EXPECT_EQ(document.UndoStep()->name, "Take over Drying depth");
  EXPECT_EQ(document.UndoStep()->page, PageId::floodAndDry);
  EXPECT_TRUE(document.IsModified());
  EXPECT_THAT(lines(), ::testing::SizeIs(1));
  EXPECT_EQ(comparison->takeOverPage(26), "");
  EXPECT_THAT(comparison->takeOverPage(26), HasSubstr("edited since"));
  EXPECT_THAT(lines(), IsEmpty());
  document.Undo();
  document.Undo();
  EXPECT_EQ(textNow(), before);
  EXPECT_FALSE(document.IsModified());
}

TEST_F(BesideDocument, ARowIsTakenOverWithAllThatIsSaidOfIt) {
  const std::string other =
      make("b.v27", "flood.v27",
           {kSources + "=2", "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_2/Source_Point=7,8",
            "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/SOURCE_SINK_2/Constant_Magnitude=3.5"});
  ASSERT_EQ(beside(other), "");
  EXPECT_EQ(comparison->takeOver(placeOf("Row 2")), "");
  EXPECT_THAT(lines(), IsEmpty());
}

TEST_F(BesideDocument, AllIsTakenOver) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one module";
  for (const char* name : kNames) {
    SCOPED_TRACE(name);
    const std::string before = textNow();
    const std::string other = make("b.v27", name);
    ASSERT_EQ(beside(other), "");
    if (differences().empty()) continue;
    EXPECT_EQ(comparison->takeOverAll(), "");
    EXPECT_THAT(lines(), IsEmpty());
    EXPECT_EQ(textNow(), *open(other).setup.tree(own)->text());
    document.Undo();
    EXPECT_EQ(textNow(), before);
  }
}

TEST_F(BesideDocument, TheOtherPageCanBeReadOnly) {
  const std::string other = make("b.v27", "flood.v27", {kDrying + "=0.05"});
  EXPECT_EQ(comparison->openPage(26), nullptr);
  ASSERT_EQ(beside(other), "");
  Form* form = comparison->openPage(26);
  ASSERT_NE(form, nullptr);
  EXPECT_EQ(form->find("Drying depth:")->text, "0.05");
  for (const Control& control : form->controls())
    EXPECT_TRUE(!control.usable() || control.kind == ControlKind::label ||
                control.kind == ControlKind::group || control.grid != nullptr)
        << control.label;
  EXPECT_EQ(comparison->openPage(1), nullptr);
  comparison->close();
  EXPECT_FALSE(comparison->isOpen());
  EXPECT_THAT(differences(), IsEmpty());
}

TEST_F(BesideDocument, WhatCannotBeReadIsTold) {
  ASSERT_EQ(beside(make("b.v27", "flood.v27", {kDrying + "=0.05"})), "");
  EXPECT_THAT(beside(folder.file("none.v27")), HasSubstr("none.v27"));
  // The one before stays.
  EXPECT_TRUE(comparison->isOpen());
  EXPECT_THAT(lines(), ::testing::SizeIs(1));
  EXPECT_THAT(comparison->takeOver(9), HasSubstr("no such difference"));
  EXPECT_THAT(startMerge(folder.file("none.v27"), {}, own), HasSubstr("none.v27"));
  EXPECT_THAT(startMerge(own, {}, folder.write("no.v27", "A {}\n")), HasSubstr("is not a setup"));
}

TEST_F(BesideDocument, AMergeIsOneStep) {
  const std::string base = make("base.v27", "flood.v27");
  const std::string other = make("b.v27", "flood.v27", {kDrying + "=0.02", kFlooding + "=0.3"});
  document.root().areaDescription->dryingDepth = 0.05F;
  document.RecordEdit(PageId::floodAndDry, "Drying depth");
  const std::string before = textNow();
  ASSERT_EQ(startMerge(base, {}, other), "");
  ASSERT_EQ(merging().questions().size(), 1U);
  EXPECT_EQ(merging().questions()[0].thing, kDrying);
  EXPECT_FALSE(merging().takeWords(""));
  EXPECT_TRUE(merging().takeWords(merging().word()));
  EXPECT_EQ(merging().questions()[0].pageName, "Basic Parameters, Flood and Dry");
  EXPECT_EQ(merging().questions()[0].thing, "Drying depth");
  EXPECT_EQ(merging().questions()[0].own, "0.05 m");
  EXPECT_EQ(finishMerge(), "");
  EXPECT_FLOAT_EQ(document.root().areaDescription->dryingDepth, 0.05F);
  EXPECT_FLOAT_EQ(document.root().areaDescription->floodingDepth, 0.3F);
  EXPECT_EQ(document.UndoStep()->name, "Merge");
  document.Undo();
  EXPECT_EQ(textNow(), before);
  ASSERT_EQ(startMerge(base, {}, other), "");
  merging().questions()[0].takesOther = true;
  EXPECT_EQ(finishMerge(), "");
  EXPECT_FLOAT_EQ(document.root().areaDescription->dryingDepth, 0.02F);
  ASSERT_EQ(startMerge(base, {}, base), "");
  EXPECT_EQ(finishMerge(), "The second setup has changed nothing that is not here already");
}

// What was found of a setup that has been edited since, or beside another one, changes nothing.
TEST_F(BesideDocument, AnOlderLookIsNotTaken) {
  const std::string other = make("b.v27", "flood.v27", {kDrying + "=0.05"});
  ASSERT_EQ(beside(other), "");
  EXPECT_FALSE(comparison->isCurrent());
  const std::string early = comparison->compare();
  document.root().areaDescription->floodingDepth = 0.4F;
  document.RecordEdit(PageId::floodAndDry, "Flooding depth");
  EXPECT_FALSE(comparison->take(early));
  EXPECT_THAT(lines(), ::testing::SizeIs(2));
  EXPECT_TRUE(comparison->isCurrent());
  EXPECT_FALSE(comparison->take(early));
  EXPECT_THAT(comparison->differences(), ::testing::SizeIs(2));
  // The same state again: it holds again.
  document.Undo();
  EXPECT_FALSE(comparison->isCurrent());
  EXPECT_TRUE(comparison->take(early));
  EXPECT_THAT(comparison->differences(), ::testing::SizeIs(1));
  ASSERT_EQ(beside(other), "");
  EXPECT_FALSE(comparison->take(early));
  const std::string found = comparison->compare();
  for (const std::string& bytes :
       {std::string(), std::string("x"), found.substr(0, found.size() / 2), found + "x"})
    EXPECT_FALSE(comparison->take(bytes));
  EXPECT_TRUE(comparison->take(found));
  document.units().setSystem(UnitSystem::us);
  comparison->unitsChanged();
  EXPECT_FALSE(comparison->take(found));
  EXPECT_THAT(lines(), ElementsAre(HasSubstr("ft>")));
}

TEST_F(BesideDocument, OneOfVeryManyIsTakenOver) {
  constexpr int kMany = 700;
  own = make("a.v27", "flood.v27", {kSources + "=" + std::to_string(kMany)});
  ASSERT_TRUE(document.OnOpenDocument(own));
  const std::string other = folder.write("b.v27", withEach(test::textOf(own), "Constant_Magnitude",
                                                           [](int n) { return fmt::format("{}.25", n); }));
  ASSERT_EQ(beside(other), "");
  ASSERT_THAT(differences(), ::testing::SizeIs(kMany));
  const std::string thing = comparison->differences()[600].thing;
  EXPECT_EQ(comparison->takeOver(600), "");
  EXPECT_THAT(differences(), ::testing::SizeIs(kMany - 1));
  EXPECT_EQ(std::ranges::find(comparison->differences(), thing, &Difference::thing),
            comparison->differences().end());
}

// The engine's options stand in no model: they are taken over and merged with an undo all the same.
TEST_F(BesideDocument, OptionsAreBroughtIn) {
  const std::string base = make("base.v27", "flood.v27");
  std::string text = test::textOf(base);
  text.replace(text.find("OPTION_PARAMETERS {}"), 20, "OPTION_PARAMETERS {\nmode 2\n}");
  const std::string other = folder.write("b.v27", text);
  const auto savedMode = [&] {
    const KvsHandle file = document.file().tree(own);
    const Node* mode = nodeAt(*file, "NESTED_MODEL_GLOBALS/OPTION_PARAMETERS/mode");
    return mode == nullptr ? std::string() : shownValues(*mode);
  };
  ASSERT_EQ(beside(other), "");
  const auto undoAndRedo = [&](const char* name) {
    EXPECT_EQ(savedMode(), "2");
    EXPECT_EQ(document.UndoStep()->name, name);
    EXPECT_TRUE(document.IsModified());
    document.Redo();
    EXPECT_EQ(savedMode(), "2");
    document.Undo();
    EXPECT_EQ(savedMode(), "");
    document.Undo();
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(savedMode(), "");
    document.Redo();
    EXPECT_EQ(savedMode(), "2");
    document.Undo();
  };
  EXPECT_EQ(comparison->takeOver(placeOf("NESTED_MODEL_GLOBALS/OPTION_PARAMETERS/mode")), "");
  EXPECT_THAT(lines(), IsEmpty());
  undoAndRedo("Take over NESTED_MODEL_GLOBALS/OPTION_PARAMETERS/mode");
  ASSERT_EQ(startMerge(base, {}, other), "");
  EXPECT_EQ(finishMerge(), "");
  undoAndRedo("Merge");
  // It reaches the file, and what stands there beside the options stays.
  document.Redo();
  ASSERT_TRUE(document.OnSaveDocument(own));
  EXPECT_TRUE(compare(own, other).isSame());
}

// A save writes the options of xenobiotics further in than it looks for them.
TEST_F(BesideDocument, OptionsOfXenobioticsAreBroughtIn) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "one module";
  const std::string type = "NESTED_MODEL_GLOBALS/MODULE_SELECTION/Simulation_Type=8";
  own = make("a.v27", "flood.v27", {type});
  ASSERT_TRUE(document.OnOpenDocument(own));
  std::string text = test::textOf(own);
  text.insert(text.find("HYDRODYNAMIC_MODULE {"),
              "XENOBIOTIC_MODULE {\nOPTION_PARAMETERS {\ndeep {\nmode 2\n}\n}\n}\n");
  const std::string other = folder.write("b.v27", text);
  const auto savedMode = [&] {
    const KvsHandle file = document.file().tree(own);
    const Node* mode =
        nodeAt(*file, "MUD_TRANSPORT_EXPANDED_MODULE/XENOBIOTIC_MODULE/OPTION_PARAMETERS/deep/mode");
    return mode == nullptr ? std::string() : shownValues(*mode);
  };
  const auto take = [&](const std::function<std::string()>& bring) {
    EXPECT_EQ(savedMode(), "");
    EXPECT_EQ(bring(), "");
    EXPECT_EQ(savedMode(), "2");
    EXPECT_THAT(lines(), IsEmpty());
    document.Undo();
  };
  ASSERT_EQ(beside(other), "");
  ASSERT_THAT(lines(), ::testing::SizeIs(1));
  take([&] { return comparison->takeOver(0); });
  ASSERT_THAT(lines(), ::testing::SizeIs(1));
  take([&] { return comparison->takeOverPage(0); });
  ASSERT_THAT(lines(), ::testing::SizeIs(1));
  take([&] { return comparison->takeOverAll(); });
  ASSERT_EQ(startMerge(own, {}, other), "");
  take([&] { return finishMerge(); });
}

// What this version does not know of the first of two files is asked for at the save, and not before.
TEST_F(BesideDocument, AMergeOfFilesKeepsWhatIsUnknown) {
  const std::string base = make("base.v27", "flood.v27");
  const std::string second = make("second.v27", "flood.v27", {kFlooding + "=0.3"});
  std::string text = test::textOf(base);
  text.insert(text.find("MODULE_SELECTION {"), "LATER_PART {\na 1\n}\n");
  const std::string first = folder.write("first.v27", text);
  ASSERT_TRUE(document.OnNewDocument());
  ASSERT_EQ(startMerge(base, first, second), "");
  EXPECT_THAT(merging().leftOut(), IsEmpty());
  EXPECT_EQ(finishMerge(), "");
  EXPECT_THAT(document.file().unknownSections(), ::testing::Contains(HasSubstr("LATER_PART")));
  document.Undo();
  EXPECT_THAT(document.file().unknownSections(), IsEmpty());
}

// What it does not know of the second is told before, unless the first has it too.
TEST_F(BesideDocument, WhatAMergeLeavesOutIsTold) {
  const std::string base = make("base.v27", "flood.v27");
  const auto later = [&](const char* name, const char* value) {
    std::string text = test::textOf(base);
    text.insert(text.find("MODULE_SELECTION {"), fmt::format("LATER_PART {{\na {}\n}}\n", value));
    return folder.write(name, text);
  };
  const std::string second = later("second.v27", "1");
  ASSERT_EQ(startMerge(base, {}, second), "");
  EXPECT_THAT(merging().leftOut(), ElementsAre("NESTED_MODEL_GLOBALS/LATER_PART"));
  EXPECT_THAT(finishMerge(), HasSubstr("nothing that is not here"));
  EXPECT_EQ(startMerge(base, later("same.v27", "1"), second), "");
  EXPECT_THAT(merging().leftOut(), IsEmpty());
  EXPECT_EQ(startMerge(base, later("other.v27", "2"), second), "");
  EXPECT_THAT(merging().leftOut(), ElementsAre("NESTED_MODEL_GLOBALS/LATER_PART"));
}

// What was read, or made, is taken whole and for the setup as it was, or not at all.
TEST_F(BesideDocument, NothingIsMergedByHalves) {
  const std::string base = make("base.v27", "flood.v27");
  const std::string other = make("b.v27", "flood.v27", {kFlooding + "=0.3"});
  const std::string before = textNow();
  const std::string read = comparison->read(other);
  for (const std::string& bytes : {std::string(), read.substr(0, read.size() / 2), read + "x"})
    EXPECT_THAT(comparison->open(other, bytes), HasSubstr("incomplete"));
  EXPECT_FALSE(comparison->isOpen());
  const std::string found = merging().read(base, {}, other);
  for (const std::string& bytes : {found.substr(0, found.size() / 2), found + "x"})
    EXPECT_THAT(merging().start(bytes), HasSubstr("incomplete"));
  EXPECT_THAT(finishMerge(), HasSubstr("nothing to merge"));
  ASSERT_EQ(merging().start(found), "");
  const std::string made = merging().make();
  EXPECT_THAT(merging().finish(made.substr(0, made.size() - 4)), HasSubstr("incomplete"));
  EXPECT_EQ(textNow(), before);
  ASSERT_EQ(merging().start(found), "");
  document.root().areaDescription->dryingDepth = 0.05F;
  document.RecordEdit(PageId::floodAndDry, "Drying depth");
  EXPECT_THAT(finishMerge(), HasSubstr("edited since"));
  document.Undo();
  ASSERT_EQ(merging().start(found), "");
  EXPECT_EQ(finishMerge(), "");
  EXPECT_FLOAT_EQ(document.root().areaDescription->floodingDepth, 0.3F);
}

// Three files become a new document, with file names that lead where they led.
TEST_F(BesideDocument, ThreeFilesAreMergedIntoANewOne) {
  const std::string base = make("base.v27", "flood.v27");
  const std::string first = make("first.v27", "flood.v27", {kDrying + "=0.05"});
  const std::string second = make("second.v27", "flood.v27", {kDrying + "=0.02", kFlooding + "=0.3"});
  ASSERT_TRUE(document.OnNewDocument());
  ASSERT_EQ(startMerge(base, first, second), "");
  ASSERT_EQ(merging().questions().size(), 1U);
  merging().questions()[0].takesOther = true;
  EXPECT_EQ(finishMerge(), "");
  EXPECT_EQ(document.path(), "");
  EXPECT_TRUE(document.IsModified());
  fs::create_directories(folder.file("elsewhere"));
  ASSERT_TRUE(document.OnSaveDocument(folder.file("elsewhere/merged.v27")));
  EXPECT_THAT(linesOf(compare(folder.file("elsewhere/merged.v27"), second).differences), IsEmpty());
  EXPECT_THAT(startMerge(base, folder.file("none.v27"), second), HasSubstr("none.v27"));
  EXPECT_THAT(finishMerge(), HasSubstr("nothing to merge"));
}

}  // namespace compare_setups_test
}  // namespace gridbay
