#pragma once

#include <cmath>
#include <cstdint>
#include <deque>
#include <functional>
#include <limits>
#include <optional>
#include <string>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

#include "core/grid_point.h"
#include "pages/binding.h"
#include "pages/choices.h"
#include "pages/file_choice.h"
#include "pages/grid_row.h"
#include "pages/grid_wnd.h"

namespace gridbay {

// The cells of a column, or of a line in a block: what they show, take and look like, each by its row.
struct Column {
  using Rule = std::function<bool(GridRow)>;

  std::string header = {};
  int width = 0;
  CellKind kind = CellKind::plain;
  CellAlign align = CellAlign::left;
  std::function<std::string(GridRow)> get = {};
  std::function<Stored(GridRow, std::string_view)> set = {};  // none: the cell is only read
  std::function<void(GridRow)> press = {};
  std::function<void(GridRow)> stored = {};  // what follows from an edit that was taken
  ByRow<Choices> choices = {};
  ByRow<FileKind> fileKind = {};  // of a result file
  Rule enabled = {};              // default: always
  Rule readOnly = {};             // default: never
  std::function<std::string(GridRow)> tip = {};
  std::function<void(GridRow, CellStyle&)> look = {};  // the last word
  std::function<int()> widthNow = {};                  // where it changes; 0 for a hidden column
  std::string subHeader = {};                          // in the second row of headers
  int headerSpan = 1;                                  // columns that the header covers

  // How the points of the cell, and of those that hold the rest of them, are pointed at on a map.
  struct Pick {
    std::function<std::optional<CellPick>(GridRow)> wanted = {};
    std::function<Stored(GridRow, std::span<const PickedPlace>)> take = {};
  };
  Pick pick = {};

  Column& Right() {
    align = CellAlign::right;
    return *this;
  }
  // Grey, as what is not edited here.
  Column& Static() {
    kind = CellKind::label;
    return Look([](GridRow, CellStyle& style) { style.isGrey = true; });
  }
  Column& EnabledIf(Rule rule) {
    enabled = std::move(rule);
    return *this;
  }
  Column& ReadOnlyIf(Rule rule) {
    readOnly = std::move(rule);
    return *this;
  }
  Column& Tip(std::function<std::string(GridRow)> text) {
    tip = std::move(text);
    return *this;
  }
  Column& Look(std::function<void(GridRow, CellStyle&)> style) {
    look = std::move(style);
    return *this;
  }
  Column& Then(std::function<void(GridRow)> follows) {
    stored = std::move(follows);
    return *this;
  }
  Column& WidthBy(std::function<int()> pixels) {
    widthNow = std::move(pixels);
    return *this;
  }
  Column& Picks(Pick how) {
    pick = std::move(how);
    return *this;
  }
  // Whose points a cell of a point takes, where it is not Area 1; and whether these are of its border alone.
  Column& OfArea(std::function<std::int32_t(GridRow)> area);
  Column& OnBorder();
  Column& SubHeader(std::string_view text) {
    subHeader = text;
    return *this;
  }
  Column& HeaderSpan(int columns) {
    headerSpan = columns;
    return *this;
  }
};

// The three columns of a file: its name, the button to choose it, the one to look at it. By the rule all
// three are enabled, the last where there is such a file.
struct FileColumns {
  FileChoice file;
  std::string_view header = "File Name";
  int width = 210;
  int browseWidth = 30;
  int viewWidth = 45;  // 0: there is no such column
  std::string_view browse = "  ...  ";
  std::string_view view = "View...";
  Column::Rule enabled = {};
};

// A grid whose cells are listed once, each bound to what it edits. A value is named by a function of the row
// that gives it, or that gives its object, and then the member:
//
//   Number("Value", 60, item, &Item::value, item::kWaterLevel).EnabledIf(isConstant);
//
// Where the function gives a null pointer there is no such cell, which is then blank and disabled.
class CellGrid : public CV27SetupGridWnd {
 public:
  void Initialize() override { OnRefresh(); }
  void OnRefresh() override { stale_ = true; }

