#pragma once

#include <QDockWidget>
#include <QLabel>
#include <QPointer>
#include <QToolButton>
#include <QTreeWidget>

#include "shell/document_tab.h"

namespace gridbay::shell {

// What the last check of a document found. The list stays while the user works down it; after an edit it
// stands back and says that it is from before, until the edit is taken back or the setup is checked again.
class MessagesDock final : public QDockWidget {
  Q_OBJECT
 public:
  // The action checks the document that is shown.
  MessagesDock(QAction* check, QWidget* parent);

  // Lists the messages of a document; null where none is open.
  void showCheckOf(DocumentTab* tab);
  // Says anew whether the messages still hold.
  void mark();

  QTreeWidget& list() { return *list_; }
  QLabel& note() { return *note_; }

 signals:
  void pageChosen(int page);

 protected:
  void changeEvent(QEvent* event) override;

 private:
  QPointer<DocumentTab> tab_;
  QLabel* note_;
  QToolButton* check_;
  QTreeWidget* list_;
};

}  // namespace gridbay::shell
