#include "shell/cell_delegate.h"

#include <QAction>
#include <QApplication>
#include <QComboBox>
#include <QHelpEvent>
#include <QPainter>
#include <QToolTip>

#include "platform/projection_search.h"
#include "shell/cell_editors.h"
#include "shell/grid_model.h"
#include "shell/projection_search.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr int kPadding = 5;

bool hasList(CellKind kind) {
  return kind == CellKind::dropDown || kind == CellKind::mapProjection || kind == CellKind::multiChoice;
}

const GridModel& gridOf(const QModelIndex& index) {
  return *static_cast<const GridModel*>(index.model());
}

QColor groundOf(const CellStyle& cell, const QPalette& palette) {
  if (cell.isHeader || cell.isHeading) return headerGround(palette);
  if (!cell.enabled || cell.isGrey) return disabledGround(palette);
  if (!cell.editable() && cell.kind != CellKind::button) return readOnlyGround(palette);
  return palette.color(QPalette::Active, QPalette::Base);
}

void paintButton(QPainter* painter, const QStyleOptionViewItem& option, const CellStyle& cell, bool isDown) {
  QStyleOptionButton button;
  button.rect = option.rect.adjusted(2, 2, -3, -3);
  button.palette = option.palette;
  button.fontMetrics = option.fontMetrics;
  button.text = QString::fromStdString(cell.value).trimmed();
  button.state = isDown ? QStyle::State_Sunken : QStyle::State_Raised;
  if (cell.enabled) {
    button.state |= QStyle::State_Enabled;
  } else {
    button.palette.setCurrentColorGroup(QPalette::Disabled);
  }
  if (option.state.testFlag(QStyle::State_MouseOver) && cell.enabled) button.state |= QStyle::State_MouseOver;
  QApplication::style()->drawControl(QStyle::CE_PushButton, &button, painter, option.widget);
}

void paintCheckBox(QPainter* painter, const QStyleOptionViewItem& option, const CellStyle& cell) {
  const QStyle* style = QApplication::style();
  QStyleOptionButton box;
  const QSize size(style->pixelMetric(QStyle::PM_IndicatorWidth),
                   style->pixelMetric(QStyle::PM_IndicatorHeight));
  box.rect = QStyle::alignedRect(Qt::LeftToRight, Qt::AlignCenter, size, option.rect.adjusted(0, 0, -1, -1));
  box.palette = option.palette;
  box.state = cell.value == "1" ? QStyle::State_On : QStyle::State_Off;
  if (cell.editable()) {
    box.state |= QStyle::State_Enabled;
  } else {
    box.palette.setCurrentColorGroup(QPalette::Disabled);
  }
  style->drawPrimitive(QStyle::PE_IndicatorCheckBox, &box, painter, option.widget);
}

