#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "core/kvs.h"
#include "setup/global_kvs.h"

namespace gridbay::python {

using Values = std::vector<std::pair<ValueKind, std::string>>;
struct Keyword {
  std::string path;
  Values values;
};

// The keywords that a save would write, with the sections that have any, in order.
struct Snapshot {
  std::vector<Keyword> keywords;
  std::vector<std::string> sections;
};

Snapshot snapshotOf(CGlobalKvs& model);

// A step of a path as the name of a list and the number of an item: "AREA_2", "weir_data[2]".
struct ItemStep {
  std::string list;  // with {} for the number
  int number = 0;
};
std::optional<ItemStep> itemOf(std::string_view step);

// Whether a path leads through no item but the first of each list.
bool isOfFirstItems(std::string_view path);
// The path of the like keyword in the first items.
std::string inFirstItems(std::string_view path);

// The path of the section that something is in, and its own name.
std::string parentOf(const std::string& path);
std::string nameOf(const std::string& path);

bool looksLikeACount(const Keyword& keyword);

}  // namespace gridbay::python
