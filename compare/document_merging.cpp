#include "compare/document_merging.h"

#include <map>
#include <optional>

#include "compare/difference_packing.h"
#include "compare/document_change.h"
#include "compare/section_pairs.h"
#include "compare/setup_merge.h"
#include "compare/tree_difference.h"
#include "compare/tree_packing.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

// Each as a save to the path would write it, where file names of the result start from.
struct MergeFiles {
  KvsHandle base = {};
  KvsHandle own = {};
  KvsHandle other = {};
  KvsHandle source = {};  // of the first of the two
  std::string path = {};
  bool isOfFiles = false;  // and not of the document
};

void pass(Packing& pack, MergeFiles& files) {
  pack(files.base, files.own, files.other, files.source, files.path, files.isOfFiles);
}

MergeFiles unpackedFiles(const std::string& bytes) {
  MergeFiles files;
  Packing pack(bytes);
  pack(files);
  return files;
}

MergedTree merged(const MergeFiles& files, const MergeChoice& choose) {
  return mergeTrees(*files.base, *files.own, *files.other, choose);
}
std::vector<MergeConflict> conflictsOf(const MergeFiles& files) {
  return merged(files, [](const MergeConflict&) { return MergeSide::own; }).conflicts;
}

std::string packedFault(std::string fault) {
  Packing pack;
  pack(fault);
  return std::move(pack.bytes());
}

}  // namespace

std::string DocumentMerging::read(const std::string& base, const std::string& own,
                                  const std::string& other) const {
  const std::string names[] = {own.empty() ? document_.path() : own, base, other};
  if (const Outcome one = areOfOneEdition(names); !one) return packedFault(one.error());
  Result<SetupFile> baseSetup = SetupFile::open(base, nullptr);
  if (!baseSetup) return packedFault(baseSetup.error());
  Result<SetupFile> otherSetup = SetupFile::open(other, nullptr);
  if (!otherSetup) return packedFault(otherSetup.error());
  std::optional<SetupFile> ownSetup;
  if (!own.empty()) {
    Result<SetupFile> opened = SetupFile::open(own, nullptr);
    if (!opened) return packedFault(opened.error());
    ownSetup = std::move(*opened);
  }
  SetupFile& first = ownSetup ? *ownSetup : document_.file();
  const std::string& path = own.empty() ? document_.path() : own;
  MergeFiles files{.base = baseSetup->tree(path),
                   .own = first.tree(path),
                   .other = otherSetup->tree(path),
                   .path = path,
                   .isOfFiles = ownSetup.has_value()};
  files.source = withOptions(first.source(), *files.own);
  std::vector<std::string> leftOut;
  for (std::string& section : otherSetup->unknownSections()) {
    const Node* held = nodeAt(first.source(), section);
    if (!sameNode(held, nodeAt(otherSetup->source(), section))) leftOut.push_back(std::move(section));
  }
  std::vector<MergeQuestion> questions;
  for (const MergeConflict& conflict : conflictsOf(files)) questions.push_back(questionOf(conflict));
  Packing inner;
  inner(files);
  std::string fault;
  std::uint64_t state = document_.ModelState();
  std::string asked = packed(std::move(questions));
  Packing pack;
  pack(fault, state, leftOut, asked, inner.bytes());
  return std::move(pack.bytes());
}

std::string DocumentMerging::start(const std::string& found) {
  files_.clear();
  leftOut_.clear();
  questions_.clear();
  std::string fault;
  std::string asked;
  std::string files;
  Packing pack(found);
  pack(fault);
  if (!fault.empty()) return fault;
  pack(state_, leftOut_, asked, files);
  if (!pack.isWhole() || !unpack(asked, questions_)) return "What was read is incomplete";
  files_ = std::move(files);
  return {};
}

std::string DocumentMerging::word() const {
  const MergeFiles files = unpackedFiles(files_);
  return packed(
      questionsOf(conflictsOf(files), *files.base, *files.own, *files.other, files.path, document_.units()));
}

bool DocumentMerging::takeWords(const std::string& words) {
  std::vector<MergeQuestion> questions;
  if (!unpack(words, questions) || questions.size() != questions_.size()) return false;
  questions_ = std::move(questions);
  return true;
}

std::string DocumentMerging::make() const {
  if (files_.empty()) return {};
  const MergeFiles files = unpackedFiles(files_);
  std::map<std::string, MergeSide> sides;
  for (const MergeQuestion& question : questions_)
    sides[question.path] = question.takesOther ? MergeSide::other : MergeSide::own;
  MergedTree tree = merged(files, [&](const MergeConflict& conflict) { return sides[conflict.path]; });
  const KvsHandle open = files.isOfFiles ? document_.file().tree(document_.path()) : nullptr;
  DocumentChange change = changeOf({.before = open == nullptr ? *files.own : *open,
                                    .beforePath = document_.path(),
                                    .after = std::move(tree.file),
                                    .path = files.path,
                                    .source = *files.source,
                                    .isOfFiles = files.isOfFiles});
  Packing pack;
  pack(change);
  return std::move(pack.bytes());
}

std::string DocumentMerging::finish(const std::string& made) {
  if (files_.empty()) return "There is nothing to merge";
  files_.clear();
  if (document_.ModelState() != state_) return "The setup has been edited since the merge was begun";
  DocumentChange change;
  Packing pack(made);
  pack(change);
  if (!pack.isWhole() || change.model == nullptr) return "What was merged is incomplete";
  if (change.isNone()) return "The second setup has changed nothing that is not here already";
  return makeChange(document_, std::move(change), PageId::none, "Merge");
}

}  // namespace gridbay
