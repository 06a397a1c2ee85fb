#include "shell/compare/compare_dock.h"

#include <QHeaderView>
#include <QVBoxLayout>

namespace gridbay::shell {
namespace {

constexpr int kPlaceRole = Qt::UserRole;
constexpr int kOwnColumn = 1;
constexpr int kOtherColumn = 2;

QString textOf(const std::optional<std::string>& value) {
  if (!value) return CompareDock::tr("not there");
  return value->empty() ? CompareDock::tr("nothing") : QString::fromStdString(*value);
}

}  // namespace

CompareDock::CompareDock(QWidget* parent)
    : QDockWidget(tr("Differences"), parent),
      note_(new QLabel(this)),
      busy_(new QProgressBar(this)),
      tools_(new QToolBar(this)),
      list_(new QTreeWidget(this)),
      next_(new QAction(tr("&Next Difference"), this)),
      previous_(new QAction(tr("Pre&vious Difference"), this)),
      take_(makeAction(tr("&Take Over"), QKeySequence(Qt::ALT | Qt::Key_Left), &TabComparison::takeOver)),
      takePage_(makeAction(tr("Take Over &Page"), {}, &TabComparison::takeOverPage)),
      takeAll_(makeAction(tr("Take Over &All"), {}, &TabComparison::takeOverAll)),
      end_(makeAction(tr("&End"), {}, &TabComparison::end)) {
  setObjectName("differences");
  next_->setShortcut(Qt::Key_F8);
  previous_->setShortcut(Qt::SHIFT | Qt::Key_F8);
  connect(next_, &QAction::triggered, this, [this] {
    if (TabComparison* on = comparison()) on->step(1);
  });
  connect(previous_, &QAction::triggered, this, [this] {
    if (TabComparison* on = comparison()) on->step(-1);
  });
  take_->setToolTip(
      tr("Make this difference as the other setup has it (%1)").arg(take_->shortcut().toString()));
  takePage_->setToolTip(tr("Make the page as the other setup has it"));
  takeAll_->setToolTip(tr("Make all as the other setup has it"));
  end_->setToolTip(tr("Compare no longer"));
  next_->setToolTip(tr("Next difference (%1)").arg(next_->shortcut().toString()));
  previous_->setToolTip(tr("Previous difference (%1)").arg(previous_->shortcut().toString()));
  tools_->setToolButtonStyle(Qt::ToolButtonTextOnly);
  for (QAction* action : {previous_, next_, take_, takePage_, takeAll_, end_}) {
    tools_->addAction(action);
    tools_->widgetForAction(action)->setFocusPolicy(Qt::StrongFocus);
  }
  list_->setAccessibleName(tr("Differences"));
  list_->setColumnCount(3);
  list_->setUniformRowHeights(true);
  list_->header()->setStretchLastSection(true);
  list_->header()->setSectionResizeMode(0, QHeaderView::Interactive);

  auto* content = new QWidget(this);
  auto* top = new QHBoxLayout();
  note_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
  note_->setTextFormat(Qt::PlainText);
  top->addWidget(note_, 1);
  busy_->setRange(0, 0);
  busy_->setTextVisible(false);
  busy_->setMaximumWidth(80);
  busy_->setAccessibleName(tr("Comparing"));
  busy_->hide();
  top->addWidget(busy_);
  top->addWidget(tools_);
  auto* layout = new QVBoxLayout(content);
  layout->setContentsMargins(4, 4, 4, 0);
  layout->addLayout(top);
  layout->addWidget(list_);
  setWidget(content);
  constexpr int kMoment = 400;  // milliseconds
  busyTimer_.setSingleShot(true);
  busyTimer_.setInterval(kMoment);
  connect(&busyTimer_, &QTimer::timeout, busy_, &QWidget::show);
  QWidget::setTabOrder(list_, tools_->widgetForAction(previous_));
  connect(list_, &QTreeWidget::currentItemChanged, this, [this](const QTreeWidgetItem* item) {
    if (isFilling_ || item == nullptr) return;
    const QTreeWidgetItem* shown = item->childCount() > 0 ? item->child(0) : item;
    if (TabComparison* on = comparison()) on->goTo(shown->data(0, kPlaceRole).toInt(), false);
    enableActions();
  });
  connect(list_, &QTreeWidget::itemActivated, this, [this](const QTreeWidgetItem* item) {
    if (TabComparison* on = comparison(); on != nullptr && item->childCount() == 0)
      on->goTo(item->data(0, kPlaceRole).toInt(), true);
  });
  fill();
}

QAction* CompareDock::makeAction(const QString& text, const QKeySequence& key, void (TabComparison::*act)()) {
  auto* action = new QAction(text, this);
  action->setShortcut(key);
  connect(action, &QAction::triggered, this, [this, act] {
    if (TabComparison* on = comparison()) (on->*act)();
  });
  return action;
}

void CompareDock::showDocument(DocumentTab* tab) {
  if (TabComparison* before = comparison()) disconnect(before, nullptr, this, nullptr);
  if (tab_ != nullptr) disconnect(tab_.data(), nullptr, this, nullptr);
  tab_ = tab;
  if (tab != nullptr) connect(tab, &DocumentTab::pageShown, this, &CompareDock::enableActions);
  if (TabComparison* on = comparison()) {
    connect(on, &TabComparison::changed, this, &CompareDock::fill);
    connect(on, &TabComparison::atWork, this, &CompareDock::showWork);
    connect(on, &TabComparison::currentChanged, this, &CompareDock::select);
    connect(on, &TabComparison::failed, this, &CompareDock::failed);
  }
  fill();
}

QString CompareDock::noteText() const {
  const TabComparison* on = comparison();
  if (on == nullptr) return tr("No setup is beside this one: File, Compare With.");
  const auto count = static_cast<int>(on->differences().size());
  if (count == 1) return tr("%1 and %2: 1 difference").arg(tab_->name(), on->otherName());
  if (count > 0) return tr("%1 and %2: %3 differences").arg(tab_->name(), on->otherName()).arg(count);
  if (on->isAtWork()) return tr("%1 and %2 are being compared.").arg(tab_->name(), on->otherName());
  return (on->isCurrent() ? tr("%1 and %2 are the same.") : tr("%1 and %2 have not been compared."))
      .arg(tab_->name(), on->otherName());
}

void CompareDock::showWork() {
  note_->setText(noteText());
  const TabComparison* on = comparison();
  if (on != nullptr && on->isAtWork()) {
    if (!busy_->isVisible()) busyTimer_.start();
  } else {
    busyTimer_.stop();
    busy_->hide();
  }
}

// A page with its differences below it.
void CompareDock::fill() {
  isFilling_ = true;
  list_->clear();
  const TabComparison* on = comparison();
  showWork();
  if (on != nullptr)
    list_->setHeaderLabels(
        {tr("Difference"), tr("In %1").arg(tab_->name()), tr("In %1").arg(on->otherName())});
  QTreeWidgetItem* page = nullptr;
  for (int i = 0; on != nullptr && i < static_cast<int>(on->differences().size()); ++i) {
    const Difference& difference = on->differences()[static_cast<std::size_t>(i)];
    const QString name =
        difference.page == 0 ? tr("On no page") : QString::fromStdString(difference.pageName);
    if (page == nullptr || page->text(0) != name) {
      page = new QTreeWidgetItem(list_, {name});
      QFont bold = page->font(0);
      bold.setBold(true);
      page->setFont(0, bold);
      page->setExpanded(true);
    }
    auto* item = new QTreeWidgetItem(page);
    item->setText(0, difference.thing.empty() ? tr("The page") : QString::fromStdString(difference.thing));
    item->setText(kOwnColumn,
                  difference.thing.empty() && difference.own ? tr("there") : textOf(difference.own));
    item->setText(kOtherColumn,
                  difference.thing.empty() && difference.other ? tr("there") : textOf(difference.other));
    item->setData(0, kPlaceRole, i);
    for (int column = 0; column <= kOtherColumn; ++column) item->setToolTip(column, item->text(column));
  }
  list_->resizeColumnToContents(0);
  constexpr int kWidest = 420;
  for (const int column : {0, kOwnColumn}) {
    list_->resizeColumnToContents(column);
    list_->setColumnWidth(column, std::min(list_->columnWidth(column) + 16, kWidest));
  }
  isFilling_ = false;
  if (on != nullptr) select(on->current());
  enableActions();
}

void CompareDock::select(int place) {
  isFilling_ = true;
  for (QTreeWidgetItemIterator item(list_); *item != nullptr; ++item) {
    if ((*item)->childCount() == 0 && (*item)->data(0, kPlaceRole).toInt() == place)
      list_->setCurrentItem(*item);
  }
  isFilling_ = false;
  enableActions();
}

void CompareDock::enableActions() {
  const TabComparison* on = comparison();
  const bool hasSome = on != nullptr && !on->differences().empty();
  for (QAction* action : {next_, previous_, takeAll_}) action->setEnabled(hasSome);
  take_->setEnabled(hasSome && on->current() >= 0);
  takePage_->setEnabled(hasSome && (on->current() >= 0 || tab_->currentPage() != 0));
  end_->setEnabled(on != nullptr);
}

}  // namespace gridbay::shell
