#pragma once

#include <QDialog>
#include <QDialogButtonBox>
#include <QLabel>
#include <QLineEdit>

namespace gridbay::shell {

// Asks for the setups of a merge: the one that two come from, and these.
class MergeFilesDialog final : public QDialog {
  Q_OBJECT
 public:
  // The open setup by its name, empty where none is open, and the filter of setups' files.
  MergeFilesDialog(const QString& open, const QString& filter, QWidget* parent);

  QString base() const { return base_->text().trimmed(); }
  // Empty for the open setup.
  QString own() const { return own_->text().trimmed(); }
  QString other() const { return other_->text().trimmed(); }

  QLineEdit& baseEdit() { return *base_; }
  QLineEdit& ownEdit() { return *own_; }
  QLineEdit& otherEdit() { return *other_; }

 private:
  QLineEdit* makeEdit(const QString& label, const QString& tip, const QString& filter);
  void showOutcome();

  bool hasOpen_;
  QLineEdit* base_;
  QLineEdit* own_;
  QLineEdit* other_;
  QLabel* outcome_ = nullptr;
  QDialogButtonBox* buttons_ = nullptr;
};

}  // namespace gridbay::shell
