#pragma once

#include <QComboBox>
#include <QCompleter>
#include <QLineEdit>
#include <QStandardItemModel>

namespace gridbay::shell {

// A projection's text as people read it: a full text by its name, one that is short as it is.
QString shownProjection(const QString& text);

// A list below an edit, of the projections whose name, code or area of use has what is typed. The first one
// is lit: Return takes it, the arrow keys light another one, Esc closes the list.
class ProjectionCompleter final : public QCompleter {
  Q_OBJECT
 public:
  // Serves the edit, and belongs to it.
  explicit ProjectionCompleter(QLineEdit* edit);
  // Makes the edit that of a list, which keeps its choices: what is typed searches all projections.
  ProjectionCompleter(QComboBox& list, QLineEdit* edit);

  // What the list holds for a text.
  void search(const QString& words);
  QStandardItemModel& found() { return found_; }

 signals:
  // The projection as files hold it, and its name.
  void chosen(const QString& text, const QString& name);

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void openList();
  void take(const QModelIndex& index);

  QLineEdit* edit_;
  QComboBox* list_ = nullptr;
  QStandardItemModel found_;
};

// An edit for a projection: searched by name, code (EPSG) and area of use, or typed in any form.
class ProjectionSearch final : public QWidget {
  Q_OBJECT
 public:
  explicit ProjectionSearch(QWidget* parent = nullptr);

  // The projection as files hold it; what is typed where that names none, empty for none at all.
  const QString& text() const { return text_; }
  void setText(const QString& text);
  // Whether the text names a projection; local coordinates are one, no text is none.
  bool isValid() const;

  QLineEdit& edit() { return *edit_; }
  ProjectionCompleter& completer() { return *completer_; }

 signals:
  // Another projection, chosen or typed, as files hold it.
  void chosen(const QString& text);

 private:
  void takeTyped();
  void choose(const QString& text, const QString& shown);

  QLineEdit* edit_;
  ProjectionCompleter* completer_;
  QString text_;
  QString shown_;  // in the edit, for the text
};

}  // namespace gridbay::shell
