#include "compare/document_comparison.h"

#include <algorithm>
#include <map>
#include <optional>
#include <set>
#include <string_view>

#include "compare/compared_model.h"
#include "compare/difference_packing.h"
#include "compare/setup_merge.h"
#include "platform/packing.h"

namespace gridbay {
namespace {

// Nothing on the page can be used, whatever its own rules say.
void makeReadOnly(Form& form) {
  const Control::Rule never = [] { return false; };
  const Control::Rule always = [] { return true; };
  for (Control& control : form.controls()) {
    if (control.isEdit()) control.readOnlyIf = always;
    if (control.isIndexed() || control.kind == ControlKind::button) control.enabledIf = never;
  }
  form.applyRules();
}

class DocumentComparison final : public SetupComparison {
 public:
  explicit DocumentComparison(CV27SetupDoc& document) : document_(document) {}

  std::string open(const std::string& path) override {
    Result<SetupFile> opened = SetupFile::open(path, nullptr);
    if (!opened) return opened.error();
    close();
    other_ = std::make_unique<SetupFile>(std::move(*opened));
    otherPath_ = path;
    return {};
  }
  void close() override {
    page_ = nullptr;
    shown_.reset();
    other_.reset();
    found_ = {};
    foundAt_.reset();
    ++begun_;
  }
  bool isOpen() const override { return other_ != nullptr; }
  std::string otherPath() const override { return otherPath_; }

  std::string compare() const override {
    if (other_ == nullptr) return {};
    const std::string& path = document_.path();
    SetupFile& own = document_.file();
    // What was found in other units, or of another file, is in other words.
    const bool isLike = foundAt_ && foundAt_->path == path && foundAt_->begun == begun_;
    SetupDifference found = compareFiles(*own.tree(path), *other_->tree(path), path, document_.units(),
                                         isLike ? &found_ : nullptr);
    compareRest(&own, *other_, path, otherPath_, found);
    Look at = now();
    Packing pack;
    pack(at.state, at.path, at.begun);
    return std::move(pack.bytes()) + packed(std::move(found));
  }
  bool take(const std::string& bytes) override {
    Look at;
    Packing pack(bytes);
    pack(at.state, at.path, at.begun);
    SetupDifference found;
    if (other_ == nullptr || at != now() || !unpack(bytes.substr(pack.place()), found)) return false;
    found_ = std::move(found);
    foundAt_ = at;
    return true;
  }
  bool isCurrent() const override { return other_ != nullptr && foundAt_ == now(); }
  const std::vector<Difference>& differences() const override { return found_.differences; }

  Form* openPage(std::int32_t id) override {
    page_ = nullptr;
    if (other_ == nullptr) return nullptr;
    if (shown_ == nullptr || shownPath_ != document_.path()) {
      shown_.reset();
      shownPath_ = document_.path();
      shownFile_ = other_->tree(shownPath_);
      shown_ = std::make_unique<ComparedModel>(*shownFile_, shownPath_, document_.units());
    }
    page_ = shown_->page(id);
    if (page_ == nullptr || !shown_->isVisible(id)) return page_ = nullptr, nullptr;
    page_->OnUpdate();
    makeReadOnly(page_->form());
    return &page_->form();
  }
  void unitsChanged() override {
    ++begun_;
    if (shown_ != nullptr) shown_->setUnits(document_.units());
    if (page_ != nullptr) page_->OnUpdate();
  }

  std::string takeOver(std::size_t place) override {
    if (place >= found_.differences.size()) return "There is no such difference any more";
    const Difference& wanted = found_.differences[place];
    const std::string name = wanted.thing.empty() ? wanted.pageName : wanted.thing;
    return takeKeywords({wanted.keywords.begin(), wanted.keywords.end()}, wanted.page, "Take over " + name);
  }
  std::string takeOverPage(std::int32_t id) override {
    std::set<std::string> paths;
    std::string name;
    for (const Difference& difference : found_.differences) {
      if (difference.page != id) continue;
      paths.insert(difference.keywords.begin(), difference.keywords.end());
      name = difference.pageName;
    }
    return takeKeywords(paths, id, "Take over " + (name.empty() ? "what is on no page" : name));
  }
  std::string takeOverAll() override {
    std::set<std::string> paths;
    for (const KeywordDifference& keyword : found_.keywords) paths.insert(keyword.path);
    return takeKeywords(paths, 0, "Take over all");
  }

