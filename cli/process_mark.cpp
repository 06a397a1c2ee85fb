#include "cli/process_mark.h"

#include <fmt/format.h>
#include <sys/utsname.h>

#include <fstream>
#include <sstream>

namespace gridbay::cli {
namespace {

// What the system tells of a process: in what state it is, and when it began, in ticks since its own start.
struct Told {
  char state = 0;  // 0 where there is no such process
  std::string start;
};

Told told(std::string_view process) {
  std::ifstream file(fmt::format("/proc/{}/stat", process));
  std::string line;
  std::getline(file, line);
  // The name of the program stands in brackets, and may have any in it.
  const std::size_t name = line.rfind(')');
  if (name == line.npos) return {};
  constexpr int kStart = 22;  // of the words, as proc(5) counts them: the state is the third
  std::istringstream words(line.substr(name + 1));
  Told about;
  words >> about.state;
  for (int word = 4; word <= kStart; ++word) words >> about.start;
  return words ? about : Told{};
}

std::string machine() {
  utsname names{};
  ::uname(&names);
  return names.nodename;
}

std::string startOfMachine() {
  std::ifstream file("/proc/sys/kernel/random/boot_id");
  std::string id;
  std::getline(file, id);
  return id;
}

}  // namespace

std::string markOf(pid_t process) {
  const Told about = told(std::to_string(process));
  if (about.state == 0) return {};
  return fmt::format("{} {} {} {}", process, about.start, startOfMachine(), machine());
}

bool isGone(std::string_view mark) {
  std::istringstream words{std::string(mark)};
  std::string process;
  std::string start;
  std::string startedWith;
  std::string on;
  if (!(words >> process >> start >> startedWith >> on) || on != machine()) return false;
  if (startedWith != startOfMachine()) return true;
  const Told about = told(process);
  constexpr std::string_view kEnded = "ZX";
  return about.start != start || kEnded.find(about.state) != kEnded.npos;
}

}  // namespace gridbay::cli
