#pragma once

#include <string>
#include <vector>

#include "compare/setup_difference.h"

namespace gridbay {

// What a copy of this process has found out, as bytes on its way back.
std::string packed(SetupDifference found);
std::string packed(std::vector<MergeQuestion> questions);
// False where they are none of these.
bool unpack(const std::string& bytes, SetupDifference& found);
bool unpack(const std::string& bytes, std::vector<MergeQuestion>& questions);

}  // namespace gridbay
