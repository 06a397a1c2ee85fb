#pragma once

#include "families/area_values.h"

namespace gridbay {

// The concentration of a component in an area when the calculation begins.
class CNadInitialObjectKvs final : public ValueOrFileKvs<CNadInitialObjectKvs> {
 public:
  static constexpr std::int32_t kMap = 1;

  using ValueOrFileKvs::Validate;
  using ValueOrFileKvs::ValueOrFileKvs;

  // Component and area from 1.
  unsigned Validate(ValidationList& messages, int deep, int component, int area);
  void RequestDataFile(CVdFileSelectorDlg& selector, int component, int area);
};

// That of a component in each area.
class CNadInitialComponentKvs final : public AreaValuesKvs<CNadInitialComponentKvs, CNadInitialObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;
};

// The initial concentrations of all components.
class CNadInitialConcentrationKvs final
    : public EntryAreasKvs<CNadInitialConcentrationKvs, CNadInitialComponentKvs> {
 public:
  using EntryAreasKvs::EntryAreasKvs;

  static constexpr std::string_view kSection = "INITIAL_CONCENTRATIONS";
};

}  // namespace gridbay
