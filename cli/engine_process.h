#pragma once

#include <string>
#include <vector>

#include "platform/result.h"

namespace gridbay::cli {

// How a process ended: its exit status, or 128 plus the signal that ended it.
struct ProcessEnd {
  int status = 0;
  bool interrupted = false;  // by us, because this program was told to stop
};

// Runs a program to its end. It shares our standard streams, so that its output is seen as it comes. When
// this program is told to stop (SIGINT, SIGTERM, SIGHUP) the other one is asked to end, and killed if it does
// not within some seconds; so are all processes that it started.
Result<ProcessEnd> runProcess(const std::string& program, const std::vector<std::string>& arguments);

}  // namespace gridbay::cli
