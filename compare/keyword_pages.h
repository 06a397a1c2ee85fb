#pragma once

#include <string>
#include <vector>

#include "compare/setup_difference.h"

namespace gridbay {

// Finds the keywords that make each difference, by giving a copy of the first model keywords of the other and
// looking at what its pages show then: one at a time, and those of the entries of long lists together. Where
// that is too much to look at, a difference is taken to be made by the keywords of its entry, or of its page.
// Pages that show what they showed at a former look of the same two are not looked at again. Returns the
// paths that make none.
std::vector<std::string> joinKeywords(const KvsFile& own, const KvsFile& other, const std::string& path,
                                      const UnitChoices& units, const SetupDifference* before,
                                      SetupDifference& found);

}  // namespace gridbay
