#pragma once

#include <QListWidget>

#include "shell/fields/value_edit.h"

namespace gridbay::shell {

// The edit of a cell. A text that the grid has refused stays, with its mark.
class CellEdit final : public ValueEdit {
  Q_OBJECT
 public:
  explicit CellEdit(QWidget* parent) : ValueEdit(parent) { setFrame(false); }

  bool isRefused() const { return !fault().isEmpty(); }
  // The user has left it with a refused text, and was brought back once.
  bool hasReturned = false;
};

// The edit of an editor: itself, or that of a list in which one can type; null for any other.
CellEdit* editOf(QWidget* editor);

// The list of a multiple choice cell, each with a mark to set. It opens below the cell; Return or a click
// elsewhere takes what is marked, Esc leaves the cell as it was.
class MultiChoiceEditor final : public QWidget {
  Q_OBJECT
 public:
  MultiChoiceEditor(const std::vector<std::string>& choices, QWidget* parent);

  void setValue(qulonglong bits);
  qulonglong value() const;
  void open();
  QListWidget& list() { return *list_; }

 signals:
  void finished(bool taken);

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void finish(bool taken);

  QFrame* popup_;
  QListWidget* list_;
  Qt::CheckState pressedState_ = Qt::Unchecked;
  qulonglong others_ = 0;  // bits with no choice, which stay
  bool isFinished_ = false;
};

}  // namespace gridbay::shell
