// The commands for many setups: an ensemble made, and several setups run at once.

#include <gmock/gmock.h>
#include <signal.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <filesystem>
#include <sstream>
#include <thread>

#include "cli/progress.h"
#include "core/edition.h"
#include "platform/side_by_side.h"
#include "tests/support/grids.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace cli_members_test {

namespace fs = std::filesystem;
using test::ProgramRun;
using test::runTool;
using test::textOf;
using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::StartsWith;

const std::string kDrying = "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth";
const std::string kKind = "." + std::string(theEdition.fileKind);

// A program started by itself, to be told to stop.
class Started {
 public:
  explicit Started(std::vector<std::string> words) : process_(::fork()) {
    if (process_ != 0) return;
    words.insert(words.begin(), test::toolPath());
    std::vector<char*> argv;
    for (std::string& word : words) argv.push_back(word.data());
    argv.push_back(nullptr);
    if (std::freopen("/dev/null", "w", stdout) == nullptr ||
        std::freopen("/dev/null", "w", stderr) == nullptr)
      ::_exit(97);
    ::execv(argv[0], argv.data());
    ::_exit(98);
  }
  int endWith(int signal) {
    ::kill(process_, signal);
    int status = 0;
    ::waitpid(process_, &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
  }

 private:
  pid_t process_;
};

void waitFor(const std::function<bool()>& condition) {
  for (int i = 0; i < 1000 && !condition(); ++i) std::this_thread::sleep_for(std::chrono::milliseconds(10));
}

// What is told of a hundred pieces that take a time each.
std::string toldOf(bool onTerminal, std::chrono::milliseconds each) {
  std::ostringstream out;
  std::ostringstream err;
  const cli::Console console{out, err, {}};
  std::chrono::steady_clock::time_point now;
  {
    cli::Progress progress(console, "Members", 100, onTerminal, [&now] { return now; });
    for (std::size_t done = 1; done <= 100; ++done) {
      now += each;
      progress.reached(done);
    }
  }
  EXPECT_EQ(out.str(), "");
  return err.str();
}

TEST(Progress, IsALineThatIsWrittenOverOnATerminalAlone) {
  using std::chrono::milliseconds;
  EXPECT_EQ(toldOf(true, milliseconds(2)), "");
  EXPECT_THAT(toldOf(true, milliseconds(100)), StartsWith("\rMembers 3 %\rMembers 4 %"));
  EXPECT_THAT(toldOf(true, milliseconds(100)), EndsWith("\rMembers 100 %\n"));
  EXPECT_EQ(toldOf(false, milliseconds(99)), "");
  EXPECT_EQ(toldOf(false, milliseconds(400)), "Members 25 %\nMembers 50 %\nMembers 75 %\nMembers 100 %\n");
}

class Members : public ::testing::Test {
 protected:
  Members() {
    test::writeGrid(folder.file("grid.tsb2"), {}, [](int j, int) { return j < 3 ? -5.0F : 10.0F; });
    const ProgramRun run = runTool({"new", base, "--area", folder.file("grid.tsb2")});
    EXPECT_EQ(run.status, 0) << run.err;
  }
  std::string table(const std::string& text) { return folder.write("table.csv", text); }
  // Makes members of these names.
  std::vector<std::string> make(const std::vector<std::string>& names) {
    std::string text = "name," + kDrying + "\n";
    std::vector<std::string> files;
    for (const std::string& name : names) {
      text += name + ",0.01\n";
      files.push_back(out + "/" + name + kKind);
    }
    const ProgramRun run = runTool({"ensemble", table(text), base, out});
    EXPECT_EQ(run.status, 0) << run.err;
    return files;
  }
  // An engine that says its setup's name, and fails for one whose name begins with "bad".
  std::string engine(const std::string& more = "") {
    const std::string path =
        folder.write("gridbay", "#!/bin/sh\nname=$(basename \"$1\")\necho \"ran $name\"\n" + more +
                                    "\ncase $name in bad*) exit 3;; esac\n");
    EXPECT_EQ(::chmod(path.c_str(), 0755), 0);
    return path;
  }
  ProgramRun run(std::vector<std::string> words, const std::vector<std::string>& files) {
    words.insert(words.begin(), "run");
    words.insert(words.end(), files.begin(), files.end());
    return runTool(words);
  }

