#pragma once

#include <optional>
#include <string>
#include <vector>

#include "compare/compared_model.h"
#include "compare/setup_comparison.h"

namespace gridbay {

// What the pages of two models show differently, without the keywords that make it.
std::vector<Difference> pageDifferences(ComparedModel& own, ComparedModel& other);

// What a page that shows `contents` has where a difference is; nothing where it has no such thing.
std::optional<std::string> valueAt(const Difference& difference, const PageContents& contents);

// Whether it is a row or a page, and not a value.
bool isThing(const Difference& difference);

}  // namespace gridbay