  std::string startMerge(const std::string& base, const std::string& own, const std::string& other) override {
    merge_ = {};
    Result<SetupFile> baseSetup = SetupFile::open(base, nullptr);
    if (!baseSetup) return baseSetup.error();
    Result<SetupFile> otherSetup = SetupFile::open(other, nullptr);
    if (!otherSetup) return otherSetup.error();
    std::optional<SetupFile> ownSetup;
    if (!own.empty()) {
      Result<SetupFile> opened = SetupFile::open(own, nullptr);
      if (!opened) return opened.error();
      ownSetup = std::move(*opened);
    }
    // Names of files in the result start where those of its first setup do.
    const std::string& path = merge_.path = own.empty() ? document_.path() : own;
    merge_.base = baseSetup->tree(path);
    merge_.own = ownSetup ? ownSetup->tree(path) : document_.file().tree(path);
    merge_.other = otherSetup->tree(path);
    merge_.source = withOptions(ownSetup ? ownSetup->source() : document_.file().source(), *merge_.own);
    merge_.isOfFiles = ownSetup.has_value();
    merge_.conflicts = mergeTrees(*merge_.base, *merge_.own, *merge_.other, [](const MergeConflict&) {
                         return MergeSide::own;
                       }).conflicts;
    for (const MergeConflict& conflict : merge_.conflicts) merge_.questions.push_back(questionOf(conflict));
    return {};
  }
  std::string wordQuestions() const override {
    return packed(questionsOf(merge_.conflicts, *merge_.base, *merge_.own, *merge_.other, merge_.path,
                              document_.units()));
  }
  bool takeQuestions(const std::string& words) override {
    std::vector<MergeQuestion> questions;
    if (!unpack(words, questions) || questions.size() != merge_.questions.size()) return false;
    merge_.questions = std::move(questions);
    return true;
  }
  std::vector<MergeQuestion>& questions() override { return merge_.questions; }
  std::string finishMerge() override {
    if (merge_.own == nullptr) return "There is nothing to merge";
    std::map<std::string, MergeSide> sides;
    for (const MergeQuestion& question : merge_.questions)
      sides[question.path] = question.takesOther ? MergeSide::other : MergeSide::own;
    const MergedTree merged = mergeTrees(*merge_.base, *merge_.own, *merge_.other,
                                         [&](const MergeConflict& conflict) { return sides[conflict.path]; });
    const KvsHandle before =
        merge_.isOfFiles ? document_.file().tree(document_.path()) : std::move(merge_.own);
    const Merge merge = std::move(merge_);
    merge_ = {};
    return bring({.before = *before,
                  .after = *merged.file,
                  .source = *merge.source,
                  .path = merge.path,
                  .isOfFiles = merge.isOfFiles,
                  .nothing = "The second setup has changed nothing that is not here already"},
                 0, "Merge");
  }

 private:
  // What a look was at: the state of the setup and its path, which setup was beside it, and in which units.
  struct Look {
    std::uint64_t state = 0;
    std::string path = {};
    std::uint64_t begun = 0;
    bool operator==(const Look&) const = default;
  };
  Look now() const { return {document_.ModelState(), document_.path(), begun_}; }

  std::string takeKeywords(const std::set<std::string>& paths, std::int32_t page, const std::string& name) {
    if (other_ == nullptr) return "There is nothing to take over";
    if (!isCurrent()) return "The setup has been edited since it was compared";
    if (paths.empty())
      return "What makes this difference is not known: take over the keywords that it follows from, or all";
    const std::string& path = document_.path();
    const KvsHandle own = document_.file().tree(path);
    const KvsHandle taken =
        withTaken(*own, *other_->tree(path), [&](const std::string& each) { return paths.contains(each); });
    return bring(
        {.before = *own,
         .after = *taken,
         .source = document_.file().source(),
         .path = path,
         .nothing = "It follows from other values, or is none of the model, and can't be taken over alone"},
        page, name);
  }

  // What a step makes of the document.
  struct Change {
    const KvsFile& before;  // as a save writes it
    const KvsFile& after;
    const KvsFile& source;          // whose options are exchanged
    const std::string& path;        // that file names in `after` start from
    bool isOfFiles = false;         // whose unknown sections come too
    std::string_view nothing = {};  // what is said where nothing changes
  };

  // Gives the document what differs between two files. Parts of the model that are the same in both keep what
  // stands on no file.
  std::string bring(const Change& change, std::int32_t page, const std::string& name) {
    CGlobalKvs from;
    from.Load(&change.before.tree().root(), document_.path());
    CGlobalKvs to;
    to.Load(&change.after.tree().root(), change.path);
    const bool keepsSource = !change.isOfFiles && sameOptions(change.before, change.after);
    if (keepsSource && from.SameState(to)) return std::string(change.nothing);
    KvsHandle source = keepsSource ? nullptr : withOptions(change.source, change.after);
    const bool isDone = document_.Attempt([&] {
      const std::vector<CKvsBase*> parts = document_.root().children();
      const std::vector<CKvsBase*> olds = from.children();
      const std::vector<CKvsBase*> news = to.children();
      for (std::size_t i = 0; i < parts.size(); ++i) {
        if (!olds[i]->SameState(*news[i])) parts[i]->AssignState(*news[i]);
      }
    });
    if (!isDone) return "The edit could not be made";
    if (source != nullptr) document_.ReplaceSource(std::move(source));
    const auto id = static_cast<PageId>(page);
    if (page != 0) document_.Touch(id);
    document_.SetModifiedFlag();
    document_.RecordEdit(id, name);
    document_.UpdateAllViews(nullptr);
    return {};
  }

  // Three setups on their way to one.
  struct Merge {
    KvsHandle base = {};
    KvsHandle own = {};
    KvsHandle other = {};
    KvsHandle source = {};  // of the first of the two
    std::string path = {};
    bool isOfFiles = false;  // and not of the document
    std::vector<MergeConflict> conflicts = {};
    std::vector<MergeQuestion> questions = {};
  };

  CV27SetupDoc& document_;
  std::unique_ptr<SetupFile> other_;
  std::string otherPath_;
  std::uint64_t begun_ = 0;  // one more for each other setup, and for other units
  SetupDifference found_;
  std::optional<Look> foundAt_;
  std::string shownPath_;
  KvsHandle shownFile_;
  std::unique_ptr<ComparedModel> shown_;
  CV27SetupFormView* page_ = nullptr;
  Merge merge_;
};

}  // namespace

std::unique_ptr<SetupComparison> makeSetupComparison(CV27SetupDoc& document) {
  return std::make_unique<DocumentComparison>(document);
}

}  // namespace gridbay
