#pragma once

#include "ecology/variable_rows.h"

namespace gridbay {

// What a transported state variable is in an area when the calculation begins.
class CWQSInitialConditionsItemKvs final : public ValueOrFileKvs<CWQSInitialConditionsItemKvs, double> {
 public:
  static constexpr std::int32_t kMap = 1;

  using ValueOrFileKvs::Validate;
  using ValueOrFileKvs::ValueOrFileKvs;

  // The place among the transported variables, and the area, from 1.
  unsigned Validate(ValidationList& messages, int deep, int variable, int area);
  void RequestDataFile(CVdFileSelectorDlg& selector, int variable, int area);
};

// That of a variable in each area.
class CWQSInitialConditionsStateVariableKvs final
    : public VariableAreasKvs<CWQSInitialConditionsStateVariableKvs, CWQSInitialConditionsItemKvs> {
 public:
  using VariableAreasKvs::VariableAreasKvs;
};

class CWQSInitialConditionsKvs final
    : public ListKvs<CWQSInitialConditionsKvs, CWQSInitialConditionsStateVariableKvs> {
 public:
  using ListKvs::ListKvs;

  static constexpr auto table() { return section("INITIAL_CONDITIONS", variableItems()); }
  void initialise(CWQSInitialConditionsStateVariableKvs& entry, int number);

  void Rebuild();
  // The model has n areas now.
  void SetNoAreas(int n) {
    for (int number = 1; number <= GetCount(); ++number) GetItem(number)->SetCount(n);
  }

  // The value of a variable in an area, by their places, with the variable's declaration; null for one that
  // is not there.
  struct Found {
    CWQSInitialConditionsItemKvs* item = nullptr;
    const CSolverItem* declaration = nullptr;
  };
  Found Find(int variable, int area);
};

}  // namespace gridbay
