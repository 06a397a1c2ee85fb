#pragma once

#include <cstdint>

#include "core/table_kvs.h"

namespace gridbay {

// The thresholds of flooding and drying, one pair for the whole model. Depths in metres.
class CAreaDescriptionKvs final : public TableKvs<CAreaDescriptionKvs> {
 public:
  using TableKvs::TableKvs;

  float dryingDepth = 0.02F;
  float floodingDepth = 0.05F;
  std::int32_t enableFloodAndDryChecking = 1;

  static constexpr auto table() {
    return section("FLOOD_AND_DRY",
                   keyword("Enable_Flood_And_Dry_Checking", &CAreaDescriptionKvs::enableFloodAndDryChecking),
                   keyword("Drying_Depth", &CAreaDescriptionKvs::dryingDepth),
                   keyword("Flooding_Depth", &CAreaDescriptionKvs::floodingDepth));
  }

  unsigned Validate(ValidationList& messages, int deep) override;
};

}  // namespace gridbay
