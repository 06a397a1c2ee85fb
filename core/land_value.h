#pragma once

#include <optional>

#include "platform/result.h"
#include "platform/tsb/tsb_types.h"

namespace gridbay {

// The land value (metres) of a grid file, which stands in one of its custom blocks: points at or above it are
// land. Nothing where the file has none; an error where the blocks can't be read to that point.
Result<std::optional<float>> landValueOf(const TsbDefinition& file);
// Gives a file that has one another land value.
void setLandValue(TsbDefinition& file, float landValue);

}  // namespace gridbay
