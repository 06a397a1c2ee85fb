#include "batch/ensemble.h"

#include <gmock/gmock.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <nlohmann/json.hpp>

#include "core/edition.h"
#include "setup/setting.h"
#include "tests/support/grids.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace batch_ensemble_test {

namespace fs = std::filesystem;
using test::textOf;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

const std::string kDrying = "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth";
const std::string kGrid = "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_1/DATA_FILE/FILE_NAME";
const std::string kOutput = "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/";
const std::string kKind = "." + std::string(theEdition.fileKind);

TEST(EnsembleTable, HasNamesOrGivesThem) {
  const test::TemporaryFolder folder;
  const auto read = [&](const std::string& text) {
    const Result<EnsembleTable> table = readEnsembleTable(folder.write("t.csv", text), "base");
    if (!table) return table.error();
    std::string shown = std::to_string(table->firstPathColumn);
    for (const std::string& path : table->paths) shown += " " + path;
    for (const EnsembleTable::Member& member : table->members) {
      shown += "|" + std::to_string(member.line) + " " + member.name;
      for (const std::string& value : member.values) shown += "," + value;
    }
    return shown;
  };
  EXPECT_EQ(read("A,B/c\n1,2\n3,4\n"), "1 A B/c|2 base_1,1,2|3 base_2,3,4");
  EXPECT_EQ(read("name,A\nnorth,1\nsouth,\n"), "2 A|2 north,1|3 south,");
  EXPECT_EQ(read("\xEF\xBB\xBF"
                 "Member;A\r\n\r\nm ; 1,5 \r\n"),
            "2 A|3 m,1,5");
  EXPECT_EQ(read("name,A\rnorth,1\rsouth,\r"), "2 A|2 north,1|3 south,");
  EXPECT_EQ(read("\tA\nm\t\"a \"\"b\"\"\nc\"\nn\t2"), "2 A|2 m,a \"b\"\nc|4 n,2");
  std::string ten = "A\n";
  for (int i = 0; i < 10; ++i) ten += "1\n";
  EXPECT_THAT(read(ten), HasSubstr("|2 base_01,1|"));
}

TEST(EnsembleTable, SaysWhereItIsWrong) {
  const test::TemporaryFolder folder;
  const std::string file = folder.file("t.csv");
  const auto error = [&](const std::string& text) {
    folder.write("t.csv", text);
    const Result<EnsembleTable> table = readEnsembleTable(file, "base");
    return table ? "none" : table.error();
  };
  const std::string none = " has no members: a row of paths is expected, and a row for each member";
  EXPECT_EQ(error(""), "\"" + file + "\"" + none);
  EXPECT_EQ(error("name,A\n\n"), "\"" + file + "\"" + none);
  const std::string longName(300, 'n');
  const std::vector<std::pair<std::string, std::string>> cases{
      {"name,A,B\nm,1\n", ", line 2 (m), column 3: the row has 2 cells where the first one has 3"},
      {"name,A\nm\n", ", line 2 (m), column 2: the row has 1 cell where the first one has 2"},
      {"name,A\nm,1,2\n", ", line 2 (m), column 3: the row has 3 cells where the first one has 2"},
      {"name,A,\nm,1,2\n", ", line 1, column 3: a column needs a path"},
      {"A,B,a\n1,2,3\n", ", line 1, column 3: \"a\" has column 1 already"},
      {"A,vane27_nested_model/A\n1,2\n",
       ", line 1, column 2: \"vane27_nested_model/A\" has column 1 already"},
      {"name,A\nm,1\nn,2\nm,3\n", ", line 4, column 1: line 2 has a member \"m\" already"},
      {"name,A\n,1\n", ", line 2, column 1: a member needs a name"},
      {"name,A\na/b,1\n",
       ", line 2, column 1: \"a/b\" cannot be the name of a member: it becomes that of a file"},
      {"name,A\n..,1\n",
       ", line 2, column 1: \"..\" cannot be the name of a member: it becomes that of a file"},
      {"name,A\n-f,1\n",
       ", line 2, column 1: \"-f\" cannot be the name of a member: it becomes that of a file"},
      {"name,A\n" + longName + ",1\n", ", line 2, column 1: a name has 231 bytes at most, not 300"},
  };
  for (const auto& [text, expected] : cases) EXPECT_EQ(error(text), file + expected);
  EXPECT_EQ(error(std::string("\xFF\xFEn\0a\0", 6)),
            "cannot read \"" + file + "\": it is in UTF-16; save it in UTF-8");
  EXPECT_EQ(error("name,A\nm,\"1\n2"), "cannot read \"" + file + "\": line 2: a quote is not closed");
  EXPECT_EQ(error("name,A\nm,1\"2\n"),
            "cannot read \"" + file +
                "\": line 2: a quote stands in a cell that is not quoted, or a text "
                "behind one that is");
  fs::remove(file);
  EXPECT_THAT(error(""), HasSubstr("has no members"));
  const Result<EnsembleTable> away = readEnsembleTable(folder.file("none.csv"), "base");
  ASSERT_FALSE(away);
  EXPECT_THAT(away.error(), HasSubstr("No such file"));
  EXPECT_FALSE(readEnsembleTable(folder.path().string(), "base"));
}

