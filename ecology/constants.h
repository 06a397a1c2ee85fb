#pragma once

#include <vector>

#include "ecology/given_values.h"
#include "families/data_files.h"

namespace gridbay {

// A constant of the processes: a value, or a map for each area.
class CWQSConstantsItemKvs final : public GivenItemKvs<CWQSConstantsItemKvs, CSolverItem::kConstant> {
 public:
  // Another choice than these two stores 4.
  static constexpr std::int32_t kMap = 3;
  static constexpr std::int32_t kOther = 4;

  using GivenItemKvs::GivenItemKvs;
  using GivenItemKvs::Validate;

  std::vector<UTsbSelection> files;  // one for each area

  static constexpr auto table() {
    using Self = CWQSConstantsItemKvs;
    return keywords(declaredRows(), formatRow(),
                    onlyIf([](const Self& item) { return isUsers(item) && !item.IsConstant(); }, FilesRow{}),
                    onlyIf(isUsers, keyword("Value", &Self::value)), offFile(&Self::number));
  }

  // Follows the number of areas. A negative number does nothing.
  void SetNoAreas(int areas);
  // The file of an area, from 1; null out of range.
  UTsbSelection* File(int area);
  // One message at most. `position` is the place in the list, from 1.
  unsigned Validate(ValidationList& messages, int deep, int position);
  void RequestDataFile(CVdFileSelectorDlg& selector, int area);

 private:
  // A section for each area, with its file.
  struct FilesRow {
    static constexpr Text kArea{"AREA_%d"};

    void save(const CWQSConstantsItemKvs& item, KvsFile& file, const std::string& documentPath) const;
    void load(CWQSConstantsItemKvs& item, KvsSection from, const std::string& documentPath) const;
    void copy(CWQSConstantsItemKvs& item, const CWQSConstantsItemKvs& other) const {
      item.files = other.files;
    }
    static constexpr auto members() { return std::tuple(&CWQSConstantsItemKvs::files); }
    bool access(CWQSConstantsItemKvs& item, std::string_view path, PathAccess& access) const;
  };
};

class CWQSConstantsKvs final
    : public GivenListKvs<CWQSConstantsKvs, CWQSConstantsItemKvs, CSolverItem::kConstant> {
 public:
  static constexpr std::string_view kSection = "CONSTANTS";
  static constexpr std::string_view kCount = "No_Of_Constants";
  static constexpr std::string_view kItem = "CONSTANT_%d";

  using GivenListKvs::GivenListKvs;

  // The model has n areas now.
  void SetNoAreas(int n) {
    for (int number = 1; number <= GetCount(); ++number) GetItem(number)->SetNoAreas(n);
  }
};

}  // namespace gridbay
