#pragma once

#include <string>
#include <vector>

#include "cli/console.h"

namespace gridbay::cli {

// Setups to be run by one engine.
struct MembersRun {
  std::vector<std::string> files;
  std::string engine;
  bool bySlurm = false;  // or else on this machine
  bool force = false;    // with their faults too
};

// Checks all setups, and where none has faults runs them, with a folder that tells how they are. The exit
// status of the command.
int runMembers(const MembersRun& run, const Console& console);

// Tells how the setups of a run are, by its folder. The exit status of the command.
int showRun(const std::string& folder, const Console& console);

}  // namespace gridbay::cli
