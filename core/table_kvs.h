#pragma once

#include <memory>
#include <string>
#include <vector>

#include "core/item_list.h"
#include "core/keyword_rows.h"
#include "core/kvs_base.h"

namespace gridbay {

// A data object whose saving, loading and copying, exact state and paths follow from `Derived::table()`. One
// that holds what was read from other files says so with `static constexpr bool kReadsOtherFiles = true`.
template <class Derived>
class TableKvs : public CKvsBase {
 public:
  static constexpr bool kReadsOtherFiles = false;

  using CKvsBase::CKvsBase;

  void Save(KvsFile& file, const std::string& documentPath) override {
    Derived::table().save(static_cast<const Derived&>(*this), file, documentPath);
  }
  void Load(KvsSection section, const std::string& documentPath) override {
    Derived::table().load(static_cast<Derived&>(*this), section, documentPath);
  }
  void CopyFrom(const CKvsBase& other) override {
    Derived::table().copy(static_cast<Derived&>(*this), static_cast<const Derived&>(other));
  }

  void AssignState(const CKvsBase& other) override {
    Derived::table().assign(static_cast<Derived&>(*this), static_cast<const Derived&>(other),
                            StateScope::whole);
  }
  bool SameState(const CKvsBase& other) const override {
    return Derived::table().same(static_cast<const Derived&>(*this), static_cast<const Derived&>(other),
                                 StateScope::whole);
  }
  void RefreshState(const CKvsBase& other) {
    Derived::table().refresh(static_cast<Derived&>(*this), static_cast<const Derived&>(other));
  }
  std::unique_ptr<StateChange> TakeChange(CKvsBase& twinObject) override {
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

  bool AccessPath(std::string_view path, PathAccess& access) override {
    return Derived::table().access(static_cast<Derived&>(*this), path, access);
  }

 private:
  struct Change final : StateChange {
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

  static std::unique_ptr<Derived> stateOf(const Derived& object) {
    auto copy = std::make_unique<Derived>(nullptr);
    Derived::table().assign(*copy, object, StateScope::withoutItems);
    return copy;
  }
};

}  // namespace gridbay
