#pragma once

#include <string>

#include "core/keyword_table.h"
#include "core/kvs_base.h"

namespace gridbay {

// A data object whose saving, loading and copying follow from `Derived::table()`.
template <class Derived>
class TableKvs : public CKvsBase {
 public:
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
};

}  // namespace gridbay
