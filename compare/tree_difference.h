#pragma once

#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "compare/section_pairs.h"

namespace gridbay {

// A keyword that two setups hold differently, or a keyword, section or entry of a list that only one has.
struct KeywordDifference {
  std::string path;  // in the target, as BATHYMETRY_SELECTION/AREA_2
  bool isSection = false;
  // The values as `v27setup get` shows them, empty text for a section; nothing where there is none.
  std::optional<std::string> own;
  std::optional<std::string> other;

  bool operator==(const KeywordDifference&) const = default;
};

// The differences of two sections in the order of the first. A section that only one has is told as one.
std::vector<KeywordDifference> differencesOf(const Node& own, const Node& other);

// The first of two files with what `isTaken` says, by its path, of the second. Both are files of setups.
KvsHandle withTaken(const KvsFile& own, const KvsFile& other,
                    const std::function<bool(const std::string& path)>& isTaken);

// Whether two files of setups have the same options of the engine.
bool sameOptions(const KvsFile& a, const KvsFile& b);
// A file of a setup that a save passes on the options of another one from, as far as that has sections for
// them.
KvsHandle withOptions(const KvsFile& file, const KvsFile& other);

}  // namespace gridbay
