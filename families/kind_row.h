#pragma once

#include <algorithm>
#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <tuple>

#include "core/kvs.h"

namespace gridbay {

// A keyword for how a value is given: a constant, a time series or a map, which are 0, 1 and 2 in the model,
// and -1, 0 and 2 on file. Another value is not written, and another number not taken.
template <class Object>
struct KindRow {
  std::string_view name;
  std::int32_t Object::*member;

  static constexpr std::array<std::int32_t, 3> kOnFile{-1, 0, 2};

  void save(const Object& object, KvsFile& file, const std::string&) const {
    const auto kind = static_cast<std::size_t>(object.*member);
    if (kind < kOnFile.size()) kvsPutParam(file, name, kOnFile[kind]);
  }
  void load(Object& object, KvsSection from, const std::string&) const {
    std::int32_t onFile = 1;  // which is none of them
    kvsGetParam(from, name, &onFile, 1, 1);
    const auto found = std::ranges::find(kOnFile, onFile);
    if (found != kOnFile.end()) object.*member = static_cast<std::int32_t>(found - kOnFile.begin());
  }
  void copy(Object& object, const Object& other) const { object.*member = other.*member; }
  constexpr auto members() const { return std::tuple(member); }
};

template <class Object>
constexpr KindRow<Object> kindRow(std::string_view name, std::int32_t Object::*member) {
  return {name, member};
}

}  // namespace gridbay
