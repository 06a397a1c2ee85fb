#pragma once

#include <vector>

#include "compare/compared_model.h"
#include "compare/setup_comparison.h"
#include "compare/tree_difference.h"

namespace gridbay {

// What the pages of two models show differently.
std::vector<Difference> pageDifferences(ComparedModel& own, ComparedModel& other);

// Finds the keywords that make each difference, by giving a copy of the first model one keyword of the other
// at a time and looking at what its pages show then. Returns the paths that make none; of very many or very
// large differences only some are looked for.
std::vector<std::string> joinKeywords(const std::vector<KeywordDifference>& keywords, const KvsFile& own,
                                      const KvsFile& other, const std::string& path, const UnitChoices& units,
                                      std::vector<Difference>& differences);

}  // namespace gridbay
