#include "cli/slurm.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>
#include <optional>

#include "cli/engine_process.h"
#include "cli/programs.h"
#include "core/number_text.h"
#include "platform/files/read_file.h"

namespace gridbay::cli::slurm {
namespace {

constexpr const char* kTasks = "tasks";

// What each task does. It tells of a member by a rename, so that no one reads half a status.
constexpr const char* kTaskScript = R"(#!/bin/bash
# Runs the members of one task of a job array: its own number's, and each so many further on as there are tasks.
folder=$1 engine=$2 tasks=$3 worst=0
mapfile -t members <"$folder/members"
tell() { echo "$2" >"$folder/.$1.status" && mv "$folder/.$1.status" "$folder/$1.status"; }
for ((n = SLURM_ARRAY_TASK_ID; n <= ${#members[@]}; n += tasks)); do
  tell "$n" running
  "$engine" "${members[n - 1]}" >"$folder/$n.log" 2>&1 </dev/null
  status=$?
  tell "$n" $status
  ((status > worst)) && worst=$status
done
exit $worst
)";

std::string_view trimmed(std::string_view text) {
  const std::size_t first = text.find_first_not_of(" \n");
  return first == text.npos ? std::string_view()
                            : text.substr(first, text.find_last_not_of(" \n") - first + 1);
}

// The most tasks of an array: their numbers are below MaxArraySize.
Result<std::size_t> mostTasks() {
  const Result<std::string> shown = outputOf(findProgram("scontrol"), {"show", "config"});
  if (!shown) return Failure{shown.error()};
  std::string_view text = *shown;
  text.remove_prefix(std::min(text.find("MaxArraySize"), text.size()));
  text = text.substr(0, text.find('\n'));
  const std::optional<std::int32_t> size =
      int32OfText(trimmed(text.substr(std::min(text.find('='), text.size() - 1) + 1)));
  if (!size || *size < 2) return Failure{"Slurm takes no job arrays here"};
  return static_cast<std::size_t>(*size) - 1;
}

}  // namespace

bool isThere() {
  return !findProgram("sbatch").empty();
}

Outcome submit(RunFolder& folder, const std::string& engine) {
  const Result<std::size_t> most = mostTasks();
  if (!most) return Failure{most.error()};
  const std::size_t tasks = std::min(*most, folder.count());
  const std::string script = (std::filesystem::path(folder.path()) / "task").string();
  if (Outcome written = folder.write("task", kTaskScript); !written) return written;
  if (Outcome written = folder.write(kTasks, fmt::format("{}\n", tasks)); !written) return written;
  const Result<std::string> job = outputOf(
      findProgram("sbatch"), {"--parsable", fmt::format("--array=1-{}", tasks), "--job-name=gridbay",
                              "--output=/dev/null", script, folder.path(), engine, std::to_string(tasks)});
  if (!job) return Failure{job.error()};
  // A cluster's name may stand behind the number.
  const std::string number(trimmed(std::string_view(*job).substr(0, job->find(';'))));
  if (const Outcome kept = folder.setJob(number); !kept)
    return Failure{
        fmt::format("Job {} is queued, but its folder does not know it: {}", number, kept.error())};
  return {};
}

Result<std::map<std::size_t, std::string>> tasksOf(const std::string& job) {
  const std::string squeue = findProgram("squeue");
  if (squeue.empty()) return Failure{"squeue, which tells how a job is, is not on the PATH"};
  const Result<std::string> shown =
      outputOf(squeue, {"--noheader", "--array", "--jobs=" + job, "--format=%K %T"});
  std::map<std::size_t, std::string> tasks;
  if (!shown && shown.error().find("Invalid job id") != std::string::npos) return tasks;
  if (!shown) return Failure{shown.error()};
  for (std::string_view text = *shown; !text.empty();) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    const std::string_view line = trimmed(text.substr(0, end));
    text.remove_prefix(std::min(end + 1, text.size()));
    const std::size_t blank = line.find(' ');
    const std::optional<std::int32_t> number = int32OfText(line.substr(0, blank));
    if (number && *number > 0 && blank != line.npos)
      tasks[static_cast<std::size_t>(*number)] = std::string(trimmed(line.substr(blank)));
  }
  return tasks;
}

Result<std::size_t> taskCount(const RunFolder& folder) {
  const std::string path = (std::filesystem::path(folder.path()) / kTasks).string();
  const Result<FileText> text = readFile(path);
  if (!text) return Failure{text.error()};
  const std::optional<std::int32_t> count = int32OfText(trimmed(text->view()));
  if (!count || *count < 1) return Failure{fmt::format("\"{}\" has no number of tasks", path)};
  return static_cast<std::size_t>(*count);
}

}  // namespace gridbay::cli::slurm
