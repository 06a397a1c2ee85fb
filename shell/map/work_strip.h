#pragma once

#include <QFrame>
#include <QLabel>
#include <QProgressBar>
#include <QToolButton>

namespace gridbay::shell {

// Work that goes on beside the window: what it is, how far it has come, and a button that stops it. Hidden
// while there is none.
class WorkStrip final : public QFrame {
  Q_OBJECT
 public:
  explicit WorkStrip(QWidget* parent);

  // How much is done, 0 to 1.
  void showWork(const QString& text, double done);
  QToolButton& cancel() { return *cancel_; }

 signals:
  void cancelled();

 private:
  QLabel* text_;
  QProgressBar* progress_;
  QToolButton* cancel_;
};

}  // namespace gridbay::shell