 protected:
  // Lists the cells. It runs again when the model is shown anew, and when the key is another one: the count
  // that columns follow.
  virtual void LayOut() = 0;
  virtual int LayoutKey() { return 0; }

  struct Place {
    const Column* cell = nullptr;
    GridRow row;
  };
  // What is said of the cell; none where there is nothing.
  virtual Place placeOf(int row, int col) = 0;

  // The lines of cells, laid out.
  const std::vector<std::deque<Column>>& lines();
  // Starts another line of a block.
  void NewLine() { lines_.emplace_back(); }

  // A function that gives the item of a list by its row, where the list is a member that a room has in the
  // root.
  template <class Parts, class Pointer>
  auto itemOf(Pointer Parts::*list) {
    return [this, list](GridRow row) { return (parts<Parts>().*list)->GetItem(row.item); };
  }
  // The same for the list whose items the grid has rows for.
  template <class Parts, class Pointer>
  auto RowsOf(Pointer Parts::*list) {
    Rows([this, list] { return (parts<Parts>().*list)->GetCount(); });
    return itemOf(list);
  }
  void Rows(std::function<int()> count) { count_ = std::move(count); }
  int ItemCount() {
    lines();
    return count_ ? count_() : 0;
  }

  // Cells of any kind.
  Column& Add(Column column);
  // Text worked out, and text in a cell that is never edited.
  Column& Shown(std::string_view header, int width, std::function<std::string(GridRow)> text);
  Column& Label(ByRow<std::string> text);
  Column& Button(std::string_view face, int width, std::function<void(GridRow)> press);

  // A number with a quantity, shown in the user's unit, "%f"; the tool tip names the unit.
  template <class Access>
  Column& Number(std::string_view header, int width, Access value, ByRow<int> quantity = 0) {
    using Real = ValueOf<Access>;
    return Number(
        header, width, RealGetter([value](GridRow row) -> std::optional<double> {
          const Real* held = pointerTo(value(row));
          return held == nullptr ? std::nullopt : std::optional(double{*held});
        }),
        [value](GridRow row, double typed) {
          if (!(std::abs(typed) <= std::numeric_limits<Real>::max())) return false;
          *pointerTo(value(row)) = static_cast<Real>(typed);
          return true;
        },
        std::move(quantity));
  }
  template <class Access, class Owner, class Real>
  Column& Number(std::string_view header, int width, Access object, Real Owner::*member,
                 ByRow<int> quantity = 0) {
    return Number(header, width, through(object, member), std::move(quantity));
  }
  // The same for a number that is worked out, in the base unit; false for one that is not taken.
  using RealGetter = std::function<std::optional<double>(GridRow)>;
  using RealSetter = std::function<bool(GridRow, double)>;
  Column& Number(std::string_view header, int width, RealGetter get, RealSetter set, ByRow<int> quantity = 0);

  // An integer, "%d", read from the front of the text; read plainly, a text that is none is 0.
  template <class Access>
  Column& Integer(std::string_view header, int width, Access value) {
    return addInteger(header, width, integerOf(value), setterOf(value), false);
  }
  template <class Access, class Owner, class Member>
  Column& Integer(std::string_view header, int width, Access object, Member Owner::*member) {
    return Integer(header, width, through(object, member));
  }
  template <class Access, class Owner, class Member>
  Column& PlainInteger(std::string_view header, int width, Access object, Member Owner::*member) {
    const auto value = through(object, member);
    return addInteger(header, width, integerOf(value), setterOf(value), true);
  }

  template <class Access>
  Column& Text(std::string_view header, int width, Access value) {
    return addText(header, width, [value](GridRow row) -> std::string* { return pointerTo(value(row)); });
  }
  template <class Access, class Owner>
  Column& Text(std::string_view header, int width, Access object, std::string Owner::*member) {
    return Text(header, width, through(object, member));
  }
  // A text with the list of map projections.
  template <class Access, class Owner>
  Column& Projection(std::string_view header, int width, Access object, std::string Owner::*member) {
    Column& column = Text(header, width, object, member);
    column.kind = CellKind::mapProjection;
    return column;
  }

