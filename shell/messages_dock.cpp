#include "shell/messages_dock.h"

#include <QEvent>
#include <QHeaderView>
#include <QStyle>
#include <QVBoxLayout>

#include "shell/tool_icons.h"

namespace gridbay::shell {
namespace {

constexpr int kAdviceType = QTreeWidgetItem::UserType;  // of an item with an advice
constexpr int kNumberRole = Qt::UserRole;               // of a message or an advice in its list
constexpr int kPageColumn = 1;
constexpr int kThingColumn = 2;
constexpr int kFixColumn = 3;

}  // namespace

MessagesDock::MessagesDock(QAction* check, QWidget* parent)
    : QDockWidget(tr("Messages"), parent),
      note_(new QLabel(this)),
      check_(new QToolButton(this)),
      list_(new QTreeWidget(this)),
      fix_(new QAction(tr("&Fix"), this)) {
  setObjectName("messages");
  check_->setDefaultAction(check);
  check_->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
  check_->setFocusPolicy(Qt::StrongFocus);
  list_->setHeaderLabels({tr("Message"), tr("Page"), tr("Of"), QString()});
  list_->setRootIsDecorated(false);
  list_->header()->setStretchLastSection(false);
  list_->header()->setSectionResizeMode(QHeaderView::ResizeToContents);
  list_->header()->setSectionResizeMode(0, QHeaderView::Stretch);
  list_->setAccessibleName(tr("Messages"));

  auto* content = new QWidget(this);
  auto* top = new QHBoxLayout();
  top->addWidget(note_, 1);
  top->addWidget(check_);
  auto* layout = new QVBoxLayout(content);
  layout->setContentsMargins(4, 4, 4, 0);
  layout->addLayout(top);
  layout->addWidget(list_);
  setWidget(content);
  QWidget::setTabOrder(list_, check_);
  connect(list_, &QTreeWidget::itemActivated, this, [this](const QTreeWidgetItem* item) {
    const auto number = static_cast<std::size_t>(item->data(0, kNumberRole).toInt());
    if (adviceAt(item) >= 0) {
      emit placeChosen(PagePlace(tab_->advice()[number].place));
    } else if (tab_ != nullptr && tab_->check() && number < tab_->check()->messages.size()) {
      emit placeChosen(tab_->editor().placeOf(tab_->check()->messages[number]));
    }
  });
  fix_->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_Period));
  fix_->setShortcutContext(Qt::WidgetWithChildrenShortcut);
  list_->addAction(fix_);
  list_->setContextMenuPolicy(Qt::ActionsContextMenu);
  connect(list_, &QTreeWidget::currentItemChanged, this,
          [this](const QTreeWidgetItem* item) { fix_->setEnabled(adviceAt(item) >= 0); });
  connect(fix_, &QAction::triggered, this, [this] {
    if (const int place = adviceAt(list_->currentItem()); place >= 0) emit fixWanted(place);
  });
  fix_->setEnabled(false);
  mark();
}

void MessagesDock::showCheckOf(DocumentTab* tab) {
  tab_ = tab;
  list_->clear();
  if (tab != nullptr && tab->check()) {
    for (const CMessage& message : tab->check()->messages) {
      auto* item = new QTreeWidgetItem(list_);
      item->setText(0, QString::fromStdString(message.text));
      item->setData(0, kNumberRole, list_->topLevelItemCount() - 1);
      showPlace(*item, tab->editor().placeOf(message));
      const bool isPlain = message.severity == Severity::fault;
      item->setIcon(
          0, style()->standardIcon(isPlain ? QStyle::SP_MessageBoxWarning : QStyle::SP_MessageBoxCritical));
      item->setToolTip(0, item->text(0));
    }
  }
  showAdvice();
  mark();
}

int MessagesDock::adviceAt(const QTreeWidgetItem* item) const {
  if (tab_ == nullptr || item == nullptr || item->type() != kAdviceType) return -1;
  const int place = item->data(0, kNumberRole).toInt();
  return place < static_cast<int>(tab_->advice().size()) ? place : -1;
}

int MessagesDock::messageCount() const {
  int count = list_->topLevelItemCount();
  while (count > 0 && list_->topLevelItem(count - 1)->type() == kAdviceType) --count;
  return count;
}

void MessagesDock::showAdvice() {
  const int current = adviceAt(list_->currentItem());
  const int messages = messageCount();
  for (int count = list_->topLevelItemCount(); count > messages; --count)
    delete list_->takeTopLevelItem(count - 1);
  if (tab_ == nullptr) return;
  // All at once: with buttons in it the list lays all of itself out for each item that comes.
  QList<QTreeWidgetItem*> items;
  for (std::size_t i = 0; i < tab_->advice().size(); ++i) items << new QTreeWidgetItem(kAdviceType);
  list_->addTopLevelItems(items);
  for (std::size_t i = 0; i < tab_->advice().size(); ++i) addAdvice(tab_->advice()[i], static_cast<int>(i));
  if (current >= 0 && messageCount() + current < list_->topLevelItemCount())
    list_->setCurrentItem(list_->topLevelItem(messageCount() + current));
}

void MessagesDock::showPlace(QTreeWidgetItem& item, const PagePlace& place) {
  item.setText(kPageColumn, tab_->caption(static_cast<std::int32_t>(place.page)));
  item.setText(kThingColumn, QString::fromStdString(place.thing));
}

void MessagesDock::addAdvice(const Advice& advice, int place) {
  const int count = static_cast<int>(tab_->advice().size());
  QTreeWidgetItem* item = list_->topLevelItem(list_->topLevelItemCount() - count + place);
  item->setText(0, QString::fromStdString(advice.doubt));
  item->setData(0, kNumberRole, place);
  showPlace(*item, advice.place);
  item->setIcon(0, toolIcon(Tool::advice));
  item->setToolTip(0, adviceTip(advice));
  auto* button = new QToolButton(list_);
  button->setText(tr("Fix"));
  button->setToolTip(QString::fromStdString(advice.fix.name));
  button->setAutoRaise(true);
  list_->setItemWidget(item, kFixColumn, button);
  // Not at once: the button goes with the list that the fix changes.
  connect(
      button, &QToolButton::clicked, this, [this, place] { emit fixWanted(place); }, Qt::QueuedConnection);
}

void MessagesDock::mark() {
  const bool isChecked = tab_ != nullptr && tab_->check();
  const bool holds = isChecked && tab_->isCheckCurrent();
  QString text;
  if (tab_ == nullptr) {
    text = tr("No setup is open.");
  } else if (!isChecked) {
    text = tr("%1 has not been checked yet.").arg(tab_->name());
  } else if (holds) {
    text = tr("%1: %2").arg(tab_->name(), faultsText(tab_->check()->faults));
  } else {
    text = tr("%1: %2 before the last edit. Check again to see what holds now.")
               .arg(tab_->name(), faultsText(tab_->check()->faults));
  }
  note_->setText(text);
  check_->setVisible(tab_ != nullptr && !holds);
  const QBrush brush = palette().brush(holds ? QPalette::Active : QPalette::Disabled, QPalette::Text);
  for (int i = 0; i < messageCount(); ++i) {
    for (int column = 0; column < list_->columnCount(); ++column)
      list_->topLevelItem(i)->setForeground(column, brush);
  }
}

void MessagesDock::changeEvent(QEvent* event) {
  QDockWidget::changeEvent(event);
  if (event->type() == QEvent::PaletteChange) mark();
}

}  // namespace gridbay::shell
