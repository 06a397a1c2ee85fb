#pragma once

#include "families/source_values.h"
#include "mud_transport_expanded/texts.h"
#include "mud_transport_expanded/transported.h"

namespace gridbay {

// The concentrations of all that is carried in the water of one source. On file the fractions come first, and
// salinity is the last.
class CNmtExpSourceObjectKvs final : public SourceValuesKvs<CNmtExpSourceObjectKvs, ExpandedMudEntries> {
 public:
  using SourceValuesKvs::SourceValuesKvs;

  static constexpr PageId kPage = PageId::mtExpSources;

  float newConstant(int entry);
  bool isHeadLastOnFile() const;
};

class CNmtExpSourcesKvs final : public SourceValuesListKvs<CNmtExpSourcesKvs, CNmtExpSourceObjectKvs> {
 public:
  using SourceValuesListKvs::SourceValuesListKvs;

  static constexpr std::string_view kSection = "SOURCE_CONCENTRATIONS";
  static constexpr std::string_view kPlaceSection = "SOURCE_SINK_%d";
  static constexpr Text kPlaceMissing = texts::expPlaceSectionMissing;
};

}  // namespace gridbay
