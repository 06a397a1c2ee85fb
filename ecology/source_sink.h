#pragma once

#include "ecology/transport_texts.h"
#include "ecology/transported.h"
#include "families/source_values.h"

namespace gridbay {

// The transported variables in the water of one source.
class CWQSADSourceSinkItemKvs final : public SourceValuesKvs<CWQSADSourceSinkItemKvs, WqsVariables> {
 public:
  using SourceValuesKvs::SourceValuesKvs;

  static constexpr PageId kPage = PageId::ecoSourceSink;

  double newConstant(int variable) { return WqsVariables::defaultValue(*this, variable); }
  unsigned CheckConstant(ValidationList& messages, int source, int variable) {
    return checkRange(messages, kPage, WqsVariables::declaration(*this, variable), *Constant(variable),
                      formatted(texts::sourceValue, source, WqsVariables::name(*this, variable)));
  }
};

class CWQSADSourceSinkKvs final : public SourceValuesListKvs<CWQSADSourceSinkKvs, CWQSADSourceSinkItemKvs> {
 public:
  using SourceValuesListKvs::SourceValuesListKvs;

  static constexpr std::string_view kSection = "AD_SOURCESINK";
  static constexpr std::string_view kPlaceSection = "SOURCESINK_%d";
  static constexpr Text kPlaceMissing{};  // passed over
};

}  // namespace gridbay
