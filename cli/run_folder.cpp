#include "cli/run_folder.h"

#include <fmt/format.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <filesystem>

#include "cli/process_mark.h"
#include "core/number_text.h"
#include "platform/files/file_descriptor.h"
#include "platform/files/paths.h"
#include "platform/files/read_file.h"
#include "platform/files/save_file.h"

namespace gridbay::cli {
namespace {

namespace fs = std::filesystem;

constexpr const char* kMembers = "members";
constexpr const char* kJob = "job";
constexpr const char* kProcess = "process";
constexpr std::string_view kRunning = "running";

std::string inFolder(const std::string& folder, const std::string& name) {
  return (fs::path(folder) / name).string();
}

std::string statusName(std::size_t number) {
  return fmt::format("{}.status", number);
}

std::vector<std::string> linesOf(std::string_view text) {
  std::vector<std::string> lines;
  while (!text.empty()) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    lines.emplace_back(text.substr(0, end));
    text.remove_prefix(std::min(end + 1, text.size()));
  }
  return lines;
}

}  // namespace

Result<RunFolder> RunFolder::create(const std::vector<std::string>& files) {
  std::vector<std::string> absolute;
  std::string members;
  for (const std::string& file : files) {
    if (file.find('\n') != file.npos) return Failure{fmt::format("\"{}\" has a line feed in its name", file)};
    absolute.push_back(absolutePath(file, {}));
    members += absolute.back() + "\n";
  }
  const std::string parent = folderOfFile(files.front());
  for (int number = 1;; ++number) {
    const std::string path = inFolder(parent, fmt::format("run-{}", number));
    if (::mkdir(path.c_str(), 0777) == 0) {
      RunFolder folder(path, std::move(absolute));
      if (Outcome written = folder.write(kMembers, members); !written) {
        folder.remove();
        return Failure{written.error()};
      }
      return folder;
    }
    if (errno != EEXIST) return Failure{systemError("cannot make the folder", path)};
  }
}

Result<RunFolder> RunFolder::open(const std::string& path) {
  const Result<FileText> members = readFile(inFolder(path, kMembers));
  if (!members) return Failure{fmt::format("\"{}\" is no folder of a run: {}", path, members.error())};
  RunFolder folder(path, linesOf(members->view()));
  if (const Result<FileText> job = readFile(inFolder(path, kJob)))
    folder.job_ = job->view().substr(0, job->view().find('\n'));
  return folder;
}

std::string RunFolder::logOf(std::size_t number) const {
  return inFolder(path_, fmt::format("{}.log", number));
}

RunFolder::Member RunFolder::member(std::size_t number) const {
  Member member{.file = file(number), .status = {}};
  const std::string name = inFolder(path_, statusName(number));
  std::error_code error;
  if (!fs::exists(name, error)) return member;
  const Result<FileText> text = readFile(name);
  if (!text) return member;
  const std::string_view line = text->view().substr(0, text->view().find('\n'));
  member.isRunning = line.starts_with(kRunning);
  if (member.isRunning) member.isGone = isGone(line.substr(kRunning.size()));
  member.status = int32OfText(line);
  return member;
}

bool RunFolder::areAllEnded() const {
  for (std::size_t number = 1; number <= count(); ++number) {
    if (!member(number).status) return false;
  }
  return true;
}

void RunFolder::remove() const {
  std::error_code ignored;
  fs::remove_all(path_, ignored);
}

Outcome RunFolder::setJob(const std::string& job) {
  job_ = job;
  return write(kJob, job + "\n");
}

bool RunFolder::isLeft() const {
  const Result<FileText> process = readFile(inFolder(path_, kProcess));
  return process && isGone(process->view());
}

Outcome RunFolder::setProcess(pid_t process) const {
  return write(kProcess, markOf(process) + "\n");
}

Outcome RunFolder::setRunning(std::size_t number, pid_t engine) const {
  return write(statusName(number), fmt::format("{} {}\n", kRunning, markOf(engine)));
}

Outcome RunFolder::setStatus(std::size_t number, int status) const {
  return write(statusName(number), fmt::format("{}\n", status));
}

Outcome RunFolder::write(const std::string& name, const std::string& text) const {
  return saveFile(inFolder(path_, name), text, FileSave::Flush::withOthers);
}

}  // namespace gridbay::cli
