#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "core/kvs.h"
#include "platform/result.h"

namespace gridbay::cli {

// The section or keyword that a path such as NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth names in a
// setup's target. An unknown path is an error that suggests the nearest one.
Result<const Node*> findPath(const KvsFile& file, std::string_view path);

// The path of the nearest name in the file; empty when none is near.
std::string nearestPath(const KvsFile& file, std::string_view path);

// The values that a text gives a keyword, of the kinds that it has now. File names are as on file: relative
// to the setup's folder.
Result<std::vector<Value>> valuesOfText(const Node& keyword, std::string_view text, ParameterTree& keeper);

// A file like the given one, but for the values of one keyword.
KvsHandle withValues(const KvsFile& file, const Node* keyword, const std::vector<Value>& values);

// What a keyword holds, for people: a single text without quotes.
std::string shownValues(const Node& keyword);

}  // namespace gridbay::cli
