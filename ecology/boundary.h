#pragma once

#include "ecology/transport_texts.h"
#include "ecology/transported.h"
#include "families/boundary_values.h"

namespace gridbay {

// The transported variables at one open boundary.
class CWQSADBoundaryItemKvs final : public BoundaryValuesKvs<CWQSADBoundaryItemKvs, WqsVariables> {
 public:
  using BoundaryValuesKvs::BoundaryValuesKvs;

  static constexpr PageId kPage = PageId::ecoBoundary;

  double newConstant(int variable) { return WqsVariables::defaultValue(*this, variable); }
  unsigned CheckConstant(ValidationList& messages, int boundary, int variable) {
    return checkRange(messages, kPage, WqsVariables::declaration(*this, variable), *Constant(variable),
                      formatted(texts::boundaryValue, boundary, WqsVariables::name(*this, variable)));
  }
};

class CWQSADBoundaryKvs final : public BoundaryValuesListKvs<CWQSADBoundaryKvs, CWQSADBoundaryItemKvs> {
 public:
  using BoundaryValuesListKvs::BoundaryValuesListKvs;

  static constexpr std::string_view kSection = "AD_BOUNDARY";
  static constexpr Text kPlaceMissing{};  // passed over
};

}  // namespace gridbay
