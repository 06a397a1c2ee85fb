#include "tests/support/programs.h"

#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <iostream>

#include "core/edition.h"
#include "tests/support/temporary_folder.h"

namespace gridbay::test {

ProgramRun runProgram(const std::string& program, const std::vector<std::string>& arguments,
                      const std::vector<std::string>& environment) {
  const TemporaryFolder folder;
  const std::string out = folder.file("out");
  const std::string err = folder.file("err");
  std::fflush(nullptr);
  std::cout.flush();
  const pid_t child = ::fork();
  if (child == 0) {
    if (std::freopen(out.c_str(), "w", stdout) == nullptr ||
        std::freopen(err.c_str(), "w", stderr) == nullptr)
      ::_exit(99);
    std::vector<std::string> words{program};
    words.insert(words.end(), arguments.begin(), arguments.end());
    std::vector<char*> argv;
    for (std::string& word : words) argv.push_back(word.data());
    argv.push_back(nullptr);
    for (const std::string& line : environment) ::putenv(const_cast<char*>(line.c_str()));
    ::execvp(program.c_str(), argv.data());
    ::_exit(98);
  }
  int status = 0;
  ::waitpid(child, &status, 0);
  return {WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status), textOf(out), textOf(err)};
}

std::string programPath(const std::string& name) {
  return std::string(GRIDBAY_PROGRAMS) + "/" + name;
}

std::string toolPath() {
  return programPath(theEdition.wetlandSweepKit ? "v27setup-wsk" : "v27setup");
}

ProgramRun runTool(const std::vector<std::string>& arguments, const std::vector<std::string>& environment) {
  return runProgram(toolPath(), arguments, environment);
}

}  // namespace gridbay::test
