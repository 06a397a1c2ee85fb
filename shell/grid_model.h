#pragma once

#include <QAbstractTableModel>
#include <optional>
#include <span>

#include "pages/grid_wnd.h"

namespace gridbay::shell {

// The cells of a grid for the toolkit; each question goes through to the grid, and so to the model.
class GridModel final : public QAbstractTableModel {
  Q_OBJECT
 public:
  GridModel(CV27SetupGridWnd& grid, QObject* parent) : QAbstractTableModel(parent), grid_(grid) { refresh(); }

  int rowCount(const QModelIndex& parent = {}) const override { return parent.isValid() ? 0 : shownRows_; }
  int columnCount(const QModelIndex& parent = {}) const override {
    return parent.isValid() ? 0 : shownColumns_;
  }
  QVariant data(const QModelIndex& index, int role) const override;
  QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
  Qt::ItemFlags flags(const QModelIndex& index) const override;
  bool setData(const QModelIndex& index, const QVariant& value, int role) override;

  // Further rows of headers, above those that can be chosen.
  int headerRows() const;
  // How a cell looks at present; one of a grid that does not apply is greyed.
  CellStyle style(const QModelIndex& index) const;
  void press(const QModelIndex& index);
  // Whether its cells can be read only.
  void setReadOnly(bool readOnly) { readOnly_ = readOnly; }
  // Lets the user browse for a cell's file, where it has one.
  bool browse(const QModelIndex& index);
  // What can be pointed at on a map for a cell, whether there is any such, and the storing of it; true when
  // it was taken.
  std::optional<CellPick> pick(const QModelIndex& index) const;
  bool hasPicks() const;
  bool storePick(const QModelIndex& index, std::span<const PickedPlace> places);
  CV27SetupGridWnd& grid() const { return grid_; }
  // The grid or the model behind it has changed. Rows and columns come and go at the end, so that the current
  // cell, the selection and what is scrolled to stay.
  void refresh();
  // Rows and columns are coming and going.
  bool isRefreshing() const { return isRefreshing_; }

 signals:
  // A cell has changed the model.
  void edited();
  // The grid is shown anew, though it may have no cells.
  void refreshed();

 private:
  CV27SetupGridWnd& grid_;
  void showCounts(int rows, int columns);

  int shownRows_ = 0;
  int shownColumns_ = 0;
  bool isRefreshing_ = false;
  bool readOnly_ = false;
};

// The texts of the choices that a multiple choice cell holds.
QStringList chosenTexts(const CellStyle& cell);
// What a cell shows: its value, or a multiple choice in short.
QString shownText(const CellStyle& cell);

}  // namespace gridbay::shell
