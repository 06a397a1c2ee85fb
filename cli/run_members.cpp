#include "cli/run_members.h"

#include <fmt/format.h>
#include <unistd.h>

#include <map>
#include <set>

#include "batch/check_setups.h"
#include "cli/commands.h"
#include "cli/engine_process.h"
#include "cli/progress.h"
#include "cli/run_folder.h"
#include "cli/slurm.h"
#include "cli/stop_signals.h"
#include "platform/files/paths.h"
#include "platform/side_by_side.h"

namespace gridbay::cli {
namespace {

std::string counted(std::size_t count, std::string_view what) {
  return fmt::format("{} {}{}", count, what, count == 1 ? "" : "s");
}

// Whether the setups can be started: all of them loadable, and without faults unless they are to be passed
// over.
int check(const MembersRun& run, const Console& console) {
  std::set<std::string> seen;
  for (const std::string& file : run.files) {
    if (!seen.insert(absolutePath(file, {})).second)
      return console.fail(fmt::format("\"{}\" is named twice", file));
  }
  const StopSignals signals;
  const Result<std::vector<MemberReport>> reports = [&] {
    Progress progress(console, "Checked", run.files.size());
    return checkSetups(
        run.files, {[&](std::size_t done) { progress.reached(done); }, [&] { return signals.isStopped(); }});
  }();
  if (!reports) return console.fail(reports.error());
  std::size_t faulty = 0;
  bool isUnreadable = false;
  for (const MemberReport& report : *reports) {
    const auto note = [&](const std::string& text) { console.note(report.file + ": " + text); };
    for (const std::string& text : report.notes) note(text);
    for (const CMessage& message : report.messages) note(messageLine(message));
    if (!report.error.empty()) console.note(report.error);
    isUnreadable = isUnreadable || !report.error.empty();
    if (report.faults > 0) ++faulty;
  }
  if (isUnreadable) return kCouldNotDoIt;
  if (faulty == 0) return kClean;
  const std::string count = counted(faulty, "setup") + " with faults";
  if (run.force) {
    console.note(count + ", started nevertheless");
    return kClean;
  }
  console.note(count + ": none is started; --force starts all nevertheless");
  return kFaultsFound;
}

int submit(RunFolder& folder, const MembersRun& run, const Console& console) {
  if (const Outcome done = slurm::submit(folder, run.engine); !done) {
    if (folder.job().empty()) folder.remove();
    return console.fail(done.error());
  }
  console.out << fmt::format("Job {}: {}. \"{} run --status {}\" tells how they are\n", folder.job(),
                             counted(folder.count(), "setup"), toolName(), folder.path());
  return kClean;
}

// An engine that can't be started, or a state that can't be written, is told and counts as a failure.
int runHere(const RunFolder& folder, const MembersRun& run, const Console& console) {
  bool isWhole = true;
  const auto keep = [&](const Outcome& written) {
    if (!written) console.note(written.error());
    isWhole = isWhole && written;
  };
  bool areAllStarted = false;
  {
    keep(folder.setProcess(::getpid()));
    Progress progress(console, "Run", folder.count());
    std::size_t done = 0;
    areAllStarted = ProcessQueue{
        .count = folder.count(),
        .atOnce = coreCount(),
        .next =
            [&](std::size_t i) {
              return ProcessStart{run.engine, {folder.file(i + 1)}, folder.logOf(i + 1)};
            },
        .began = [&](std::size_t i, pid_t engine) { keep(folder.setRunning(i + 1, engine)); },
        .ended =
            [&](std::size_t i, const Result<ProcessEnd>& end) {
              constexpr int kNotStarted = 127;
              if (!end) console.note(end.error());
              keep(folder.setStatus(i + 1, end ? end->status : kNotStarted));
              progress.reached(++done);
            }}.run();
  }
  const int status = showRun(folder.path(), console);
  if (!areAllStarted) return console.fail("Stopped");
  return isWhole ? status : static_cast<int>(kCouldNotDoIt);
}

}  // namespace

int runMembers(const MembersRun& run, const Console& console) {
  if (const int status = check(run, console); status != kClean) return status;
  Result<RunFolder> folder = RunFolder::create(run.files);
  if (!folder) return console.fail(folder.error());
  console.out.flush();
  return run.bySlurm ? submit(*folder, run, console) : runHere(*folder, run, console);
}

int showRun(const std::string& path, const Console& console) {
  const Result<RunFolder> folder = RunFolder::open(path);
  if (!folder) return console.fail(folder.error());
  const bool isJob = !folder->job().empty();
  // The queue before its members: what is no longer in it then has its status already.
  std::map<std::size_t, std::string> tasks;
  std::size_t taskCount = 1;
  bool isQueueKnown = false;
  const bool isAsked = isJob && !folder->areAllEnded();
  if (isAsked) {
    Result<std::map<std::size_t, std::string>> queued = slurm::tasksOf(folder->job());
    const Result<std::size_t> count = slurm::taskCount(*folder);
    isQueueKnown = queued && count;
    if (isQueueKnown) {
      tasks = std::move(*queued);
      taskCount = *count;
    } else {
      console.note(fmt::format("What Slurm has ended itself is not known: {}",
                               queued ? count.error() : queued.error()));
    }
  }
  const bool isLeft = !isJob && folder->isLeft();
  std::size_t done = 0;
  std::size_t running = 0;
  std::size_t waiting = 0;
  std::string failures;
  std::size_t failed = 0;
  for (std::size_t number = 1; number <= folder->count(); ++number) {
    const RunFolder::Member member = folder->member(number);
    const bool isEndedBySlurm = isQueueKnown && !tasks.contains((number - 1) % taskCount + 1);
    // An engine whose run has been left may be at work still.
    const bool isStopped = isLeft && (!member.isRunning || member.isGone);
    if (member.status == 0) {
      ++done;
    } else if (member.status || isEndedBySlurm || isStopped) {
      ++failed;
      failures += member.status ? fmt::format("{} failed: status {}, see {}\n", member.file, *member.status,
                                              folder->logOf(number))
                                : fmt::format("{} failed: {}{}\n", member.file,
                                              isJob ? "Slurm ended it" : "stopped with its run",
                                              member.isRunning ? "" : " before it began");
    } else {
      ++(member.isRunning ? running : waiting);
    }
  }
  console.out << fmt::format("{}{}: {} done, {} failed, {} running, {} waiting\n{}",
                             isJob ? "Job " + folder->job() + ", " : "", counted(folder->count(), "setup"),
                             done, failed, running, waiting, failures);
  if (isAsked && !isQueueKnown) return kCouldNotDoIt;
  return failed == 0 ? kClean : kFaultsFound;
}

}  // namespace gridbay::cli
