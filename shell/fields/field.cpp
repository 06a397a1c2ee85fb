#include "shell/fields/field.h"

#include <QEvent>

#include "shell/shades.h"

namespace gridbay::shell {
namespace {

// A text in a colour that follows the palette.
class TintedLabel final : public QLabel {
 public:
  using Tint = QColor (*)(const QPalette&);
  TintedLabel(Tint tint, QWidget* parent) : QLabel(parent), tint_(tint) { apply(); }

 protected:
  void changeEvent(QEvent* event) override {
    if (event->type() == QEvent::PaletteChange && !applying_) apply();
    QLabel::changeEvent(event);
  }

 private:
  void apply() {
    applying_ = true;
    // No more than this colour is set, so that the others go on following.
    QPalette tinted;
    const QColor colour = tint_(parentWidget()->palette());
    tinted.setColor(QPalette::Active, QPalette::WindowText, colour);
    tinted.setColor(QPalette::Inactive, QPalette::WindowText, colour);
    setPalette(tinted);
    applying_ = false;
  }

  Tint tint_;
  bool applying_ = false;
};

void setText(QLabel* label, const QString& text) {
  if (label->text() != text) label->setText(text);
}

}  // namespace

QString nameOf(const Control& control) {
  QString name = QString::fromStdString(control.label).remove('&').trimmed();
  while (name.endsWith(':') || name.endsWith(' ')) name.chop(1);
  return name;
}

void Field::makeLabel(QWidget* parent) {
  label_ = new QLabel(parent);
  label_->setTextFormat(Qt::PlainText);
  if (hasKey_) label_->setBuddy(input());
}

void Field::makeUnit(QWidget* parent) {
  unit_ = new TintedLabel(quietText, parent);
  unit_->setTextFormat(Qt::PlainText);
}

void Field::showCaption() {
  if (isCaptionShown_ && shownLabel_ == control_.label) return;
  keys_.release(shownCaption_);
  shownLabel_ = control_.label;
  shownCaption_ = caption();
  shownCaption_ = hasKey_ ? keys_.take(shownCaption_) : shownCaption_.remove('&');
  isCaptionShown_ = true;
  if (label_ != nullptr) {
    label_->setText(shownCaption_);
  } else {
    setCaption(shownCaption_);
  }
}

void Field::showFault() {
  const QString fault = QString::fromStdString(control_.fault);
  if (explanation_ == nullptr) {
    if (fault.isEmpty()) return;
    explanation_ = new TintedLabel(faultColour, input()->parentWidget());
    explanation_->setTextFormat(Qt::PlainText);
    explanation_->setObjectName("explanation");
    emit explained(explanation_);
  }
  setText(explanation_, fault);
  explanation_->setVisible(control_.visible && !fault.isEmpty());
}

void Field::refresh() {
  showCaption();
  QWidget* widget = input();
  if (unit_ != nullptr) setText(unit_, QString::fromStdString(control_.unit));
  for (QWidget* each : std::initializer_list<QWidget*>{label_, widget, unit_}) {
    if (each == nullptr) continue;
    const bool isShown = control_.visible && (each != unit_ || !control_.unit.empty()) &&
                         (each != label_ || !shownCaption_.isEmpty());
    if (each->isHidden() == isShown) each->setVisible(isShown);
    each->setEnabled(control_.enabled);
  }
  show();
  showFault();
  const QString tip = QString::fromStdString(control_.fault.empty() ? control_.toolTip : control_.fault);
  if (widget->toolTip() != tip) widget->setToolTip(tip);
  QString name = nameOf(control_);
  if (!control_.unit.empty()) name += ", " + QString::fromStdString(control_.unit);
  if (widget->accessibleName() != name) widget->setAccessibleName(name);
  const QString fault = QString::fromStdString(control_.fault);
  if (widget->accessibleDescription() != fault) widget->setAccessibleDescription(fault);
}

}  // namespace gridbay::shell
