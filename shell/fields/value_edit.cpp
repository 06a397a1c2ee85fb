#include "shell/fields/value_edit.h"

#include <QApplication>
#include <QDate>
#include <QDragEnterEvent>
#include <QFrame>
#include <QKeyEvent>
#include <QMimeData>
#include <QPainter>
#include <QStyleOptionFrame>
#include <QTextCharFormat>
#include <QUrl>
#include <QVBoxLayout>

#include "shell/shades.h"

namespace gridbay::shell {
namespace {

// A button inside of an edit, with a sign of its own.
class InnerButton final : public QToolButton {
 public:
  enum class Sign { up, down, calendar };

  InnerButton(Sign sign, QWidget* parent) : QToolButton(parent), sign_(sign) {
    setFocusPolicy(Qt::NoFocus);
    setCursor(Qt::ArrowCursor);
  }

 protected:
  void paintEvent(QPaintEvent*) override {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const QPalette::ColorGroup group = isEnabled() ? QPalette::Active : QPalette::Disabled;
    const QColor text = palette().color(group, QPalette::Text);
    if (isEnabled() && (underMouse() || isDown())) {
      painter.setPen(Qt::NoPen);
      painter.setBrush(blend(palette().color(QPalette::Base), palette().color(QPalette::Highlight),
                             isDown() ? 0.45 : 0.2));
      painter.drawRoundedRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5), 2, 2);
    }
    const QPointF middle = QRectF(rect()).center();
    if (sign_ == Sign::calendar) {
      const double side = std::min(width(), height()) * 0.56;
      const QRectF sheet(middle.x() - side / 2, middle.y() - side / 2 + 0.5, side, side);
      painter.setPen(QPen(text, 1.1));
      painter.setBrush(Qt::NoBrush);
      painter.drawRoundedRect(sheet, 1.5, 1.5);
      painter.fillRect(QRectF(sheet.left(), sheet.top(), side, side * 0.28), text);
      for (int row = 0; row < 2; ++row) {
        for (int day = 0; day < 3; ++day) {
          const QPointF at(sheet.left() + side * (0.24 + 0.26 * day),
                           sheet.top() + side * (0.5 + 0.26 * row));
          painter.fillRect(QRectF(at.x() - 0.7, at.y() - 0.7, 1.6, 1.6), text);
        }
      }
      return;
    }
    const double reach = std::min(width() * 0.22, height() * 0.32);
    const double sense = sign_ == Sign::up ? -1 : 1;
    painter.setPen(QPen(text, 1.4, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.drawPolyline(QPolygonF({{middle.x() - reach, middle.y() - sense * reach / 2},
                                    {middle.x(), middle.y() + sense * reach / 2},
                                    {middle.x() + reach, middle.y() - sense * reach / 2}}));
  }

 private:
  Sign sign_;
};

constexpr int kDateLength = 10;  // of "2026-03-21"

QString droppedFile(const QMimeData* data) {
  return data->urls().size() == 1 ? data->urls().first().toLocalFile() : QString();
}

}  // namespace

ValueEdit::ValueEdit(QWidget* parent) : QLineEdit(parent) {
  setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
  applyMargins();
}

void ValueEdit::setLetters(int letters) {
  letters_ = letters;
  setSizePolicy(letters > 0 ? QSizePolicy::Fixed : QSizePolicy::Expanding, QSizePolicy::Fixed);
  updateGeometry();
}

void ValueEdit::setFault(const QString& fault) {
  if (fault == fault_) return;
  fault_ = fault;
  applyMargins();
  update();
}

void ValueEdit::setTrailing(int width) {
  trailing_ = width;
  applyMargins();
}

QSize ValueEdit::hint(int letters) const {
  constexpr int kPadding = 14;
  const QSize usual = QLineEdit::sizeHint();
  return {letters * fontMetrics().horizontalAdvance('0') + kPadding + trailing_, usual.height()};
}

QSize ValueEdit::sizeHint() const {
  constexpr int kText = 36;
  return hint(letters_ > 0 ? letters_ : kText);
}

QSize ValueEdit::minimumSizeHint() const {
  constexpr int kLeast = 14;
  return hint(letters_ > 0 ? letters_ : kLeast);
}

void ValueEdit::initStyleOption(QStyleOptionFrame* option) const {
  QLineEdit::initStyleOption(option);
  if (!isEnabled()) {
    option->palette.setColor(QPalette::Base, disabledGround(palette()));
  } else if (isReadOnly()) {
    option->palette.setColor(QPalette::Base, readOnlyGround(palette()));
  }
}

void ValueEdit::paintEvent(QPaintEvent* event) {
  QLineEdit::paintEvent(event);
  if (fault_.isEmpty()) return;
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const QColor red = faultColour(palette());
  painter.setPen(QPen(red, 2));
  painter.setBrush(Qt::NoBrush);
  painter.drawRoundedRect(QRectF(rect()).adjusted(1, 1, -1, -1), 2, 2);
  const double side = fontMetrics().height() * 0.9;
  const QRectF sign(width() - trailing_ - side - 5, (height() - side) / 2.0, side, side);
  painter.setPen(Qt::NoPen);
  painter.setBrush(red);
  painter.drawEllipse(sign);
  QFont bold = font();
  bold.setBold(true);
  bold.setPixelSize(static_cast<int>(side * 0.8));
  painter.setFont(bold);
  painter.setPen(palette().color(QPalette::Base));
  painter.drawText(sign, Qt::AlignCenter, "!");
}

// A file that is dropped gives its name.
void ValueEdit::dragEnterEvent(QDragEnterEvent* event) {
  if (letters_ == 0 && !isReadOnly() && !droppedFile(event->mimeData()).isEmpty())
    return event->acceptProposedAction();
  QLineEdit::dragEnterEvent(event);
}

void ValueEdit::dropEvent(QDropEvent* event) {
  const QString name = letters_ == 0 && !isReadOnly() ? droppedFile(event->mimeData()) : QString();
  if (name.isEmpty()) return QLineEdit::dropEvent(event);
  event->acceptProposedAction();
  setText(name);
  setModified(true);
  emit editingFinished();
}

CountEdit::CountEdit(QWidget* parent)
    : ValueEdit(parent),
      up_(new InnerButton(InnerButton::Sign::up, this)),
      down_(new InnerButton(InnerButton::Sign::down, this)) {
  for (QToolButton* button : {up_, down_}) {
    button->setAutoRepeat(true);
    connect(button, &QToolButton::clicked, this, [this, button] { step(button == up_ ? 1 : -1); });
  }
  up_->setObjectName("up");
  down_->setObjectName("down");
  setTrailing(fontMetrics().height() + 2);
}

void CountEdit::setRange(int lowest, int highest) {
  const QString range = tr("%1 to %2").arg(lowest).arg(highest);
  if (up_->toolTip() == range) return;
  up_->setToolTip(range);
  down_->setToolTip(range);
}

void CountEdit::step(int delta) {
  if (isEnabled() && !isReadOnly()) emit stepped(delta);
}

void CountEdit::keyPressEvent(QKeyEvent* event) {
  if (event->key() != Qt::Key_Up && event->key() != Qt::Key_Down) return ValueEdit::keyPressEvent(event);
  step(event->key() == Qt::Key_Up ? 1 : -1);
}

// Only where the user is: a page that is scrolled changes no count that passes below the pointer.
void CountEdit::wheelEvent(QWheelEvent* event) {
  if (!hasFocus()) return event->ignore();
  constexpr int kNotch = 120;
  wheel_ += event->angleDelta().y();
  const int steps = wheel_ / kNotch;
  wheel_ -= steps * kNotch;
  for (int i = 0; i < std::abs(steps); ++i) step(steps > 0 ? 1 : -1);
  event->accept();
}

void CountEdit::resizeEvent(QResizeEvent* event) {
  ValueEdit::resizeEvent(event);
  const int side = fontMetrics().height();
  const int half = (height() - 4) / 2;
  up_->setGeometry(width() - side - 2, 2, side, half);
  down_->setGeometry(width() - side - 2, height() - 2 - half, side, half);
}

DateTimeEdit::DateTimeEdit(QWidget* parent)
    : ValueEdit(parent), button_(new InnerButton(InnerButton::Sign::calendar, this)) {
  button_->setToolTip(tr("Pick a date"));
  button_->setObjectName("calendar");
  connect(button_, &QToolButton::clicked, this, [this] { openCalendar(); });
  setTrailing(fontMetrics().height() + 6);
  setPlaceholderText("YYYY-MM-DD hh:mm:ss");
}

void DateTimeEdit::resizeEvent(QResizeEvent* event) {
  ValueEdit::resizeEvent(event);
  const int side = height() - 4;
  button_->setGeometry(width() - side - 2, 2, side, side);
}

void DateTimeEdit::keyPressEvent(QKeyEvent* event) {
  if (event->key() == Qt::Key_Down && event->modifiers().testFlag(Qt::AltModifier)) {
    openCalendar();
  } else {
    ValueEdit::keyPressEvent(event);
  }
}

QCalendarWidget* DateTimeEdit::openCalendar() {
  if (isReadOnly() || !isEnabled()) return nullptr;
  auto* popup = new QFrame(this, Qt::Popup);
  popup->setAttribute(Qt::WA_DeleteOnClose);
  popup->setFrameShape(QFrame::StyledPanel);
  auto* layout = new QVBoxLayout(popup);
  layout->setContentsMargins(1, 1, 1, 1);
  auto* calendar = new QCalendarWidget(popup);
  calendar->setVerticalHeaderFormat(QCalendarWidget::NoVerticalHeader);
  calendar->setFirstDayOfWeek(Qt::Monday);
  // Days of all kinds are days of a simulation.
  for (const auto day : {Qt::Saturday, Qt::Sunday}) calendar->setWeekdayTextFormat(day, QTextCharFormat());
  const QDate date = QDate::fromString(text().trimmed().left(kDateLength), Qt::ISODate);
  if (date.isValid()) calendar->setSelectedDate(date);
  layout->addWidget(calendar);
  const auto pick = [this, popup](const QDate& day) {
    popup->close();
    take(day);
  };
  connect(calendar, &QCalendarWidget::clicked, this, pick);
  connect(calendar, &QCalendarWidget::activated, this, [popup, pick](const QDate& day) {
    if (popup->isVisible()) pick(day);
  });
  popup->move(mapToGlobal(QPoint(0, height())));
  popup->show();
  calendar->setFocus();
  return calendar;
}

// The time of day stays.
void DateTimeEdit::take(const QDate& date) {
  const QString typed = text().trimmed();
  const bool hasTime = QDate::fromString(typed.left(kDateLength), Qt::ISODate).isValid();
  const QString time = hasTime ? typed.mid(kDateLength).trimmed() : QString();
  setText(date.toString(Qt::ISODate) + ' ' + (time.isEmpty() ? QString("00:00:00") : time));
  setModified(true);
  setFocus();
  emit picked();
}

}  // namespace gridbay::shell