  test::TemporaryFolder folder;
  std::string base = folder.file("base" + kKind);
  std::string out = folder.file("out");
};

TEST_F(Members, AnEnsembleIsMadeAndReported) {
  ProgramRun run = runTool({"ensemble", table("name," + kDrying + "\nwell,0.01\ndry,-1\n"), base, out});
  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.out, out + ": 2 members, 1 with faults; see " + out + "/report.csv\n");
  EXPECT_EQ(textOf(out + "/report.csv"),
            "\"member\",\"file\",\"faults\",\"messages\"\n\"well\",\"" + out + "/well" + kKind +
                "\",\"0\",\"\"\n\"dry\",\"" + out + "/dry" + kKind +
                "\",\"1\",\"page 26, severity 1: Drying depth must be positive\"\n");
  EXPECT_EQ(runTool({"get", out + "/well" + kKind, kDrying}).out, "0.01\n");
  EXPECT_EQ(runTool({"validate", out + "/well" + kKind}).status, 0);

  run = runTool({"ensemble", table("name," + kDrying + "\nwell,0.02\n"), base, out});
  EXPECT_EQ(run.status, 2);
  EXPECT_THAT(run.err, HasSubstr("is there already; --force replaces it"));
  run = runTool({"ensemble", table("name," + kDrying + "\nwell,0.02\n"), base, out, "--force"});
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.out, out + ": 1 member, 0 with faults; see " + out + "/report.csv\n");
  EXPECT_EQ(runTool({"get", out + "/well" + kKind, kDrying}).out, "0.02\n");
}

TEST_F(Members, ThatSeveralMakeTheSameFileIsAWarning) {
  const std::string outputs = "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/";
  ASSERT_EQ(runTool({"set", base, outputs + "Number_Of_Output_areas=1"}).err, "");
  const ProgramRun run =
      runTool({"ensemble", table("name," + outputs + "OUTPUT_AREA_1/File_Name\na,maps.tsb2\nb,maps.tsb2\n"),
               base, out});
  EXPECT_NE(run.status, 2);
  EXPECT_EQ(run.err, "Warning: all 2 members make \"" + out +
                         "/maps.tsb2\": each run replaces what another one made\n");
  EXPECT_THAT(textOf(out + "/report.csv"), HasSubstr("Warning: 1 other member makes"));
}

TEST_F(Members, AnEnsembleThatCannotBe) {
  const std::string file = table("name," + kDrying + "\nm,wet\n");
  ProgramRun run = runTool({"ensemble", file, base, out});
  EXPECT_EQ(run.status, 2);
  EXPECT_EQ(run.err,
            file + ", line 2 (m), column 2 (" + kDrying + "): Drying_Depth takes a number, not \"wet\"\n");
  EXPECT_FALSE(fs::exists(out));
  EXPECT_EQ(runTool({"ensemble", folder.file("none.csv"), base, out}).status, 2);
  EXPECT_EQ(runTool({"ensemble", file, folder.file("none" + kKind), out}).status, 2);
  EXPECT_THAT(runTool({"ensemble", file, base}).err, HasSubstr("FOLDER is required"));
}

TEST_F(Members, AnEnsembleThatIsStoppedHasWholeFilesAndAReport) {
  std::string text = kDrying + "\n";
  for (int i = 0; i < 20000; ++i) text += "0.01\n";
  Started tool({"ensemble", table(text), base, out});
  waitFor([&] { return fs::exists(out) && !fs::is_empty(out); });
  EXPECT_EQ(tool.endWith(SIGINT), 2);
  std::size_t files = 0;
  for (const auto& entry : fs::directory_iterator(out)) {
    const std::string name = entry.path().filename().string();
    EXPECT_FALSE(name.starts_with(".")) << name;
    if (!name.ends_with(kKind)) continue;
    ++files;
    EXPECT_THAT(textOf(entry.path().string()), ::testing::EndsWith("}\n"));
  }
  EXPECT_GT(files, 0U);
  EXPECT_LT(files, 20000U);
  const std::string report = textOf(out + "/report.csv");
  EXPECT_EQ(static_cast<std::size_t>(std::ranges::count(report, '\n')), files + 1);
}

