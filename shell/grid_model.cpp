#include "shell/grid_model.h"

#include <QApplication>
#include <QFont>
#include <QPalette>
#include <QPointer>

namespace gridbay::shell {

QStringList chosenTexts(const CellStyle& cell) {
  const qulonglong bits = QString::fromStdString(cell.value).toULongLong();
  QStringList texts;
  for (std::size_t i = 0; i < cell.choices.size() && i < 64; ++i) {
    if ((bits >> i & 1U) != 0) texts << QString::fromStdString(cell.choices[i]).trimmed();
  }
  return texts;
}

QString shownText(const CellStyle& cell) {
  if (cell.kind == CellKind::checkBox) return {};
  if (cell.kind != CellKind::multiChoice) return QString::fromStdString(cell.value);
  const QStringList chosen = chosenTexts(cell);
  if (chosen.isEmpty()) return GridModel::tr("None");
  constexpr qsizetype kShort = 24;
  const QString all = chosen.join(", ");
  return all.size() <= kShort ? all : GridModel::tr("%1 of %2").arg(chosen.size()).arg(cell.choices.size());
}

int GridModel::headerRows() const {
  int rows = 0;
  while (rows < rowCount() && style(index(rows, 0)).isHeader) ++rows;
  return rows;
}

CellStyle GridModel::style(const QModelIndex& index) const {
  CellStyle style;
  grid_.GetStyleRowCol(index.row() + 1, index.column() + 1, style);
  if (!grid_.IsEnabled()) style.enabled = false;
  if (readOnly_) style.readOnly = true;
  return style;
}

QVariant GridModel::data(const QModelIndex& index, int role) const {
  const CellStyle cell = style(index);
  switch (role) {
    case Qt::DisplayRole:
      if (cell.kind == CellKind::checkBox) return {};
      return shownText(cell);
    case Qt::EditRole:
      return QString::fromStdString(cell.value);
    case Qt::ToolTipRole: {
      QStringList lines;
      if (!cell.toolTip.empty()) lines << QString::fromStdString(cell.toolTip).trimmed();
      if (cell.kind == CellKind::multiChoice) lines << chosenTexts(cell);
      return lines.join('\n');
    }
    case Qt::TextAlignmentRole:
      return QVariant(static_cast<int>((cell.align == CellAlign::right ? Qt::AlignRight : Qt::AlignLeft) |
                                       Qt::AlignVCenter));
    case Qt::ForegroundRole:
      return cell.enabled ? QVariant()
                          : QVariant(QApplication::palette().brush(QPalette::Disabled, QPalette::Text));
    case Qt::FontRole: {
      if (!cell.isHeading) return {};
      QFont bold;
      bold.setBold(true);
      return bold;
    }
    case Qt::CheckStateRole:
      if (cell.kind != CellKind::checkBox) return {};
      return static_cast<int>(cell.value == "1" ? Qt::Checked : Qt::Unchecked);
    default:
      return {};
  }
}

QVariant GridModel::headerData(int section, Qt::Orientation orientation, int role) const {
  if (role != Qt::DisplayRole && role != Qt::ToolTipRole) return {};
  return QString::fromStdString(orientation == Qt::Horizontal ? grid_.GetColHeader(section + 1)
                                                              : grid_.GetRowHeader(section + 1));
}

Qt::ItemFlags GridModel::flags(const QModelIndex& index) const {
  if (!index.isValid()) return Qt::NoItemFlags;
  const CellStyle cell = style(index);
  if (cell.isHeading || cell.isHeader) return Qt::NoItemFlags;
  Qt::ItemFlags flags = Qt::ItemIsSelectable;
  if (cell.enabled) flags |= Qt::ItemIsEnabled;
  if (cell.editable())
    flags |= cell.kind == CellKind::checkBox ? Qt::ItemIsUserCheckable : Qt::ItemIsEditable;
  return flags;
}

// What a change leads to may close the grid, so that nothing is done after it then.
bool GridModel::setData(const QModelIndex& index, const QVariant& value, int role) {
  if (role != Qt::EditRole && role != Qt::CheckStateRole) return false;
  if (readOnly_ || !grid_.IsEnabled()) return false;
  const QString text = role == Qt::EditRole ? value.toString() : value.toInt() == Qt::Checked ? "1" : "0";
  const QPointer<GridModel> self(this);
  const bool stored = grid_.StoreStyleRowCol(index.row() + 1, index.column() + 1, text.toStdString()) != 0;
  if (self != nullptr) refresh();
  if (self != nullptr && stored) emit edited();
  return stored;
}

void GridModel::press(const QModelIndex& index) {
  if (readOnly_ || !grid_.IsEnabled()) return;
  const QPointer<GridModel> self(this);
  grid_.OnClickedButtonRowCol(index.row() + 1, index.column() + 1);
  if (self != nullptr) refresh();
  if (self != nullptr) emit edited();
}

bool GridModel::browse(const QModelIndex& index) {
  if (readOnly_ || !grid_.IsEnabled()) return false;
  const QPointer<GridModel> self(this);
  const bool browsed = grid_.ProcessKeys(GridKey::browse, index.row() + 1, index.column() + 1);
  if (self != nullptr && browsed) refresh();
  if (self != nullptr && browsed) emit edited();
  return browsed;
}

std::optional<CellPick> GridModel::pick(const QModelIndex& index) const {
  if (readOnly_ || !index.isValid()) return std::nullopt;
  return grid_.PickRowCol(index.row() + 1, index.column() + 1);
}

bool GridModel::hasPicks() const {
  for (int row = 0; row < shownRows_; ++row) {
    for (int column = 0; column < shownColumns_; ++column) {
      if (pick(index(row, column))) return true;
    }
  }
  return false;
}

bool GridModel::storePick(const QModelIndex& index, std::span<const PickedPlace> places) {
  if (readOnly_ || !index.isValid()) return false;
  const QPointer<GridModel> self(this);
  const bool stored = grid_.StorePickRowCol(index.row() + 1, index.column() + 1, places) != 0;
  if (self != nullptr) refresh();
  if (self != nullptr && stored) emit edited();
  return stored;
}

// Rows that go may move the current cell, and who hears of that may refresh in turn.
void GridModel::refresh() {
  if (isRefreshing_) return;
  isRefreshing_ = true;
  showCounts(grid_.GetRowCount(), grid_.GetColCount());
  isRefreshing_ = false;
  if (shownRows_ > 0 && shownColumns_ > 0)
    emit dataChanged(index(0, 0), index(shownRows_ - 1, shownColumns_ - 1));
  emit refreshed();
}

void GridModel::showCounts(int rows, int columns) {
  if (columns > shownColumns_) {
    beginInsertColumns({}, shownColumns_, columns - 1);
    shownColumns_ = columns;
    endInsertColumns();
  } else if (columns < shownColumns_) {
    beginRemoveColumns({}, columns, shownColumns_ - 1);
    shownColumns_ = columns;
    endRemoveColumns();
  }
  if (rows > shownRows_) {
    beginInsertRows({}, shownRows_, rows - 1);
    shownRows_ = rows;
    endInsertRows();
  } else if (rows < shownRows_) {
    beginRemoveRows({}, rows, shownRows_ - 1);
    shownRows_ = rows;
    endRemoveRows();
  }
}

}  // namespace gridbay::shell
