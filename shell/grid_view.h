#pragma once

#include <QTableView>
#include <set>

#include "core/page_place.h"
#include "shell/cell_delegate.h"
#include "shell/grid_header.h"
#include "shell/grid_model.h"

namespace gridbay::shell {

// The widget of a grid: as high as its rows and as wide as its columns, where there is the room.
//
// A click opens the editor of a cell; typing, F2 or Return does for the current one. The arrow keys go from
// cell to cell. A text that is refused stays in its editor, marked and explained, and Esc brings the value
// back; who clicks elsewhere comes back to it once.
class GridView final : public QTableView {
  Q_OBJECT
 public:
  GridView(CV27SetupGridWnd& grid, QWidget* parent);
  // Whether it takes the width that is left over; a table of numbers alone has no use for it.
  void setStretches(bool stretches);
  GridModel& cells() { return *model_; }
  // Makes the cell at a place of the page the current one, and opens no editor; false where there is none.
  // Where it is not there and need not be found exactly, one of its row will do.
  bool goTo(const PagePlace& place, bool exactly);
  // Makes a cell of the table itself (from 0, headers counted) the current one, and opens none.
  void goToCell(int row, int column);
  // Hands over what is typed in a cell and not yet entered.
  void commitEdit();

  QSize sizeHint() const override;
  QSize minimumSizeHint() const override;

 public slots:
  void copy() const;
  void paste();

 signals:
  // The model, or the current row, has changed.
  void edited();
  // Another cell is the current one.
  void cellChosen();

 protected:
  bool edit(const QModelIndex& index, EditTrigger trigger, QEvent* event) override;
  void commitData(QWidget* editor) override;
  void closeEditor(QWidget* editor, QAbstractItemDelegate::EndEditHint hint) override;
  void currentChanged(const QModelIndex& current, const QModelIndex& previous) override;
  void keyPressEvent(QKeyEvent* event) override;
  void focusInEvent(QFocusEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;
  bool focusNextPrevChild(bool next) override;
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  bool stretches_ = true;
  bool hasText_ = false;
  struct Column {
    int natural = 0;  // width
    int least = 0;    // where there is not enough for all
    int growth = 0;   // its part of the width that is left
    bool isUserSized = false;
  };

  // From 0; none where there are no such entries.
  struct Rows {
    int first = 0;
    int count = 0;
  };
  Rows rowsOf(const std::vector<ListEntry>& entries) const;
  int columnOf(const PagePlace& place, int row) const;
  void layOutGrid();
  void followCurrentRow();
  void measureColumns();
  int measured(int column) const;
  bool isTextColumn(int column) const;
  void shareWidth();
  void layOutRows();
  bool spanShownCells();
  void fitSize();
  int naturalWidth() const;
  int rowsHeight() const;
  void clicked(const QModelIndex& index);
  void openCell(const QModelIndex& index, bool withList);
  bool keepsRefused(QWidget* editor, QAbstractItemDelegate::EndEditHint hint);
  void returnToEditor(QWidget* editor);

  GridModel* model_;
  CellDelegate* delegate_;
  GridHeader* columnHeader_;
  GridHeader* rowHeader_;
  std::vector<Column> columns_;
  QStringList shownHeaders_;
  int shownRows_ = 0;
  int currentRow_ = 0;
  bool isSharing_ = false;     // widths are set by us, not dragged
  bool movingByKeys_ = false;  // no editor opens where the arrow keys pass
  bool opening_ = false;
  bool isReturning_ = false;  // to an editor with a refused text
};

}  // namespace gridbay::shell
