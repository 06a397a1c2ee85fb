#pragma once

#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QSpinBox>
#include <optional>
#include <vector>

#include "conversion/table_reader.h"

namespace gridbay::shell {

// How a table of text is read, but for its columns: as it was recognised, and as the user has it.
class SeriesForm final : public QWidget {
  Q_OBJECT
 public:
  explicit SeriesForm(QWidget* parent);

  void showForm(const TableForm& form);
  // Only what can be used with it; what is typed stays.
  void enable(const TableForm& form);
  // Fills in what the fields say; the columns stay as they are.
  void takeInto(TableForm& form) const;
  // What is wrong with a field, which shows it too; empty where nothing is.
  QString fault() const;

  char separatorChosen() const;
  QComboBox& separator() { return *separator_; }
  QComboBox& decimals() { return *decimals_; }
  QSpinBox& headings() { return *headings_; }
  QComboBox& dates() { return *dates_; }
  QLineEdit& missing() { return *missing_; }
  QLineEdit& start() { return *start_; }
  QComboBox& timeUnit() { return *timeUnit_; }

 signals:
  // What parts lines and fields is another one, which leads to another look at all of the table; or
  // something else is. While it is typed, `typed` tells.
  void partsChanged();
  void changed();
  void typed();

 private:
  std::optional<std::vector<double>> missingNumbers() const;
  void showFault();

  QComboBox* separator_;
  QComboBox* decimals_;
  QSpinBox* headings_;
  QComboBox* dates_;
  QLineEdit* missing_;
  QLineEdit* start_;
  QComboBox* timeUnit_;
  QLabel* fault_;
};

}  // namespace gridbay::shell