class EnsembleMaking : public ::testing::Test {
 protected:
  EnsembleMaking() {
    fs::create_directory(folder.file("setups"));
    fs::create_directory(folder.file("setups/results"));
    for (const char* name : {"setups/a.tsb2", "setups/b.tsb2"}) test::writeGrid(folder.file(name));
    SetupFile setup(nullptr);
    for (const auto& [path, value] : std::vector<std::pair<std::string, std::string>>{
             {kGrid, "a.tsb2"},
             {kOutput + "Number_Of_Output_areas", "2"},
             {kOutput + "OUTPUT_AREA_1/File_Name", "results/maps.tsb2"},
             {kOutput + "OUTPUT_AREA_2/File_Name", "../points.tsb2"}}) {
      const Outcome done = applySetting(setup, {path, value}, base);
      EXPECT_TRUE(done) << done.error();
    }
    EXPECT_TRUE(setup.save(base));
  }

  Result<EnsembleResult> make(const std::string& table, bool mayReplace = false,
                              const BatchWatch& watch = {}) {
    Result<EnsembleTable> read = readEnsembleTable(folder.write("table.csv", table), "base");
    if (!read) return Failure{read.error()};
    return makeEnsemble({*read, base, folder.file("out"), mayReplace}, host, watch);
  }
  std::string errorOf(const std::string& table) {
    const Result<EnsembleResult> made = make(table);
    return made ? "none" : made.error();
  }
  std::string memberText(const std::string& name) { return textOf(folder.file("out/" + name + kKind)); }
  std::vector<std::string> filesMade() {
    std::vector<std::string> names;
    if (!fs::exists(folder.file("out"))) return names;
    for (const auto& entry : fs::directory_iterator(folder.file("out")))
      names.push_back(entry.path().filename().string());
    std::ranges::sort(names);
    return names;
  }

  test::TemporaryFolder folder;
  std::string base = folder.file("setups/base" + kKind);
  CollectingMessageHost host;
};

