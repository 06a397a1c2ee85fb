#pragma once

#include <ostream>

namespace gridbay::cli {

// Runs the tool on a command line and returns its exit status.
int runCommandLine(int argc, const char* const* argv, std::ostream& out, std::ostream& err);

}  // namespace gridbay::cli
