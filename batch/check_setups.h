#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <vector>

#include "batch/member_report.h"
#include "setup/setup_file.h"

namespace gridbay {

// What a long piece of work on many setups asks of who waits for it.
struct BatchWatch {
  std::function<void(std::size_t done)> reached = [](std::size_t) {};
  // Asked between two setups; when it holds, those that were begun are finished and no others are.
  std::function<bool()> isStopped = [] { return false; };
};

// Checks a setup that has been loaded, its data files too.
void checkInto(MemberReport& report, SetupFile& setup);

// Checks setups side by side, on as many cores as there are; the reports are in the order of the files, and
// have their names. An error of a file is in its report. Fails where the work cannot be done at all, or was
// stopped.
Result<std::vector<MemberReport>> checkSetups(const std::vector<std::string>& files, const BatchWatch& watch);

}  // namespace gridbay
