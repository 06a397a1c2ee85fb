#include "shell/fields/text_field.h"

#include <QKeyEvent>
#include <QPointer>

namespace gridbay::shell {
namespace {

constexpr int kNumberLetters = 12;
constexpr int kCountLetters = 8;
constexpr int kDateLetters = 19;

ValueEdit* makeEdit(const Control& control, QWidget* parent) {
  if (control.kind == ControlKind::dateTime) {
    auto* edit = new DateTimeEdit(parent);
    edit->setLetters(kDateLetters);
    return edit;
  }
  if (control.onSpin) {
    auto* edit = new CountEdit(parent);
    edit->setLetters(kCountLetters);
    return edit;
  }
  auto* edit = new ValueEdit(parent);
  const bool isText = std::holds_alternative<std::string*>(control.variable) ||
                      std::holds_alternative<std::monostate>(control.variable);
  edit->setLetters(isText ? 0 : kNumberLetters);
  return edit;
}

}  // namespace

TextField::TextField(Control& control, Accelerators& keys, QWidget* parent)
    : Field(control, keys), edit_(makeEdit(control, parent)) {
  giveKey();
  makeLabel(parent);
  if (control.itemCode != 0 || !control.unit.empty()) makeUnit(parent);
  edit_->installEventFilter(this);
  connect(edit_, &QLineEdit::editingFinished, this, [this] {
    if (edit_->hasFocus()) {
      commit();
    } else {
      left();
    }
  });
  if (auto* count = qobject_cast<CountEdit*>(edit_)) {
    connect(count, &CountEdit::stepped, this, [this](int delta) {
      if (commit()) emit stepped(delta);
    });
  } else if (auto* date = qobject_cast<DateTimeEdit*>(edit_)) {
    connect(date, &DateTimeEdit::picked, this, [this] { commit(); });
  }
}

bool TextField::isTyped() const {
  return edit_->text() != QString::fromStdString(control().text);
}

bool TextField::commit() {
  if (edit_->isReadOnly()) return true;
  edit_->setModified(false);
  if (isTyped()) {
    control().text = edit_->text().toStdString();
    // What the change leads to may close the page.
    const QPointer<TextField> self(this);
    emit changed();
    if (self == nullptr) return true;
  }
  return control().fault.empty();
}

// Hands over what is typed, and tells whether it is no value and the user is to be kept here to see that.
bool TextField::hasNewFault() {
  if (!isTyped() || commit() || hasReturned_) return false;
  hasReturned_ = true;
  return true;
}

void TextField::left() {
  if (hasNewFault()) emit returnWanted();
}

bool TextField::takeBack() {
  if (edit_->isReadOnly() || (!isTyped() && control().fault.empty()) || edit_->text() == lastValue_)
    return false;
  edit_->setText(lastValue_);
  if (!control().fault.empty()) commit();
  edit_->selectAll();
  return true;
}

bool TextField::eventFilter(QObject*, QEvent* event) {
  if (event->type() == QEvent::ShortcutOverride) {
    // An edit keeps the keys of undo and redo to itself only while there is typing of its own to take back.
    const auto* key = static_cast<QKeyEvent*>(event);
    const bool isUndo = key->matches(QKeySequence::Undo) && !edit_->isUndoAvailable();
    const bool isRedo = key->matches(QKeySequence::Redo) && !edit_->isRedoAvailable();
    if (isUndo || isRedo) {
      event->ignore();
      return true;
    }
  }
  if (event->type() != QEvent::KeyPress) return false;
  switch (static_cast<QKeyEvent*>(event)->key()) {
    case Qt::Key_Tab:
    case Qt::Key_Backtab:
      return hasNewFault();
    case Qt::Key_Escape:
      return takeBack();
    default:
      return false;
  }
}

void TextField::show() {
  const Control& it = control();
  const QString text = QString::fromStdString(it.text);
  if (it.fault.empty()) {
    lastValue_ = text;
    hasReturned_ = false;
  }
  // What is being typed stays.
  const bool isBeingTyped = edit_->hasFocus() && edit_->isModified();
  if (!isBeingTyped && edit_->text() != text) {
    const int cursor = edit_->hasFocus() ? edit_->cursorPosition() : 0;
    edit_->setText(text);
    edit_->setCursorPosition(cursor);
  }
  if (edit_->isReadOnly() != it.readOnly) edit_->setReadOnly(it.readOnly);
  edit_->setFault(QString::fromStdString(it.fault));
  if (auto* count = qobject_cast<CountEdit*>(edit_)) count->setRange(it.spinLowest, it.spinHighest);
}

}  // namespace gridbay::shell
