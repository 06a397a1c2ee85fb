#pragma once

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "core/list_kvs.h"

namespace gridbay {

// A list with an entry for each area, which follows the areas' count. `Derived` is as for a ListKvs. Where a
// list of another length than the areas' is a fault it has
//   static constexpr PageId kPage             where its messages lead
//   static constexpr Text kCountDiffers
// and an empty list is then none.
template <class Derived, class Item>
class AreaListKvs : public ListKvs<Derived, Item> {
 public:
  using ListKvs<Derived, Item>::ListKvs;

  unsigned Validate(ValidationList& messages, int deep) override {
    unsigned faults = 0;
    if constexpr (requires { Derived::kCountDiffers; }) {
      if (this->GetCount() == 0) return 0;
      auto* basic = this->template parts<BasicParts>();
      if (basic != nullptr && basic->bathymetry->GetCount() != this->GetCount())
        faults += report(messages, Derived::kPage, Severity::fault, Derived::kCountDiffers);
    }
    return faults + ListKvs<Derived, Item>::Validate(messages, deep);
  }
};

}  // namespace gridbay
