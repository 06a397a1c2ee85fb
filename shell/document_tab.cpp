#include "shell/document_tab.h"

#include <QFileInfo>
#include <QHeaderView>
#include <QPushButton>
#include <QTimer>
#include <QVBoxLayout>
#include <algorithm>

#include "shell/tool_icons.h"

namespace gridbay::shell {
namespace {

constexpr int kIdRole = Qt::UserRole;
constexpr const char* kUntitled = "Untitled";
constexpr int kAdviceDelay = 400;  // milliseconds after an edit
constexpr int kAdvicePiece = 15;   // milliseconds of reading at a time

}  // namespace

QString faultsText(unsigned faults) {
  return faults == 0   ? DocumentTab::tr("no faults")
         : faults == 1 ? DocumentTab::tr("1 fault")
                       : DocumentTab::tr("%1 faults").arg(faults);
}

DocumentTab::DocumentTab(std::function<std::unique_ptr<SetupEditor>(SetupHost&)> make,
                         WindowServices services, QWidget* parent)
    : QSplitter(parent), services_(std::move(services)) {
  auto* side = new QWidget(this);
  auto* sideLayout = new QVBoxLayout(side);
  sideLayout->setContentsMargins(0, 0, 0, 0);
  filter_ = new QLineEdit(side);
  filter_->setPlaceholderText(tr("Find a page"));
  filter_->setAccessibleName(tr("Find a page"));
  filter_->setClearButtonEnabled(true);
  tree_ = new QTreeWidget(side);
  tree_->setHeaderHidden(true);
  tree_->setAccessibleName(tr("Pages"));
  sideLayout->addWidget(filter_);
  sideLayout->addWidget(tree_);
  auto* main = new QWidget(this);
  auto* mainLayout = new QVBoxLayout(main);
  mainLayout->setContentsMargins(0, 0, 0, 0);
  notice_ = new FileNotice(
      {tr("%1 was changed by another program. Reload it and lose the edits made here, or keep what is open "
          "here."),
       tr("%1 is no longer on disk. What is open here can be saved again."), tr("Reload"), tr("Keep mine")},
      main);
  pages_ = new QSplitter(main);
  pages_->setChildrenCollapsible(false);
  pane_ = new PagePane(pages_);
  pages_->addWidget(pane_);
  cover_ = new CoverView(main);
  summary_ = new SummaryView(main);
  adviceStrip_ = new AdviceStrip(main);
  mainLayout->addWidget(notice_);
  mainLayout->addWidget(pages_, 1);
  mainLayout->addWidget(cover_, 1);
  mainLayout->addWidget(summary_, 1);
  // Below the page, which stays where it is when advice comes and goes.
  mainLayout->addWidget(adviceStrip_);
  addWidget(side);
  addWidget(main);
  setStretchFactor(1, 1);
  setSizes({260, 700});

  editor_ = make(*this);
  adviceTimer_.setSingleShot(true);
  adviceTimer_.setInterval(kAdviceDelay);
  readingTimer_.setInterval(0);
  connect(&adviceTimer_, &QTimer::timeout, this, &DocumentTab::lookForAdvice);
  connect(&readingTimer_, &QTimer::timeout, this, &DocumentTab::readForAdvice);
  connect(adviceStrip_, &AdviceStrip::chosen, this,
          [this](int place) { goToPlace(PagePlace(advice_.at(static_cast<std::size_t>(place)).place)); });
  connect(adviceStrip_, &AdviceStrip::fixWanted, this,
          [this](int place) { fixAdvice(static_cast<std::size_t>(place)); });

  editor_->onChange([this] {
    adviceTimer_.start();
    applyVisibility();
    showSummary();
    emit documentChanged();
  });
  editor_->onSave([this] {
    adviceTimer_.start();
    watch();
    showSummary();
    emit documentChanged();
    emit saved();
  });
  connect(summary_, &SummaryView::pageChosen, this, [this](int page) { goToPage(page); });
  connect(summary_, &SummaryView::checkWanted, this, [this] { runCommand(kValidate); });
  fillTree();
  showFirstView();
  connect(pane_, &PagePane::cellChosen, this, &DocumentTab::cellChosen);
  connect(pane_, &PagePane::pickWanted, this, [this] { emit pickWanted(pane_); });
  connect(filter_, &QLineEdit::textChanged, this, [this] { applyVisibility(); });
  connect(tree_, &QTreeWidget::currentItemChanged, this, [this] { showCurrentPage(); });
  connect(notice_, &FileNotice::readAgain, this, [this] { open(QString::fromStdString(editor_->path())); });
}

// The page's widgets go before the editor whose form they show.
DocumentTab::~DocumentTab() {
  emit closing();
  pane_->clear();
}

void DocumentTab::fillTree() {
  const QSignalBlocker blocker(tree_);
  tree_->clear();
  itemsById_.clear();
  std::vector<QTreeWidgetItem*> path;
  for (const SetupEditor::Item& item : editor_->items()) {
    path.resize(static_cast<std::size_t>(item.depth));
    auto* node = path.empty() ? new QTreeWidgetItem(tree_) : new QTreeWidgetItem(path.back());
    node->setText(0, QString::fromStdString(item.caption));
    node->setData(0, kIdRole, item.id);
    itemsById_.insert(item.id, node);
    path.push_back(node);
  }
  applyVisibility();
  for (int i = 0; i < tree_->topLevelItemCount(); ++i) tree_->topLevelItem(i)->setExpanded(true);
}

// An item is seen when the rules show it and the filter finds it or something below it.
void DocumentTab::applyVisibility() {
  const QString wanted = filter_->text();
  const std::vector<SetupEditor::Item> items = editor_->items();
  bool currentHidden = false;
  for (const SetupEditor::Item& item : items) {
    QTreeWidgetItem* node = itemOf(item.id);
    if (node == nullptr) continue;
    const bool hidden = !item.visible || !wanted.isEmpty();
    if (node->isHidden() != hidden) node->setHidden(hidden);
    if (node == tree_->currentItem() && !item.visible) currentHidden = true;
  }
  for (const SetupEditor::Item& item : items) {
    if (wanted.isEmpty() || !item.visible) continue;
    if (!QString::fromStdString(item.caption).contains(wanted, Qt::CaseInsensitive)) continue;
    for (QTreeWidgetItem* node = itemOf(item.id); node != nullptr; node = node->parent())
      node->setHidden(false);
  }
  // Not at once: the page may be in the middle of the edit that hides it.
  if (currentHidden) QTimer::singleShot(0, this, [this] { leaveHiddenPage(); });
}

// From a page that has gone out the view moves to what is above it and still seen.
void DocumentTab::leaveHiddenPage() {
  QTreeWidgetItem* node = tree_->currentItem();
  const auto isOut = [this](const QTreeWidgetItem* at) {
    for (const SetupEditor::Item& item : editor_->items()) {
      if (itemOf(item.id) == at) return !item.visible;
    }
    return false;
  };
  if (node == nullptr || !isOut(node)) return;
  while (node != nullptr && isOut(node)) node = node->parent();
  tree_->setCurrentItem(node != nullptr ? node : tree_->topLevelItem(0));
}

bool DocumentTab::isShown(std::int32_t id) const {
  const std::vector<SetupEditor::Item> items = editor_->items();
  const auto found = std::ranges::find(items, id, &SetupEditor::Item::id);
  return found != items.end() && found->visible;
}

bool DocumentTab::goToPage(std::int32_t id) {
  QTreeWidgetItem* node = itemOf(id);
  if (node == nullptr || !isShown(id)) return false;
  if (node->isHidden()) filter_->clear();
  tree_->setCurrentItem(node);
  return true;
}

bool DocumentTab::goToPlace(const PagePlace& place, Keyboard keyboard) {
  const auto page = static_cast<std::int32_t>(place.page);
  if (currentPage() != page && !goToPage(page)) return false;
  QWidget* found = pane_->goTo(place);
  if (found != nullptr && keyboard == Keyboard::follows) {
    window()->activateWindow();  // who asks may be in a window of its own
    found->setFocus(Qt::OtherFocusReason);
  }
  return true;
}

void DocumentTab::goToNeighbour(int direction) {
  QTreeWidgetItem* node = tree_->currentItem();
  if (node != nullptr) node = direction > 0 ? tree_->itemBelow(node) : tree_->itemAbove(node);
  if (tree_->currentItem() == nullptr) node = tree_->topLevelItem(0);
  if (node != nullptr) tree_->setCurrentItem(node);
}

std::int32_t DocumentTab::currentPage() const {
  const QTreeWidgetItem* node = tree_->currentItem();
  return node == nullptr ? 0 : node->data(0, kIdRole).toInt();
}

QString DocumentTab::caption(std::int32_t id) const {
  const QTreeWidgetItem* node = itemOf(id);
  return node == nullptr ? QString::number(id) : node->text(0);
}

void DocumentTab::showFirstView() {
  tree_->setCurrentItem(nullptr);
  pane_->clear();
  const SetupEditor::FirstView view = editor_->firstView();
  pane_->showPicture(QString::fromStdString(view.picture.value_or("")), QString::fromStdString(view.text));
  cover_->hide();
  pages_->show();
  summary_->show();
  showSummary();
  showAdvice();
  emit pageShown();
}

// The model's lines, and one for its check.
void DocumentTab::showSummary() {
  if (summary_->isHidden()) return;
  SetupSummary summary = editor_->summary();
  if (!check_) {
    summary.lines.push_back({0, "Check", "not checked yet", false});
  } else {
    const std::string faults = faultsText(check_->faults).toStdString();
    const int page = check_->messages.empty() ? 0 : static_cast<int>(check_->messages.front().page);
    const bool holds = isCheckCurrent();
    summary.lines.push_back({page, "Check", holds ? faults : faults + " before the last edit", holds});
  }
  summary_->showSummary(summary);
  summary_->checkButton().setVisible(!isCheckCurrent() || !summary.gridsAreRead);
}

void DocumentTab::showCurrentPage() {
  const QTreeWidgetItem* node = tree_->currentItem();
  if (node == nullptr) return;
  const int id = node->data(0, kIdRole).toInt();
  // The old page's widgets go before the form that they show.
  pane_->clear();
  summary_->hide();
  Form* form = editor_->openPage(id);
  if (form != nullptr) {
    pane_->showForm(node->text(0), *form);
  } else {
    cover_->showCover(editor_->cover(id));
  }
  cover_->setVisible(form == nullptr);
  pages_->setVisible(form != nullptr);
  emit cellChosen();
  showAdvice();
  emit pageShown();
}

// In a column of their own, as advice has its marks beside the captions.
void DocumentTab::markPages(const QHash<std::int32_t, QString>& tips) {
  constexpr int kMarkColumn = 1;
  const bool hasMarks = !tips.isEmpty();
  tree_->setColumnCount(hasMarks ? kMarkColumn + 1 : kMarkColumn);
  tree_->header()->setStretchLastSection(!hasMarks);
  if (!hasMarks) return;
  // Rows with a mark are as high as the others.
  const int height = tree_->fontMetrics().height();
  tree_->setIconSize({height, height});
  tree_->header()->setSectionResizeMode(0, QHeaderView::Stretch);
  tree_->header()->setSectionResizeMode(kMarkColumn, QHeaderView::ResizeToContents);
  for (auto item = itemsById_.cbegin(); item != itemsById_.cend(); ++item) {
    QStringList tip{tips.value(item.key())};
    // One that is folded in is marked on what it is folded into.
    for (auto below = itemsById_.cbegin(); below != itemsById_.cend(); ++below) {
      if (below.value()->parent() == item.value() && item.value()->parent() != nullptr)
        tip << tips.value(below.key());
    }
    tip.removeAll(QString());
    item.value()->setIcon(kMarkColumn, tip.isEmpty() ? QIcon() : toolIcon(Tool::differs));
    item.value()->setToolTip(kMarkColumn, tip.join('\n'));
    item.value()->setData(kMarkColumn, Qt::AccessibleTextRole, tip.join('\n'));
  }
}

void DocumentTab::lookForAdvice() {
  readingTimer_.stop();
  std::vector<Advice> found = editor_->advice();
  if (found != advice_) {
    advice_ = std::move(found);
    showAdvice();
  }
  if (!editor_->isAdviceWhole()) readingTimer_.start();
}

void DocumentTab::readForAdvice() {
  if (!editor_->readForAdvice(kAdvicePiece)) return;
  lookForAdvice();
}

// Marks on the items of the tree, and the open page's own advice below it.
void DocumentTab::showAdvice() {
  QHash<std::int32_t, QStringList> tips;
  std::vector<int> here;
  for (std::size_t i = 0; i < advice_.size(); ++i) {
    const auto page = static_cast<std::int32_t>(advice_[i].place.page);
    tips[page] << adviceTip(advice_[i]);
    // An item that is folded in is marked on what it is folded into; the roots stay open.
    QTreeWidgetItem* item = itemOf(page);
    for (item = item == nullptr ? nullptr : item->parent(); item != nullptr && item->parent() != nullptr;
         item = item->parent())
      tips[item->data(0, kIdRole).toInt()] << adviceTip(advice_[i]);
    if (page == currentPage() && page != 0) here.push_back(static_cast<int>(i));
  }
  for (auto item = itemsById_.cbegin(); item != itemsById_.cend(); ++item) {
    const QString tip = tips.value(item.key()).join("\n\n");
    if (item.value()->toolTip(0) == tip) continue;
    item.value()->setToolTip(0, tip);
    item.value()->setIcon(0, tip.isEmpty() ? QIcon() : toolIcon(Tool::advice));
  }
  adviceStrip_->showAdvice(advice_, here);
  emit advised();
}

// The setup and its files may be others since the advice was given: it is worked out anew, and made where it
// still does what was offered.
void DocumentTab::fixAdvice(std::size_t place) {
  if (place >= advice_.size()) return;
  Advice wanted = advice_[place];
  commit();
  lookForAdvice();
  const auto now = std::ranges::find_if(advice_, [&](const Advice& each) {
    return each.kind == wanted.kind && each.place == wanted.place && each.fix.name == wanted.fix.name;
  });
  if (now == advice_.end()) return;
  wanted = *now;
  if (!editor_->makeFix(wanted)) return;
  editor_->refreshPage();
  pane_->refresh();
  goToPage(static_cast<std::int32_t>(wanted.place.page));
  // What the fix has mended is seen to be gone at once.
  lookForAdvice();
}

QString DocumentTab::name() const {
  const QString path = QString::fromStdString(editor_->path());
  return path.isEmpty() ? QString(kUntitled) : QFileInfo(path).fileName();
}

QString DocumentTab::title() const {
  return name() + (editor_->isModified() ? " *" : "");
}

void DocumentTab::watch() {
  notice_->watch(QString::fromStdString(editor_->path()));
}

// The page that was open is opened again.
bool DocumentTab::replaceSetup(const std::function<bool()>& load) {
  const std::int32_t page = currentPage();
  pane_->clear();
  const bool loaded = load();
  if (loaded) {
    check_.reset();
    fillTree();
    watch();
    advice_.clear();
    adviceTimer_.start();
  }
  const bool isShown = page != 0 && goToPage(page);
  if (!isShown) showFirstView();
  if (!isShown || !loaded) showCurrentPage();
  if (loaded) {
    showAdvice();
    emit documentChanged();
    emit checked();
  }
  return loaded;
}

bool DocumentTab::open(const QString& path) {
  return replaceSetup([&] { return editor_->open(path.toStdString()); });
}

bool DocumentTab::recover(const QString& copy, const QString& path) {
  return replaceSetup([&] { return editor_->recover(copy.toStdString(), path.toStdString()); });
}

bool DocumentTab::save(const QString& path) {
  commit();
  return editor_->save(path.toStdString());
}

bool DocumentTab::mayWriteOver(const std::string& path) {
  return path != editor_->path() || !isChangedOnDisk() ||
         askYesNo(path + " was changed by another program since it was opened here.\n\nWrite over it?");
}

bool DocumentTab::runCommand(int id) {
  commit();
  const bool done = editor_->command(id);
  pane_->refresh();
  showSummary();
  return done;
}

void DocumentTab::showMessages(const ValidationList& messages, unsigned faults) {
  check_ = {messages, faults, editor_->modelState()};
  emit checked();
}

void DocumentTab::undo() {
  commit();
  if (const std::optional<SetupEditor::Edit> edit = editor_->undoable()) {
    editor_->undo();
    showEdit(*edit);
  }
}

void DocumentTab::redo() {
  commit();
  if (const std::optional<SetupEditor::Edit> edit = editor_->redoable()) {
    editor_->redo();
    showEdit(*edit);
  }
}

void DocumentTab::showEdit(const SetupEditor::Edit& edit) {
  pane_->refresh();
  goToPage(edit.page);
}

void DocumentTab::setUnits(const UnitChoices& units) {
  commit();
  editor_->setUnits(units);
  pane_->refresh();
}

}  // namespace gridbay::shell
