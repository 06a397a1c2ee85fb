#pragma once

#include <string>
#include <string_view>

#include "core/list_kvs.h"

namespace gridbay {

// The row of a list whose items are a part of the state and are written by another object.
struct StateItemsRow : ListRow<OwnList> {
  void save(const auto&, KvsFile&, const std::string&) const {}
  void load(auto&, KvsSection, const std::string&) const {}
  bool access(auto&, std::string_view, PathAccess&) const { return false; }
};
constexpr StateItemsRow stateItems() {
  return {};
}

}  // namespace gridbay
