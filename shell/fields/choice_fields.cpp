#include "shell/fields/choice_fields.h"

#include <QBoxLayout>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QWheelEvent>

#include "shell/fields/text_field.h"

namespace gridbay::shell {
namespace {

QStringList textsOf(const std::vector<std::string>& choices) {
  QStringList texts;
  for (const std::string& choice : choices) texts << QString::fromStdString(choice);
  return texts;
}

}  // namespace

ChoiceList::ChoiceList(QWidget* parent) : QComboBox(parent) {
  setSizeAdjustPolicy(QComboBox::AdjustToContents);
  setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
  setFocusPolicy(Qt::StrongFocus);
  constexpr int kRows = 20;
  setMaxVisibleItems(kRows);
}

void ChoiceList::wheelEvent(QWheelEvent* event) {
  if (hasFocus()) {
    QComboBox::wheelEvent(event);
  } else {
    event->ignore();
  }
}

DropDownField::DropDownField(Control& control, Accelerators& keys, QWidget* parent)
    : Field(control, keys), list_(new ChoiceList(parent)) {
  giveKey();
  makeLabel(parent);
  connect(list_, &QComboBox::activated, this, [this](int index) {
    if (this->control().index == index) return;
    this->control().index = index;
    emit changed();
  });
}

void DropDownField::show() {
  const Control& it = control();
  const QSignalBlocker blocker(list_);
  if (it.choices != shownChoices_) {
    shownChoices_ = it.choices;
    list_->clear();
    list_->addItems(textsOf(it.choices));
  }
  if (list_->currentIndex() != it.index) list_->setCurrentIndex(it.index);
}

RadioField::RadioField(Control& control, Accelerators& keys, QWidget* parent)
    : Field(control, keys), box_(new QWidget(parent)) {
  makeLabel(parent);
  box_->setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
  makeButtons();
}

// A few short choices stand in one line, others below each other.
void RadioField::makeButtons() {
  for (const QString& text : captions_) keys().release(text);
  captions_.clear();
  qDeleteAll(box_->findChildren<QRadioButton*>(Qt::FindDirectChildrenOnly));
  delete group_;
  delete box_->layout();
  shownChoices_ = control().choices;
  const QStringList texts = textsOf(shownChoices_);
  constexpr qsizetype kInLine = 3;
  constexpr qsizetype kLettersInLine = 40;
  const bool inLine = texts.size() <= kInLine && texts.join("").size() <= kLettersInLine;
  auto* layout = new QBoxLayout(inLine ? QBoxLayout::LeftToRight : QBoxLayout::TopToBottom, box_);
  layout->setContentsMargins(0, 0, 0, 0);
  layout->setSpacing(inLine ? 16 : 5);
  group_ = new QButtonGroup(box_);
  for (int i = 0; i < texts.size(); ++i) {
    captions_ << keys().take(texts[i].trimmed());
    auto* button = new QRadioButton(captions_.back(), box_);
    group_->addButton(button, i);
    layout->addWidget(button);
  }
  connect(group_, &QButtonGroup::idClicked, this, [this](int index) {
    control().index = index;
    emit changed();
  });
}

void RadioField::show() {
  const Control& it = control();
  if (it.choices != shownChoices_) makeButtons();
  if (group_->checkedId() != it.index) {
    // An exclusive group keeps one button down.
    group_->setExclusive(false);
    for (QAbstractButton* button : group_->buttons()) button->setChecked(group_->id(button) == it.index);
    group_->setExclusive(true);
  }
  for (QAbstractButton* button : group_->buttons()) {
    const auto id = static_cast<std::size_t>(group_->id(button));
    button->setEnabled(id >= it.choiceEnabled.size() || it.choiceEnabled[id]);
  }
}

CheckField::CheckField(Control& control, Accelerators& keys, QWidget* parent)
    : Field(control, keys), box_(new QCheckBox(parent)) {
  giveKey();
  connect(box_, &QCheckBox::clicked, this, [this](bool on) {
    this->control().index = on ? 1 : 0;
    emit changed();
  });
}

void CheckField::show() {
  const bool isOn = control().index == 1;
  if (box_->isChecked() != isOn) box_->setChecked(isOn);
}

ButtonField::ButtonField(Control& control, Accelerators& keys, QWidget* parent)
    : Field(control, keys), button_(new QPushButton(parent)) {
  if (caption() != "...") giveKey();
  button_->setAutoDefault(false);
  button_->setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
  connect(button_, &QPushButton::clicked, this, [this] { emit changed(); });
}

void ButtonField::setCaption(const QString& text) {
  constexpr int kAround = 22;
  button_->setText(text);
  button_->setFixedWidth(button_->fontMetrics().size(Qt::TextShowMnemonic, text).width() + kAround);
}

LabelField::LabelField(Control& control, Accelerators& keys, QWidget* parent)
    : Field(control, keys), value_(new QLabel(parent)) {
  makeLabel(parent);
  value_->setTextFormat(Qt::PlainText);
  value_->setTextInteractionFlags(Qt::TextSelectableByMouse);
}

void LabelField::show() {
  const QString text = QString::fromStdString(control().text);
  if (value_->text() != text) value_->setText(text);
}

std::unique_ptr<Field> makeField(Control& control, Accelerators& keys, QWidget* parent) {
  switch (control.kind) {
    case ControlKind::check:
      return std::make_unique<CheckField>(control, keys, parent);
    case ControlKind::radio:
      return std::make_unique<RadioField>(control, keys, parent);
    case ControlKind::dropDown:
      return std::make_unique<DropDownField>(control, keys, parent);
    case ControlKind::label:
      return std::make_unique<LabelField>(control, keys, parent);
    case ControlKind::button:
      return std::make_unique<ButtonField>(control, keys, parent);
    case ControlKind::text:
    case ControlKind::dateTime:
      return std::make_unique<TextField>(control, keys, parent);
    case ControlKind::group:
    case ControlKind::grid:
      break;
  }
  return nullptr;
}

}  // namespace gridbay::shell
