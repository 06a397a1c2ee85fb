#pragma once

#include <vector>

#include "core/table_kvs.h"

// What follows from the tables of objects. Included by the source that holds the first function of a class,
// or by the one that makes the objects of a room, and nowhere else: so each table's code is compiled once.

namespace gridbay {

template <class Derived>
struct TableKvs<Derived>::Change final : StateChange {
  std::unique_ptr<Derived> before;  // without its items; null where that is the same
  std::unique_ptr<Derived> after;
  std::vector<std::unique_ptr<ListChange>> lists;  // null for one that is the same

  void apply(CKvsBase& object, bool forward) const override {
    auto& self = static_cast<Derived&>(object);
    if (before != nullptr)
      Derived::table().assign(self, forward ? *after : *before, StateScope::withoutItems);
    std::size_t place = 0;
    Derived::table().visitLists(self, self, [&](auto& list, auto&) {
      if (const auto& listChange = lists[place++]; listChange != nullptr) list.apply(*listChange, forward);
    });
  }
  std::size_t bytes() const override {
    std::size_t sum = sizeof(*this) + (before == nullptr ? 0 : 2 * sizeof(Derived));
    for (const auto& list : lists) sum += list == nullptr ? 0 : list->bytes();
    return sum;
  }
};

template <class Derived>
void TableKvs<Derived>::Save(KvsFile& file, const std::string& documentPath) {
  Derived::table().save(static_cast<const Derived&>(*this), file, documentPath);
}

template <class Derived>
void TableKvs<Derived>::Load(KvsSection section, const std::string& documentPath) {
  Derived::table().load(static_cast<Derived&>(*this), section, documentPath);
}

template <class Derived>
void TableKvs<Derived>::CopyFrom(const CKvsBase& other) {
  Derived::table().copy(static_cast<Derived&>(*this), static_cast<const Derived&>(other));
}

template <class Derived>
void TableKvs<Derived>::AssignState(const CKvsBase& other) {
  Derived::table().assign(static_cast<Derived&>(*this), static_cast<const Derived&>(other),
                          StateScope::whole);
}

template <class Derived>
bool TableKvs<Derived>::SameState(const CKvsBase& other) const {
  return Derived::table().same(static_cast<const Derived&>(*this), static_cast<const Derived&>(other),
                               StateScope::whole);
}

template <class Derived>
void TableKvs<Derived>::RefreshState(const CKvsBase& other) {
  Derived::table().refresh(static_cast<Derived&>(*this), static_cast<const Derived&>(other));
}

template <class Derived>
std::unique_ptr<StateChange> TableKvs<Derived>::TakeChange(CKvsBase& twinObject) {
  auto& self = static_cast<Derived&>(*this);
  auto& twin = static_cast<Derived&>(twinObject);
  auto change = std::make_unique<Change>();
  if (!Derived::table().same(self, twin, StateScope::withoutItems)) {
    change->before = stateOf(twin);
    change->after = stateOf(self);
    Derived::table().assign(twin, self, StateScope::withoutItems);
  }
  bool inLists = false;
  Derived::table().visitLists(self, twin, [&](auto& list, auto& twinList) {
    change->lists.push_back(list.takeChange(twinList));
    inLists = inLists || change->lists.back() != nullptr;
  });
  Derived::table().refresh(twin, self);
  if (change->before == nullptr && !inLists) return nullptr;
  return change;
}

template <class Derived>
bool TableKvs<Derived>::AccessPath(std::string_view path, PathAccess& access) {
  return Derived::table().access(static_cast<Derived&>(*this), path, access);
}

template <class Derived>
std::unique_ptr<Derived> TableKvs<Derived>::stateOf(const Derived& object) {
  auto copy = std::make_unique<Derived>(nullptr);
  Derived::table().assign(*copy, object, StateScope::withoutItems);
  return copy;
}

}  // namespace gridbay
