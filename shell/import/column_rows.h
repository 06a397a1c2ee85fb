#pragma once

#include <QComboBox>
#include <QGridLayout>
#include <QLineEdit>
#include <QScrollArea>
#include <vector>

#include "conversion/table_reader.h"

namespace gridbay::shell {

// A row for each column of a table: what it holds, its name, item type and unit.
class ColumnRows final : public QScrollArea {
  Q_OBJECT
 public:
  explicit ColumnRows(QWidget* parent);
  ~ColumnRows() override;

  void showColumns(const std::vector<TableColumn>& columns);
  const std::vector<TableColumn>& columns() const { return columns_; }

  struct Row {
    QComboBox* role;
    QLineEdit* name;
    QComboBox* type;
    QLineEdit* unit;
  };
  const std::vector<Row>& rows() const { return rows_; }

 signals:
  // The user has changed what a column holds or how it is called.
  void changed();

 private:
  Row makeRow(const TableColumn& column, QGridLayout& grid);
  void forgetRows();
  void take(std::size_t place);
  void enable(std::size_t place);

  std::vector<TableColumn> columns_;
  std::vector<Row> rows_;
};

}  // namespace gridbay::shell
