#pragma once

#include <cstdint>

#include "core/list_kvs.h"
#include "families/data_files.h"

namespace gridbay {

// A value that is a constant, or given by a data file. `Self` may have a `formatRow()` of its own, where the
// formats have other numbers on file.
template <class Self, class Real = float>
class ValueOrFileKvs : public TableKvs<Self> {
 public:
  static constexpr std::int32_t kConstant = 0;

  using TableKvs<Self>::TableKvs;

  std::int32_t format = kConstant;
  Real value = 0;  // base units
  UTsbSelection file{1};

  static constexpr auto table() {
    return keywords(Self::formatRow(), keyword("Constant_Value", &ValueOrFileKvs::value),
                    selection(&ValueOrFileKvs::file, 1));
  }
  static constexpr auto formatRow() { return keyword("Data_Format", &ValueOrFileKvs::format); }
};

// The values of one entry (a component, a fraction, a layer), one for each area.
template <class Self, class Item>
class AreaValuesKvs : public ListKvs<Self, Item> {
 public:
  using ListKvs<Self, Item>::ListKvs;
  using ListKvs<Self, Item>::Validate;

  static constexpr auto table() { return keywords(items("AREA_%d")); }

  // Number of the entry, from 1.
  unsigned Validate(ValidationList& messages, int deep, int entry) {
    unsigned faults = 0;
    for (int area = 1; deep != 0 && area <= this->GetCount(); ++area)
      faults += this->GetItem(area)->Validate(messages, deep, entry, area);
    return faults;
  }
};

int areaCount(CKvsBase& object);

// The values of all entries, a sub-section for each in the section `Self::kSection`; one that is missing is
// passed over in silence. Follows the count of entries, and within each that of areas.
template <class Self, class Entry>
class EntryAreasKvs : public ListKvs<Self, Entry> {
 public:
  using ListKvs<Self, Entry>::ListKvs;

  static constexpr auto table() { return section(Self::kSection, items("COMPONENT_%d")); }
  void initialise(Entry& entry, int) { entry.SetCount(areaCount(*this)); }

  // The model has n areas now.
  void SetNoAreas(int n) {
    for (int number = 1; number <= this->GetCount(); ++number) this->GetItem(number)->SetCount(n);
  }
};

}  // namespace gridbay