TEST_F(EnsembleMaking, AMemberIsWhatSetAndASaveThereMake) {
  const Result<EnsembleResult> made = make("name," + kDrying + "," + kGrid + "," + kOutput +
                                           "OUTPUT_AREA_2/File_Name\nn,0.01,,\ns,,b.tsb2,own.tsb2\n");
  ASSERT_TRUE(made) << made.error();
  EXPECT_FALSE(made->isStopped);
  EXPECT_THAT(filesMade(), ElementsAre("n" + kKind, "report.csv", "report.json", "results", "s" + kKind));

  const auto expected = [&](const std::string& name, const std::vector<Setting>& settings) {
    const std::string file = folder.file("out/" + name + kKind);
    Result<SetupFile> setup = SetupFile::open(base, nullptr);
    for (const Setting& setting : settings) {
      const bool isResult = setting.path.starts_with(kOutput);
      EXPECT_TRUE(applySetting(*setup, setting, isResult ? file : base));
    }
    return *setup->tree(file)->text();
  };
  EXPECT_EQ(memberText("n"), expected("n", {{kDrying, "0.01"},
                                            {kOutput + "OUTPUT_AREA_1/File_Name", "results/n_maps.tsb2"},
                                            {kOutput + "OUTPUT_AREA_2/File_Name", "../n_points.tsb2"}}));
  EXPECT_EQ(memberText("s"), expected("s", {{kGrid, "b.tsb2"},
                                            {kOutput + "OUTPUT_AREA_1/File_Name", "results/s_maps.tsb2"},
                                            {kOutput + "OUTPUT_AREA_2/File_Name", "own.tsb2"}}));
  EXPECT_THAT(memberText("s"), HasSubstr("FILE_NAME (file)\"../setups/b.tsb2\""));
  EXPECT_THAT(memberText("n"), HasSubstr("\"results/n_maps.tsb2\""));
  EXPECT_THAT(memberText("s"), HasSubstr("\"own.tsb2\""));
}

TEST_F(EnsembleMaking, MembersThatMakeTheSameFileAreTold) {
  const std::string maps = kOutput + "OUTPUT_AREA_1/File_Name";
  const std::string points = kOutput + "OUTPUT_AREA_2/File_Name";
  const auto warned = [&](const std::string& table) {
    const Result<EnsembleResult> made = make(table, true);
    EXPECT_TRUE(made) << made.error();
    std::vector<std::string> notes;
    for (const MemberReport& member : made->members) {
      for (const std::string& note : member.notes) notes.push_back(member.name + ": " + note);
      EXPECT_TRUE(member.error.empty());
    }
    return std::pair(made->warnings, notes);
  };
  const auto none = std::pair(std::vector<std::string>(), std::vector<std::string>());
  EXPECT_EQ(warned("name," + kDrying + "\na,0.01\nb,0.02\n"), none);
  EXPECT_EQ(warned("name," + maps + "\na,a.tsb2\nb,b.tsb2\n"), none);
  // The same one by another spelling, and one that two of three have.
  const std::string same = folder.file("out/same.tsb2");
  const std::string two = folder.file("out/two.tsb2");
  const auto [warnings, notes] = warned(
      "name," + maps + "," + points + "\na,same.tsb2,two.tsb2\nb,./x/../same.tsb2,two.tsb2\nc,same.tsb2,\n");
  EXPECT_THAT(warnings,
              ElementsAre("all 3 members make \"" + same + "\": each run replaces what another one made",
                          "2 members (a, b) make \"" + two + "\": each run replaces what another one made"));
  EXPECT_THAT(notes, ElementsAre("a: Warning: 2 other members make \"" + same + "\", too",
                                 "a: Warning: 1 other member makes \"" + two + "\", too",
                                 "b: Warning: 2 other members make \"" + same + "\", too",
                                 "b: Warning: 1 other member makes \"" + two + "\", too",
                                 "c: Warning: 2 other members make \"" + same + "\", too"));
  EXPECT_THAT(textOf(folder.file("out/report.csv")), HasSubstr("1 other member makes"));
  EXPECT_EQ(nlohmann::json::parse(textOf(folder.file("out/report.json")))[2]["notes"][0],
            "Warning: 2 other members make \"" + same + "\", too");
}

