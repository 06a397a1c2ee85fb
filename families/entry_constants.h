#pragma once

#include <algorithm>
#include <cstdint>
#include <string>
#include <tuple>
#include <type_traits>
#include <vector>

#include "core/list_kvs.h"
#include "core/selections.h"
#include "platform/units/edit_style.h"

// What a module carries with the water: components, fractions or state variables. The templates of this room
// call each of them an entry, number them from 1, and know the module as a class of static functions, where
// `object` is any part of the model:
//
//   struct Entries {
//     using Value = float;                                           of a constant
//     using File = UFileName;                                        of a data file, or UTsbSelection
//     static int count(CKvsBase& object);
//     static std::string name(CKvsBase& object, int entry);          at the head of its row or column
//     static int quantity(CKvsBase& object, int entry);              the item code of its concentration
//     static int sourceQuantity(CKvsBase& object, int entry, int source);   of what a source brings, from 1
//     static void requestItems(CVdFileSelectorDlg& selector, CKvsBase& object);    what a file must have
//     static void requestSourceItems(CVdFileSelectorDlg& selector, CKvsBase& object, int source);
//     static std::string tip(CKvsBase& object, const UnitChoices& units, int entry);   of a constant's cell;
//                                                                    may be left out, for that of its
//                                                                    quantity
//   };

namespace gridbay {

template <class Module>
concept HasTips = requires(CKvsBase& object, const UnitChoices& units) {
  Module::tip(object, units, 1);
};

// Concentrations as a constant for each entry, or from a data file with an item for each. `Self` may have
//   Value newConstant(int entry)          in place of 0
//   bool isHeadLastOnFile() const         whether the first entry, salinity, comes behind all others on file
//   unsigned CheckConstant(ValidationList& messages, int place, int entry)   a check of one constant, at
//                                         place `place` of a list; it returns the number of faults
template <class Self, class Module>
class EntryConstantsKvs : public TableKvs<Self> {
 public:
  using TableKvs<Self>::TableKvs;
  using Carried = Module;
  using Value = typename Module::Value;

  std::int32_t format = 0;
  std::vector<Value> constants;  // base units
  typename Module::File file;

  // Constants come and go at the tail, and so do the items of a file that has such to choose. A negative
  // count does nothing.
  void SetNoConstants(int n) {
    if (n < 0) return;
    if constexpr (kHasItems) file.SetNoItems(n);
    auto entry = static_cast<int>(constants.size());
    constants.resize(static_cast<std::size_t>(n));
    if constexpr (requires(Self & self) { self.newConstant(1); }) {
      while (entry < n) {
        const Value value = static_cast<Self&>(*this).newConstant(entry + 1);
        constants[static_cast<std::size_t>(entry++)] = value;
      }
    }
  }
  // Another constant before all others, and the first one's end.
  void InsertHeadConstant() {
    Value value{};
    if constexpr (requires(Self & self) { self.newConstant(1); }) {
      value = static_cast<Self&>(*this).newConstant(1);
    }
    constants.insert(constants.begin(), value);
  }
  void RemoveHeadConstant() {
    if (!constants.empty()) constants.erase(constants.begin());
  }
  // All as new, for other entries.
  void Rebuild() {
    if constexpr (requires { Self::kFormat; }) {
      format = Self::kFormat;
    } else {
      format = 0;
    }
    file = typename Module::File();
    constants.clear();
    SetNoConstants(Module::count(*this));
  }
  // The constant of an entry, or null for one that has none.
  Value* Constant(int entry) {
    const bool isThere = entry >= 1 && entry <= static_cast<int>(constants.size());
    return isThere ? &constants[static_cast<std::size_t>(entry) - 1] : nullptr;
  }

  // A numbered keyword for each constant. Numbers that are missing keep their value; further ones are not
  // read. Where the head is the last on file, its number goes by how many there are: then as many are taken
  // as the file has, if the module carries so many.
  struct ConstantsRow {
    static constexpr Text kName{"Constant_Value_%d"};

