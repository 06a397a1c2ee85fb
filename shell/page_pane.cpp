#include "shell/page_pane.h"

#include <QApplication>
#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QFormLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QToolButton>

#include "shell/grid_view.h"

namespace gridbay::shell {
namespace {

constexpr int kMargin = 16;
constexpr const char* kMenuKeys = "FEVRWH";

QLabel* makeCaption(const QString& text, QWidget* parent) {
  auto* caption = new QLabel(text, parent);
  QFont font = caption->font();
  font.setPointSizeF(font.pointSizeF() * 1.4);
  font.setBold(true);
  caption->setFont(font);
  return caption;
}

// An edit with a button on either side of its count; the up and down keys do the same.
class CountEdit final : public QWidget {
 public:
  CountEdit(Control& control, QWidget* parent, std::function<void(int)> step)
      : QWidget(parent), edit(new QLineEdit(this)), step_(std::move(step)) {
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(edit);
    edit->installEventFilter(this);
    for (const int delta : {-1, 1}) {
      auto* button = new QToolButton(this);
      button->setText(delta < 0 ? "-" : "+");
      button->setToolTip(tr("%1 to %2").arg(control.spinLowest).arg(control.spinHighest));
      button->setFocusPolicy(Qt::NoFocus);
      button->setAutoRepeat(true);
      connect(button, &QToolButton::clicked, this, [this, delta] { step_(delta); });
      layout->addWidget(button);
    }
    setFocusProxy(edit);
  }

  QLineEdit* edit;

 protected:
  bool eventFilter(QObject*, QEvent* event) override {
    if (event->type() != QEvent::KeyPress) return false;
    const int key = static_cast<QKeyEvent*>(event)->key();
    if (key != Qt::Key_Up && key != Qt::Key_Down) return false;
    step_(key == Qt::Key_Up ? 1 : -1);
    return true;
  }

 private:
  std::function<void(int)> step_;
};

class Picture final : public QLabel {
 public:
  Picture(const QString& path, const QString& text, QWidget* parent) : QLabel(text, parent), picture_(path) {
    setAlignment(Qt::AlignCenter);
  }

 protected:
  void resizeEvent(QResizeEvent* event) override {
    QLabel::resizeEvent(event);
    if (!picture_.isNull()) setPixmap(picture_.scaled(size()));
  }

