#include "shell/page_pane.h"

#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QToolButton>
#include <QVBoxLayout>

#include "shell/grid_view.h"

namespace gridbay::shell {
namespace {

constexpr int kMargin = 16;

QLabel* makeCaption(const QString& text, QWidget* parent) {
  auto* caption = new QLabel(text, parent);
  QFont font = caption->font();
  font.setPointSizeF(font.pointSizeF() * 1.4);
  font.setBold(true);
  caption->setFont(font);
  return caption;
}

// An edit with a button on either side of its count.
class CountEdit final : public QWidget {
 public:
  CountEdit(Control& control, QWidget* parent, const std::function<void(int)>& step)
      : QWidget(parent), edit(new QLineEdit(this)) {
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(edit);
    for (const int delta : {-1, 1}) {
      auto* button = new QToolButton(this);
      button->setText(delta < 0 ? "-" : "+");
      button->setToolTip(tr("%1 to %2").arg(control.spinLowest).arg(control.spinHighest));
      connect(button, &QToolButton::clicked, this, [step, delta] { step(delta); });
      layout->addWidget(button);
    }
    setFocusProxy(edit);
  }
  QLineEdit* edit;
};

}  // namespace

PagePane::PagePane(QWidget* parent) : QScrollArea(parent) {
  setWidgetResizable(true);
  setFrameShape(QFrame::NoFrame);
}

void PagePane::showText(const QString& caption, const QString& text) {
  bound_.clear();
  auto* page = new QWidget(this);
  auto* layout = new QVBoxLayout(page);
  layout->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
  layout->addWidget(makeCaption(caption, page));
  auto* body = new QLabel(text, page);
  body->setWordWrap(true);
  layout->addWidget(body);
  layout->addStretch();
  setWidget(page);
}

void PagePane::showForm(const QString& caption, Form& form) {
  bound_.clear();
  auto* page = new QWidget(this);
  auto* layout = new QVBoxLayout(page);
  layout->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
  layout->addWidget(makeCaption(caption, page));
  auto* rows = new QFormLayout();
  layout->addLayout(rows);
  bool hasGrid = false;
  for (Control& control : form.controls()) {
    QWidget* widget = makeWidget(control, page);
    QLabel* label = nullptr;
    if (control.kind == ControlKind::grid) {
      layout->addWidget(widget, 1);
      hasGrid = true;
    } else if (control.kind == ControlKind::group || control.kind == ControlKind::check ||
               control.kind == ControlKind::button) {
      rows->addRow(widget);
    } else {
      label = new QLabel(page);
      label->setBuddy(widget);
      rows->addRow(label, widget);
    }
    bound_.push_back({&control, widget, label});
  }
  if (!hasGrid) layout->addStretch();
  setWidget(page);
  refresh();
}

QWidget* PagePane::makeWidget(Control& control, QWidget* parent) {
  const QString text = QString::fromStdString(control.label);
  switch (control.kind) {
    case ControlKind::group: {
      auto* group = new QLabel("<b>" + text.toHtmlEscaped() + "</b>", parent);
      return group;
    }
    case ControlKind::label:
      return new QLabel(parent);
    case ControlKind::grid:
      return new GridView(*control.grid, parent);
    case ControlKind::button: {
      auto* button = new QPushButton(text, parent);
      connect(button, &QPushButton::clicked, this, [this, &control] { changed(control); });
      return button;
    }
    case ControlKind::check: {
      auto* box = new QCheckBox(text.trimmed(), parent);
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
    case ControlKind::radio: {
      auto* box = new QWidget(parent);
      auto* layout = new QVBoxLayout(box);
      layout->setContentsMargins(0, 0, 0, 0);
      auto* group = new QButtonGroup(box);
      for (std::size_t i = 0; i < control.choices.size(); ++i) {
        auto* button = new QRadioButton(QString::fromStdString(control.choices[i]), box);
        group->addButton(button, static_cast<int>(i));
        layout->addWidget(button);
      }
      connect(group, &QButtonGroup::idClicked, this, [this, &control](int index) {
        control.index = index;
        changed(control);
      });
      return box;
    }
    case ControlKind::text:
      break;
  }
  QLineEdit* edit = nullptr;
  QWidget* widget = nullptr;
  if (control.onSpin) {
    auto* count = new CountEdit(control, parent, [this, &control](int delta) {
      control.onSpin(delta);
      refresh();
    });
    edit = count->edit;
    widget = count;
  } else {
    edit = new QLineEdit(parent);
    widget = edit;
  }
  connect(edit, &QLineEdit::editingFinished, this, [this, edit, &control] {
    if (edit->text().toStdString() == control.text) return;
    control.text = edit->text().toStdString();
    changed(control);
  });
  return widget;
}

void PagePane::changed(Control& control) {
  if (refreshing_) return;
  if (control.onChange) control.onChange();
  refresh();
}

void PagePane::refresh() {
  refreshing_ = true;
  for (const Bound& bound : bound_) {
    const Control& control = *bound.control;
    const QSignalBlocker blocker(bound.widget);
    bound.widget->setVisible(control.visible);
    bound.widget->setEnabled(control.enabled);
    if (bound.label != nullptr) {
      const QString unit =
          control.unit.empty() ? QString() : QString(" [%1]").arg(QString::fromStdString(control.unit));
      bound.label->setText(QString::fromStdString(control.label) + unit);
      bound.label->setVisible(control.visible);
    }
    const QString text = QString::fromStdString(control.text);
    if (control.kind == ControlKind::label) {
      qobject_cast<QLabel*>(bound.widget)->setText(text);
    } else if (control.kind == ControlKind::text) {
      auto* edit = qobject_cast<QLineEdit*>(control.onSpin ? bound.widget->focusProxy() : bound.widget);
      if (edit->text() != text) edit->setText(text);
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
  refreshing_ = false;
}

QWidget* PagePane::widgetOf(const QString& label, int n) const {
  for (const Bound& bound : bound_) {
    if (QString::fromStdString(bound.control->label) == label && --n == 0) return bound.widget;
  }
  return nullptr;
}

}  // namespace gridbay::shell