TEST_F(Members, SeveralRunOnAsManyCoresAsThereAre) {
  const std::vector<std::string> files = make({"a", "bad", "c", "d", "e"});
  // Each leaves a mark while it runs, and counts the marks that it sees.
  const std::string marks = folder.file("marks");
  fs::create_directory(marks);
  const std::string program =
      engine("touch " + marks + "/$$; ls " + marks + " | wc -l; sleep 0.2; rm " + marks + "/$$");
  const ProgramRun ran = run({"--engine", program}, files);
  EXPECT_EQ(ran.status, 1) << ran.err;
  EXPECT_EQ(ran.out, "5 setups: 4 done, 1 failed, 0 running, 0 waiting\n" + files[1] +
                         " failed: status 3, see " + out + "/run-1/2.log\n");
  int most = 0;
  for (int n = 1; n <= 5; ++n) {
    const std::string log = textOf(out + "/run-1/" + std::to_string(n) + ".log");
    EXPECT_THAT(log,
                StartsWith("ran " + fs::path(files[static_cast<std::size_t>(n) - 1]).filename().string()));
    most = std::max(most, std::stoi(log.substr(log.find('\n'))));
  }
  EXPECT_LE(most, static_cast<int>(coreCount()));
  if (coreCount() > 1) EXPECT_GT(most, 1);

  const ProgramRun status = runTool({"run", "--status", out + "/run-1"});
  EXPECT_EQ(status.out, ran.out);
  EXPECT_EQ(status.status, 1);
  const ProgramRun again = run({"--engine", program}, {files[0], files[2]});
  EXPECT_EQ(again.status, 0);
  EXPECT_EQ(again.out, "2 setups: 2 done, 0 failed, 0 running, 0 waiting\n");
  EXPECT_EQ(runTool({"run", "--status", out + "/run-2"}).status, 0);
}

TEST_F(Members, NoneIsStartedWithFaultsUnasked) {
  std::vector<std::string> files = make({"a", "b"});
  ASSERT_EQ(runTool({"set", files[1], kDrying + "=-1"}).status, 0);
  const std::string program = engine();
  ProgramRun ran = run({"--engine", program}, files);
  EXPECT_EQ(ran.status, 1);
  EXPECT_EQ(ran.out, "");
  EXPECT_THAT(ran.err,
              ::testing::EndsWith(files[1] +
                                  ": page 26, severity 1: Drying depth must be positive\n"
                                  "1 setup with faults: none is started; --force starts all nevertheless\n"));
  EXPECT_FALSE(fs::exists(out + "/run-1"));
  ran = run({"--engine", program, "--force"}, files);
  EXPECT_EQ(ran.status, 0);
  EXPECT_THAT(ran.err, HasSubstr("1 setup with faults, started nevertheless\n"));
  files.push_back(folder.file("none" + kKind));
  EXPECT_EQ(run({"--engine", program, "--force"}, files).status, 2);
  ran = run({"--engine", program}, {files[0], out + "/../out/a" + kKind});
  EXPECT_EQ(ran.status, 2);
  EXPECT_THAT(ran.err, HasSubstr("is named twice"));
}

TEST_F(Members, ARunThatIsStoppedEndsItsEngines) {
  const std::vector<std::string> files = make({"a", "b", "c", "d", "e", "f", "g", "h"});
  const std::string program = engine("trap 'exit 9' TERM; touch \"$1.on\"; while :; do sleep 0.05; done");
  std::vector<std::string> words{"run", "--engine", program};
  words.insert(words.end(), files.begin(), files.end());
  Started tool(words);
  waitFor([&] { return fs::exists(files[0] + ".on"); });
  EXPECT_EQ(tool.endWith(SIGINT), 2);
  const ProgramRun status = runTool({"run", "--status", out + "/run-1"});
  EXPECT_THAT(status.out, HasSubstr(files[0] + " failed: status 9"));
  EXPECT_THAT(status.out, HasSubstr(" 0 done, 8 failed, 0 running, 0 waiting\n"));
  if (coreCount() < files.size())
    EXPECT_THAT(status.out, HasSubstr(files[7] + " failed: stopped with its run before it began\n"));
}

