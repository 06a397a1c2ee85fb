#pragma once

#include "families/source_values.h"
#include "mud_transport/texts.h"
#include "mud_transport/transported.h"

namespace gridbay {

// The concentrations of salinity and all fractions in the water of one source.
class CNmtSourceSinkObjectKvs final : public SourceValuesKvs<CNmtSourceSinkObjectKvs, MudFractions> {
 public:
  using SourceValuesKvs::SourceValuesKvs;

  static constexpr PageId kPage = PageId::mtSourceSink;

  bool isHeadLastOnFile() const;
};

class CNmtSourceSinkKvs final : public SourceValuesListKvs<CNmtSourceSinkKvs, CNmtSourceSinkObjectKvs> {
 public:
  using SourceValuesListKvs::SourceValuesListKvs;

  static constexpr std::string_view kSection = "SOURCE_CONCENTRATIONS";
  static constexpr std::string_view kPlaceSection = "SOURCE_SINK_%d";
  static constexpr Text kPlaceMissing = texts::mtSourceSectionMissing;
};

}  // namespace gridbay
