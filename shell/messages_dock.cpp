#include "shell/messages_dock.h"

#include <QEvent>
#include <QStyle>
#include <QVBoxLayout>

namespace gridbay::shell {
namespace {

constexpr int kPageRole = Qt::UserRole;
constexpr int kMessageWidth = 700;

}  // namespace

MessagesDock::MessagesDock(QAction* check, QWidget* parent)
    : QDockWidget(tr("Messages"), parent),
      note_(new QLabel(this)),
      check_(new QToolButton(this)),
      list_(new QTreeWidget(this)) {
  setObjectName("messages");
  check_->setDefaultAction(check);
  check_->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
  check_->setFocusPolicy(Qt::StrongFocus);
  list_->setHeaderLabels({tr("Message"), tr("Page")});
  list_->setRootIsDecorated(false);
  list_->setColumnWidth(0, kMessageWidth);
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
  connect(list_, &QTreeWidget::itemActivated, this,
          [this](const QTreeWidgetItem* item) { emit pageChosen(item->data(0, kPageRole).toInt()); });
  mark();
}

void MessagesDock::showCheckOf(DocumentTab* tab) {
  tab_ = tab;
  list_->clear();
  if (tab != nullptr && tab->check()) {
    for (const CMessage& message : tab->check()->messages) {
      auto* item = new QTreeWidgetItem(list_);
      const int page = static_cast<int>(message.page);
      item->setText(0, QString::fromStdString(message.text));
      item->setText(1, tab->caption(page));
      item->setData(0, kPageRole, page);
      const bool isPlain = message.severity == Severity::fault;
      item->setIcon(
          0, style()->standardIcon(isPlain ? QStyle::SP_MessageBoxWarning : QStyle::SP_MessageBoxCritical));
      item->setToolTip(0, item->text(0));
    }
  }
  mark();
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
  for (int i = 0; i < list_->topLevelItemCount(); ++i) {
    for (int column = 0; column < list_->columnCount(); ++column)
      list_->topLevelItem(i)->setForeground(column, brush);
  }
}

void MessagesDock::changeEvent(QEvent* event) {
  QDockWidget::changeEvent(event);
  if (event->type() == QEvent::PaletteChange) mark();
}

}  // namespace gridbay::shell