// Nobody tells any more how the engines of a killed tool end.
TEST_F(Members, ARunWhoseToolIsKilledIsStopped) {
  const std::vector<std::string> files = make({"a", "b", "c", "d", "e", "f", "g", "h"});
  const std::size_t begun = std::min(coreCount(), files.size());
  const std::string program =
      engine("echo $$ >\"$1.new\" && mv \"$1.new\" \"$1.pid\"; while :; do sleep 0.05; done");
  std::vector<std::string> words{"run", "--engine", program};
  words.insert(words.end(), files.begin(), files.end());
  Started tool(words);
  const auto status = [&] { return runTool({"run", "--status", out + "/run-1"}); };
  const auto counted = [&](std::size_t failed, std::size_t running, std::size_t waiting) {
    return "8 setups: 0 done, " + std::to_string(failed) + " failed, " + std::to_string(running) +
           " running, " + std::to_string(waiting) + " waiting\n";
  };
  waitFor([&] { return status().out.find(" " + std::to_string(begun) + " running") != std::string::npos; });
  EXPECT_EQ(status().out, counted(0, begun, 8 - begun));
  waitFor([&] { return fs::exists(files[begun - 1] + ".pid"); });
  EXPECT_EQ(tool.endWith(SIGKILL), 128 + SIGKILL);
  // Those that it has started are at work still.
  EXPECT_THAT(status().out, StartsWith(counted(8 - begun, begun, 0)));
  for (std::size_t i = 0; i < begun; ++i) {
    waitFor([&] { return fs::exists(files[i] + ".pid"); });
    ASSERT_EQ(::kill(std::stoi(textOf(files[i] + ".pid")), SIGKILL), 0);
  }
  std::string expected = counted(8, 0, 0);
  for (std::size_t i = 0; i < files.size(); ++i)
    expected += files[i] + " failed: stopped with its run" + (i < begun ? "" : " before it began") + "\n";
  waitFor([&] { return status().out == expected; });
  EXPECT_EQ(status().out, expected);
  EXPECT_EQ(status().status, 1);

  // A process with the number of one that has ended is another one; what is elsewhere can't be told.
  const std::string file = out + "/run-1/1.status";
  std::istringstream line(textOf(file));
  std::string word, process, start, machineStart, machine;
  line >> word >> process >> start >> machineStart >> machine;
  EXPECT_EQ(word, "running");
  const std::string own = std::to_string(::getpid());
  for (const auto& [mark, running] : {std::pair(own + " " + start + " " + machineStart + " " + machine, 0),
                                      {process + " " + start + " other " + machine, 0},
                                      {process + " " + start + " " + machineStart + " elsewhere", 1},
                                      {std::string(), 1}}) {
    folder.write("out/run-1/1.status", "running " + mark + "\n");
    EXPECT_THAT(status().out, HasSubstr(" " + std::to_string(running) + " running, 0 waiting\n")) << mark;
  }
}

TEST_F(Members, ARunThatIsNone) {
  EXPECT_EQ(runTool({"run"}).status, 2);
  EXPECT_EQ(runTool({"run"}).err, "FILE is required\n");
  EXPECT_THAT(runTool({"run", "--status", out}).err, HasSubstr("is no folder of a run"));
  EXPECT_EQ(runTool({"run", "--status", out, base}).status, 2);
  const std::vector<std::string> files = make({"a", "b"});
  EXPECT_THAT(runTool({"run", files[0], files[1]}, {"PATH=/nowhere"}).err, HasSubstr("There is no engine"));
}

TEST_F(Members, WithoutSlurmTheyRunHere) {
  const std::vector<std::string> files = make({"a", "bad"});
  fs::create_directory(folder.file("bin"));
  for (const char* program : {"basename", "sh"})
    fs::create_symlink(fs::exists("/usr/bin/" + std::string(program)) ? "/usr/bin/" + std::string(program)
                                                                      : "/bin/" + std::string(program),
                       folder.file("bin/" + std::string(program)));
  const ProgramRun ran =
      runTool({"run", "--slurm", "--engine", engine(), files[0], files[1]}, {"PATH=" + folder.file("bin")});
  EXPECT_EQ(ran.status, 1);
  EXPECT_THAT(ran.err, StartsWith("There is no sbatch on the PATH: the run is made on this machine\n"));
  EXPECT_THAT(ran.out, StartsWith("2 setups: 1 done, 1 failed"));
}

// Where Slurm is there but does not answer.
TEST_F(Members, ASlurmThatDoesNotAnswer) {
  const std::vector<std::string> files = make({"a", "b"});
  fs::create_directory(folder.file("bin"));
  for (const char* program : {"sbatch", "scontrol", "squeue"}) {
    const std::string path = folder.write("bin/" + std::string(program), "#!/bin/sh\nexit 1\n");
    ASSERT_EQ(::chmod(path.c_str(), 0755), 0);
  }
  const std::vector<std::string> noSlurm{"PATH=" + folder.file("bin")};
  const ProgramRun ran = runTool({"run", "--slurm", "--engine", engine(), files[0], files[1]}, noSlurm);
  EXPECT_EQ(ran.status, 2);
  EXPECT_FALSE(fs::exists(out + "/run-1")) << "a folder of a run that never was";

  // What is known of a job is told without it.
  fs::create_directory(out + "/run-1");
  folder.write("out/run-1/members", files[0] + "\n" + files[1] + "\n");
  folder.write("out/run-1/job", "7\n");
  folder.write("out/run-1/tasks", "2\n");
  folder.write("out/run-1/1.status", "0\n");
  const auto status = [&] { return runTool({"run", "--status", out + "/run-1"}, noSlurm); };
  EXPECT_EQ(status().status, 2);
  EXPECT_EQ(status().out, "Job 7, 2 setups: 1 done, 0 failed, 0 running, 1 waiting\n");
  EXPECT_THAT(status().err, StartsWith("What Slurm has ended itself is not known: "));
  folder.write("out/run-1/2.status", "0\n");
  EXPECT_EQ(status().status, 0);
  EXPECT_EQ(status().out, "Job 7, 2 setups: 2 done, 0 failed, 0 running, 0 waiting\n");
  EXPECT_EQ(status().err, "");
}

