#pragma once

#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "core/kvs.h"

namespace gridbay {

// A keyword, section or entry of a list that two setups have each made into something else.
struct MergeConflict {
  std::string path;  // in the target, as two setups of one file both name it
  bool isSection = false;
  // The values as `v27setup get` shows them, empty text for a section; nothing where there is none.
  std::optional<std::string> base;
  std::optional<std::string> own;
  std::optional<std::string> other;

  bool operator==(const MergeConflict&) const = default;
};

// Whose version of a conflict stands.
enum class MergeSide { own, other };
using MergeChoice = std::function<MergeSide(const MergeConflict&)>;

struct MergedTree {
  KvsHandle file;
  std::vector<MergeConflict> conflicts;  // with what was chosen in the file
  std::size_t takenFromOther = 0;        // without the conflicts
};

// What two files of setups have made of a third: what one alone has changed is taken from it, what both have
// changed alike is taken once. Entries of lists go by their number; new ones of lists that nothing else
// refers to by number are kept, those of the first before those of the other.
MergedTree mergeTrees(const KvsFile& base, const KvsFile& own, const KvsFile& other,
                      const MergeChoice& choose);

}  // namespace gridbay
