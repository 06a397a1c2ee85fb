#pragma once

#include "advection_dispersion/texts.h"
#include "families/deposition.h"
#include "families/kind_row.h"
#include "platform/units/units.h"

namespace gridbay {

// The deposition of a component in an area: a constant, a time series or a map. What is asked of its file is
// called `Self::kDescription`.
template <class Self>
class NadDepositionObjectKvs : public ValueOrFileKvs<Self> {
 public:
  enum Format : std::int32_t { kConstant = 0, kTimeSeries = 1, kMap = 2 };

  using ValueOrFileKvs<Self>::ValueOrFileKvs;
  using ValueOrFileKvs<Self>::Validate;

  static constexpr auto formatRow() { return kindRow("Data_Format", &NadDepositionObjectKvs::format); }

  // Component and area from 1.
  unsigned Validate(ValidationList& messages, int, int component, int area) {
    if (this->format != kTimeSeries && this->format != kMap) return 0;
    CVdFileSelectorDlg selector;
    RequestDataFile(selector, component, area);
    return checkDataFile(messages, PageId::adDepositionConcentration, selector, this->file);
  }
  void RequestDataFile(CVdFileSelectorDlg& selector, int, int area) {
    if (this->format == kMap) {
      requestVaryingMap(selector, *this, area, Self::kDescription, item::kDepositionRate);
    } else {
      requestTimeSeries(selector, *this, Self::kDescription, item::kDepositionRate);
    }
  }
};

class CNadSurfaceDepositionObjectKvs final : public NadDepositionObjectKvs<CNadSurfaceDepositionObjectKvs> {
 public:
  using NadDepositionObjectKvs::NadDepositionObjectKvs;

  static constexpr Text kDescription = texts::surfaceDepositionRequest;
};

class CNadSoilDepositionObjectKvs final : public NadDepositionObjectKvs<CNadSoilDepositionObjectKvs> {
 public:
  using NadDepositionObjectKvs::NadDepositionObjectKvs;

  static constexpr Text kDescription = texts::soilDepositionRequest;
};

// The deposition of a component in each area.
class CNadSurfaceDepositionComponentKvs final
    : public AreaValuesKvs<CNadSurfaceDepositionComponentKvs, CNadSurfaceDepositionObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;
};

class CNadSoilDepositionComponentKvs final
    : public AreaValuesKvs<CNadSoilDepositionComponentKvs, CNadSoilDepositionObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;
};

// The deposition of all components.
class CNadDepositionConcentrationKvs final
    : public DepositionKvs<CNadDepositionConcentrationKvs, CNadSurfaceDepositionComponentKvs,
                           CNadSoilDepositionComponentKvs> {
 public:
  using DepositionKvs::DepositionKvs;

  static constexpr std::string_view kSection = "DEPOSITION_CONCENTRATIONS";
  static constexpr std::string_view kEntrySection = "COMPONENT_%d";
};

}  // namespace gridbay
