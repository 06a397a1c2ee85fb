#include "shell/grid_view.h"

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QComboBox>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLineEdit>
#include <QPainter>
#include <QPalette>

namespace gridbay::shell {
namespace {

// Widths of columns are told in pixels of a font whose letters are this wide.
constexpr int kCharWidth = 5;

}  // namespace

int GridModel::rowCount(const QModelIndex& parent) const {
  return parent.isValid() ? 0 : grid_.GetRowCount();
}
int GridModel::columnCount(const QModelIndex& parent) const {
  return parent.isValid() ? 0 : grid_.GetColCount();
}

CellStyle GridModel::style(const QModelIndex& index) const {
  CellStyle style;
  grid_.GetStyleRowCol(index.row() + 1, index.column() + 1, style);
  return style;
}

QVariant GridModel::data(const QModelIndex& index, int role) const {
  const CellStyle cell = style(index);
  switch (role) {
    case Qt::DisplayRole:
      if (cell.kind == CellKind::checkBox) return {};
      [[fallthrough]];
    case Qt::EditRole:
      return QString::fromStdString(cell.value);
    case Qt::ToolTipRole:
      return QString::fromStdString(cell.toolTip);
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
  if (role != Qt::DisplayRole) return {};
  return QString::fromStdString(orientation == Qt::Horizontal ? grid_.GetColHeader(section + 1)
                                                              : grid_.GetRowHeader(section + 1));
}

Qt::ItemFlags GridModel::flags(const QModelIndex& index) const {
  const CellStyle cell = style(index);
  Qt::ItemFlags flags = Qt::ItemIsSelectable;
  if (cell.enabled) flags |= Qt::ItemIsEnabled;
  if (cell.editable())
    flags |= cell.kind == CellKind::checkBox ? Qt::ItemIsUserCheckable : Qt::ItemIsEditable;
  return flags;
}

bool GridModel::setData(const QModelIndex& index, const QVariant& value, int role) {
  if (role != Qt::EditRole && role != Qt::CheckStateRole) return false;
  const QString text = role == Qt::EditRole ? value.toString() : value.toInt() == Qt::Checked ? "1" : "0";
  const bool stored = grid_.StoreStyleRowCol(index.row() + 1, index.column() + 1, text.toStdString()) != 0;
  refresh();
  return stored;
}

void GridModel::press(const QModelIndex& index) {
  grid_.OnClickedButtonRowCol(index.row() + 1, index.column() + 1);
  refresh();
}

bool GridModel::browse(const QModelIndex& index) {
  const bool browsed = grid_.ProcessKeys(GridKey::browse, index.row() + 1, index.column() + 1);
  if (browsed) refresh();
  return browsed;
}

void GridModel::refresh() {
  if (rowCount() == shownRows_ && columnCount() == shownColumns_) {
    if (shownRows_ > 0 && shownColumns_ > 0)
      emit dataChanged(index(0, 0), index(shownRows_ - 1, shownColumns_ - 1));
    return;
  }
  beginResetModel();
  shownRows_ = rowCount();
  shownColumns_ = columnCount();
  endResetModel();
}

QWidget* CellDelegate::createEditor(QWidget* parent, const QStyleOptionViewItem&,
                                    const QModelIndex& index) const {
  // The model and the signals of a delegate belong to objects that are not const.
  auto* cells = const_cast<GridModel*>(static_cast<const GridModel*>(index.model()));
  auto* self = const_cast<CellDelegate*>(this);
  const CellStyle cell = cells->style(index);
  if (cell.kind != CellKind::dropDown && cell.kind != CellKind::mapProjection) {
    auto* edit = new QLineEdit(parent);
    if (cell.kind != CellKind::resultFile) return edit;
    auto* browse = new QAction("...", edit);
    browse->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_D));
    browse->setShortcutContext(Qt::WidgetShortcut);
    browse->setIcon(QApplication::style()->standardIcon(QStyle::SP_DirOpenIcon));
    edit->addAction(browse, QLineEdit::TrailingPosition);
    connect(browse, &QAction::triggered, edit, [self, cells, edit, at = QPersistentModelIndex(index)] {
      if (cells->browse(at)) emit self->closeEditor(edit, QAbstractItemDelegate::RevertModelCache);
    });
    return edit;
  }
  auto* list = new QComboBox(parent);
  if (cell.kind == CellKind::mapProjection) {
    for (const std::string& choice : cells->grid().OnStartEditing(index.row() + 1, index.column() + 1))
      list->addItem(QString::fromStdString(choice));
  }
  for (const std::string& choice : cell.choices) list->addItem(QString::fromStdString(choice));
  // A choice counts at once, without a further key.
  connect(list, &QComboBox::activated, self, [self, list] {
    emit self->commitData(list);
    emit self->closeEditor(list);
  });
  return list;
}

