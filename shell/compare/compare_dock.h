#pragma once

#include <QAction>
#include <QDockWidget>
#include <QLabel>
#include <QPointer>
#include <QProgressBar>
#include <QTimer>
#include <QToolBar>
#include <QTreeWidget>

#include "shell/compare/tab_comparison.h"

namespace gridbay::shell {

// What differs between the document that is shown and the one beside it, page by page, with what is done
// about it.
class CompareDock final : public QDockWidget {
  Q_OBJECT
 public:
  explicit CompareDock(QWidget* parent);

  // Null where none is open.
  void showDocument(DocumentTab* tab);

  QTreeWidget& list() { return *list_; }
  QLabel& note() { return *note_; }
  // Seen while comparing takes longer than a moment.
  QProgressBar& busy() { return *busy_; }
  QToolBar& tools() { return *tools_; }
  // For menus: they have keys, and can be used while there is something to do.
  QAction* nextAction() { return next_; }
  QAction* previousAction() { return previous_; }
  QAction* takeAction() { return take_; }
  QAction* takePageAction() { return takePage_; }
  QAction* takeAllAction() { return takeAll_; }
  QAction* endAction() { return end_; }

 signals:
  void failed(const QString& text);

 private:
  QAction* makeAction(const QString& text, const QKeySequence& key, void (TabComparison::*act)());
  TabComparison* comparison() const { return TabComparison::of(tab_); }
  void fill();
  void showWork();
  QString noteText() const;
  void select(int place);
  void enableActions();

  QPointer<DocumentTab> tab_;
  QLabel* note_;
  QProgressBar* busy_;
  QTimer busyTimer_;
  QToolBar* tools_;
  QTreeWidget* list_;
  QAction* next_;
  QAction* previous_;
  QAction* take_;
  QAction* takePage_;
  QAction* takeAll_;
  QAction* end_;
  bool isFilling_ = false;
};

}  // namespace gridbay::shell