TEST_F(EnsembleMaking, TheReportsSayWhatAValidationOfEachFileSays) {
  const Result<EnsembleResult> made =
      make("name," + kDrying + "," + kGrid + "\nwell,,\ndry,-1,\naway,,none.tsb2\n");
  ASSERT_TRUE(made) << made.error();
  std::string csv = "\"member\",\"file\",\"faults\",\"messages\"\n";
  nlohmann::json json = nlohmann::json::parse(textOf(folder.file("out/report.json")));
  ASSERT_EQ(json.size(), 3U);
  ASSERT_EQ(made->members.size(), 3U);
  for (std::size_t i = 0; i < 3; ++i) {
    const MemberReport& member = made->members[i];
    EXPECT_EQ(member.file, folder.file("out/" + member.name + kKind));
    Result<SetupFile> setup = SetupFile::open(member.file, nullptr);
    ASSERT_TRUE(setup);
    ValidationList messages;
    const unsigned faults = setup->model().Validate(messages, 1);
    EXPECT_EQ(member.faults, faults);
    EXPECT_EQ(member.messages, messages);
    EXPECT_EQ(json[i]["member"], member.name);
    EXPECT_EQ(json[i]["file"], member.file);
    EXPECT_EQ(json[i]["faults"], faults);
    ASSERT_EQ(json[i]["messages"].size(), messages.size());
    std::string all;
    for (std::size_t m = 0; m < messages.size(); ++m) {
      EXPECT_EQ(json[i]["messages"][m]["text"], messages[m].text);
      all += (m == 0 ? "" : "; ") + std::string("page ") +
             std::to_string(static_cast<int>(messages[m].page)) + ", severity " +
             std::to_string(static_cast<int>(messages[m].severity)) + ": ";
      for (const char c : messages[m].text) all += c == '"' ? std::string("\"\"") : std::string(1, c);
    }
    csv += "\"" + member.name + "\",\"" + member.file + "\",\"" + std::to_string(faults) + "\",\"" + all +
           "\"\n";
  }
  EXPECT_EQ(textOf(folder.file("out/report.csv")), csv);
  EXPECT_EQ(made->members[1].faults, made->members[0].faults + 1);
  EXPECT_GT(made->members[2].faults, 0U);
}

TEST_F(EnsembleMaking, EachErrorHasItsLineAndColumnAndNothingIsMade) {
  const std::string file = folder.file("table.csv");
  EXPECT_EQ(errorOf("name," + kDrying + "," + kDrying + "x\nm,wet,1\nn,0.1,\no,1 2,\np,,2\n"),
            file + ", line 2 (m), column 2 (" + kDrying + "): Drying_Depth takes a number, not \"wet\"\n" +
                file + ", line 4 (o), column 2 (" + kDrying + "): Drying_Depth takes 1 value, not 2\n" +
                file + ", line 5 (p), column 3 (" + kDrying + "x): There is no \"" + kDrying +
                "x\" in this setup; did you mean \"" + kDrying + "\"?");
  EXPECT_EQ(
      errorOf("name," + kDrying + "," + kDrying + "x\nm,0.1,\n"),
      file + ", column 3: There is no \"" + kDrying + "x\" in this setup; did you mean \"" + kDrying + "\"?");
  EXPECT_THAT(errorOf("name," + kDrying + "\nm,1e400\n"), HasSubstr("allowed is a finite number"));
  EXPECT_THAT(filesMade(), IsEmpty());
  std::string many = kDrying + "\n";
  for (int i = 0; i < 50; ++i) many += "x\n";
  const std::string error = errorOf(many);
  EXPECT_EQ(std::ranges::count(error, '\n'), 20);
  EXPECT_TRUE(error.ends_with("\n..."));
  EXPECT_THAT(filesMade(), IsEmpty());
}

TEST_F(EnsembleMaking, EachMemberBeginsFromTheCommonSetup) {
  const std::string count = kOutput + "Number_Of_Output_areas";
  const Result<EnsembleResult> made = make("name," + count + "," + kOutput + "OUTPUT_AREA_3/File_Name\n" +
                                           "more,3,third.tsb2\nless,1,\nsame,,\n");
  ASSERT_TRUE(made) << made.error();
  EXPECT_THAT(memberText("more"), HasSubstr("\"third.tsb2\""));
  EXPECT_THAT(memberText("less"), ::testing::Not(HasSubstr("OUTPUT_AREA_2")));
  EXPECT_THAT(memberText("same"), HasSubstr("\"../same_points.tsb2\""));
  EXPECT_THAT(memberText("same"), ::testing::Not(HasSubstr("OUTPUT_AREA_3")));
}

