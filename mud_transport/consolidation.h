#pragma once

#include <cstdint>

#include "core/table_kvs.h"

namespace gridbay {

// Whether the mud consolidates within its layers.
class CNmtConsolidationKvs final : public TableKvs<CNmtConsolidationKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t useConsolidation = 0;

  static constexpr auto table() {
    return section("CONSOLIDATION_OF_MUD_WITHIN_LAYERS",
                   keyword("Use_Consolidation_Module", &CNmtConsolidationKvs::useConsolidation));
  }
};

}  // namespace gridbay
