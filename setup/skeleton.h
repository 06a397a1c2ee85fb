#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include "setup/global_kvs.h"

// The tables of the root: its members, and the orders in which they are saved, loaded and checked.

namespace gridbay {

// Whether a row takes part for the model as it is now; null for a row that always does.
using Condition = bool (*)(const CGlobalKvs&);

inline bool holds(Condition condition, const CGlobalKvs& model) {
  return condition == nullptr || condition(model);
}

// A member of the root.
using MemberRow = CKvsBase& (*)(CGlobalKvs&);

// A row of the orders of saving and loading. A place is the path of the sections that the root opens around
// what follows it.
struct FileRow {
  enum class What { place, child, options, zeroKeyword };

  What what;
  std::string_view name = {};  // the place, or the keyword
  CKvsBase& (*object)(CGlobalKvs&) = nullptr;
  Condition condition = nullptr;
};

struct CheckRow {
  CKvsBase& (*object)(CGlobalKvs&);
  Condition condition = nullptr;
};

std::span<const MemberRow> members();
// The counts that start a model, to be set once all members are there.
std::span<void (*const)(CGlobalKvs&)> startingCounts();
std::span<const FileRow> savingOrder();
std::span<const FileRow> loadingOrder();
std::span<const CheckRow> checkingOrder();

// The sections of a place, outermost first.
std::vector<std::string_view> sectionsOf(std::string_view place);

}  // namespace gridbay
