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

// Requires of a file that it fits area `number` (from 1) and has one item, of whatever quantity. A map that
// varies covers the simulation, one of a single time step holds throughout.
void requestAnyMap(CVdFileSelectorDlg& selector, CKvsBase& object, int number, const Text& description);

// A value that is a constant, or given by the map of an area. `Self` has
//   static constexpr PageId kPage         where its messages lead
//   static constexpr Text kDescription    what is asked of its file
//   static constexpr int kQuantity        the item code of the constant; 0 for a plain number
template <class Self>
class ValueOrMapKvs : public ValueOrFileKvs<Self> {
 public:
  static constexpr std::int32_t kMap = 1;

  using ValueOrFileKvs<Self>::ValueOrFileKvs;
  using ValueOrFileKvs<Self>::Validate;

  // Area from 1; of several entries, the number of the one whose value it is.
  unsigned Validate(ValidationList& messages, int, int area) {
    if (this->format != kMap) return 0;
    CVdFileSelectorDlg selector;
    RequestMap(selector, area);
    return checkDataFile(messages, Self::kPage, selector, this->file);
  }
  unsigned Validate(ValidationList& messages, int deep, int, int area) {
    return Validate(messages, deep, area);
  }
  void RequestMap(CVdFileSelectorDlg& selector, int area) {
    requestAnyMap(selector, *this, area, Self::kDescription);
  }
  void RequestDataFile(CVdFileSelectorDlg& selector, int, int area) { RequestMap(selector, area); }
};

// The values of one entry (a component, a fraction, a layer), one for each area.
template <class Self, class Item>
class AreaValuesKvs : public ListKvs<Self, Item> {
 public:
  using ListKvs<Self, Item>::ListKvs;
  using ListKvs<Self, Item>::Validate;

  static constexpr auto table() { return keywords(items("AREA_%d")); }

  // Number of the entry, from 1. What is given further goes to each item's check.
  unsigned Validate(ValidationList& messages, int deep, int entry, const auto&... further) {
    unsigned faults = 0;
    for (int area = 1; deep != 0 && area <= this->GetCount(); ++area)
      faults += checkedEntry(messages, {area, this->GetCount()}, [&] {
        return this->GetItem(area)->Validate(messages, deep, entry, area, further...);
      });
    return faults;
  }
};

int areaCount(CKvsBase& object);

// The values of all entries, a sub-section for each in the section `Self::kSection`, empty for none of its
// own; one that is missing is passed over in silence. Follows the count of entries, and within each that of
// areas. `Self` may have
//   static constexpr std::string_view kEntrySection   what its entries are called on file
//   float newValue(int entry)                         in place of 0
template <class Self, class Entry>
class EntryAreasKvs : public ListKvs<Self, Entry> {
 public:
  using ListKvs<Self, Entry>::ListKvs;

  static constexpr std::string_view kEntrySection = "COMPONENT_%d";

  static constexpr auto table() { return section(Self::kSection, items(Self::kEntrySection)); }
  void initialise(Entry& entry, int number) { setAreas(entry, number, areaCount(*this)); }

  // The model has n areas now.
  void SetNoAreas(int n) {
    for (int number = 1; number <= this->GetCount(); ++number) setAreas(*this->GetItem(number), number, n);
  }

 private:
  void setAreas(Entry& entry, int number, int areas) {
    int area = entry.GetCount();
    entry.SetCount(areas);
    if constexpr (requires(Self & self) { self.newValue(1); }) {
      while (area < entry.GetCount())
        entry.GetItem(++area)->value = static_cast<Self&>(*this).newValue(number);
    }
  }
};

}  // namespace gridbay
