#pragma once

#include <functional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "core/grid_point.h"
#include "pages/cell_controls.h"
#include "pages/form_view.h"

namespace gridbay {

// A multiple choice holds the sum of the bits of its choices: that of the n-th, from 0, is 2 to the power n.
enum class CellKind { plain, button, dropDown, checkBox, resultFile, mapProjection, label, multiChoice };
enum class CellAlign { left, right };
// Keys that mean something to a cell.
enum class GridKey { browse /* Ctrl+D */, other };

// One cell as it is painted: its value and look, taken from the model each time.
struct CellStyle {
  std::string value = {};
  CellKind kind = CellKind::plain;
  CellAlign align = CellAlign::left;
  std::vector<std::string> choices = {};
  std::string toolTip = {};
  bool enabled = true;
  bool readOnly = false;
  bool isHeading = false;  // stands over the rows below, across all columns
  bool isHeader = false;   // of a further row of headers
  int span = 1;            // columns that it covers, to the right

  // Whether the cell takes a value at all, and whether a user can type one.
  bool takesValue() const { return enabled && !readOnly && kind != CellKind::button; }
  bool editable() const { return takesValue() && kind != CellKind::label; }
};

// How a row stands out.
struct RowLook {
  double height = 1;  // in parts of a usual row's
  bool lineBelow = false;
};

// Base of all grids. Cells are not stored: each paint reads the model, and each edit goes there. Rows and
// columns count from 1; row 0 and column 0 are headers.
class CV27SetupGridWnd {
 public:
  CV27SetupGridWnd() = default;
  CV27SetupGridWnd(const CV27SetupGridWnd&) = delete;
  CV27SetupGridWnd& operator=(const CV27SetupGridWnd&) = delete;
  virtual ~CV27SetupGridWnd() = default;

  void SetParentPage(CV27SetupFormView* page) { page_ = page; }
  virtual void Initialize() {}

  virtual int GetRowCount() = 0;
  virtual int GetColCount() = 0;
  // Header text of a column or row, and the width of a column in pixels (0 is the row headers).
  virtual std::string GetColHeader(int col) = 0;
  virtual std::string GetRowHeader(int row) { return std::to_string(row); }
  virtual int GetColWidth(int col) = 0;
  virtual bool ShowsHeaders() const { return true; }
  // How many columns the header of a column covers, to the right; 0 for one that is covered.
  virtual int GetHeaderSpan(int) { return 1; }
  virtual RowLook GetRowLook(int) { return {}; }
  // False while the grid as a whole does not apply: it is greyed then, and takes nothing.
  virtual bool IsEnabled() { return true; }
  // The current cell has come to another row; 0 for none.
  virtual void OnCurrentRow(int) {}

  // Fills the cell's style; 1 when there is such a cell.
  virtual int GetStyleRowCol(int row, int col, CellStyle& style);
  // Stores an edited cell; 1 when the text was taken. Text that is no value is dropped, and the model's value
  // stands.
  virtual int StoreStyleRowCol(int row, int col, std::string_view text);
  // A press of the button in a cell.
  virtual void OnClickedButtonRowCol(int row, int col);

  // A click on a cell that is no button.
  virtual void OnLButtonHitRowCol(int, int) {}
  // Ctrl+D lets the user browse for the file of a result file cell; false for any other key or cell.
  virtual bool ProcessKeys(GridKey key, int row, int col);
  // Whether a user may drag the column wider: a hidden one stays hidden.
  virtual bool OnTrackColWidth(int col) { return GetColWidth(col) > 0; }

  // A cell with a map projection while it is edited: the list starts from what the cell holds, takes what is
  // picked, and stores it at the end. The first gives the list; empty for any other cell.
  virtual std::vector<std::string> OnStartEditing(int row, int col);
  virtual void OnModifyCell(std::string_view text);
  virtual int OnEndEditing(int row, int col) {
    return StoreStyleRowCol(row, col, projection_.GetMapProjection());
  }

  // Long values of a column are shown whole as tool tips.
  void EnableGridToolTips(int col) { toolTipColumns_.insert(col); }

  // While a grid is being laid out anew it gives and takes no cells.
  void SetRebuilding(bool rebuilding) { rebuilding_ = rebuilding; }

 protected:
  CKvsBase& GetKvs() { return page_->GetKvs(); }
  template <class Parts>
  Parts& parts() {
    return page_->parts<Parts>();
  }
  CV27SetupFormView& page() { return *page_; }
  int UpdateDoc() { return page_->UpdateDoc(); }
  static void SetDisabled(CellStyle& style) { style.enabled = false; }
  static void SetReadOnly(CellStyle& style) { style.readOnly = true; }

  // One cell of the data; false where there is none.
  virtual bool styleOf(int row, int col, CellStyle& style) = 0;
  // Takes a trimmed text; false when it is no value, with the model untouched.
  virtual bool storeCell(int row, int col, std::string_view text) = 0;
  virtual void buttonPressed(int, int) {}
  // Says what a result file cell is browsed for.
  virtual void setUpResultFile(int, int, CVdGridResultFileEditCtrl&) {}
  // What an edit of a cell is called.
  virtual std::string editName(int row, int col);

 private:
  CV27SetupFormView* page_ = nullptr;
  bool rebuilding_ = false;
  std::set<int> toolTipColumns_;
  CVdMapProjectionGXComboBox projection_;
};

// A grid with one row for each item of a list, whose columns are said once.
class ColumnGrid : public CV27SetupGridWnd {
 public:
  struct Column {
    std::string header;
    int width;
    CellKind kind = CellKind::plain;
    CellAlign align = CellAlign::left;
    std::function<std::string(int item)> get = {};
    std::function<bool(int item, std::string_view text)> set = {};
    std::function<bool(int item)> enabled = {};   // default: always
    std::function<bool(int item)> readOnly = {};  // default: never
    std::function<void(int item)> press = {};
    std::vector<std::string> choices = {};
  };

  int GetRowCount() override { return ItemCount(); }
  int GetColCount() override { return static_cast<int>(columns_.size()); }
  std::string GetColHeader(int col) override { return col == 0 ? "" : column(col).header; }
  int GetColWidth(int col) override { return col == 0 ? rowHeaderWidth_ : column(col).width; }

 protected:
  virtual int ItemCount() = 0;
  // A column of grid points, shown as "(3,4)"; a store takes "3,4" too.
  static Column PointColumn(std::string_view header, int width,
                            const std::function<GridPoint&(int item)>& point);
  void SetColumns(int rowHeaderWidth, std::vector<Column> columns);

  bool styleOf(int row, int col, CellStyle& style) override;
  bool storeCell(int row, int col, std::string_view text) override;
  void buttonPressed(int row, int col) override;

 private:
  const Column& column(int col) const { return columns_[static_cast<std::size_t>(col) - 1]; }

  int rowHeaderWidth_ = 30;
  std::vector<Column> columns_;
};

// Text of a cell as an integer, read as far as it is one: "12x" is 12, "x" is 0.
int plainInteger(std::string_view text);

}  // namespace gridbay
