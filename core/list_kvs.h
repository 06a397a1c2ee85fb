#pragma once

#include <array>

#include "core/item_rows.h"
#include "core/model_root.h"
#include "core/table_kvs.h"

namespace gridbay {

// A data object that holds one list of items. The count is the list's length and stands nowhere beside it.
// `Derived::table()` has among its rows `count` and `items` (core/item_rows.h). Derived may have
//   void initialise(Item&, int number)               a default that depends on the item's place, from 1
//   static constexpr bool kChecksItemsAlways = true  its items are checked with and without `deep`, as with 0
// The root knows which lists follow this one. A holder of several lists has `ItemList` members instead.
template <class Derived, class Item>
class ListKvs : public TableKvs<Derived> {
 public:
  explicit ListKvs(CKvsBase* parent) : TableKvs<Derived>(parent), items_(this, initialiser()) {}

  int GetCount() const { return items_.GetCount(); }
  // Item `number` from 1, or null out of range; `at` throws std::invalid_argument instead.
  Item* GetItem(int number) { return items_.GetItem(number); }
  const Item* GetItem(int number) const { return items_.GetItem(number); }
  Item& at(int number) { return items_.at(number); }

  // Takes items from the tail, or appends default ones, and tells the followers. A negative count does
  // nothing.
  void SetCount(int count) {
    if (count < 0) return;
    items_.SetCount(count);
    notifyFollowers();
  }

  // Asks each item, with its number where its check wants one; without `deep` none.
  unsigned Validate(ValidationList& messages, int deep) override {
    constexpr bool kAlways = requires {
      Derived::kChecksItemsAlways;
    };
    unsigned faults = 0;
    for (int number = 1; (kAlways || deep != 0) && number <= GetCount(); ++number) {
      Item& item = *GetItem(number);
      faults += checkedEntry(messages, {number, GetCount()}, [&] {
        if constexpr (requires { item.Validate(messages, deep, number); }) {
          return item.Validate(messages, kAlways ? 0 : deep, number);
        } else {
          return item.Validate(messages, kAlways ? 0 : deep);
        }
      });
    }
    return faults;
  }

  // For the rows of the table.
  ItemList<Item>& itemList() { return items_; }
  const ItemList<Item>& itemList() const { return items_; }

 protected:
  void notifyFollowers() {
    const std::array counts{GetCount()};
    if (auto* root = this->template parts<ModelRoot>()) root->TellFollowers(*this, counts);
  }

 private:
  static constexpr typename ItemList<Item>::Initialise initialiser() {
    if constexpr (requires(Derived & derived, Item & item) { derived.initialise(item, 1); }) {
      return [](CKvsBase& owner, Item& item, int number) {
        static_cast<Derived&>(owner).initialise(item, number);
      };
    } else {
      return nullptr;
    }
  }

  ItemList<Item> items_;
};

}  // namespace gridbay
