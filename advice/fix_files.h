#pragma once

#include <span>
#include <string>

#include "advice/advice.h"
#include "platform/result.h"

namespace gridbay {

// Makes the data files of a fix, all or none. An error says which can't be made and why; a file that has one
// of the names already is one. `progress` is told how much is done, 0 to 1, and stops the work by false.
inline constexpr std::string_view kFixStopped = "The fix was stopped";
Outcome makeFiles(std::span<const AdviceFile> files, const FileProgress& progress);
void removeFiles(std::span<const AdviceFile> files);

// Whether two files hold the same; files of more than 100 kB are taken for different ones.
bool isSmallAndSame(const std::string& a, const std::string& b);

}  // namespace gridbay