  // A drop-down list of choices.
  using Getter = std::function<std::optional<std::int32_t>(GridRow)>;
  using Setter = std::function<void(GridRow, std::int32_t)>;
  Column& List(std::string_view header, int width, Getter get, Setter set, ByRow<Choices> choices);
  template <class Access, class Owner, class Member>
  Column& List(std::string_view header, int width, Access object, Member Owner::*member,
               ByRow<Choices> choices) {
    const auto value = through(object, member);
    return List(header, width, integerOf(value), setterOf(value), std::move(choices));
  }
  // A choice of several: the sum of their bits.
  Column& MultiChoice(std::string_view header, int width, std::function<std::int64_t(GridRow)> get,
                      std::function<void(GridRow, std::int64_t)> set, ByRow<Choices> choices);
  template <class Access>
  Column& Check(std::string_view header, int width, Access value) {
    return addCheck(header, width, integerOf(value), setterOf(value));
  }
  template <class Access, class Owner, class Member>
  Column& Check(std::string_view header, int width, Access object, Member Owner::*member) {
    return Check(header, width, through(object, member));
  }

  // A grid point as "(3,14)"; "3,14" is taken too.
  template <class Access>
  Column& Point(std::string_view header, int width, Access value) {
    return addPoint(header, width, [value](GridRow row) -> GridPoint* { return pointerTo(value(row)); });
  }
  template <class Access, class Owner>
  Column& Point(std::string_view header, int width, Access object, GridPoint Owner::*member) {
    return Point(header, width, through(object, member));
  }
  // First, last and interval as "0-100,5", or first and last alone.
  using RangeGetter = std::function<std::optional<USubLine>(GridRow)>;
  Column& Range(std::string_view header, int width, RangeGetter get,
                std::function<void(GridRow, const USubLine&)> set, bool hasInterval = true);
  template <class Access>
  requires std::is_same_v<std::remove_cvref_t<decltype(*pointerTo(std::declval<Access>()(GridRow{})))>,
                          USubLine>
      Column& Range(std::string_view header, int width, Access value, bool hasInterval = true) {
    return Range(
        header, width,
        [value](GridRow row) -> std::optional<USubLine> {
          const USubLine* held = pointerTo(value(row));
          return held == nullptr ? std::nullopt : std::optional(*held);
        },
        [value](GridRow row, const USubLine& typed) { *pointerTo(value(row)) = typed; }, hasInterval);
  }

  // The pick of the columns that hold the ranges of a part of a grid along J and K; a line has no width.
  static Column::Pick partPick(std::function<USubArea*(GridRow)> part,
                               std::function<std::int32_t(GridRow)> area,
                               std::function<bool(GridRow)> isLine = {});

  // The columns of a file, together or one by one. The first gives that of the name.
  Column& File(const FileColumns& columns);
  Column& FileName(std::string_view header, int width, const FileChoice& file);
  Column& Browse(std::string_view face, int width, const FileChoice& file);
  Column& View(std::string_view face, int width, const FileChoice& file, Column::Rule enabled = {});
  // The name of a file that the engine makes, with a dialog of its own for Ctrl+D.
  Column& ResultFile(std::string_view header, int width, const FileChoice& file);

  bool styleOf(int row, int col, CellStyle& style) override;
  Stored storeCell(int row, int col, std::string_view text) override;
  void buttonPressed(int row, int col) override;
  std::optional<CellPick> pickOf(int row, int col) override;
  Stored storePick(int row, int col, std::span<const PickedPlace> places) override;
  void setUpResultFile(int row, int col, CVdGridResultFileEditCtrl& control) override;

 private:
  template <class Access>
  using ValueOf = std::remove_cvref_t<decltype(*pointerTo(std::declval<Access>()(GridRow{})))>;

