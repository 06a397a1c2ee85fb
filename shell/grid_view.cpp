#include "shell/grid_view.h"

#include <QAbstractButton>
#include <QApplication>
#include <QClipboard>
#include <QComboBox>
#include <QKeyEvent>
#include <QPainter>
#include <QToolTip>
#include <algorithm>
#include <utility>

#include "shell/cell_editors.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr int kRowPadding = 9;

bool hasListEditor(CellKind kind) {
  return kind == CellKind::dropDown || kind == CellKind::mapProjection || kind == CellKind::multiChoice;
}

}  // namespace

GridView::GridView(CV27SetupGridWnd& grid, QWidget* parent)
    : QTableView(parent),
      model_(new GridModel(grid, this)),
      delegate_(new CellDelegate(this)),
      columnHeader_(new GridHeader(*model_, Qt::Horizontal, this)),
      rowHeader_(new GridHeader(*model_, Qt::Vertical, this)) {
  setHorizontalHeader(columnHeader_);
  setVerticalHeader(rowHeader_);
  setModel(model_);
  setItemDelegate(delegate_);
  setWordWrap(false);
  setShowGrid(false);
  setCornerButtonEnabled(false);
  if (auto* corner = findChild<QAbstractButton*>()) corner->installEventFilter(this);
  setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
  setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
  setEditTriggers(QAbstractItemView::CurrentChanged | QAbstractItemView::EditKeyPressed |
                  QAbstractItemView::AnyKeyPressed);
  viewport()->setAttribute(Qt::WA_Hover);
  rowHeader_->setSectionResizeMode(QHeaderView::Fixed);
  rowHeader_->setDefaultSectionSize(fontMetrics().height() + kRowPadding);
  columnHeader_->setVisible(grid.ShowsHeaders());
  rowHeader_->setVisible(grid.GetColWidth(0) > 0);
  measureColumns();
  layOutRows();
  fitSize();
  connect(model_, &GridModel::refreshed, this, [this] { layOutGrid(); });
  connect(model_, &GridModel::rowsInserted, this, [this] { layOutGrid(); });
  connect(model_, &GridModel::rowsRemoved, this, [this] { layOutGrid(); });
  connect(model_, &GridModel::columnsInserted, this, [this] { layOutGrid(); });
  connect(model_, &GridModel::columnsRemoved, this, [this] { layOutGrid(); });
  connect(model_, &GridModel::edited, this, &GridView::edited);
  connect(this, &QTableView::clicked, this, [this](const QModelIndex& index) { clicked(index); });
  connect(columnHeader_, &QHeaderView::sectionResized, this, [this](int column) {
    if (isSharing_ || column >= static_cast<int>(columns_.size())) return;
    columns_[static_cast<std::size_t>(column)].isUserSized = true;
    columnHeader_->setExtent(columnHeader_->neededHeight());
  });
}

// Where the grid has another row as the current one, that is it, and nobody is told of it.
void GridView::followCurrentRow() {
  const std::optional<int> row = model_->grid().CurrentRow();
  if (!row || *row == currentRow_ || *row > model_->rowCount()) return;
  currentRow_ = *row;
  const int column = std::max(currentIndex().column(), 0);
  const bool outer = std::exchange(movingByKeys_, true);  // opens no editor
  if (*row == 0) {
    selectionModel()->clear();
  } else {
    selectionModel()->setCurrentIndex(model_->index(*row - 1, column), QItemSelectionModel::ClearAndSelect);
  }
  movingByKeys_ = outer;
}

// Cells that cover others, and titles across all columns, are found among those that are seen.
bool GridView::spanShownCells() {
  bool changed = false;
  const int columns = model_->columnCount();
  const int first = std::max(0, rowAt(0));
  int last = rowAt(viewport()->height() - 1);
  if (last < 0) last = model_->rowCount() - 1;
  for (int row = first; row <= last && columns > 0; ++row) {
    for (int column = 0; column < columns;) {
      const CellStyle cell = model_->style(model_->index(row, column));
      const int wanted = cell.isHeading && column == 0 ? columns : std::clamp(cell.span, 1, columns - column);
      if (columnSpan(row, column) != wanted) {
        // A span that covers this cell no longer does.
        setSpan(row, column, 1, wanted);
        changed = true;
      }
      column += wanted;
    }
  }
  return changed;
}

void GridView::paintEvent(QPaintEvent* event) {
  spanShownCells();
  QTableView::paintEvent(event);
}

// The corner between the headers is one of them.
bool GridView::eventFilter(QObject* watched, QEvent* event) {
  auto* corner = qobject_cast<QAbstractButton*>(watched);
  if (corner == nullptr || event->type() != QEvent::Paint) return QTableView::eventFilter(watched, event);
  QPainter painter(corner);
  const QColor line = lineColour(palette());
  painter.fillRect(corner->rect(), headerGround(palette()));
  painter.fillRect(QRect(corner->width() - 1, 0, 1, corner->height()), line);
  painter.fillRect(QRect(0, corner->height() - 1, corner->width(), 1), line);
  return true;
}