TEST_F(EnsembleMaking, WhatIsThereIsReplacedByForceOnly) {
  const std::string table = "name," + kDrying + "\nm,0.1\nn,0.2\n";
  ASSERT_TRUE(make(table));
  const std::string before = memberText("n");
  fs::remove(folder.file("out/report.csv"));
  fs::remove(folder.file("out/report.json"));
  fs::remove(folder.file("out/m" + kKind));
  EXPECT_EQ(errorOf(table), folder.file("table.csv") + ", line 3 (n): \"" + folder.file("out/n" + kKind) +
                                "\" is there already; --force replaces it");
  EXPECT_THAT(filesMade(), ElementsAre("n" + kKind, "results"));
  const Result<EnsembleResult> forced = make("name," + kDrying + "\nn,0.3\n", true);
  ASSERT_TRUE(forced) << forced.error();
  EXPECT_NE(memberText("n"), before);
  EXPECT_EQ(forced->others, 0U);
  const Result<EnsembleResult> other = make("name," + kDrying + "\no,0.3\n", true);
  ASSERT_TRUE(other) << other.error();
  EXPECT_EQ(other->others, 1U);
  // Never the setup that is read.
  Result<EnsembleTable> read =
      readEnsembleTable(folder.write("table.csv", "name," + kDrying + "\nbase,1\n"), "b");
  const Result<EnsembleResult> over = makeEnsemble({*read, base, folder.file("setups"), true}, host, {});
  ASSERT_FALSE(over);
  EXPECT_THAT(over.error(), HasSubstr("is a file that is read here"));
}

TEST_F(EnsembleMaking, AStopLeavesWholeFilesAndTheirReport) {
  std::string table = kDrying + "\n";
  for (int i = 1; i <= 2000; ++i) table += "0.1\n";
  std::size_t reached = 0;
  const Result<EnsembleResult> made =
      make(table, false, {[&](std::size_t done) { reached = done; }, [&] { return reached >= 5; }});
  ASSERT_TRUE(made) << made.error();
  EXPECT_TRUE(made->isStopped);
  EXPECT_EQ(made->members.size(), reached);
  EXPECT_GE(reached, 5U);
  EXPECT_LT(reached, 2000U);
  EXPECT_EQ(filesMade().size(), reached + 3);  // with the reports and the folder of results
  EXPECT_EQ(nlohmann::json::parse(textOf(folder.file("out/report.json"))).size(), reached);
  for (const MemberReport& member : made->members) EXPECT_TRUE(SetupFile::open(member.file, nullptr));
}

TEST_F(EnsembleMaking, AStopBeforeTheFirstMakesNothing) {
  const Result<EnsembleResult> made =
      make(kDrying + "\n0.1\n", false, {[](std::size_t) {}, [] { return true; }});
  EXPECT_TRUE(!made || made->members.empty());
}

TEST_F(EnsembleMaking, AFullDiskIsToldWithItsRowAndLeavesWholeFiles) {
  fs::create_directory(folder.file("out"));
  std::string table = kDrying + "\n";
  for (int i = 1; i <= 200; ++i) table += "0.1\n";
  {
    const test::SmallDisk disk(folder.file("out"), 256 << 10);
    if (!disk.mounted()) GTEST_SKIP() << "no file system can be mounted here";
    const Result<EnsembleResult> made = make(table);
    ASSERT_FALSE(made);
    EXPECT_THAT(made.error(), HasSubstr("table.csv, line "));
    EXPECT_THAT(made.error(), HasSubstr("No space left on device"));
    EXPECT_THAT(made.error(), ::testing::ContainsRegex("[0-9]+ of 200 members were made"));
    for (const std::string& name : filesMade()) {
      EXPECT_FALSE(name.starts_with(".")) << name;
      if (name.ends_with(kKind)) EXPECT_TRUE(SetupFile::open(folder.file("out/" + name), nullptr)) << name;
    }
  }
}

TEST_F(EnsembleMaking, FilesAndFoldersThatCannotBeHad) {
  const std::string table = "name," + kDrying + "\nm,0.1\n";
  folder.write("out", "a file");
  EXPECT_THAT(errorOf(table), HasSubstr("out\""));
  fs::remove(folder.file("out"));
  fs::remove(base);
  EXPECT_THAT(errorOf(table), HasSubstr("No such file"));
  folder.write("setups/base" + kKind, "A {");
  EXPECT_THAT(errorOf(table), HasSubstr("Syntax error"));
  EXPECT_THAT(filesMade(), IsEmpty());
}

