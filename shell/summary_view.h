#pragma once

#include <QPushButton>
#include <QTreeWidget>

#include "plugin/setup_summary.h"

namespace gridbay::shell {

// A setup at a glance, below the first view. A line is chosen by a click or by Enter.
class SummaryView final : public QWidget {
  Q_OBJECT
 public:
  explicit SummaryView(QWidget* parent);

  void showSummary(const SetupSummary& summary);
  QTreeWidget& lines() { return *lines_; }
  QPushButton& checkButton() { return *check_; }

 signals:
  // A line with a page; one without a page asks for a check.
  void pageChosen(int page);
  void checkWanted();

 protected:
  void changeEvent(QEvent* event) override;

 private:
  void choose(const QTreeWidgetItem* item);
  void colour();

  QTreeWidget* lines_;
  QPushButton* check_;
};

}  // namespace gridbay::shell
