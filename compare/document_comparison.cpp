#include "compare/document_comparison.h"

#include <optional>
#include <set>

#include "compare/compared_model.h"
#include "compare/difference_packing.h"
#include "compare/document_change.h"
#include "compare/document_merging.h"
#include "compare/tree_packing.h"

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
  explicit DocumentComparison(CV27SetupDoc& document) : document_(document), merging_(document) {}

  std::string read(const std::string& path) const override {
    const Result<SetupFile> opened = SetupFile::open(path, nullptr);
    std::string fault = opened ? std::string() : opened.error();
    Packing pack;
    pack(fault);
    if (opened) passTree(pack, opened->source());
    return std::move(pack.bytes());
  }
  std::string open(const std::string& path, const std::string& read) override {
    std::string fault;
    KvsHandle file;
    Packing pack(read);
    pack(fault);
    if (fault.empty()) pack(file);
    if (fault.empty() && (file == nullptr || !pack.isWhole())) fault = "What was read is incomplete";
    if (!fault.empty()) return fault;
    close();
    other_ = std::make_unique<SetupFile>(SetupFile::fromTree(std::move(file), path, nullptr));
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

  SetupMerging& merging() override { return merging_; }

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
    DocumentChange change =
        changeOf({.before = *own,
                  .beforePath = path,
                  .after = withTaken(*own, *other_->tree(path),
                                     [&](const std::string& each) { return paths.contains(each); }),
                  .path = path,
                  .source = document_.file().source()});
    if (change.isNone())
      return "It follows from other values, or is none of the model, and can't be taken over alone";
    return makeChange(document_, std::move(change), static_cast<PageId>(page), name);
  }

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
  DocumentMerging merging_;
};

}  // namespace

std::unique_ptr<SetupComparison> makeSetupComparison(CV27SetupDoc& document) {
  return std::make_unique<DocumentComparison>(document);
}

}  // namespace gridbay
