#include "compare/setup_merge.h"

#include <fmt/format.h>

#include <map>

namespace gridbay {
namespace {

// What is told of a section is what has become of it.
std::optional<std::string> sectionText(const std::optional<std::string>& value, bool hadBase) {
  if (!value) return std::nullopt;
  return hadBase ? "changed" : "added";
}

// The differences that pages show, by the keywords that make them.
class PageWords {
 public:
  explicit PageWords(const SetupDifference& found) {
    for (const Difference& each : found.differences) {
      if (each.page == 0 || each.thing.empty()) continue;
      for (const std::string& path : each.keywords) byPath_.emplace(path, &each);
    }
  }
  const Difference* of(const std::string& path) const {
    const auto found = byPath_.find(path);
    return found == byPath_.end() ? nullptr : found->second;
  }
  // The first of what a section holds.
  const Difference* within(const std::string& section) const {
    const auto found = byPath_.lower_bound(section + '/');
    return found != byPath_.end() && found->first.starts_with(section + '/') ? found->second : nullptr;
  }

 private:
  std::map<std::string, const Difference*> byPath_;
};

}  // namespace

Outcome areOfOneEdition(std::span<const std::string> paths) {
  const std::string* first = nullptr;
  for (const std::string& path : paths) {
    const std::string edition = editionNamed(path);
    if (edition.empty()) continue;
    if (first == nullptr) first = &path;
    if (editionNamed(*first) != edition)
      return Failure{
          fmt::format("\"{}\" and \"{}\" are setups of two editions, which can't be merged", *first, path)};
  }
  return {};
}

MergedTree mergeSetups(MergeSources& sources, const std::string& path, const MergeChoice& choose) {
  const KvsHandle base = sources.base.setup.tree(path);
  const KvsHandle own = sources.own.setup.tree(path);
  const KvsHandle other = sources.other.setup.tree(path);
  return mergeTrees(*base, *own, *other, choose);
}

MergeQuestion questionOf(const MergeConflict& conflict) {
  MergeQuestion question{.path = conflict.path, .thing = conflict.path};
  if (!conflict.isSection) {
    question.base = conflict.base;
    question.own = conflict.own;
    question.other = conflict.other;
    return question;
  }
  const bool hadBase = conflict.base.has_value();
  question.own = sectionText(conflict.own, hadBase);
  question.other = sectionText(conflict.other, hadBase);
  if (hadBase) question.base = "there";
  return question;
}

std::vector<MergeQuestion> questionsOf(const std::vector<MergeConflict>& conflicts, const KvsFile& base,
                                       const KvsFile& own, const KvsFile& other, const std::string& path,
                                       const UnitChoices& units) {
  std::vector<MergeQuestion> questions;
  if (conflicts.empty()) return questions;
  const SetupDifference found = compareFiles(own, other, path, units);
  const PageWords words(found);
  const SetupDifference fromBase = compareFiles(base, own, path, units);
  const PageWords baseWords(fromBase);
  for (const MergeConflict& conflict : conflicts) {
    MergeQuestion& question = questions.emplace_back(questionOf(conflict));
    const Difference* shown = words.of(conflict.path);
    const Difference* place = shown == nullptr ? words.within(conflict.path) : shown;
    if (place == nullptr) continue;
    question.page = place->page;
    question.pageName = place->pageName;
    if (shown == nullptr) continue;
    question.thing = shown->thing;
    if (conflict.isSection) continue;
    question.own = shown->own;
    question.other = shown->other;
    const Difference* before = baseWords.of(conflict.path);
    if (before != nullptr && before->thing == shown->thing) question.base = before->own;
  }
  return questions;
}

}  // namespace gridbay
