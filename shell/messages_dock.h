#pragma once

#include <QAction>
#include <QDockWidget>
#include <QLabel>
#include <QPointer>
#include <QToolButton>
#include <QTreeWidget>

#include "shell/document_tab.h"

namespace gridbay::shell {

// What the last check of a document found, and below it, as messages of another kind, what is doubtful in it
// now. The list stays while the user works down it; after an edit it stands back and says that it is from
// before, until the edit is taken back or the setup is checked again.
class MessagesDock final : public QDockWidget {
  Q_OBJECT
 public:
  // The action checks the document that is shown.
  MessagesDock(QAction* check, QWidget* parent);

  // Lists the messages of a document; null where none is open.
  void showCheckOf(DocumentTab* tab);
  // Says anew whether the messages still hold.
  void mark();
  // Lists the advice of the document anew.
  void showAdvice();

  // The messages of the check; those of advice come behind them.
  int messageCount() const;
  QTreeWidget& list() { return *list_; }
  QLabel& note() { return *note_; }

 signals:
  // What a message or an advice speaks of.
  void placeChosen(const gridbay::PagePlace& place);
  // An advice by its place in the document's list.
  void fixWanted(int place);

 protected:
  void changeEvent(QEvent* event) override;

 private:
  void showPlace(QTreeWidgetItem& item, const PagePlace& place);
  void addAdvice(const Advice& advice, int place);
  int adviceAt(const QTreeWidgetItem* item) const;

  QPointer<DocumentTab> tab_;
  QLabel* note_;
  QToolButton* check_;
  QTreeWidget* list_;
  QAction* fix_;
};

}  // namespace gridbay::shell
