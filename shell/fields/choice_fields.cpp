#include "shell/fields/choice_fields.h"

#include <QBoxLayout>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QWheelEvent>
#include <algorithm>
#include <utility>

#include "platform/cartography/cartography.h"
#include "platform/projection_search.h"
#include "shell/fields/text_field.h"

namespace gridbay::shell {
namespace {

constexpr int kLocalCoordinates = 1;

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
  connect(list_, &QComboBox::activated, this, &DropDownField::take);
}

void DropDownField::take(int index) {
  if (search_ != nullptr) list_->lineEdit()->setModified(false);
  if (control().index == index && control().fault.empty()) return;
  control().index = index;
  control().fault.clear();
  emit changed();
}

void DropDownField::makeSearchable() {
  auto* edit = new ValueEdit(list_);
  edit->setFrame(false);
  list_->installEventFilter(this);
  search_ = new ProjectionCompleter(*list_, edit);
  connect(search_, &ProjectionCompleter::chosen, this,
          [this](const QString& text) { takeProjection(text.toStdString()); });
  connect(edit, &QLineEdit::editingFinished, this, &DropDownField::commit);
  constexpr int kLetters = 32;
  list_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
  list_->setMinimumContentsLength(kLetters);
}

// A projection that is not in the list joins it.
void DropDownField::takeProjection(const std::string& text) {
  std::vector<std::string>& choices = control().choices;
  const auto found = std::ranges::find(choices, text);
  const auto place = static_cast<int>(found - choices.begin());
  if (found == choices.end()) choices.push_back(text);
  take(place);
  showChoice();
}

bool DropDownField::commit() {
  if (search_ == nullptr || search_->popup()->isVisible()) return true;
  const QString typed = list_->currentText().trimmed();
  if (typed == list_->itemText(control().index)) return control().fault.empty();
  const Result<std::string> text = projectionText(typed.toStdString());
  if (text && !text->empty()) {
    takeProjection(*text);
    return true;
  }
  control().fault = text ? tr("A projection is missing").toStdString() : text.error();
  refresh();
  // Who leaves comes back to it once.
  if (!list_->hasFocus() && !std::exchange(hasReturned_, true)) emit returnWanted();
  return false;
}

// Esc brings the choice back.
bool DropDownField::eventFilter(QObject*, QEvent* event) {
  if (event->type() != QEvent::KeyPress || static_cast<QKeyEvent*>(event)->key() != Qt::Key_Escape)
    return false;
  if (list_->currentText() == list_->itemText(control().index)) return false;
  control().fault.clear();
  list_->setEditText(list_->itemText(control().index));
  refresh();
  return true;
}

void DropDownField::showChoice() {
  if (list_->currentIndex() != control().index) list_->setCurrentIndex(control().index);
  if (search_ == nullptr) return;
  auto* edit = static_cast<ValueEdit*>(list_->lineEdit());
  const bool isTyped = edit->hasFocus() && edit->isModified();
  edit->setFault(QString::fromStdString(control().fault));
  if (isTyped || !control().fault.empty()) return;
  hasReturned_ = false;
  list_->setEditText(list_->itemText(control().index));
  edit->setCursorPosition(0);
}

void DropDownField::show() {
  const Control& it = control();
  const QSignalBlocker blocker(list_);
  if (it.choices != shownChoices_) {
    shownChoices_ = it.choices;
    list_->clear();
    // A list that offers local coordinates is one of projections.
    const bool ofProjections =
        std::ranges::find(it.choices, CVdMapProjection::IDtoProjectionString(kLocalCoordinates)) !=
        it.choices.end();
    if (ofProjections && search_ == nullptr) makeSearchable();
    for (const QString& text : textsOf(it.choices))
      list_->addItem(ofProjections ? shownProjection(text) : text);
  }
  showChoice();
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
