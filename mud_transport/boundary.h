#pragma once

#include "families/boundary_values.h"
#include "mud_transport/texts.h"
#include "mud_transport/transported.h"

namespace gridbay {

// The concentrations of salinity and all fractions at one open boundary.
class CNmtBoundaryObjectKvs final : public BoundaryValuesKvs<CNmtBoundaryObjectKvs, MudFractions> {
 public:
  using BoundaryValuesKvs::BoundaryValuesKvs;

  static constexpr PageId kPage = PageId::mtBoundary;
};

class CNmtBoundaryKvs final : public BoundaryValuesListKvs<CNmtBoundaryKvs, CNmtBoundaryObjectKvs> {
 public:
  using BoundaryValuesListKvs::BoundaryValuesListKvs;

  static constexpr std::string_view kSection = "BOUNDARY_CONCENTRATIONS";
  static constexpr Text kPlaceMissing = texts::mtBoundarySectionMissing;
};

}  // namespace gridbay
