#pragma once

#include <QPointer>
#include <QStyledItemDelegate>

#include "pages/grid_wnd.h"

namespace gridbay::shell {

// Paints the cells of a grid, and makes their editors: an edit, a list for a drop-down or a map projection,
// an edit with a browse button, a list of marks for a multiple choice. Check boxes and buttons need none.
class CellDelegate final : public QStyledItemDelegate {
  Q_OBJECT
 public:
  using QStyledItemDelegate::QStyledItemDelegate;

  // The editor that is open, or null.
  QWidget* editor() const { return editor_; }
  void forgetEditor() { editor_ = nullptr; }
  // Whether the cell of the editor has gone, and the editor with it.
  bool isEditorLost() const { return editor_ != nullptr && !edited_.isValid(); }
  // The button that is held down.
  void setPressed(const QModelIndex& index) { pressed_ = index; }
  const QPersistentModelIndex& pressed() const { return pressed_; }
  // Room around the text of a cell, with the sign of its kind.
  static int aroundText(CellKind kind, const QFontMetrics& metrics);

  QWidget* createEditor(QWidget* parent, const QStyleOptionViewItem& option,
                        const QModelIndex& index) const override;
  void updateEditorGeometry(QWidget* editor, const QStyleOptionViewItem& option,
                            const QModelIndex& index) const override;
  void setEditorData(QWidget* editor, const QModelIndex& index) const override;
  void setModelData(QWidget* editor, QAbstractItemModel* model, const QModelIndex& index) const override;
  void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override;
  bool editorEvent(QEvent* event, QAbstractItemModel* model, const QStyleOptionViewItem& option,
                   const QModelIndex& index) override;
  bool helpEvent(QHelpEvent* event, QAbstractItemView* view, const QStyleOptionViewItem& option,
                 const QModelIndex& index) override;

 private:
  QWidget* makeEdit(QWidget* parent, const CellStyle& cell, const QModelIndex& index) const;
  QWidget* makeList(QWidget* parent, const CellStyle& cell, const QModelIndex& index) const;
  QWidget* makeMultiChoice(QWidget* parent, const CellStyle& cell) const;

  mutable QPointer<QWidget> editor_;
  mutable QPersistentModelIndex edited_;
  QPersistentModelIndex pressed_;
};

}  // namespace gridbay::shell
