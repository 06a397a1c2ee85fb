#pragma once

#include "families/boundary_values.h"
#include "mud_transport_expanded/texts.h"
#include "mud_transport_expanded/transported.h"

namespace gridbay {

// The concentrations of all that is carried at one open boundary.
class CNmtExpBoundaryObjectKvs final
    : public BoundaryValuesKvs<CNmtExpBoundaryObjectKvs, ExpandedMudEntries> {
 public:
  using BoundaryValuesKvs::BoundaryValuesKvs;

  static constexpr PageId kPage = PageId::mtExpBoundary;

  static float newConstant(int) { return 0.01F; }
};

class CNmtExpBoundaryKvs final : public BoundaryValuesListKvs<CNmtExpBoundaryKvs, CNmtExpBoundaryObjectKvs> {
 public:
  using BoundaryValuesListKvs::BoundaryValuesListKvs;

  static constexpr std::string_view kSection = "BOUNDARY_CONCENTRATIONS";
  static constexpr Text kPlaceMissing = texts::expPlaceSectionMissing;
};

}  // namespace gridbay
