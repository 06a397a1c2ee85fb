#include "core/land_value.h"

#include <string_view>

#include "core/name_bytes.h"

namespace gridbay {

Result<std::optional<float>> landValueOf(const TsbDefinition& file) {
  constexpr std::string_view kBlock = "V27_Misc";
  constexpr std::size_t kPlace = 3;
  for (const TsbCustomBlock& block : file.customBlocks) {
    if (!block.readable) return Failure{"A custom block can't be read"};
    if (!names::same(block.name, kBlock)) continue;
    return block.values.size() > kPlace ? std::optional(block.values[kPlace]) : std::optional<float>();
  }
  return std::optional<float>();
}

}  // namespace gridbay