void GridView::commitEdit() {
  QWidget* editor = delegate_->editor();
  if (editor == nullptr) return;
  commitData(editor);
  closeEditor(editor, QAbstractItemDelegate::NoHint);
}

bool GridView::edit(const QModelIndex& index, EditTrigger trigger, QEvent* event) {
  if (isReturning_) return false;
  const bool isOnItsWay =
      movingByKeys_ || model_->isRefreshing() || QApplication::mouseButtons() != Qt::NoButton;
  if (trigger == CurrentChanged && isOnItsWay) return false;
  if (!opening_ && index.isValid() && model_->style(index).kind == CellKind::multiChoice) {
    if (trigger == EditKeyPressed) openCell(index, true);
    return trigger == EditKeyPressed;
  }
  return QTableView::edit(index, trigger, event);
}

// `withList` opens the list of a cell that has one.
void GridView::openCell(const QModelIndex& index, bool withList) {
  opening_ = true;
  edit(index, AllEditTriggers, nullptr);
  opening_ = false;
  if (!withList) return;
  if (auto* list = qobject_cast<QComboBox*>(delegate_->editor())) list->showPopup();
  if (auto* choice = qobject_cast<MultiChoiceEditor*>(delegate_->editor())) choice->open();
}

void GridView::clicked(const QModelIndex& index) {
  if (isReturning_ || index != currentIndex()) return;
  const QPersistentModelIndex at(index);
  if (model_->style(index).kind == CellKind::button) return model_->press(index);
  model_->grid().OnLButtonHitRowCol(index.row() + 1, index.column() + 1);
  const bool isOne = selectionModel()->selectedIndexes().size() <= 1;
  if (at.isValid() && isOne && QApplication::keyboardModifiers() == Qt::NoModifier &&
      model_->flags(at).testFlag(Qt::ItemIsEditable))
    openCell(at, true);
}

void GridView::commitData(QWidget* editor) {
  if (!isReturning_) QTableView::commitData(editor);
}

void GridView::closeEditor(QWidget* editor, QAbstractItemDelegate::EndEditHint hint) {
  // Its cell may have gone with what was stored, and the editor with that.
  if (delegate_->isEditorLost()) return delegate_->forgetEditor();
  if (keepsRefused(editor, hint)) return;
  const bool isEntered = hint == QAbstractItemDelegate::SubmitModelCache;
  const bool hadFocus = editor->hasFocus() || qobject_cast<MultiChoiceEditor*>(editor) != nullptr;
  const QModelIndex current = currentIndex();
  QTableView::closeEditor(editor, hint);
  delegate_->forgetEditor();
  if (hadFocus && isVisible() && !hasFocus()) setFocus();
  // Return goes on to the cell below, where there is one to fill in.
  const QModelIndex below = current.siblingAtRow(current.row() + 1);
  if (!isEntered || !below.isValid() || current != currentIndex()) return;
  if (!model_->flags(below).testFlag(Qt::ItemIsEnabled)) return;
  movingByKeys_ = true;
  setCurrentIndex(below);
  movingByKeys_ = false;
}

// Whether an editor with a refused text stays open. Who leaves it for elsewhere is brought back once.
bool GridView::keepsRefused(QWidget* editor, QAbstractItemDelegate::EndEditHint hint) {
  CellEdit* edit = editOf(editor);
  if (edit == nullptr || !edit->isRefused() || hint == QAbstractItemDelegate::RevertModelCache) return false;
  if (isReturning_) return true;
  const bool isLeft = !edit->hasFocus();
  if (isLeft && edit->hasReturned) return false;
  if (isLeft) {
    edit->hasReturned = true;
    isReturning_ = true;
    // Not at once: the click that leaves it is still on its way.
    QMetaObject::invokeMethod(
        editor, [this, editor] { returnToEditor(editor); }, Qt::QueuedConnection);
  }
  if (edit->isVisible())
    QToolTip::showText(edit->mapToGlobal(QPoint(0, edit->height())), edit->fault(), edit, {}, 10000);
  return true;
}

// Into another part of the window the user may go: the text waits for him.
void GridView::returnToEditor(QWidget* editor) {
  isReturning_ = false;
  const QModelIndex index = indexAt(editor->geometry().center());
  const QWidget* now = QApplication::focusWidget();
  if (!index.isValid() || now == nullptr || now->window() != window()) return;
  if (!parentWidget()->isAncestorOf(now)) return;
  movingByKeys_ = true;
  if (currentIndex() != index) setCurrentIndex(index);
  movingByKeys_ = false;
  editor->setFocus(Qt::OtherFocusReason);
}

void GridView::currentChanged(const QModelIndex& current, const QModelIndex& previous) {
  QTableView::currentChanged(current, previous);
  rowHeader_->viewport()->update();
  columnHeader_->viewport()->update();
  const int row = current.isValid() ? current.row() + 1 : 0;
  if (row != currentRow_) {
    currentRow_ = row;
    model_->grid().OnCurrentRow(row);
    emit edited();
  }
  emit cellChosen();
}

