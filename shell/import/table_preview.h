#pragma once

#include <QAbstractTableModel>
#include <map>
#include <string>
#include <vector>

#include "conversion/series_table.h"

namespace gridbay::shell {

// The first lines of a table by its form, and behind them those further on that can't be taken. A line that
// can't is red, and says why; headings and columns that are left out stand back.
class TablePreview final : public QAbstractTableModel {
  Q_OBJECT
 public:
  explicit TablePreview(QObject* parent) : QAbstractTableModel(parent) {}

  void show(std::string_view text, const TableForm& form);
  // The lines that can't be taken, once all are read.
  void showFaults(const std::vector<TableFault>& faults);
  // Why the line in a row can't be taken; empty for nothing.
  QString faultOf(int row) const;

  int rowCount(const QModelIndex& parent = {}) const override;
  int columnCount(const QModelIndex& parent = {}) const override;
  QVariant data(const QModelIndex& index, int role) const override;
  QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

 private:
  struct Line {
    std::size_t number;
    std::string text;
  };
  void measure();

  TableForm form_;
  std::vector<Line> first_;
  std::vector<Line> lines_;
  std::map<std::size_t, std::string> faults_;  // by the number of the line
  int columns_ = 0;
};

}  // namespace gridbay::shell