 private:
  QPixmap picture_;
};

}  // namespace

PagePane::PagePane(QWidget* parent) : QScrollArea(parent) {
  setWidgetResizable(true);
  setFrameShape(QFrame::NoFrame);
}

void PagePane::clear() {
  bound_.clear();
  form_ = nullptr;
  usedKeys_ = kMenuKeys;
  delete takeWidget();
}

QVBoxLayout* PagePane::startPage(const QString& caption) {
  clear();
  auto* page = new QWidget(this);
  auto* layout = new QVBoxLayout(page);
  layout->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
  layout->addWidget(makeCaption(caption, page));
  return layout;
}

void PagePane::showText(const QString& caption, const QString& text) {
  QVBoxLayout* layout = startPage(caption);
  auto* body = new QLabel(text, layout->parentWidget());
  body->setWordWrap(true);
  body->setTextFormat(Qt::MarkdownText);
  body->setTextInteractionFlags(Qt::TextBrowserInteraction);
  layout->addWidget(body);
  layout->addStretch();
  setWidget(layout->parentWidget());
}

void PagePane::showPicture(const QString& path, const QString& text) {
  clear();
  setWidget(new Picture(path, text, this));
}

void PagePane::showForm(const QString& caption, Form& form) {
  QVBoxLayout* layout = startPage(caption);
  QWidget* page = layout->parentWidget();
  form_ = &form;
  auto* rows = new QFormLayout();
  rows->setFieldGrowthPolicy(QFormLayout::ExpandingFieldsGrow);
  layout->addLayout(rows);
  bool hasGrid = false;
  for (Control& control : form.controls()) {
    QWidget* widget = makeWidget(control, page);
    QLabel* label = nullptr;
    QString text = QString::fromStdString(control.label);
    if (control.kind == ControlKind::grid) {
      widget->setAccessibleName(text);
      layout->addWidget(widget, 1);
      hasGrid = true;
    } else if (control.kind == ControlKind::group || control.kind == ControlKind::check ||
               control.kind == ControlKind::button) {
      rows->addRow(widget);
    } else {
      label = new QLabel(page);
      label->setBuddy(widget);
      const bool takesFocus = control.kind == ControlKind::text || control.kind == ControlKind::dropDown;
      if (takesFocus) text = withAccelerator(text);
      rows->addRow(label, widget);
    }
    bound_.push_back({&control, widget, label, text});
  }
  if (!hasGrid) layout->addStretch();
  setWidget(page);
  refresh();
}

// A label's own key, or the first letter that no other label of the page and no menu has.
QString PagePane::withAccelerator(const QString& text) {
  const qsizetype own = text.indexOf('&');
  if (own >= 0 && own + 1 < text.size()) {
    usedKeys_ += text[own + 1].toUpper();
    return text;
  }
  for (qsizetype i = 0; i < text.size(); ++i) {
    const QChar letter = text[i].toUpper();
    if (!letter.isLetter() || letter.unicode() > 127 || usedKeys_.contains(letter)) continue;
    usedKeys_ += letter;
    return QString(text).insert(i, '&');
  }
  return text;
}

QWidget* PagePane::makeWidget(Control& control, QWidget* parent) {
  const QString text = QString::fromStdString(control.label).trimmed();
  switch (control.kind) {
    case ControlKind::group:
      return new QLabel("<b>" + text.toHtmlEscaped() + "</b>", parent);
    case ControlKind::label:
      return new QLabel(parent);
    case ControlKind::grid:
      return new GridView(*control.grid, parent);
    case ControlKind::button: {
      auto* button = new QPushButton(text == "..." ? text : withAccelerator(text), parent);
      connect(button, &QPushButton::clicked, this, [this, &control] { changed(control); });
      return button;
    }
    case ControlKind::check: {
      auto* box = new QCheckBox(withAccelerator(text), parent);
      connect(box, &QCheckBox::toggled, this, [this, &control](bool on) {
        control.index = on ? 1 : 0;
        changed(control);
      });
      return box;
    }
    case ControlKind::dropDown: {
      auto* list = new QComboBox(parent);
      connect(list, &QComboBox::activated, this, [this, &control](int index) {
        control.index = index;
        changed(control);
      });
      return list;
    }
    case ControlKind::radio:
      return makeRadio(control, parent);
    case ControlKind::text:
      break;
  }
  return makeEdit(control, parent);
}

QWidget* PagePane::makeRadio(Control& control, QWidget* parent) {
  auto* box = new QWidget(parent);
  auto* layout = new QVBoxLayout(box);
  layout->setContentsMargins(0, 0, 0, 0);
  auto* group = new QButtonGroup(box);
  for (std::size_t i = 0; i < control.choices.size(); ++i) {
    auto* button = new QRadioButton(withAccelerator(QString::fromStdString(control.choices[i])), box);
    group->addButton(button, static_cast<int>(i));
    layout->addWidget(button);
  }
  connect(group, &QButtonGroup::idClicked, this, [this, &control](int index) {
    control.index = index;
    changed(control);
  });
  return box;
}

QWidget* PagePane::makeEdit(Control& control, QWidget* parent) {
  QLineEdit* edit = nullptr;
  QWidget* widget = nullptr;
  if (control.onSpin) {
    auto* count = new CountEdit(control, parent, [this, &control](int delta) {
      form_->spin(control, delta);
      refresh();
    });
    edit = count->edit;
    widget = count;
  } else {
    edit = new QLineEdit(parent);
    widget = edit;
  }
  // A number needs no more room than its digits; a text may be long.
  if (!std::holds_alternative<std::string*>(control.variable)) {
    for (QWidget* each : {widget, static_cast<QWidget*>(edit)})
      each->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
  }
  edit->installEventFilter(this);
  connect(edit, &QLineEdit::editingFinished, this, [this, edit, &control] {
    if (edit->text().toStdString() == control.text) return;
    control.text = edit->text().toStdString();
    changed(control);
  });
  return widget;
}

// An edit keeps the keys of undo and redo to itself only while there is typing of its own to take back.
bool PagePane::eventFilter(QObject* watched, QEvent* event) {
  const auto* edit = qobject_cast<QLineEdit*>(watched);
  if (edit != nullptr && event->type() == QEvent::ShortcutOverride) {
    const auto* key = static_cast<QKeyEvent*>(event);
    const bool isUndo = key->matches(QKeySequence::Undo) && !edit->isUndoAvailable();
    const bool isRedo = key->matches(QKeySequence::Redo) && !edit->isRedoAvailable();
    if (isUndo || isRedo) {
      event->ignore();
      return true;
    }
  }
  return QScrollArea::eventFilter(watched, event);
}

void PagePane::commit() {
  QWidget* focused = QApplication::focusWidget();
  if (focused == nullptr || !isAncestorOf(focused)) return;
  focused->clearFocus();
  focused->setFocus();
}

void PagePane::changed(Control& control) {
  if (refreshing_) return;
  form_->act(control);
  refresh();
}

void PagePane::refresh() {
  refreshing_ = true;
  for (const Bound& bound : bound_) refresh(bound);
  refreshing_ = false;
}

void PagePane::refresh(const Bound& bound) {
  const Control& control = *bound.control;
  const QSignalBlocker blocker(bound.widget);
  bound.widget->setVisible(control.visible);
  bound.widget->setEnabled(control.enabled);
  bound.widget->setToolTip(QString::fromStdString(control.toolTip));
  if (bound.label != nullptr) {
    const QString unit =
        control.unit.empty() ? QString() : QString(" [%1]").arg(QString::fromStdString(control.unit));
    bound.label->setText(bound.text + unit);
    bound.label->setVisible(control.visible);
  }
  const QString text = QString::fromStdString(control.text);
  if (control.kind == ControlKind::label) {
    qobject_cast<QLabel*>(bound.widget)->setText(text);
  } else if (control.kind == ControlKind::text) {
    auto* edit = qobject_cast<QLineEdit*>(control.onSpin ? bound.widget->focusProxy() : bound.widget);
    if (edit->text() != text || edit->isModified()) edit->setText(text);
    edit->setReadOnly(control.readOnly);
  } else if (control.kind == ControlKind::check) {
    qobject_cast<QCheckBox*>(bound.widget)->setChecked(control.index == 1);
  } else if (control.kind == ControlKind::dropDown) {
    auto* list = qobject_cast<QComboBox*>(bound.widget);
    list->clear();
    for (const std::string& choice : control.choices) list->addItem(QString::fromStdString(choice));
    list->setCurrentIndex(control.index);
  } else if (control.kind == ControlKind::radio) {
    auto* group = bound.widget->findChild<QButtonGroup*>();
    for (QAbstractButton* button : group->buttons()) {
      const int id = group->id(button);
      button->setChecked(id == control.index);
      button->setEnabled(control.choiceEnabled[static_cast<std::size_t>(id)]);
    }
  } else if (control.kind == ControlKind::grid) {
    static_cast<GridView*>(bound.widget)->cells().refresh();
  }
}

QWidget* PagePane::widgetOf(const QString& label, int n) const {
  for (const Bound& bound : bound_) {
    if (QString::fromStdString(bound.control->label) == label && --n == 0) return bound.widget;
  }
  return nullptr;
}

}  // namespace gridbay::shell
