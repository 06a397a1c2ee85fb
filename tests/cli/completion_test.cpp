// What the tool says to a shell that asks how a command line can go on, and the scripts by which shells ask.

#include <gmock/gmock.h>

#include <algorithm>
#include <filesystem>
#include <map>

#include "core/edition.h"
#include "tests/support/grids.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace cli_completion_test {

using test::runTool;
using ::testing::HasSubstr;
using ::testing::Not;
namespace fs = std::filesystem;
using Words = std::vector<std::string>;

class Completion : public ::testing::Test {
 protected:
  // The candidates for the last word, a line each, without what they are.
  static std::string of(Words words) {
    words.insert(words.begin(), "complete-words");
    const test::ProgramRun run = runTool(words);
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.err, "");
    std::string candidates;
    for (std::size_t start = 0; start < run.out.size();) {
      const std::string line = run.out.substr(start, run.out.find('\n', start) - start);
      candidates += line.substr(0, line.find('\t')) + '\n';
      start += line.size() + 1;
    }
    return candidates;
  }

  test::TemporaryFolder folder;
};

TEST_F(Completion, Commands) {
  EXPECT_EQ(of({"va"}), "validate\n");
  EXPECT_THAT(of({""}), HasSubstr("convert\n"));
  EXPECT_EQ(of({"convert", ""}), "raster\nseries\ntypes\n");
  EXPECT_EQ(of({"nonsense"}), "");
  EXPECT_EQ(of({}), "");
  EXPECT_EQ(runTool({"complete-words", "validat"}).out,
            "validate\tChecks a setup and the data files that it names\n");
}

TEST_F(Completion, OptionsAndTheirValues) {
  EXPECT_EQ(of({"validate", "--"}), "--help\n--json\n--advice\n");
  EXPECT_EQ(of({"convert", "raster", "a.asc", "--no"}), "--nodata-as\n");
  EXPECT_EQ(of({"convert", "raster", "--item-type", "mann"}), "Manning number\n");
  EXPECT_EQ(of({"convert", "raster", "--crs", ""}), "");
  // A value is no command, and what follows it is a word of its own again.
  EXPECT_EQ(of({"convert", "raster", "--crs", "types", "--fo"}), "--force\n");
  EXPECT_EQ(of({"completion", ""}), "bash\nfish\nzsh\n");
}

TEST_F(Completion, FilesAreTheShells) {
  EXPECT_EQ(of({"validate", ""}), "");
  EXPECT_EQ(of({"get", "n"}), "");
}

TEST_F(Completion, PathsStepByStep) {
  const std::string setup = folder.file("a." + std::string(theEdition.fileKind));
  ASSERT_EQ(runTool({"new", setup}).status, 0);
  EXPECT_EQ(of({"get", setup, "hydro"}), "HYDRODYNAMIC_MODULE/\n");
  EXPECT_EQ(of({"get", setup, "NESTED_MODEL_GLOBALS/FLOOD"}), "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/\n");
  EXPECT_EQ(of({"get", setup, "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/d"}),
            "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth\n");
  EXPECT_EQ(of({"set", setup, "a=1", "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/d"}),
            "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=\n");
  EXPECT_EQ(of({"get", setup, "NOWHERE/"}), "");
  EXPECT_EQ(of({"get", folder.file("none.v27"), ""}), "");
  EXPECT_EQ(of({"get", folder.write("bad.v27", "{"), ""}), "");
}

TEST_F(Completion, SectionsOfOneNameHaveTheirNumbers) {
  if (theEdition.wetlandSweepKit) return;  // it has no structures
  const std::string setup = folder.file("a.v27");
  ASSERT_EQ(runTool({"new", setup}).status, 0);
  const std::string weir = "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE/WEIR/";
  ASSERT_EQ(runTool({"set", setup, weir + "number_of_weirs=2"}).err, "");
  EXPECT_EQ(of({"get", setup, weir + "w"}), weir + "weir_data/\n" + weir + "weir_data[2]/\n");
}

TEST_F(Completion, BashCompletesByTheScript) {
  const std::string tool = test::toolPath();
  const auto completed = [&](const std::string& words) {
    return test::runProgram(
        "bash",
        {"-c",
         "source <(\"$0\" completion bash); COMP_WORDS=(\"$0\" " + words +
             "); COMP_CWORD=$((${#COMP_WORDS[@]} - 1)); command=$(complete -p | sed -n "
             "'s/.*-F \\([a-z0-9_]*\\).*/\\1/p'); $command \"$0\"; printf '%s\\n' \"${COMPREPLY[@]}\"",
         tool});
  };
  EXPECT_EQ(completed("convert s").out, "series\n");
  EXPECT_EQ(completed("convert series --item-type 'Manning n'").out, "Manning\\ number\n");
  EXPECT_EQ(completed("validate ''").out, "\n");
  EXPECT_EQ(completed("validate ''").err, "");
}

// A shell that is not here can't read its script: what stands in it is looked at in any case.
TEST_F(Completion, ScriptsOfOtherShells) {
  const std::string tool = fs::path(test::toolPath()).filename().string();
  std::string function = "_" + tool + "_complete";
  std::ranges::replace(function, '-', '_');
  const std::map<std::string, std::pair<std::string, Words>> shells{
      {"zsh",
       {"-n",
        {"#compdef " + tool + "\n", function + "() {\n",
         "\"${words[1]}\" complete-words \"${(@)words[2,CURRENT]}\"", "_describe -t words " + tool + " ended",
         "\"$funcstack[1]\" = _" + tool + " ]; then " + function,
         "compdef " + function + " " + tool + "; fi\n"}}},
      {"fish",
       {"--no-execute",
        {"function " + function + "\n",
         "($words[1] complete-words $words[2..-1] (commandline -ct) 2>/dev/null)",
         "complete -c " + tool + " -f -a '(" + function + ")'\n"}}}};
  for (const auto& [shell, script] : shells) {
    const auto& [parseOnly, parts] = script;
    const test::ProgramRun run = runTool({"completion", shell});
    EXPECT_EQ(run.status, 0) << run.err;
    for (const std::string& part : parts) EXPECT_THAT(run.out, HasSubstr(part));
    for (const char* left : {"@tool@", "@ask@", "@function@"}) EXPECT_THAT(run.out, Not(HasSubstr(left)));
    for (const char* pair : {"[]", "{}"})
      EXPECT_EQ(std::ranges::count(run.out, pair[0]), std::ranges::count(run.out, pair[1])) << shell << pair;
    if (test::runProgram("which", {shell}).status != 0) continue;
    const test::ProgramRun parsed = test::runProgram(shell, {parseOnly, folder.write("script", run.out)});
    EXPECT_EQ(parsed.status, 0) << parsed.err;
  }
}

TEST_F(Completion, AShellThatIsNone) {
  const test::ProgramRun run = runTool({"completion", "csh"});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("csh"));
}

}  // namespace cli_completion_test
}  // namespace gridbay
