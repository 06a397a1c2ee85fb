#pragma once

#include <QComboBox>
#include <QDialog>
#include <QTreeWidget>
#include <vector>

#include "compare/setup_comparison.h"

namespace gridbay::shell {

// What two setups have each made into something else, page by page, with a choice for each and for all of a
// page.
class MergeDialog final : public QDialog {
  Q_OBJECT
 public:
  // With what else is to be said before; empty for nothing.
  MergeDialog(const QString& own, const QString& other, std::vector<MergeQuestion>& questions,
              const QString& warning, QWidget* parent);

  QTreeWidget& list() { return *list_; }
  // The choice for a question: 0 for the first setup, 1 for the other; and for a page, by its place.
  QComboBox& choice(int question) { return *choices_.at(static_cast<std::size_t>(question)); }
  QComboBox& pageChoice(int place);

 private:
  QComboBox* makeChoice(QTreeWidgetItem& item, const QString& own, const QString& other);
  void fill(const QString& own, const QString& other);
  void showPageChoice(QTreeWidgetItem& page);
  void chooseAll(int side);

  std::vector<MergeQuestion>& questions_;
  QTreeWidget* list_;
  std::vector<QComboBox*> choices_;
};

}  // namespace gridbay::shell
