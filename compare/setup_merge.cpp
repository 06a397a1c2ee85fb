#include "compare/setup_merge.h"

#include <algorithm>

namespace gridbay {
namespace {

// What is told of a section is what has become of it.
std::optional<std::string> sectionText(const std::optional<std::string>& value, bool hadBase) {
  if (!value) return std::nullopt;
  return hadBase ? "changed" : "added";
}

}  // namespace

MergedTree mergeSetups(MergeSources& sources, const std::string& path, const MergeChoice& choose) {
  const KvsHandle base = sources.base.setup.tree(path);
  const KvsHandle own = sources.own.setup.tree(path);
  const KvsHandle other = sources.other.setup.tree(path);
  return mergeTrees(*base, *own, *other, choose);
}

std::vector<MergeQuestion> questionsOf(const std::vector<MergeConflict>& conflicts, const KvsFile& own,
                                       const KvsFile& other, const std::string& path,
                                       const UnitChoices& units) {
  std::vector<MergeQuestion> questions;
  if (conflicts.empty()) return questions;
  const SetupDifference found = compareFiles(own, other, path, units);
  for (const MergeConflict& conflict : conflicts) {
    MergeQuestion question{conflict.path, conflict.base, conflict.own, conflict.other};
    // The base has no pages of its own here: its value is told where it is the only one that the page adds
    // to.
    const auto shown = std::ranges::find_if(found.differences, [&](const Difference& difference) {
      return difference.page != 0 && !difference.thing.empty() &&
             std::ranges::find(difference.keywords, conflict.path) != difference.keywords.end();
    });
    if (conflict.isSection) {
      const bool hadBase = conflict.base.has_value();
      question.own = sectionText(conflict.own, hadBase);
      question.other = sectionText(conflict.other, hadBase);
      question.base = hadBase ? std::optional<std::string>("there") : std::nullopt;
    } else if (shown != found.differences.end()) {
      question.thing = shown->pageName + ": " + shown->thing;
      question.own = shown->own;
      question.other = shown->other;
    }
    questions.push_back(std::move(question));
  }
  return questions;
}

}  // namespace gridbay
