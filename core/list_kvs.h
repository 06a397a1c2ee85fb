#pragma once

#include <algorithm>
#include <array>
#include <memory>
#include <string>
#include <vector>

#include "core/model_root.h"
#include "core/table_kvs.h"

namespace gridbay {

// A count in a file is believed as far as the sections beside it bear it out, and this much further.
inline constexpr int kCountSlack = 1024;

// A data object that holds a list of items, in the order of file and screen. The count is the list's length
// and stands nowhere beside it. `Derived::table()` has among its rows `count` and `items` (below). Derived
// may have
//   void initialise(Item&, int number)   a default that depends on the item's place, from 1
// The root knows which lists follow this one.
template <class Derived, class Item>
class ListKvs : public TableKvs<Derived> {
 public:
  using TableKvs<Derived>::TableKvs;

  int GetCount() const { return static_cast<int>(items_.size()); }

  // Item `number` from 1, or null out of range.
  Item* GetItem(int number) {
    return number < 1 || number > GetCount() ? nullptr : items_[static_cast<std::size_t>(number) - 1].get();
  }
  const Item* GetItem(int number) const { return const_cast<ListKvs*>(this)->GetItem(number); }

  // Takes items from the tail, or appends default ones, and tells the followers. A negative count does
  // nothing.
  void SetCount(int count) {
    if (count < 0) return;
    resize(count);
    notifyFollowers();
  }

  // Asks each item, with its number where its check wants one; without `deep` none.
  unsigned Validate(ValidationList& messages, int deep) override {
    unsigned faults = 0;
    for (int number = 1; deep != 0 && number <= GetCount(); ++number) {
      Item& item = *GetItem(number);
      if constexpr (requires { item.Validate(messages, deep, number); }) {
        faults += item.Validate(messages, deep, number);
      } else {
        faults += item.Validate(messages, deep);
      }
    }
    return faults;
  }

  // The steps of the rows `count` and `items`.
  void loadCount(int count, KvsSection section) {
    const int sections = static_cast<int>(section->sectionCount());
    const int believed = std::min(count, sections + kCountSlack);
    if (believed < count) {
      this->ShowMessage(
          formatted(texts::countNotBorneOut, std::string(section->name()), count, sections, believed));
    }
    static_cast<Derived&>(*this).SetCount(believed);
  }
  void saveItems(const Text& sectionName, KvsFile& file, const std::string& documentPath) const {
    NumberedText name(sectionName);
    for (int number = 1; number <= GetCount(); ++number) {
      kvsAddSection(file, name.of(number));
      items_[static_cast<std::size_t>(number) - 1]->Save(file, documentPath);
      kvsEndSection(file);
    }
  }
  void loadItems(const Text& sectionName, const Text& missing, KvsSection section,
                 const std::string& documentPath) {
    NumberedText name(sectionName);
    for (int number = 1; number <= GetCount(); ++number) {
      const KvsSection itemSection = kvsSectionByNameNum(section, name.of(number), 1);
      if (itemSection != nullptr) {
        GetItem(number)->Load(itemSection, documentPath);
      } else {
        this->ShowMessage(formatted(missing));
      }
    }
  }
  void copyItems(const ListKvs& other) {
    resize(0);
    resize(other.GetCount());
    for (int number = 1; number <= GetCount(); ++number) copyItem(*GetItem(number), *other.GetItem(number));
  }

 protected:
  void notifyFollowers() {
    const std::array counts{GetCount()};
    if (auto* root = this->template parts<ModelRoot>()) root->TellFollowers(*this, counts);
  }

 private:
  void resize(int count) {
    while (GetCount() > count) items_.pop_back();
    items_.reserve(static_cast<std::size_t>(count));
    while (GetCount() < count) {
      items_.push_back(std::make_unique<Item>(this));
      if constexpr (requires(Derived & derived, Item & item) { derived.initialise(item, 1); }) {
        static_cast<Derived&>(*this).initialise(*items_.back(), GetCount());
      }
    }
  }

  // What a copied list takes over of an item may be more than what the item's own CopyFrom does.
  static void copyItem(Item& item, const Item& other) {
    if constexpr (requires { item.copyWhole(other); }) {
      item.copyWhole(other);
    } else {
      item.CopyFrom(other);
    }
  }

  std::vector<std::unique_ptr<Item>> items_;
};

// The row of the count. A count that the file lacks is 0, and a negative one leaves the list as it is.
struct CountRow {
  std::string_view name;

  void save(const auto& list, KvsFile& file, const std::string&) const {
    kvsPutParam(file, name, list.GetCount());
  }
  void load(auto& list, KvsSection from, const std::string&) const {
    int count = 0;
    kvsGetParam(from, name, &count, 1, 1);
    if (count >= 0) list.loadCount(count, from);
  }
  void copy(auto&, const auto&) const {}
};
constexpr CountRow count(std::string_view name) {
  return {name};
}

// A count that the Wetland Sweep Kit fixes, on file and after a load.
struct PinnedCountRow {
  CountRow row;
  int fixed = 0;

  void save(const auto& list, KvsFile& file, const std::string& documentPath) const {
    if (theEdition.wetlandSweepKit) {
      kvsPutParam(file, row.name, fixed);
    } else {
      row.save(list, file, documentPath);
    }
  }
  void load(auto& list, KvsSection from, const std::string& documentPath) const {
    if (theEdition.wetlandSweepKit) {
      list.SetCount(fixed);
    } else {
      row.load(list, from, documentPath);
    }
  }
  void copy(auto&, const auto&) const {}
};
constexpr PinnedCountRow pinnedCount(std::string_view name, int fixed) {
  return {{name}, fixed};
}

// The row of the items: their numbered sections, and the text shown for a section that is missing.
struct ItemsRow {
  Text sectionName;
  Text missing;

  void save(const auto& list, KvsFile& file, const std::string& documentPath) const {
    list.saveItems(sectionName, file, documentPath);
  }
  void load(auto& list, KvsSection from, const std::string& documentPath) const {
    list.loadItems(sectionName, missing, from, documentPath);
  }
  void copy(auto& list, const auto& other) const { list.copyItems(other); }
};
constexpr ItemsRow items(std::string_view sectionName, Text missing) {
  return {{sectionName}, missing};
}

}  // namespace gridbay