    static bool isHeadLast(const Self& object) {
      if constexpr (requires { object.isHeadLastOnFile(); }) return object.isHeadLastOnFile();
      return false;
    }
    // Of the number `number` among `count` on file.
    static int entryOf(const Self& object, int number, int count) {
      if (number < 1 || !isHeadLast(object)) return number;
      return number == count ? 1 : number + 1;
    }
    static int countOf(const Self& object) { return static_cast<int>(object.constants.size()); }
    static int countIn(KvsSection from) {
      NumberedText name(kName);
      int number = 0;
      while (kvsKeywordByNameNum(from, name.of(number + 1), 1) != nullptr) ++number;
      return number;
    }
    void save(const Self& object, KvsFile& file, const std::string&) const {
      NumberedText name(kName);
      const int count = countOf(object);
      for (int number = 1; number <= count; ++number)
        kvsPutParam(file, name.of(number),
                    *const_cast<Self&>(object).Constant(entryOf(object, number, count)));
    }
    void load(Self& object, KvsSection from, const std::string&) const {
      NumberedText name(kName);
      int count = countOf(object);
      if (isHeadLast(object)) {
        const int carried = Module::count(object);
        const int onFile = countIn(from);
        if (onFile > count || onFile == carried) {
          object.SetNoConstants(std::max(count, std::min(onFile, carried)));
          count = onFile;
        }
      }
      for (int number = 1; number <= count; ++number) {
        if (Value* constant = object.Constant(entryOf(object, number, count)))
          kvsGetParam(from, name.of(number), constant, 1, 1);
      }
    }
    void copy(Self& object, const Self& other) const { object.constants = other.constants; }
    static constexpr auto members() { return std::tuple(&EntryConstantsKvs::constants); }
    bool access(Self& object, std::string_view path, PathAccess& access) const {
      const std::optional<int> number = numberIn(path, kName);
      Value* constant = number ? object.Constant(entryOf(object, *number, countOf(object))) : nullptr;
      if (constant == nullptr) return false;
      if (access.what == PathAccess::What::write) kvsPutParam(*access.out, path, *constant);
      if (access.what == PathAccess::What::set) kvsGetParam(access.in, path, constant, 1, 1);
      return true;
    }
  };

  static constexpr auto table() {
    return keywords(keyword("Data_Format", &EntryConstantsKvs::format), ConstantsRow{}, fileRow());
  }

 protected:
  unsigned CheckConstants(ValidationList& messages, int place = 0) {
    unsigned faults = 0;
    if constexpr (requires(Self & self) { self.CheckConstant(messages, place, 1); }) {
      for (int entry = 1; entry <= static_cast<int>(constants.size()); ++entry)
        faults += static_cast<Self&>(*this).CheckConstant(messages, place, entry);
    }
    return faults;
  }

 private:
  static constexpr bool kHasItems = std::is_same_v<typename Module::File, UTsbSelection>;

  static constexpr auto fileRow() {
    if constexpr (kHasItems) {
      return selection(&EntryConstantsKvs::file);
    } else {
      return keyword("FILE_NAME", &EntryConstantsKvs::file);
    }
  }
};

// The concentrations at each place of a list: what the places are called on file, and the text for one whose
// section is missing, are `Self::kPlaceSection` and `Self::kPlaceMissing`, in the section `Self::kSection`.
template <class Self, class Item>
class EntryConstantsListKvs : public ListKvs<Self, Item> {
 public:
  using ListKvs<Self, Item>::ListKvs;

  static constexpr auto table() {
    return section(Self::kSection, items(Self::kPlaceSection, Self::kPlaceMissing));
  }
  void initialise(Item& item, int) { item.SetNoConstants(Item::Carried::count(*this)); }

  // The module has n entries now. A negative number does nothing.
  void SetNoConstants(int n) {
    for (int number = 1; number <= this->GetCount(); ++number) this->GetItem(number)->SetNoConstants(n);
  }
  // The module has another entry before all others now, or its first one no more.
  void InsertHeadConstant() {
    for (int number = 1; number <= this->GetCount(); ++number) this->GetItem(number)->InsertHeadConstant();
  }
  void RemoveHeadConstant() {
    for (int number = 1; number <= this->GetCount(); ++number) this->GetItem(number)->RemoveHeadConstant();
  }
  // The module has other entries now.
  void Rebuild() {
    for (int number = 1; number <= this->GetCount(); ++number) this->GetItem(number)->Rebuild();
  }
};

}  // namespace gridbay