// So that a list is seen to be one before it is opened.
void paintArrow(QPainter* painter, const QRect& rect, const QColor& colour) {
  const QPointF middle(rect.right() - rect.height() * 0.32, rect.top() + rect.height() / 2.0);
  const double reach = rect.height() * 0.14;
  painter->save();
  painter->setRenderHint(QPainter::Antialiasing);
  painter->setPen(QPen(colour, 1.4, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
  painter->drawPolyline(QPolygonF({{middle.x() - reach, middle.y() - reach / 2},
                                   {middle.x(), middle.y() + reach / 2},
                                   {middle.x() + reach, middle.y() - reach / 2}}));
  painter->restore();
}

QRect textRoom(const QRect& cell, CellKind kind) {
  return cell.adjusted(kPadding, 0, -kPadding - 1 - (hasList(kind) ? cell.height() / 2 : 0), 0);
}

// One of the list's own texts, or what is typed where that names a projection.
bool storeProjection(GridModel& cells, const QModelIndex& index, const QComboBox& list) {
  std::string text = list.currentText().toStdString();
  if (list.findText(list.currentText(), Qt::MatchExactly | Qt::MatchCaseSensitive) < 0) {
    const Result<std::string> known = projectionText(list.currentText().trimmed().toStdString());
    if (!known || known->empty()) return false;
    text = *known;
  }
  cells.grid().OnModifyCell(text);
  cells.grid().OnEndEditing(index.row() + 1, index.column() + 1);
  cells.refresh();
  emit cells.edited();
  return true;
}

// Why a text was not taken, by what the cell holds.
QString refusal(const QString& typed, const QModelIndex& index) {
  const CellStyle cell = gridOf(index).style(index);
  const QString column =
      gridOf(index).headerData(index.column(), Qt::Horizontal, Qt::DisplayRole).toString().trimmed();
  QString text = column.isEmpty() ? CellDelegate::tr("\"%1\" is no value for this cell.").arg(typed)
                                  : CellDelegate::tr("\"%1\" is no value for \"%2\".").arg(typed, column);
  if (!cell.value.empty())
    text += CellDelegate::tr(" One looks like %1.").arg(QString::fromStdString(cell.value));
  if (!cell.toolTip.empty()) text += '\n' + QString::fromStdString(cell.toolTip).trimmed();
  return text + '\n' + CellDelegate::tr("Esc brings the value back.");
}

}  // namespace

int CellDelegate::aroundText(CellKind kind, const QFontMetrics& metrics) {
  return 2 * kPadding + 3 + (hasList(kind) ? metrics.height() : 0) +
         (kind == CellKind::button ? 2 * kPadding : 0);
}

QWidget* CellDelegate::createEditor(QWidget* parent, const QStyleOptionViewItem&,
                                    const QModelIndex& index) const {
  const CellStyle cell = gridOf(index).style(index);
  edited_ = index;
  switch (cell.kind) {
    case CellKind::dropDown:
    case CellKind::mapProjection:
      editor_ = makeList(parent, cell, index);
      break;
    case CellKind::multiChoice:
      editor_ = makeMultiChoice(parent, cell);
      break;
    default:
      editor_ = makeEdit(parent, cell, index);
  }
  editor_->setAccessibleName(
      gridOf(index).headerData(index.column(), Qt::Horizontal, Qt::DisplayRole).toString().trimmed());
  return editor_;
}

// The model and the signals of a delegate belong to objects that are not const.
QWidget* CellDelegate::makeEdit(QWidget* parent, const CellStyle& cell, const QModelIndex& index) const {
  auto* edit = new CellEdit(parent);
  edit->setAlignment((cell.align == CellAlign::right ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignVCenter);
  if (cell.kind != CellKind::resultFile) return edit;
  auto* cells = const_cast<GridModel*>(&gridOf(index));
  auto* self = const_cast<CellDelegate*>(this);
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

QWidget* CellDelegate::makeList(QWidget* parent, const CellStyle& cell, const QModelIndex& index) const {
  auto* self = const_cast<CellDelegate*>(this);
  auto* list = new QComboBox(parent);
  const auto take = [self, list] {
    emit self->commitData(list);
    emit self->closeEditor(list);
  };
  if (cell.kind == CellKind::mapProjection) {
    for (const std::string& choice : gridOf(index).grid().OnStartEditing(index.row() + 1, index.column() + 1))
      list->addItem(QString::fromStdString(choice));
    auto* completer = new ProjectionCompleter(*list, new CellEdit(list));
    connect(completer, &ProjectionCompleter::chosen, self, [list, take](const QString& text) {
      list->setEditText(text);
      take();
    });
  }
  for (const std::string& choice : cell.choices) list->addItem(QString::fromStdString(choice));
  // The list shows its texts whole, also below a narrow cell.
  list->view()->setMinimumWidth(list->view()->sizeHintForColumn(0) + 3 * list->fontMetrics().height());
  // A choice counts at once, without a further key.
  connect(list, &QComboBox::activated, self, take);
  return list;
}

QWidget* CellDelegate::makeMultiChoice(QWidget* parent, const CellStyle& cell) const {
  auto* self = const_cast<CellDelegate*>(this);
  auto* choice = new MultiChoiceEditor(cell.choices, parent);
  connect(choice, &MultiChoiceEditor::finished, self, [self, choice](bool taken) {
    if (taken) emit self->commitData(choice);
    emit self->closeEditor(choice, taken ? NoHint : RevertModelCache);
  });
  return choice;
}

void CellDelegate::updateEditorGeometry(QWidget* editor, const QStyleOptionViewItem& option,
                                        const QModelIndex&) const {
  editor->setGeometry(option.rect.adjusted(0, 0, -1, -1));
}

// Once: what is typed since is the user's.
void CellDelegate::setEditorData(QWidget* editor, const QModelIndex& index) const {
  if (editor->property("filled").toBool()) return;
  editor->setProperty("filled", true);
  const QString text = index.data(Qt::EditRole).toString();
  if (auto* list = qobject_cast<QComboBox*>(editor)) {
    list->setCurrentText(text);
    if (list->isEditable()) list->lineEdit()->selectAll();
  } else if (auto* choice = qobject_cast<MultiChoiceEditor*>(editor)) {
    choice->setValue(text.toULongLong());
  } else if (auto* edit = qobject_cast<QLineEdit*>(editor)) {
    edit->setText(text);
  }
}

void CellDelegate::setModelData(QWidget* editor, QAbstractItemModel* model, const QModelIndex& index) const {
  auto* cells = static_cast<GridModel*>(model);
  const auto* list = qobject_cast<QComboBox*>(editor);
  const auto* choice = qobject_cast<MultiChoiceEditor*>(editor);
  CellEdit* edit = editOf(editor);
  const QString text = list != nullptr     ? list->currentText()
                       : choice != nullptr ? QString::number(choice->value())
                                           : edit->text();
  const bool isSame = text == index.data(Qt::EditRole).toString();
  // What the change leads to may close the grid.
  const QPersistentModelIndex at(index);
  const QPointer<CellEdit> alive(edit);
  const bool isProjection = cells->style(index).kind == CellKind::mapProjection;
  const bool taken = isSame || (isProjection ? storeProjection(*cells, index, *list)
                                             : cells->setData(index, text, Qt::EditRole));
  if (alive == nullptr) return;
  const QString why = taken || !at.isValid() ? QString() : refusal(text, at);
  edit->setFault(why);
  edit->setToolTip(why);
  edit->setAccessibleDescription(why);
}

void CellDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                         const QModelIndex& index) const {
  // A row without height: styles draw a button that has no room beside it, and what comes after too.
  if (option.rect.isEmpty()) return;
  const CellStyle cell = gridOf(index).style(index);
  const QPalette& palette = option.palette;
  const bool isHeader = cell.isHeader || cell.isHeading;
  const QRect rect = option.rect;
  QColor ground = groundOf(cell, palette);
  if (option.state.testFlag(QStyle::State_Selected) && !isHeader)
    ground = blend(ground, palette.color(QPalette::Active, QPalette::Highlight), 0.25);
  painter->fillRect(rect, ground);

  const QColor line = lineColour(palette);
  painter->fillRect(QRect(rect.right(), rect.top(), 1, rect.height()), line);
  painter->fillRect(QRect(rect.left(), rect.bottom(), rect.width(), 1), line);
  if (gridOf(index).grid().GetRowLook(index.row() + 1).lineBelow)
    painter->fillRect(QRect(rect.left(), rect.bottom() - 1, rect.width(), 2),
                      blend(line, palette.color(QPalette::Active, QPalette::Text), 0.45));

  const QColor text = palette.color(cell.enabled ? QPalette::Active : QPalette::Disabled, QPalette::Text);
  if (cell.kind == CellKind::button) {
    if (!cell.value.empty()) paintButton(painter, option, cell, pressed_ == index);
  } else if (cell.kind == CellKind::checkBox) {
    paintCheckBox(painter, option, cell);
  } else {
    if (hasList(cell.kind) && cell.editable()) paintArrow(painter, rect, text);
    QFont font = option.font;
    if (cell.isHeading) font.setWeight(QFont::DemiBold);
    painter->setFont(font);
    painter->setPen(text);
    const QString shown = shownText(cell);
    const QRect room = textRoom(rect, cell.editable() ? cell.kind : CellKind::plain);
    const Qt::Alignment align = cell.isHeader                    ? Qt::AlignHCenter
                                : cell.align == CellAlign::right ? Qt::AlignRight
                                                                 : Qt::AlignLeft;
    // Of a file's name the end tells more than the middle.
    const Qt::TextElideMode elide = shown.contains('/') ? Qt::ElideMiddle : Qt::ElideRight;
    if (cell.isHeader) {
      painter->drawText(room, static_cast<int>(align | Qt::AlignVCenter | Qt::TextWordWrap), shown);
    } else {
      painter->drawText(room, static_cast<int>(align | Qt::AlignVCenter),
                        QFontMetrics(font).elidedText(shown, elide, room.width()));
    }
  }
  if (option.state.testFlag(QStyle::State_HasFocus) && !isHeader) {
    painter->save();
    painter->setPen(QPen(palette.color(QPalette::Active, QPalette::Highlight), 2));
    painter->setBrush(Qt::NoBrush);
    painter->drawRect(rect.adjusted(1, 1, -2, -2));
    painter->restore();
  }
}

// A check box is set by a click anywhere in its cell, and by Space.
bool CellDelegate::editorEvent(QEvent* event, QAbstractItemModel* model, const QStyleOptionViewItem&,
                               const QModelIndex& index) {
  if (!model->flags(index).testFlag(Qt::ItemIsUserCheckable)) return false;
  if (event->type() == QEvent::KeyPress) {
    const int key = static_cast<QKeyEvent*>(event)->key();
    if (key != Qt::Key_Space && key != Qt::Key_Select) return false;
  } else if (event->type() != QEvent::MouseButtonRelease ||
             static_cast<QMouseEvent*>(event)->button() != Qt::LeftButton) {
    return false;
  }
  const bool isOn = index.data(Qt::CheckStateRole).toInt() == Qt::Checked;
  return model->setData(index, isOn ? Qt::Unchecked : Qt::Checked, Qt::CheckStateRole);
}

// A text that does not fit is told whole, with what the cell has to say.
bool CellDelegate::helpEvent(QHelpEvent* event, QAbstractItemView* view, const QStyleOptionViewItem& option,
                             const QModelIndex& index) {
  if (event->type() != QEvent::ToolTip || !index.isValid()) return false;
  const CellStyle cell = gridOf(index).style(index);
  QString tip = index.data(Qt::ToolTipRole).toString();
  const QString shown = shownText(cell);
  const bool isCut = option.fontMetrics.horizontalAdvance(shown) > textRoom(option.rect, cell.kind).width();
  if (isCut && cell.kind != CellKind::button && cell.kind != CellKind::multiChoice && !tip.contains(shown))
    tip = tip.isEmpty() ? shown : shown + '\n' + tip;
  QToolTip::showText(event->globalPos(), tip, view);
  return true;
}

}  // namespace gridbay::shell
