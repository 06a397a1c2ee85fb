#pragma once

#include <ostream>
#include <string>
#include <string_view>
#include <vector>

#include "core/message.h"
#include "setup/setup_file.h"

namespace gridbay::cli {

// The exit statuses of every command.
enum ExitStatus : int { kClean = 0, kFaultsFound = 1, kCouldNotDoIt = 2 };

// Where a command writes: results to `out`, all else to `err`.
struct Console {
  std::ostream& out;
  std::ostream& err;
  std::string commandLine;  // what was asked for, as a shell would take it again

  int fail(std::string_view why) const;
  void note(std::string_view text) const;
};

// What a load has to say, on standard error.
class ConsoleMessageHost : public MessageHost {
 public:
  explicit ConsoleMessageHost(const Console& console) : console_(console) {}

  void show(const std::string& text) override { console_.note(text); }

 private:
  const Console& console_;
};

// A word as a shell takes it.
std::string shellText(std::string_view word);

// A message of a validation on one line.
std::string messageLine(const CMessage& message);

// Saves a setup to its own file, and says which of its sections this version does not know and leaves out.
int saveSetup(SetupFile& setup, const std::string& path, const Console& console);

}  // namespace gridbay::cli
