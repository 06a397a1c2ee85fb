#include "shell/grid_view.h"

#include <QApplication>
#include <QComboBox>
#include <QHeaderView>
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
  if (cell.editable()) flags |= Qt::ItemIsEditable;
  return flags;
}

bool GridModel::setData(const QModelIndex& index, const QVariant& value, int role) {
  if (role != Qt::EditRole) return false;
  const bool stored =
      grid_.StoreStyleRowCol(index.row() + 1, index.column() + 1, value.toString().toStdString()) != 0;
  refresh();
  return stored;
}

void GridModel::press(const QModelIndex& index) {
  grid_.OnClickedButtonRowCol(index.row() + 1, index.column() + 1);
  refresh();
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
  const CellStyle cell = static_cast<const GridModel*>(index.model())->style(index);
  if (cell.kind != CellKind::dropDown) return new QLineEdit(parent);
  auto* list = new QComboBox(parent);
  for (const std::string& choice : cell.choices) list->addItem(QString::fromStdString(choice));
  // A choice counts at once, without a further key. The signals of a delegate belong to an object that is not
  // const.
  auto* self = const_cast<CellDelegate*>(this);
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
  const auto* list = qobject_cast<QComboBox*>(editor);
  model->setData(index, list != nullptr ? list->currentText() : qobject_cast<QLineEdit*>(editor)->text(),
                 Qt::EditRole);
}

void CellDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                         const QModelIndex& index) const {
  const CellStyle cell = static_cast<const GridModel*>(index.model())->style(index);
  if (cell.kind != CellKind::button) {
    QStyledItemDelegate::paint(painter, option, index);
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
  for (int column = 1; column <= grid.GetColCount(); ++column) {
    setColumnWidth(column - 1, grid.GetColWidth(column) * fontMetrics().averageCharWidth() / kCharWidth);
  }
  connect(this, &QTableView::clicked, this, [this](const QModelIndex& index) {
    if (model_->style(index).kind == CellKind::button) model_->press(index);
  });
}

}  // namespace gridbay::shell
