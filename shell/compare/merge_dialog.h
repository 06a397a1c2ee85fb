#pragma once

#include <QComboBox>
#include <QDialog>
#include <QTreeWidget>
#include <vector>

#include "compare/setup_comparison.h"

namespace gridbay::shell {

// What two setups have each made into something else, with a choice for each.
class MergeDialog final : public QDialog {
  Q_OBJECT
 public:
  MergeDialog(const QString& own, const QString& other, std::vector<MergeQuestion>& questions,
              QWidget* parent);

  QTreeWidget& list() { return *list_; }
  // The choice for a question: 0 for the document's own, 1 for the other's.
  QComboBox& choice(int place);

 private:
  void chooseAll(int side);

  std::vector<MergeQuestion>& questions_;
  QTreeWidget* list_;
};

}  // namespace gridbay::shell
