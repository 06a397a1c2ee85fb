#include "compare/document_comparison.h"

#include <algorithm>
#include <map>
#include <optional>
#include <set>

#include "compare/compared_model.h"
#include "compare/setup_merge.h"
#include "setup/setup_path.h"

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
    readOwn();
    return {};
  }
  void close() override {
    page_ = nullptr;
    shown_.reset();
    otherFile_.reset();
    other_.reset();
    found_ = {};
    state_.reset();
  }
  bool isOpen() const override { return other_ != nullptr; }
  std::string otherPath() const override { return otherPath_; }

  const std::vector<Difference>& differences() override {
    if (other_ == nullptr) return found_.differences;
    const Look now{document_.ModelState(), document_.path()};
    if (state_ == now) return found_.differences;
    ownFile_ = treeOf(document_.root());
    otherFile_ = other_->tree(document_.path());
    found_ = compareFiles(*ownFile_, *otherFile_, document_.path(), document_.units());
    compareRest(own_.get(), *other_, document_.path(), otherPath_, found_);
    state_ = now;
    return found_.differences;
  }

  Form* openPage(std::int32_t id) override {
    page_ = nullptr;
    if (other_ == nullptr) return nullptr;
    shown_.reset();
    shownFile_ = other_->tree(document_.path());
    shown_ = std::make_unique<ComparedModel>(*shownFile_, document_.path(), document_.units());
    page_ = shown_->page(id);
    if (page_ == nullptr || !shown_->isVisible(id)) return nullptr;
    makeReadOnly(page_->form());
    return &page_->form();
  }
  void unitsChanged() override {
    state_.reset();
    if (page_ == nullptr) return;
    shown_->setUnits(document_.units());
    page_->OnUpdate();
  }

  std::string takeOver(std::size_t place) override {
    if (place >= found_.differences.size()) return "There is no such difference any more";
    const Difference& wanted = found_.differences[place];
    const std::string name = wanted.thing.empty() ? wanted.pageName : wanted.thing;
    return take({wanted.keywords.begin(), wanted.keywords.end()}, wanted.page, "Take over " + name);
  }
  std::string takeOverPage(std::int32_t id) override {
    std::set<std::string> paths;
    std::string name;
    for (const Difference& difference : found_.differences) {
      if (difference.page != id) continue;
      paths.insert(difference.keywords.begin(), difference.keywords.end());
      name = difference.pageName;
    }
    return take(paths, id, "Take over " + name);
  }
  std::string takeOverAll() override {
    std::set<std::string> paths;
    for (const KeywordDifference& keyword : found_.keywords) paths.insert(keyword.path);
    return take(paths, 0, "Take over all");
  }

  std::string startMerge(const std::string& base, const std::string& other) override {
    Result<SetupFile> baseSetup = SetupFile::open(base, nullptr);
    if (!baseSetup) return baseSetup.error();
    Result<SetupFile> otherSetup = SetupFile::open(other, nullptr);
    if (!otherSetup) return otherSetup.error();
    readOwn();
    const std::string& path = document_.path();
    mergeBase_ = baseSetup->tree(path);
    mergeOther_ = otherSetup->tree(path);
    mergeOwn_ = treeOf(document_.root());
    const MergedTree merged = mergeTrees(*mergeBase_, *mergeOwn_, *mergeOther_,
                                         [](const MergeConflict&) { return MergeSide::own; });
    questions_ = questionsOf(merged.conflicts, *mergeOwn_, *mergeOther_, path, document_.units());
    conflicts_ = merged.conflicts;
    return {};
  }
  std::vector<MergeQuestion>& questions() override { return questions_; }
  std::string finishMerge() override {
    std::map<std::string, MergeSide> sides;
    for (std::size_t i = 0; i < conflicts_.size(); ++i)
      sides[conflicts_[i].path] = questions_[i].takesOther ? MergeSide::other : MergeSide::own;
    const MergedTree merged = mergeTrees(*mergeBase_, *mergeOwn_, *mergeOther_,
                                         [&](const MergeConflict& conflict) { return sides[conflict.path]; });
    return bring(*mergeOwn_, *merged.file, 0, "Merge");
  }

 private:
  // What the last look was at.
  struct Look {
    std::uint64_t state;
    std::string path;
    bool operator==(const Look&) const = default;
  };

  // What the document's file holds beside the model.
  void readOwn() {
    own_.reset();
    if (document_.path().empty()) return;
    if (Result<SetupFile> own = SetupFile::open(document_.path(), nullptr))
      own_ = std::make_unique<SetupFile>(std::move(*own));
  }

  KvsHandle treeOf(CGlobalKvs& root) const {
    // A save may leave out what can't be written, of a copy only. The engine's options are in no model.
    CGlobalKvs copy;
    copy.AssignState(root);
    if (own_ != nullptr) copy.SetSourceFile(&own_->source());
    KvsHandle file = kvsCreate();
    copy.Save(*file, document_.path());
    return file;
  }

  std::string take(const std::set<std::string>& paths, std::int32_t page, const std::string& name) {
    if (other_ == nullptr || ownFile_ == nullptr) return "There is nothing to take over";
    if (std::ranges::all_of(paths, [](const std::string& path) { return isOption(path); }))
      return "What makes this difference is not known: take over the keywords that it follows from, or all";
    const KvsHandle taken =
        withTaken(*ownFile_, *otherFile_, [&](const std::string& path) { return paths.contains(path); });
    return bring(*ownFile_, *taken, page, name);
  }

  // Gives the document what differs between two files. Parts of the model that are the same in both keep what
  // stands on no file.
  std::string bring(const KvsFile& before, const KvsFile& after, std::int32_t page, const std::string& name) {
    CGlobalKvs from;
    from.Load(&before.tree().root(), document_.path());
    CGlobalKvs to;
    to.Load(&after.tree().root(), document_.path());
    if (from.SameState(to))
      return "It follows from other values, or is none of the model, and can't be taken over alone";
    const bool isDone = document_.Attempt([&] {
      const std::vector<CKvsBase*> parts = document_.root().children();
      const std::vector<CKvsBase*> olds = from.children();
      const std::vector<CKvsBase*> news = to.children();
      for (std::size_t i = 0; i < parts.size(); ++i) {
        if (!olds[i]->SameState(*news[i])) parts[i]->AssignState(*news[i]);
      }
    });
    if (!isDone) return "The edit could not be made";
    const auto id = static_cast<PageId>(page);
    if (page != 0) document_.Touch(id);
    document_.SetModifiedFlag();
    document_.RecordEdit(id, name);
    document_.UpdateAllViews(nullptr);
    return {};
  }

  CV27SetupDoc& document_;
  std::unique_ptr<SetupFile> other_;
  std::string otherPath_;
  std::unique_ptr<SetupFile> own_;  // as it is on disk
  SetupDifference found_;
  std::optional<Look> state_;
  KvsHandle ownFile_;  // as of the last look
  KvsHandle otherFile_;
  KvsHandle shownFile_;
  std::unique_ptr<ComparedModel> shown_;
  CV27SetupFormView* page_ = nullptr;
  KvsHandle mergeBase_;
  KvsHandle mergeOwn_;
  KvsHandle mergeOther_;
  std::vector<MergeConflict> conflicts_;
  std::vector<MergeQuestion> questions_;
};

}  // namespace

std::unique_ptr<SetupComparison> makeSetupComparison(CV27SetupDoc& document) {
  return std::make_unique<DocumentComparison>(document);
}

}  // namespace gridbay
