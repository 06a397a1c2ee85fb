#include "shell/import/number_edit.h"

#include <QEvent>
#include <cmath>

#include "core/number_text.h"
#include "shell/shades.h"

namespace gridbay::shell {

NumberEdit::NumberEdit(QWidget* parent) : QLineEdit(parent) {
  connect(this, &QLineEdit::textChanged, this, &NumberEdit::colour);
}

std::optional<double> NumberEdit::number() const {
  const std::optional<double> number = doubleOfText(text().trimmed().replace(',', '.').toStdString());
  return number && std::isfinite(*number) ? number : std::nullopt;
}

void NumberEdit::setNumber(double number, int digits) {
  QString text = QString::number(number, 'f', digits);
  while (text.contains('.') && (text.endsWith('0') || text.endsWith('.'))) {
    const bool isWhole = text.endsWith('.');
    text.chop(1);
    if (isWhole) break;
  }
  setText(text);
}

void NumberEdit::changeEvent(QEvent* event) {
  QLineEdit::changeEvent(event);
  if (event->type() == QEvent::ParentChange || event->type() == QEvent::ApplicationPaletteChange) colour();
}

void NumberEdit::colour() {
  QPalette shown;
  if (isFaulty()) shown.setColor(QPalette::Text, faultColour(shown));
  setPalette(shown);
}

}  // namespace gridbay::shell
