#pragma once

#include <string>
#include <vector>

namespace gridbay::test {

struct ProgramRun {
  int status = -1;
  std::string out;
  std::string err;
};

// Runs a program to its end with its output kept; `environment` has lines such as NAME=value.
ProgramRun runProgram(const std::string& program, const std::vector<std::string>& arguments,
                      const std::vector<std::string>& environment = {});

// The tool of the edition that is under test, or another program of this build.
std::string toolPath();
std::string programPath(const std::string& name);
ProgramRun runTool(const std::vector<std::string>& arguments,
                   const std::vector<std::string>& environment = {});

}  // namespace gridbay::test
