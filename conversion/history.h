#pragma once

#include <string>

namespace gridbay {

// The history of a file that is written now: that of what it is made from, if any, and a line with the moment
// (UTC) and how it came about.
std::string historyWith(const std::string& before, const std::string& how);

}  // namespace gridbay
