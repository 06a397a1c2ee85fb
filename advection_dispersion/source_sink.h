#pragma once

#include "advection_dispersion/texts.h"
#include "advection_dispersion/transported.h"
#include "families/source_values.h"

namespace gridbay {

// The concentrations of all components in the water of one source.
class CNadSourceSinkObjectKvs final : public SourceValuesKvs<CNadSourceSinkObjectKvs, AdComponents> {
 public:
  using SourceValuesKvs::SourceValuesKvs;

  static constexpr PageId kPage = PageId::adSourceSink;
};

class CNadSourceSinkKvs final : public SourceValuesListKvs<CNadSourceSinkKvs, CNadSourceSinkObjectKvs> {
 public:
  using SourceValuesListKvs::SourceValuesListKvs;

  static constexpr std::string_view kSection = "SOURCE_CONCENTRATIONS";
  static constexpr std::string_view kPlaceSection = "SOURCE_SINK_%d";
  static constexpr Text kPlaceMissing = texts::adSourceSectionMissing;
};

}  // namespace gridbay
