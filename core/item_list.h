#pragma once

#include <algorithm>
#include <deque>
#include <memory>
#include <stdexcept>
#include <string>
#include <utility>

#include "core/kvs_base.h"

namespace gridbay {

// The change of one list: what stood between an unchanged head and an unchanged tail, before and after.
class ListChange {
 public:
  virtual ~ListChange() = default;
  virtual std::size_t bytes() const = 0;
};

// Owned items of one class, in the order of file and screen; an item's number is its place, from 1. An item
// stays where it is in memory until it is removed. One that holds much shares it with its copies, and says by
// `bytesBeside(const Item* other)` how much it holds that the other one, or null, does not share.
template <class Item>
class ItemList {
 public:
  // Gives a new item the defaults that depend on its number.
  using Initialise = void (*)(CKvsBase& owner, Item& item, int number);

  explicit ItemList(CKvsBase* owner, Initialise initialise = nullptr)
      : owner_(owner), initialise_(initialise) {}
  ItemList(const ItemList&) = delete;
  ItemList& operator=(const ItemList&) = delete;
  ~ItemList() { SetCount(0); }

  int GetCount() const { return static_cast<int>(items_.size()); }
  // Item `number` from 1, or null out of range.
  Item* GetItem(int number) {
    return number < 1 || number > GetCount() ? nullptr : &items_[static_cast<std::size_t>(number) - 1];
  }
  const Item* GetItem(int number) const { return const_cast<ItemList*>(this)->GetItem(number); }
  // The same where a number out of range is the caller's error: std::invalid_argument.
  Item& at(int number) {
    if (Item* item = GetItem(number); item != nullptr) return *item;
    throw std::invalid_argument("There is no item " + std::to_string(number) + " in a list of " +
                                std::to_string(GetCount()));
  }

  // Takes items from the tail, or appends default ones. A negative count does nothing.
  void SetCount(int count) {
    if (count < 0) return;
    while (GetCount() > count) items_.pop_back();
    while (GetCount() < count) {
      items_.emplace_back(owner_);
      if (initialise_ != nullptr) initialise_(*owner_, items_.back(), GetCount());
    }
  }
  // Another item at the end, with none of the defaults that depend on its number: a load fills it.
  Item& AppendPlain() { return items_.emplace_back(owner_); }
  // A default item before all others, which move on by one; and the first one's end.
  Item& InsertHead() {
    items_.emplace_front(owner_);
    if (initialise_ != nullptr) initialise_(*owner_, items_.front(), 1);
    return items_.front();
  }
  void RemoveHead() {
    if (!items_.empty()) items_.pop_front();
  }

  // Rebuilds the list with copies. What a copied list takes over of an item may be more than what the item's
  // own CopyFrom does.
  void CopyFrom(const ItemList& other) {
    SetCount(0);
    SetCount(other.GetCount());
    for (std::size_t i = 0; i < items_.size(); ++i) {
      if constexpr (requires { items_[i].copyWhole(other.items_[i]); }) {
        items_[i].copyWhole(other.items_[i]);
      } else {
        items_[i].CopyFrom(other.items_[i]);
      }
    }
  }

  bool same(const ItemList& other) const {
    return items_.size() == other.items_.size() &&
           std::equal(items_.begin(), items_.end(), other.items_.begin(), sameItem);
  }
  void assign(const ItemList& other) {
    resizePlain(other.items_.size());
    for (std::size_t i = 0; i < items_.size(); ++i) items_[i].Item::AssignState(other.items_[i]);
  }
  void refresh(const ItemList& other) {
    if constexpr (Item::kReadsOtherFiles) {
      for (std::size_t i = 0; i < std::min(items_.size(), other.items_.size()); ++i)
        items_[i].Item::RefreshState(other.items_[i]);
    }
  }

  // Brings the twin, a list of the same class, to the state of this one; null when it was the same.
  std::unique_ptr<ListChange> takeChange(ItemList& twin) {
    const std::size_t size = items_.size();
    const std::size_t twinSize = twin.items_.size();
    const std::size_t least = std::min(size, twinSize);
    std::size_t head = static_cast<std::size_t>(
        std::mismatch(items_.begin(), items_.begin() + static_cast<std::ptrdiff_t>(least),
                      twin.items_.begin(), sameItem)
            .first -
        items_.begin());
    if (head == size && head == twinSize) return nullptr;
    std::size_t tail = 0;
    while (tail < least - head && sameItem(items_[size - 1 - tail], twin.items_[twinSize - 1 - tail])) ++tail;
    auto change = std::make_unique<Change>(head);
    for (std::size_t i = head; i < twinSize - tail; ++i) keep(change->before, twin.items_[i]);
    for (std::size_t i = head; i < size - tail; ++i) keep(change->after, items_[i]);
    change->weigh();
    twin.apply(*change, true);
    return change;
  }
  // Forward, or back; the list is in the state that the change starts from.
  void apply(const ListChange& listChange, bool forward) {
    const auto& change = static_cast<const Change&>(listChange);
    const std::deque<Item>& from = forward ? change.before : change.after;
    const std::deque<Item>& to = forward ? change.after : change.before;
    const std::size_t tail = items_.size() - change.head - from.size();
    const std::size_t wanted = change.head + to.size() + tail;
    if (to.size() < from.size()) {
      const std::size_t shift = from.size() - to.size();
      for (std::size_t i = change.head + to.size(); i < wanted; ++i)
        items_[i].Item::AssignState(items_[i + shift]);
    }
    resizePlain(wanted);
    if (to.size() > from.size()) {
      const std::size_t shift = to.size() - from.size();
      for (std::size_t i = wanted; i-- > change.head + to.size();)
        items_[i].Item::AssignState(items_[i - shift]);
    }
    for (std::size_t i = 0; i < to.size(); ++i) items_[change.head + i].Item::AssignState(to[i]);
  }

 private:
  struct Change final : ListChange {
    explicit Change(std::size_t first) : head(first) {}
    std::size_t bytes() const override { return weight; }
    void weigh() {
      weight = sizeof(*this) + (before.size() + after.size()) * sizeof(Item);
      if constexpr (requires(const Item& item) { item.bytesBeside(&item); }) {
        for (const auto& [held, other] : {std::pair(&before, &after), std::pair(&after, &before)}) {
          for (std::size_t i = 0; i < held->size(); ++i)
            weight += (*held)[i].bytesBeside(i < other->size() ? &(*other)[i] : nullptr);
        }
      }
    }

    std::size_t head;  // items before the first that differs
    std::deque<Item> before;
    std::deque<Item> after;
    std::size_t weight = 0;
  };

  static bool sameItem(const Item& a, const Item& b) { return a.Item::SameState(b); }
  static void keep(std::deque<Item>& items, const Item& item) {
    items.emplace_back(nullptr);
    items.back().Item::AssignState(item);
  }
  // Items that get their whole state next.
  void resizePlain(std::size_t count) {
    while (items_.size() > count) items_.pop_back();
    while (items_.size() < count) items_.emplace_back(owner_);
  }

  CKvsBase* owner_;
  Initialise initialise_;
  std::deque<Item> items_;
};

}  // namespace gridbay