void CellDelegate::setEditorData(QWidget* editor, const QModelIndex& index) const {
  const QString text = index.data(Qt::EditRole).toString();
  if (auto* list = qobject_cast<QComboBox*>(editor)) {
    list->setCurrentText(text);
  } else {
    qobject_cast<QLineEdit*>(editor)->setText(text);
  }
}

void CellDelegate::setModelData(QWidget* editor, QAbstractItemModel* model, const QModelIndex& index) const {
  auto* cells = static_cast<GridModel*>(model);
  const auto* list = qobject_cast<QComboBox*>(editor);
  const QString text = list != nullptr ? list->currentText() : qobject_cast<QLineEdit*>(editor)->text();
  if (text == index.data(Qt::EditRole).toString()) return;
  if (cells->style(index).kind == CellKind::mapProjection) {
    cells->grid().OnModifyCell(text.toStdString());
    cells->grid().OnEndEditing(index.row() + 1, index.column() + 1);
    cells->refresh();
    return;
  }
  model->setData(index, text, Qt::EditRole);
}

void CellDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                         const QModelIndex& index) const {
  const CellStyle cell = static_cast<const GridModel*>(index.model())->style(index);
  if (cell.kind != CellKind::button) {
    QStyledItemDelegate::paint(painter, option, index);
    const bool hasList = cell.kind == CellKind::dropDown || cell.kind == CellKind::mapProjection;
    if (!hasList || !cell.editable()) return;
    // So that a list is seen to be one before it is opened.
    QStyleOption arrow;
    const int side = option.fontMetrics.averageCharWidth();
    arrow.rect = QRect(option.rect.right() - side, option.rect.center().y() - side / 2, side, side);
    arrow.palette = option.palette;
    arrow.state = QStyle::State_Enabled;
    QApplication::style()->drawPrimitive(QStyle::PE_IndicatorArrowDown, &arrow, painter);
    return;
  }
  QStyleOptionButton button;
  button.rect = option.rect.adjusted(1, 1, -1, -1);
  button.text = QString::fromStdString(cell.value).trimmed();
  if (!cell.enabled) button.palette.setCurrentColorGroup(QPalette::Disabled);
  button.state = cell.enabled ? QStyle::State_Enabled | QStyle::State_Raised : QStyle::State_None;
  QApplication::style()->drawControl(QStyle::CE_PushButton, &button, painter);
}

GridView::GridView(CV27SetupGridWnd& grid, QWidget* parent)
    : QTableView(parent), model_(new GridModel(grid, this)) {
  setModel(model_);
  setItemDelegate(new CellDelegate(this));
  setWordWrap(false);
  setEditTriggers(QAbstractItemView::AllEditTriggers);
  horizontalHeader()->setVisible(grid.ShowsHeaders());
  verticalHeader()->setVisible(grid.GetColWidth(0) > 0);
  layOutColumns();
  connect(model_, &QAbstractItemModel::modelReset, this, [this] { layOutColumns(); });
  connect(this, &QTableView::clicked, this, [this](const QModelIndex& index) {
    if (model_->style(index).kind == CellKind::button) {
      model_->press(index);
    } else {
      model_->grid().OnLButtonHitRowCol(index.row() + 1, index.column() + 1);
    }
  });
}

