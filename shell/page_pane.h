#pragma once

#include <QPersistentModelIndex>
#include <QPointer>
#include <QScrollArea>
#include <memory>
#include <optional>
#include <span>
#include <vector>

#include "core/page_place.h"
#include "pages/field_picks.h"
#include "shell/fields/accelerators.h"
#include "shell/fields/field.h"
#include "shell/fields/field_layout.h"

class QLineEdit;

namespace gridbay::shell {

class GridView;

// The one renderer of all pages: builds widgets from a form, hands what the user does to it, and shows what
// it says.
class PagePane final : public QScrollArea {
  Q_OBJECT
 public:
  explicit PagePane(QWidget* parent);

  // What is shown from now on can be read only; its form says the same of its controls.
  void setReadOnly(bool readOnly) { readOnly_ = readOnly; }
  // With no caption there is none above the form. The picks of its fields, if any, stay for as long as it.
  void showForm(const QString& caption, Form& form, std::span<const FieldPick> picks = {});
  void showText(const QString& caption, const QString& text);
  // A picture in the whole pane, or a text in its middle where there is no picture.
  void showPicture(const QString& path, const QString& text);
  // Hands over what is typed and shows nothing: to be called before the form that is shown goes.
  void clear();
  // Brings the widgets in line with the form. Where the user is at work, nothing moves.
  void refresh();
  // Hands over what is typed and not yet entered.
  void commit();
  // The input of the n-th control of a label; null when there is none.
  QWidget* widgetOf(const QString& label, int n = 1) const;

  // The n-th table, from 1; null where there is none.
  GridView* tableAt(int n) const;
  // Brings a place of the page into view, and makes its cell the current one, where it is in a table. The
  // input or table that it is in, for who wants the focus there; null where there is none.
  QWidget* goTo(const PagePlace& place);
  // The cell that was last at work: its table, and row and column in it (from 1, without headers), with the
  // number of rows that the table has. Row 0 for none.
  struct Cell {
    int table = 0;
    int row = 0;
    int column = 0;
    int rows = 0;
  };
  Cell currentCell() const;
  // A cell of a table, or fields, that hold points which can be pointed at on a map.
  struct PointPlace {
    QPersistentModelIndex cell{};
    const FieldPick* fields = nullptr;
    bool operator==(const PointPlace&) const = default;
  };
  // The one that is at work.
  std::optional<PointPlace> pointPlace() const;
  // Whether there is any.
  bool hasPoints() const;
  // What is pointed at for it, and the storing of that; nothing for one that is gone.
  std::optional<CellPick> pick(const PointPlace& place) const;
  bool storePick(const PointPlace& place, std::span<const PickedPlace> places);

  // The whole page, as far as the screen has the room.
  QSize sizeHint() const override;

 signals:
  // Another cell of a table is at work, or other fields that hold points.
  void cellChosen();
  // The points of the cell or fields that are at work are to be pointed at on a map. Who never hears of it
  // has no map.
  void pickWanted();

 private:
  bool eventFilter(QObject* watched, QEvent* event) override;

  // A control with what shows it: a field, a table, a frame, or a heading.
  struct Part {
    Control* control;
    QWidget* widget;
    std::unique_ptr<Field> field = {};
    GridView* grid = nullptr;
  };
  QWidget* widgetAt(const PagePlace& place) const;
  Part makePart(Control& control, QWidget* parent, bool hasBody);
  void place(const Part& part, FieldLayout& layout, bool beside);
  void connectField(Field& field, FieldLayout& layout);
  void setTabOrder();
  void refreshGroup(const Part& part, bool isShown);
  QWidget* startPage(const QString& caption);
  void changed(Control& control);
  void offerPick(GridView& grid, QPoint at);
  void offerPick(QLineEdit& edit, QPoint at);
  bool isPickHeard() const;

  Form* form_ = nullptr;
  std::span<const FieldPick> picks_;
  std::vector<Part> parts_;
  QPointer<GridView> lastGrid_;
  const FieldPick* lastFields_ = nullptr;  // where fields are at work and no table
  Accelerators keys_;
  bool refreshing_ = false;
  bool readOnly_ = false;
};

}  // namespace gridbay::shell
