#pragma once

#include <cstdint>

#include "families/transport_results.h"

namespace gridbay {

// An output of all fractions, and the hot start file of an area.
using CNmtResultObjectKvs = TransportOutputKvs<PageId::mtResult>;
using CNmtResultHotStartObjectKvs = ResultHotStartKvs<PageId::mtResult>;

// What the module writes.
class CNmtResultKvs final : public TransportResultsKvs<CNmtResultKvs, CNmtResultObjectKvs, PageId::mtResult> {
 public:
  using TransportResultsKvs::TransportResultsKvs;

  std::int32_t includeLayers = 1;
  std::int32_t netSedimentationInMm = 1;  // else in g/m²

  static constexpr auto table() {
    using Self = CNmtResultKvs;
    return section("OUTPUT_SPECIFICATION", outputCountRow(),
                   keyword("Include_Layers_In_Output_File", &Self::includeLayers),
                   keyword("NetSedimentation_in_mm", &Self::netSedimentationInMm),
                   writtenOnly("NetSedimentation_in_gm2",
                               [](const Self& results) -> std::int32_t {
                                 return results.netSedimentationInMm == 0 ? 1 : 0;
                               }),
                   outputRows(), hotStartRows());
  }

  bool hydrodynamicHotStart();
  // Salinity and fractions; in the task of layers these too where they are included.
  int valuesAtPoint(const CNmtResultObjectKvs& output);
  int itemsOfHotStart();
};

}  // namespace gridbay
