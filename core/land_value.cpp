#include "core/land_value.h"

#include <algorithm>
#include <string_view>

#include "core/name_bytes.h"

namespace gridbay {

namespace {

constexpr std::string_view kBlock = "V27_Misc";
constexpr std::size_t kPlace = 3;

}  // namespace

Result<std::optional<float>> landValueOf(const TsbDefinition& file) {
  for (const TsbCustomBlock& block : file.customBlocks) {
    if (!block.readable) return Failure{"A custom block can't be read"};
    if (!names::same(block.name, kBlock)) continue;
    return block.values.size() > kPlace ? std::optional(block.values[kPlace]) : std::optional<float>();
  }
  return std::optional<float>();
}

void setLandValue(TsbDefinition& file, float landValue) {
  const auto isIts = [](const TsbCustomBlock& block) { return names::same(block.name, kBlock); };
  const auto block = std::ranges::find_if(file.customBlocks, isIts);
  if (block != file.customBlocks.end() && block->values.size() > kPlace) block->values[kPlace] = landValue;
}

}  // namespace gridbay
