#include "shell/cell_editors.h"

#include <QComboBox>
#include <QFrame>
#include <QKeyEvent>
#include <QScreen>
#include <QVBoxLayout>
#include <algorithm>

namespace gridbay::shell {
namespace {

constexpr int kSpacing = 2;  // around each choice

}  // namespace

CellEdit* editOf(QWidget* editor) {
  const auto* list = qobject_cast<QComboBox*>(editor);
  return qobject_cast<CellEdit*>(list == nullptr ? editor : list->lineEdit());
}

MultiChoiceEditor::MultiChoiceEditor(const std::vector<std::string>& choices, QWidget* parent)
    : QWidget(parent), popup_(new QFrame(this, Qt::Popup)), list_(new QListWidget(popup_)) {
  popup_->setFrameShape(QFrame::StyledPanel);
  auto* layout = new QVBoxLayout(popup_);
  layout->setContentsMargins(1, 1, 1, 1);
  layout->addWidget(list_);
  list_->setFrameShape(QFrame::NoFrame);
  list_->setSpacing(kSpacing);
  for (const std::string& choice : choices) {
    auto* item = new QListWidgetItem(QString::fromStdString(choice).trimmed(), list_);
    item->setFlags(Qt::ItemIsEnabled | Qt::ItemIsSelectable | Qt::ItemIsUserCheckable);
    item->setCheckState(Qt::Unchecked);
  }
  list_->installEventFilter(this);
  popup_->installEventFilter(this);
  setFocusPolicy(Qt::StrongFocus);
  // A click on the text sets the mark as one on the mark does.
  connect(list_, &QListWidget::itemPressed, this,
          [this](const QListWidgetItem* item) { pressedState_ = item->checkState(); });
  connect(list_, &QListWidget::itemClicked, this, [this](QListWidgetItem* item) {
    if (item->checkState() == pressedState_)
      item->setCheckState(pressedState_ == Qt::Checked ? Qt::Unchecked : Qt::Checked);
  });
}

void MultiChoiceEditor::setValue(qulonglong bits) {
  others_ = list_->count() < 64 ? bits >> list_->count() << list_->count() : 0;
  for (int i = 0; i < list_->count(); ++i)
    list_->item(i)->setCheckState(i < 64 && (bits >> i & 1U) != 0 ? Qt::Checked : Qt::Unchecked);
}

qulonglong MultiChoiceEditor::value() const {
  qulonglong bits = others_;
  for (int i = 0; i < std::min(list_->count(), 64); ++i) {
    if (list_->item(i)->checkState() == Qt::Checked) bits |= qulonglong{1} << i;
  }
  return bits;
}

void MultiChoiceEditor::open() {
  constexpr int kRows = 16;
  constexpr int kAround = 6;
  const int rows = std::clamp(list_->count(), 1, kRows);
  const int scroll = list_->count() > kRows ? 24 : 0;
  const QSize size(std::max(width(), list_->sizeHintForColumn(0) + 2 * kAround + scroll),
                   rows * (std::max(1, list_->sizeHintForRow(0)) + 2 * kSpacing) + kAround);
  popup_->resize(size);
  QPoint at = mapToGlobal(QPoint(0, height()));
  const QRect room = screen()->availableGeometry();
  if (at.y() + size.height() > room.bottom()) at.setY(mapToGlobal(QPoint(0, 0)).y() - size.height());
  at.setY(std::max(at.y(), room.top()));
  at.setX(std::clamp(at.x(), room.left(), std::max(room.left(), room.right() - size.width())));
  popup_->move(at);
  popup_->show();
  if (list_->currentRow() < 0) list_->setCurrentRow(0);
  list_->setFocus();
}

void MultiChoiceEditor::finish(bool taken) {
  if (isFinished_) return;
  isFinished_ = true;
  popup_->hide();
  window()->activateWindow();
  emit finished(taken);
}

bool MultiChoiceEditor::eventFilter(QObject* watched, QEvent* event) {
  if (watched == popup_ && event->type() == QEvent::Hide) {
    finish(true);
  } else if (watched == list_ && event->type() == QEvent::KeyPress) {
    const int key = static_cast<QKeyEvent*>(event)->key();
    const bool isTaken = key == Qt::Key_Return || key == Qt::Key_Enter || key == Qt::Key_Tab;
    if (isTaken || key == Qt::Key_Escape) {
      finish(isTaken);
      return true;
    }
  }
  return false;
}

}  // namespace gridbay::shell
