#pragma once

#include "advection_dispersion/texts.h"
#include "advection_dispersion/transported.h"
#include "families/boundary_values.h"

namespace gridbay {

// The concentrations of all components at one open boundary.
class CNadBoundaryObjectKvs final : public BoundaryValuesKvs<CNadBoundaryObjectKvs, AdComponents> {
 public:
  using BoundaryValuesKvs::BoundaryValuesKvs;

  static constexpr PageId kPage = PageId::adBoundary;
};

class CNadBoundaryKvs final : public BoundaryValuesListKvs<CNadBoundaryKvs, CNadBoundaryObjectKvs> {
 public:
  using BoundaryValuesListKvs::BoundaryValuesListKvs;

  static constexpr std::string_view kSection = "BOUNDARY_CONCENTRATIONS";
  static constexpr Text kPlaceMissing = texts::adBoundarySectionMissing;
};

}  // namespace gridbay
