#pragma once

#include <sys/types.h>

#include <string>
#include <string_view>

namespace gridbay::cli {

// A process as a line of text, for who looks for it later: its number, when it began, and the machine with
// the start of that, so that no other process with its number is taken for it. Empty where that can't be
// told.
std::string markOf(pid_t process);

// Whether a process has ended; false where that can't be told, as of one on another machine.
bool isGone(std::string_view mark);

}  // namespace gridbay::cli
