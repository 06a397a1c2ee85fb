#pragma once

#include <QAbstractTableModel>
#include <QStyledItemDelegate>
#include <QTableView>

#include "pages/grid_wnd.h"

namespace gridbay::shell {

// The cells of a grid for the toolkit; each question goes through to the grid, and so to the model.
class GridModel final : public QAbstractTableModel {
  Q_OBJECT
 public:
  GridModel(CV27SetupGridWnd& grid, QObject* parent) : QAbstractTableModel(parent), grid_(grid) { refresh(); }

  int rowCount(const QModelIndex& parent = {}) const override;
  int columnCount(const QModelIndex& parent = {}) const override;
  QVariant data(const QModelIndex& index, int role) const override;
  QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
  Qt::ItemFlags flags(const QModelIndex& index) const override;
  bool setData(const QModelIndex& index, const QVariant& value, int role) override;

  CellStyle style(const QModelIndex& index) const;
  void press(const QModelIndex& index);
  // Lets the user browse for a cell's file, where it has one.
  bool browse(const QModelIndex& index);
  CV27SetupGridWnd& grid() const { return grid_; }
  // The grid or the model behind it has changed.
  void refresh();

 private:
  CV27SetupGridWnd& grid_;
  int shownRows_ = -1;
  int shownColumns_ = -1;
};

// Editors of cells: an edit, a list for a drop-down or a map projection, an edit with a browse button.
class CellDelegate final : public QStyledItemDelegate {
  Q_OBJECT
 public:
  using QStyledItemDelegate::QStyledItemDelegate;

  QWidget* createEditor(QWidget* parent, const QStyleOptionViewItem& option,
                        const QModelIndex& index) const override;
  void setEditorData(QWidget* editor, const QModelIndex& index) const override;
  void setModelData(QWidget* editor, QAbstractItemModel* model, const QModelIndex& index) const override;
  void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override;
};

// The widget of a grid.
class GridView final : public QTableView {
  Q_OBJECT
 public:
  GridView(CV27SetupGridWnd& grid, QWidget* parent);
  GridModel& cells() { return *model_; }

 public slots:
  void copy() const;
  void paste();

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  bool focusNextPrevChild(bool next) override;

 private:
  void layOutColumns();
  CellStyle styleOfButton(int column) const;

  GridModel* model_;
};

}  // namespace gridbay::shell
