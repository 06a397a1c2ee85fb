#pragma once

#include "advection_dispersion/entries.h"
#include "families/transport_results.h"

namespace gridbay {

// An output of all components, and the hot start file of an area.
using CNadResultObjectKvs = TransportOutputKvs<PageId::adResult>;
using CNadResultHotStartObjectKvs = ResultHotStartKvs<PageId::adResult>;

// What the module writes.
class CNadResultKvs final : public TransportResultsKvs<CNadResultKvs, CNadResultObjectKvs, PageId::adResult> {
 public:
  using TransportResultsKvs::TransportResultsKvs;

  static constexpr auto table() {
    return section("OUTPUT_SPECIFICATION", outputCountRow(), outputRows(), hotStartRows());
  }

  bool hydrodynamicHotStart();
  int valuesAtPoint(const CNadResultObjectKvs&) { return componentCount(*this); }
  int itemsOfHotStart() { return componentCount(*this); }
};

}  // namespace gridbay
