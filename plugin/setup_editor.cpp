#include "plugin/setup_editor.h"

#include <chrono>
#include <stdexcept>

#include "advice/advisor.h"
#include "advice/fix_files.h"
#include "compare/document_comparison.h"
#include "map/document_map.h"
#include "plugin/cover_pages.h"
#include "setup/graphical_view.h"
#include "setup/gridbay_doc.h"
#include "setup/page_factory.h"
#include "setup/page_places.h"

namespace gridbay {
namespace {

class Editor final : public SetupEditor {
 public:
  explicit Editor(SetupHost& host) : document_(host), tree_(document_.enumerator()) {
    tree_.OnInitialUpdate(&document_.root());
    document_.AddView(this, [this] { update(); });
  }

  bool open(const std::string& path) override {
    dropPage();
    if (!document_.OnOpenDocument(path)) return false;
    tree_.OnInitialUpdate(&document_.root());
    update();
    return true;
  }
  bool save(const std::string& path) override { return document_.OnSaveDocument(path); }
  std::string path() const override { return document_.path(); }
  std::string fileKind() const override { return document_.fileKind(); }
  bool isModified() const override { return document_.IsModified(); }
  std::uint64_t modelState() const override { return document_.ModelState(); }

  std::string writeRecoveryCopy(const std::string& copy) override {
    const Outcome written = document_.WriteRecoveryCopy(copy);
    return written ? std::string() : written.error();
  }
  bool recover(const std::string& copy, const std::string& path) override {
    dropPage();
    if (!document_.OnRecoverDocument(copy, path)) return false;
    tree_.OnInitialUpdate(&document_.root());
    update();
    return true;
  }

  std::optional<Edit> undoable() const override { return editOf(document_.UndoStep()); }
  std::optional<Edit> redoable() const override { return editOf(document_.RedoStep()); }
  void undo() override { document_.Undo(); }
  void redo() override { document_.Redo(); }

  FirstView firstView() const override {
    CGraphicalView view;
    view.OnInitialUpdate();
    return {view.picture(), std::string(CGraphicalView::kText)};
  }

  SetupSummary summary() override { return summaryOf(document_.root(), document_.units()); }

  MapEditor& map() override { return *map_; }

  std::vector<Item> items() const override {
    std::vector<Item> items;
    for (const TreeItem& item : tree_.items())
      items.push_back({item.id, item.caption, item.depth, tree_.IsVisible(item)});
    return items;
  }
  void applyRules() override { tree_.OnUpdate(&document_.root()); }
  // What a page writes when it is left is an edit.
  void leavePage() {
    if (page_ == nullptr) return;
    const std::uint64_t before = document_.ModelState();
    page_->OnLeave();
    if (document_.ModelState() != before) document_.SetModifiedFlag();
  }
  // A page that is left may still write; that is not for a model that has just been read.
  void dropPage() { page_.reset(); }
  Form* openPage(std::int32_t id) override {
    std::string topic;
    std::string local;
    leavePage();
    page_ = makePage(document_.enumerator().GetPageClass(id, &topic, &local), document_);
    return page_ == nullptr ? nullptr : &page_->form();
  }
  void refreshPage() override {
    if (page_ != nullptr) page_->SetData();
  }
  Cover cover(std::int32_t id) const override {
    std::string topic;
    std::string local;
    const CDlgEnumerator& pages = document_.enumerator();
    return pages.GetPageClass(id, &topic, &local).empty() ? coverPage(local)
                                                          : missingPage(pages.GetCaption(id));
  }

  PagePlace placeOf(const CMessage& message) const override { return placeOfMessage(message); }
  std::vector<Advice> advice() override { return advisor_.look(document_.root(), document_.path()); }
  bool isAdviceWhole() const override { return advisor_.isComplete(); }
  bool readForAdvice(int milliseconds) override {
    return advisor_.read(std::chrono::milliseconds(milliseconds));
  }
  bool makeFix(const Advice& advice) override {
    bool isStopped = false;
    const bool isMade = document_.Attempt([this, &isStopped, &fix = advice.fix] {
      Outcome made;
      const auto make = [&](const Progress& progress) {
        made = gridbay::makeFix(document_.root(), fix, document_.path(), progress);
      };
      if (fix.files.empty()) {
        make({});
      } else {
        document_.host().doLongWork(fix.name, make);
      }
      isStopped = !made && made.error() == kFixStopped;
      if (!made && !isStopped) throw std::runtime_error(made.error());
    });
    if (!isMade || isStopped) return false;
    document_.Touch(advice.place.page);
    document_.SetModifiedFlag();
    document_.RecordEdit(advice.place.page, advice.fix.name);
    document_.UpdateAllViews(nullptr);
    return true;
  }

  std::vector<Command> commands() const override {
    std::vector<Command> commands;
    commands.reserve(CGridbayDoc::kCommands.size());
    for (const DocCommand& command : CGridbayDoc::kCommands) {
      commands.push_back({command.id, std::string(command.text), document_.IsChecked(command.id)});
    }
    return commands;
  }
  bool command(int id) override {
    const bool done = document_.OnCommand(id);
    refreshPage();
    return done;
  }
  std::int32_t helpTopic(std::int32_t id) const override {
    return document_.enumerator().GetHelpTopicNumber(id);
  }
  const UnitChoices& units() const override { return document_.units(); }
  void setUnits(const UnitChoices& units) override {
    document_.units() = units;
    comparison_->unitsChanged();
    refreshPage();
    update();
  }
  void onChange(std::function<void()> changed) override { changed_ = std::move(changed); }
  void onSave(std::function<void()> saved) override { document_.OnSaved(std::move(saved)); }
  SetupComparison& comparison() override { return *comparison_; }
  SeriesPlaces seriesPlaces(const std::string& file) override { return findSeriesPlaces(document_, file); }
  std::string useSeries(const std::string& file, const SeriesPlace& place) override {
    return putSeries(document_, file, place);
  }

 private:
  std::optional<Edit> editOf(const EditHistory::Step* step) const {
    if (step == nullptr) return std::nullopt;
    const auto page = static_cast<std::int32_t>(step->page);
    return Edit{page, step->name.empty() ? std::string(document_.enumerator().GetCaption(page)) : step->name};
  }
  void update() {
    applyRules();
    if (changed_) changed_();
  }

  CGridbayDoc document_;
  std::unique_ptr<MapEditor> map_ = makeMapEditor(document_);
  std::unique_ptr<SetupComparison> comparison_ = makeSetupComparison(document_);
  CNavigationView tree_;
  Advisor advisor_;
  std::unique_ptr<CV27SetupFormView> page_;
  std::function<void()> changed_;
};

}  // namespace

std::unique_ptr<SetupEditor> makeSetupEditor(SetupHost& host) {
  return std::make_unique<Editor>(host);
}

}  // namespace gridbay