void GridView::layOutColumns() {
  CV27SetupGridWnd& grid = model_->grid();
  const int rows = model_->rowCount();
  for (int column = 1; column <= model_->columnCount(); ++column) {
    int width = grid.GetColWidth(column) * fontMetrics().averageCharWidth() / kCharWidth;
    const CellStyle first = rows == 0 ? CellStyle() : styleOfButton(column);
    if (first.kind == CellKind::button) {
      constexpr int kFrame = 4;  // letters
      const int text = fontMetrics().horizontalAdvance(QString::fromStdString(first.value).trimmed());
      width = std::max(width, text + kFrame * fontMetrics().averageCharWidth());
    }
    setColumnWidth(column - 1, width);
    setColumnHidden(column - 1, !grid.OnTrackColWidth(column));
  }
  clearSpans();
  for (int row = 0; row < rows && !grid.ShowsHeaders(); ++row) {
    if (model_->style(model_->index(row, 0)).isHeading) setSpan(row, 0, 1, model_->columnCount());
  }
}

// The first button in a column; a plain cell where there is none near the top.
CellStyle GridView::styleOfButton(int column) const {
  constexpr int kNear = 8;
  for (int row = 0; row < std::min(kNear, model_->rowCount()); ++row) {
    CellStyle style = model_->style(model_->index(row, column - 1));
    if (style.kind == CellKind::button) return style;
  }
  return {};
}

void GridView::keyPressEvent(QKeyEvent* event) {
  const QModelIndex index = currentIndex();
  const bool isPress =
      event->key() == Qt::Key_Space || event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
  if (event->matches(QKeySequence::Copy)) {
    copy();
  } else if (event->matches(QKeySequence::Paste)) {
    paste();
  } else if (isPress && index.isValid() && model_->style(index).kind == CellKind::button) {
    model_->press(index);
  } else if (event->modifiers() == Qt::ControlModifier && event->key() == Qt::Key_D && index.isValid() &&
             model_->browse(index)) {
    return;
  } else {
    QTableView::keyPressEvent(event);
  }
}

// Tab goes from cell to cell, and on to the next control from the last one that can be used.
bool GridView::focusNextPrevChild(bool next) {
  const int columns = model_->columnCount();
  const int cells = model_->rowCount() * columns;
  const QModelIndex current = currentIndex();
  int cell = current.isValid() ? current.row() * columns + current.column() : -1;
  const auto isUsable = [this, columns](int n) {
    return model_->flags(model_->index(n / columns, n % columns)).testFlag(Qt::ItemIsEnabled);
  };
  for (cell += next ? 1 : -1; cell >= 0 && cell < cells; cell += next ? 1 : -1) {
    if (isUsable(cell)) return QTableView::focusNextPrevChild(next);
  }
  return QAbstractScrollArea::focusNextPrevChild(next);
}

// The selected cells as a spreadsheet takes them.
void GridView::copy() const {
  QModelIndexList cells = selectionModel()->selectedIndexes();
  std::sort(cells.begin(), cells.end());
  QString text;
  for (qsizetype i = 0; i < cells.size(); ++i) {
    if (i > 0) text += cells[i].row() == cells[i - 1].row() ? '\t' : '\n';
    text += cells[i].data(Qt::EditRole).toString();
  }
  QApplication::clipboard()->setText(text);
}

// Rows and columns of the clipboard from the current cell on; what a cell refuses is dropped.
void GridView::paste() {
  const QModelIndex from = currentIndex();
  if (!from.isValid()) return;
  const QStringList lines = QApplication::clipboard()->text().trimmed().split('\n');
  for (qsizetype row = 0; row < lines.size(); ++row) {
    const QStringList texts = lines[row].split('\t');
    for (qsizetype column = 0; column < texts.size(); ++column) {
      const QModelIndex cell = from.siblingAtRow(from.row() + static_cast<int>(row))
                                   .siblingAtColumn(from.column() + static_cast<int>(column));
      if (cell.isValid() && cell.flags().testFlag(Qt::ItemIsEditable))
        model_->setData(cell, texts[column], Qt::EditRole);
    }
  }
}

}  // namespace gridbay::shell
