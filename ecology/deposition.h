#pragma once

#include "ecology/transport_texts.h"
#include "ecology/variable_rows.h"
#include "families/deposition.h"

namespace gridbay {

// The deposition of a variable in an area: a constant, or a map.
class CWQSADDepositionItemKvs final : public ValueOrFileKvs<CWQSADDepositionItemKvs, double> {
 public:
  static constexpr std::int32_t kMap = 1;

  using ValueOrFileKvs::Validate;
  using ValueOrFileKvs::ValueOrFileKvs;

  // Variable and area from 1; `whose` is for a value out of its range.
  unsigned Validate(ValidationList& messages, int deep, int variable, int area, const Text& whose);
  void RequestDataFile(CVdFileSelectorDlg& selector, int variable, int area);
};

// That of a variable in each area.
class CWQSADDepositionStateVariableKvs final
    : public VariableAreasKvs<CWQSADDepositionStateVariableKvs, CWQSADDepositionItemKvs> {
 public:
  using VariableAreasKvs::VariableAreasKvs;

  void Bind(int number) { variable = number; }
};

// The deposition of all transported variables.
class CWQSADDepositionKvs final : public DepositionKvs<CWQSADDepositionKvs, CWQSADDepositionStateVariableKvs,
                                                       CWQSADDepositionStateVariableKvs> {
 public:
  using DepositionKvs::DepositionKvs;

  static constexpr std::string_view kSection = "AD_DEPOSITION";
  template <class Object, class Item>
  static constexpr auto entryItems(ItemList<Item> Object::*list) {
    return variableItems(list);
  }

  static constexpr Text kSurface = texts::surfaceDepositionValue;
  static constexpr Text kSoil = texts::soilDepositionValue;

  // All values as new, for other variables. What is included stays.
  void Rebuild();
};

}  // namespace gridbay