bool GridView::goTo(const PagePlace& place, bool exactly) {
  const auto [first, count] = rowsOf(place.entries);
  for (int row = first; row < first + count; ++row) {
    if (const int column = columnOf(place, row); column >= 0) {
      goToCell(row, column);
      return true;
    }
  }
  if (exactly || count == 0 || model_->columnCount() == 0) return false;
  goToCell(first, std::max(currentIndex().column(), 0));
  return true;
}

void GridView::goToCell(int row, int column) {
  const bool outer = std::exchange(movingByKeys_, true);
  selectionModel()->setCurrentIndex(model_->index(row, column), QItemSelectionModel::ClearAndSelect);
  scrollTo(currentIndex());
  movingByKeys_ = outer;
}

// An entry may have several rows, and a title above them.
GridView::Rows GridView::rowsOf(const std::vector<ListEntry>& entries) const {
  int first = model_->headerRows();
  int rows = std::max(model_->rowCount() - first, 0);
  const auto isTitle = [this](int row) { return model_->style(model_->index(row, 0)).isHeading; };
  for (const auto& [number, count] : entries) {
    const int each = std::max(count > 0 ? rows / count : 1, 1);
    if (number < 1 || (number - 1) * each >= rows) return {};
    first += (number - 1) * each;
    rows = each;
    while (rows > 1 && isTitle(first)) {
      ++first;
      --rows;
    }
  }
  return {first, rows};
}

// The column that a place names, by its header or what stands in it; -1 where the row has none.
int GridView::columnOf(const PagePlace& place, int row) const {
  if (place.column > 0) return place.column <= model_->columnCount() ? place.column - 1 : -1;
  if (place.field.empty() && place.value.empty())
    return model_->columnCount() == 0 ? -1 : std::max(currentIndex().column(), 0);
  int number = place.fieldNumber;
  for (int column = 0; column < model_->columnCount(); ++column) {
    if (isColumnHidden(column)) continue;
    const QString header = model_->headerData(column, Qt::Horizontal, Qt::DisplayRole).toString().trimmed();
    if (!place.field.empty() && header == QString::fromStdString(place.field) && --number == 0) return column;
    if (!place.value.empty() && model_->style(model_->index(row, column)).value == place.value) return column;
  }
  return -1;
}

// To come here by Tab makes a cell the current one, and opens none. The focus that a closed editor gives back
// makes none current where the grid has none.
void GridView::focusInEvent(QFocusEvent* event) {
  if (event->reason() == Qt::OtherFocusReason && model_->grid().CurrentRow() == 0)
    return QAbstractScrollArea::focusInEvent(event);
  movingByKeys_ = true;
  QTableView::focusInEvent(event);
  movingByKeys_ = false;
}

void GridView::mousePressEvent(QMouseEvent* event) {
  const QModelIndex index = indexAt(event->position().toPoint());
  const CellStyle cell = index.isValid() ? model_->style(index) : CellStyle();
  if (event->button() == Qt::LeftButton && cell.kind == CellKind::button && cell.enabled) {
    delegate_->setPressed(index);
    viewport()->update();
  }
  QTableView::mousePressEvent(event);
}

void GridView::mouseReleaseEvent(QMouseEvent* event) {
  if (delegate_->pressed().isValid()) {
    delegate_->setPressed({});
    viewport()->update();
  }
  QTableView::mouseReleaseEvent(event);
}

void GridView::keyPressEvent(QKeyEvent* event) {
  if (event->key() == Qt::Key_Space && event->isAutoRepeat()) return;
  const QModelIndex index = currentIndex();
  const CellKind kind = index.isValid() ? model_->style(index).kind : CellKind::label;
  const bool isEnter = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
  const bool isPress = event->key() == Qt::Key_Space || isEnter;
  const bool opensList = isPress || event->key() == Qt::Key_F4 ||
                         (event->key() == Qt::Key_Down && event->modifiers().testFlag(Qt::AltModifier));
  if (event->matches(QKeySequence::Copy)) {
    copy();
  } else if (event->matches(QKeySequence::Paste)) {
    paste();
  } else if (isPress && kind == CellKind::button) {
    model_->press(index);
  } else if (opensList && hasListEditor(kind) && editOf(delegate_->editor()) == nullptr) {
    if (model_->flags(index).testFlag(Qt::ItemIsEditable)) openCell(index, true);
  } else if (isEnter && index.isValid()) {
    if (model_->flags(index).testFlag(Qt::ItemIsEditable)) openCell(index, false);
  } else if (event->modifiers() == Qt::ControlModifier && event->key() == Qt::Key_D && index.isValid() &&
             model_->browse(index)) {
    return;
  } else {
    movingByKeys_ = true;
    QTableView::keyPressEvent(event);
    movingByKeys_ = false;
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
  movingByKeys_ = true;
  bool moved = false;
  for (cell += next ? 1 : -1; cell >= 0 && cell < cells; cell += next ? 1 : -1) {
    if (!isUsable(cell)) continue;
    moved = QTableView::focusNextPrevChild(next);
    movingByKeys_ = false;
    return moved;
  }
  movingByKeys_ = false;
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
