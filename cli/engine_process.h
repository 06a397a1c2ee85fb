#pragma once

#include <sys/types.h>

#include <cstddef>
#include <functional>
#include <string>
#include <vector>

#include "platform/result.h"

namespace gridbay::cli {

// How a process ended: its exit status, or 128 plus the signal that ended it.
struct ProcessEnd {
  int status = 0;
  bool interrupted = false;  // by us, because this program was told to stop
};

// A program to be run, and the file that takes what it says; with none it shares our standard streams, so
// that this is seen as it comes.
struct ProcessStart {
  std::string program;
  std::vector<std::string> arguments;
  std::string outputFile = {};
};

// Runs a program to its end. When this program is told to stop (SIGINT, SIGTERM, SIGHUP) the other one is
// asked to end, and killed if it does not within some seconds; so are all processes that it started.
Result<ProcessEnd> runProcess(const ProcessStart& start);

// Runs so many programs, numbered from 0, as many at once as said, and tells of each one's begin and end.
// When this program is told to stop those that run end as above, and no others are started. An error of one
// that can't be started is its end.
struct ProcessQueue {
  std::size_t count = 0;
  std::size_t atOnce = 1;
  std::function<ProcessStart(std::size_t number)> next;
  std::function<void(std::size_t number, pid_t process)> began = [](std::size_t, pid_t) {};
  std::function<void(std::size_t number, const Result<ProcessEnd>& end)> ended;

  // Whether all were started.
  bool run() const;
};

// What a program writes to its standard output until it ends, which it does soon. A program that ends with
// another status than 0 is an error, with what it wrote to its standard error.
Result<std::string> outputOf(const std::string& program, const std::vector<std::string>& arguments);

}  // namespace gridbay::cli
