#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "core/item_list.h"
#include "core/keyword_rows.h"
#include "core/kvs_base.h"

namespace gridbay {

// A data object whose saving, loading and copying, exact state and paths follow from `Derived::table()`. One
// that holds what was read from other files says so with `static constexpr bool kReadsOtherFiles = true`.
//
// The code that follows from a table is large. It stands in core/table_code.h, which the one source that
// makes the objects of a room includes.
template <class Derived>
class TableKvs : public CKvsBase {
 public:
  static constexpr bool kReadsOtherFiles = false;

  using CKvsBase::CKvsBase;

  void Save(KvsFile& file, const std::string& documentPath) override;
  void Load(KvsSection section, const std::string& documentPath) override;
  void CopyFrom(const CKvsBase& other) override;
  void AssignState(const CKvsBase& other) override;
  bool SameState(const CKvsBase& other) const override;
  void RefreshState(const CKvsBase& other);
  std::unique_ptr<StateChange> TakeChange(CKvsBase& twinObject) override;
  bool AccessPath(std::string_view path, PathAccess& access) override;

 private:
  struct Change;

  static std::unique_ptr<Derived> stateOf(const Derived& object);
};

}  // namespace gridbay
