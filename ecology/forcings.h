#pragma once

#include "ecology/given_values.h"
#include "families/data_files.h"

namespace gridbay {

// What drives the processes from outside: a value, a time series, or a map that varies.
class CWQSForcingsItemKvs final : public GivenItemKvs<CWQSForcingsItemKvs, CSolverItem::kForcing> {
 public:
  static constexpr std::int32_t kTimeSeries = 1;
  static constexpr std::int32_t kMap = 3;

  using GivenItemKvs::GivenItemKvs;
  using GivenItemKvs::Validate;

  UTsbSelection file{1};

  static constexpr auto table() {
    using Self = CWQSForcingsItemKvs;
    return keywords(declaredRows(), formatRow(),
                    onlyIf([](const Self& item) { return isUsers(item) && !item.IsConstant(); },
                           selection(&Self::file, 1)),
                    onlyIf([](const Self& item) { return isUsers(item) && item.IsConstant(); },
                           keyword("Value", &Self::value)),
                    offFile(&Self::number));
  }

  // What was written for another definition is taken only where it fits this one.
  void Load(KvsSection section, const std::string& documentPath) override;
  // `position` is the place in the list, from 1.
  unsigned Validate(ValidationList& messages, int deep, int position);
  void RequestDataFile(CVdFileSelectorDlg& selector, int position);

 private:
  bool fits(KvsSection section) const;
};

class CWQSForcingsKvs final
    : public GivenListKvs<CWQSForcingsKvs, CWQSForcingsItemKvs, CSolverItem::kForcing> {
 public:
  static constexpr std::string_view kSection = "FORCINGS";
  static constexpr std::string_view kCount = "No_Of_Forcings";
  static constexpr std::string_view kItem = "FORCING_%d";

  using GivenListKvs::GivenListKvs;
};

}  // namespace gridbay
