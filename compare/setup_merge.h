#pragma once

#include <span>
#include <string>
#include <vector>

#include "compare/setup_comparison.h"
#include "compare/setup_difference.h"
#include "compare/tree_merge.h"
#include "platform/result.h"

namespace gridbay {

// Three setups on their way to one: the base, and the two that have come from it.
struct MergeSources {
  SetupOnDisk base;
  SetupOnDisk own;
  SetupOnDisk other;
};

// Whether all of these setups are of one edition, by their names: what one of them lacks by its nature is no
// edit of its user.
Outcome areOfOneEdition(std::span<const std::string> paths);

// The setup that the two make together, as the file at `path` will have it: file names lead from there to
// where they led before. Sections that this version does not know are left out.
MergedTree mergeSetups(MergeSources& sources, const std::string& path, const MergeChoice& choose);

// A conflict by its path, with what has become of it.
MergeQuestion questionOf(const MergeConflict& conflict);

// What was chosen, or is to be, in the words of the pages where one shows it. The files are those that the
// conflicts come from, as a save to the path would write them.
std::vector<MergeQuestion> questionsOf(const std::vector<MergeConflict>& conflicts, const KvsFile& base,
                                       const KvsFile& own, const KvsFile& other, const std::string& path,
                                       const UnitChoices& units = {});

}  // namespace gridbay