  template <class Access, class Owner, class Member>
  static auto through(Access object, Member Owner::*member) {
    return [object, member](GridRow row) -> Member* {
      auto* owner = pointerTo(object(row));
      return owner == nullptr ? nullptr : &(owner->*member);
    };
  }
  template <class Access>
  static Getter integerOf(Access value) {
    return [value](GridRow row) -> std::optional<std::int32_t> {
      const auto* held = pointerTo(value(row));
      return held == nullptr ? std::nullopt : std::optional(static_cast<std::int32_t>(*held));
    };
  }
  template <class Access>
  static Setter setterOf(Access value) {
    return [value](GridRow row, std::int32_t typed) {
      *pointerTo(value(row)) = static_cast<ValueOf<Access>>(typed);
    };
  }

  Column& addInteger(std::string_view header, int width, Getter get, Setter set, bool plainly);
  Column& addText(std::string_view header, int width, std::function<std::string*(GridRow)> text);
  Column& addCheck(std::string_view header, int width, Getter get, Setter set);
  Column& addPoint(std::string_view header, int width, std::function<GridPoint*(GridRow)> point);

  std::function<int()> count_;
  std::vector<std::deque<Column>> lines_;
  bool stale_ = true;
  int key_ = 0;
};

// A grid with a row for each item, below a second row of headers where columns have such.
class ColumnGrid : public CellGrid {
 public:
  int GetRowCount() override { return headerRows() + dataRows(); }
  int GetColCount() override { return static_cast<int>(columns().size()); }
  std::string GetColHeader(int col) override { return col == 0 ? CornerHeader() : column(col).header; }
  std::string GetRowHeader(int row) override;
  int GetColWidth(int col) override;
  int GetHeaderSpan(int col) override;

 protected:
  virtual std::string CornerHeader() { return {}; }
  virtual int RowHeaderWidth() { return 30; }
  virtual std::string RowHeader(GridRow row) { return std::to_string(row.item); }

  // The rows below the headers, and what the n-th of them, from 1, stands for.
  virtual int dataRows() { return ItemCount(); }
  virtual GridRow rowAt(int n) { return {n, 0}; }
  int headerRows();

  bool styleOf(int row, int col, CellStyle& style) override;
  Stored storeCell(int row, int col, std::string_view text) override;
  Place placeOf(int row, int col) override { return {&column(col), rowAt(row - headerRows())}; }
  std::optional<CellPick> pickOf(int row, int col) override;

  const std::deque<Column>& columns() { return lines().front(); }
  const Column& column(int col) { return columns()[static_cast<std::size_t>(col) - 1]; }
};

// A grid with a band for each item: a row with its title, which is row 0 of the band, and its rows, as many
// as the item has at present.
class BandedGrid : public ColumnGrid {
 public:
  RowLook GetRowLook(int row) override;

 protected:
  virtual int BandSize(int item) = 0;
  virtual std::string BandTitle(int item) = 0;
  // Whether the first row of a band has cells as the others have, in place of a title across all columns.
  virtual bool TitleHasCells() { return false; }
  std::string RowHeader(GridRow row) override { return row.sub == 0 ? "" : std::to_string(row.sub); }

  int dataRows() override;
  GridRow rowAt(int n) override;
  bool styleOf(int row, int col, CellStyle& style) override;

 private:
  bool isTitle(int row) {
    return row > headerRows() && rowAt(row - headerRows()).sub == 0 && !TitleHasCells();
  }
};

// A grid with a block of lines for each item, the cells of each line said by themselves. It shows no headers.
class BlockGrid : public CellGrid {
 public:
  int GetRowCount() override { return static_cast<int>(lines().size()) * ItemCount(); }
  int GetColCount() override { return static_cast<int>(Widths().size()); }
  std::string GetColHeader(int) override { return {}; }
  std::string GetRowHeader(int) override { return {}; }
  int GetColWidth(int col) override { return col == 0 ? 0 : Widths()[static_cast<std::size_t>(col) - 1]; }
  bool ShowsHeaders() const override { return false; }
  RowLook GetRowLook(int row) override { return {.lineBelow = row % static_cast<int>(lines().size()) == 0}; }

 protected:
  virtual std::vector<int> Widths() const = 0;
  // The item of a row and its line in the block, both from 1.
  GridRow rowAt(int row);
  Place placeOf(int row, int col) override;
};

}  // namespace gridbay