// Runs the tool's words with a Slurm of the test's own; skips the test where it can't be had.
class BySlurm : public Members {
 protected:
  ProgramRun withSlurm(const std::string& script) {
    const test::TemporaryFolder slurm;
    const std::string file =
        folder.write("script", "tool=" + test::toolPath() + "\ncd " + out + "\n" + script);
    return test::runProgram(std::string(GRIDBAY_TESTS) + "/support/with_slurm",
                            {slurm.path().string(), "bash", file});
  }
  // Waits until no member runs or waits.
  static constexpr const char* kWait =
      "for i in $(seq 300); do $tool run --status run-1 >status; code=$?\n"
      "grep -q ' 0 running, 0 waiting' status && break; sleep 0.1; done\n"
      "cat status; exit $code\n";
};
constexpr int kNoSlurm = 77;

TEST_F(BySlurm, MembersAreOneJobArrayWithItsStatus) {
  const std::vector<std::string> files = make({"a", "bad1", "c", "d", "bad2"});
  // The folder's arrays have three tasks: two of them run two members.
  const ProgramRun ran =
      withSlurm("$tool run --slurm --engine " + engine("sleep 0.3") + " a" + kKind + " bad1" + kKind + " c" +
                kKind + " d" + kKind + " bad2" + kKind + " || exit\n$tool run --status run-1\n" + kWait);
  if (ran.status == kNoSlurm) GTEST_SKIP() << ran.err;
  EXPECT_EQ(ran.status, 1) << ran.err;
  const std::string tool = fs::path(test::toolPath()).filename().string();
  EXPECT_THAT(ran.out, StartsWith("Job 1: 5 setups. \"" + tool + " run --status " + out +
                                  "/run-1\" tells how they are\nJob 1, 5 setups: 0 done, 0 failed, "));
  EXPECT_THAT(ran.out, ::testing::EndsWith("Job 1, 5 setups: 3 done, 2 failed, 0 running, 0 waiting\n" +
                                           files[1] + " failed: status 3, see run-1/2.log\n" + files[4] +
                                           " failed: status 3, see run-1/5.log\n"));
  for (std::size_t n = 1; n <= files.size(); ++n)
    EXPECT_EQ(textOf(out + "/run-1/" + std::to_string(n) + ".log"),
              "ran " + fs::path(files[n - 1]).filename().string() + "\n");
}

TEST_F(BySlurm, MembersWhoseJobIsCancelledHaveFailed) {
  const std::vector<std::string> files = make({"a", "b", "c"});
  const ProgramRun ran = withSlurm("$tool run --slurm --engine " + engine("sleep 60") + " a" + kKind + " b" +
                                   kKind + " c" + kKind +
                                   " || exit\nfor i in $(seq 300); do $tool run --status run-1 >status\n"
                                   "grep -q ' 2 running, 1 waiting' status && break; sleep 0.1; done\n"
                                   "cat status; scancel 1\n" +
                                   kWait);
  if (ran.status == kNoSlurm) GTEST_SKIP() << ran.err;
  EXPECT_EQ(ran.status, 1) << ran.err;
  EXPECT_THAT(ran.out, HasSubstr("Job 1, 3 setups: 0 done, 0 failed, 2 running, 1 waiting\n"));
  EXPECT_THAT(ran.out,
              ::testing::EndsWith("Job 1, 3 setups: 0 done, 3 failed, 0 running, 0 waiting\n" + files[0] +
                                  " failed: Slurm ended it\n" + files[1] + " failed: Slurm ended it\n" +
                                  files[2] + " failed: Slurm ended it before it began\n"));
}

TEST_F(BySlurm, AJobThatSlurmRefusesIsToldAndNothingRuns) {
  make({"a", "b"});
  const ProgramRun ran = withSlurm("export SBATCH_PARTITION=nowhere\n$tool run --slurm --engine " + engine() +
                                   " a" + kKind + " b" + kKind);
  if (ran.status == kNoSlurm) GTEST_SKIP() << ran.err;
  EXPECT_EQ(ran.status, 2);
  EXPECT_THAT(ran.err, HasSubstr("invalid partition specified: nowhere"));
  EXPECT_FALSE(fs::exists(out + "/run-1"));
}

}  // namespace cli_members_test
}  // namespace gridbay