TEST_F(EnsembleMaking, AFolderThatMayNotBeWrittenTo) {
  if (::geteuid() == 0) GTEST_SKIP() << "nothing is forbidden to this user";
  fs::create_directory(folder.file("out"));
  ASSERT_EQ(::chmod(folder.file("out").c_str(), 0555), 0);
  EXPECT_THAT(errorOf("name," + kDrying + "\nm,0.1\n"), HasSubstr("Permission denied"));
}

TEST(CheckSetups, ReportsEachFileInItsPlace) {
  const test::TemporaryFolder folder;
  test::writeGrid(folder.file("a.tsb2"));
  SetupFile setup(nullptr);
  ASSERT_TRUE(applySetting(setup, {kGrid, "a.tsb2"}, folder.file("x")));
  std::vector<std::string> files;
  for (const char* name : {"one", "two"}) {
    files.push_back(folder.file(name + kKind));
    ASSERT_TRUE(setup.save(files.back()));
  }
  files.insert(files.begin() + 1, folder.file("none" + kKind));
  const Result<std::vector<MemberReport>> reports = checkSetups(files, {});
  ASSERT_TRUE(reports) << reports.error();
  ASSERT_EQ(reports->size(), 3U);
  EXPECT_THAT((*reports)[1].error, HasSubstr("No such file"));
  for (const std::size_t i : {0U, 2U}) {
    EXPECT_EQ((*reports)[i].error, "");
    EXPECT_EQ((*reports)[i].file, files[i]);
    Result<SetupFile> again = SetupFile::open(files[i], nullptr);
    ValidationList messages;
    EXPECT_EQ((*reports)[i].faults, again->model().Validate(messages, 1));
    EXPECT_EQ((*reports)[i].messages, messages);
  }
}

// There is no memory for the first one, whose look at its data files is to serve the others.
TEST(CheckSetups, ABrokenFirstFileDoesNotBringDownTheBatch) {
  if (test::textOf("/proc/sys/vm/overcommit_memory").starts_with("1"))
    GTEST_SKIP() << "memory is promised without end";
  const test::TemporaryFolder folder;
  SetupFile setup(nullptr);
  std::vector<std::string> files{folder.write("broken" + kKind, "VANE27_NESTED_MODEL {")};
  fs::resize_file(files[0], std::uintmax_t{8} << 40);
  for (const char* name : {"one", "two"}) {
    files.push_back(folder.file(name + kKind));
    ASSERT_TRUE(setup.save(files.back()));
  }
  std::size_t reached = 0;
  const auto count = [&reached](std::size_t done) { reached = done; };
  const Result<std::vector<MemberReport>> reports = checkSetups(files, {.reached = count});
  ASSERT_TRUE(reports) << reports.error();
  EXPECT_EQ(reached, 3U);
  EXPECT_EQ((*reports)[0].error, "\"" + files[0] + "\" was not checked");
  for (const std::size_t i : {1U, 2U}) {
    EXPECT_EQ((*reports)[i].error, "");
    EXPECT_EQ((*reports)[i].faults, 1U);
  }
}

TEST(MemberReport, ComesThroughAsItIs) {
  MemberReport report;
  report.error = "why\n";
  report.notes = {"one", std::string("t\0wo", 4)};
  report.results = {"/out/a.tsb2", ""};
  report.faults = 3;
  report.messages = {{PageId::floodAndDry, "12:a\xFF;", Severity::dependedUpon},
                     {PageId::bathymetry, "", Severity::fault}};
  MemberReport other;
  unpack(packed(report), other);
  EXPECT_EQ(other.error, report.error);
  EXPECT_EQ(other.notes, report.notes);
  EXPECT_EQ(other.results, report.results);
  EXPECT_EQ(other.faults, report.faults);
  EXPECT_EQ(other.messages, report.messages);
}

}  // namespace batch_ensemble_test
}  // namespace gridbay
