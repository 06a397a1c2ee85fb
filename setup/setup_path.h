#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "core/kvs.h"
#include "platform/result.h"

namespace gridbay {

// A path of the target without the target's own name, where it begins with that.
std::string_view withoutTarget(std::string_view path);

// Whether a path leads to an option of the engine, which the model does not hold.
bool isOption(std::string_view path);

// The section or keyword that a path such as NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth names in a
// setup's target; null for none. `findPath` makes an unknown path an error that suggests the nearest one.
const Node* nodeAt(const KvsFile& file, std::string_view path);
Result<const Node*> findPath(const KvsFile& file, std::string_view path);

// The path of the nearest name in the file; empty when none is near.
std::string nearestPath(const KvsFile& file, std::string_view path);

// The values that a text gives a keyword, of the kinds that it has now, and as many unless it takes any
// number of them. File names are as on file: relative to the setup's folder.
Result<std::vector<Value>> valuesOfText(const Node& keyword, std::string_view text, bool takesAnyNumber,
                                        ParameterTree& keeper);

// A file like the given one, but for the values of one keyword.
KvsHandle withValues(const KvsFile& file, const Node* keyword, const std::vector<Value>& values);

// What a keyword holds, for people: a single text without quotes.
std::string shownValues(const Node& keyword);

}  // namespace gridbay
