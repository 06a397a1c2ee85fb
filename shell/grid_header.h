#pragma once

#include <QHeaderView>

namespace gridbay::shell {

class GridModel;

// The headers of a grid's columns or rows. Those of columns may cover several, and take the lines that they
// need.
class GridHeader final : public QHeaderView {
  Q_OBJECT
 public:
  GridHeader(GridModel& model, Qt::Orientation orientation, QWidget* parent);

  // Height of column headers, or width of row headers.
  void setExtent(int extent);
  QSize sizeHint() const override;
  // The height that the headers need at the widths that the columns have.
  int neededHeight() const;

 protected:
  void paintSection(QPainter* painter, const QRect& rect, int logical) const override;

 private:
  // The first column of those that a header covers, and how many they are.
  std::pair<int, int> covered(int logical) const;

  GridModel& model_;
  int extent_ = 0;
};

}  // namespace gridbay::shell
