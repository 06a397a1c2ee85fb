#pragma once

#include <QCalendarWidget>
#include <QLineEdit>
#include <QToolButton>
#include <functional>

namespace gridbay::shell {

// An edit that is as wide as what it is for, and marks a text that is no value.
class ValueEdit : public QLineEdit {
  Q_OBJECT
 public:
  explicit ValueEdit(QWidget* parent);

  // Room for so many digits and no more; 0 lets the edit take the width there is.
  void setLetters(int letters);
  // What is wrong with the text; empty for nothing.
  void setFault(const QString& fault);
  const QString& fault() const { return fault_; }

  QSize sizeHint() const override;
  QSize minimumSizeHint() const override;

 protected:
  void paintEvent(QPaintEvent* event) override;
  void initStyleOption(QStyleOptionFrame* option) const override;
  void dragEnterEvent(QDragEnterEvent* event) override;
  void dropEvent(QDropEvent* event) override;
  // Room kept at the right edge, for buttons.
  void setTrailing(int width);

 private:
  QSize hint(int letters) const;
  int faultWidth() const { return fault_.isEmpty() ? 0 : fontMetrics().height() + 4; }
  void applyMargins() { setTextMargins(kInset, 0, trailing_ + faultWidth(), 0); }

  static constexpr int kInset = 2;  // of the text from the edge

  int letters_ = 0;
  int trailing_ = 0;
  QString fault_;
};

// A count: two buttons at its right edge, the up and down keys and the wheel step it.
class CountEdit final : public ValueEdit {
  Q_OBJECT
 public:
  explicit CountEdit(QWidget* parent);
  void setRange(int lowest, int highest);

 signals:
  void stepped(int delta);

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  void wheelEvent(QWheelEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;

 private:
  void step(int delta);

  QToolButton* up_;
  QToolButton* down_;
  int wheel_ = 0;
};

// A date and time as text, "2026-03-21 06:00:00", with a calendar to pick the date from.
class DateTimeEdit final : public ValueEdit {
  Q_OBJECT
 public:
  explicit DateTimeEdit(QWidget* parent);

  // Opens the calendar at the date that the text says. Alt and the down key do the same.
  QCalendarWidget* openCalendar();

 signals:
  // A day was picked, and is in the text.
  void picked();

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;

 private:
  void take(const QDate& date);

  QToolButton* button_;
};

}  // namespace gridbay::shell
