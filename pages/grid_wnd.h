#pragma once

#include <functional>
#include <optional>
#include <set>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "pages/cell_controls.h"
#include "pages/form_view.h"
#include "pages/grid_host.h"
#include "pages/map_pick.h"

namespace gridbay {

// A multiple choice holds the sum of the bits of its choices: that of the n-th, from 0, is 2 to the power n.
enum class CellKind { plain, button, dropDown, checkBox, resultFile, mapProjection, label, multiChoice };
enum class CellAlign { left, right };
// Keys that mean something to a cell.
enum class GridKey { browse /* Ctrl+D */, other };
// What has become of a text: the model has it; it is what the model had before; it is none, and the model is
// as it was; it is none, and yet a part of it is in the model.
enum class Stored { taken, same, refused, partly };

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
  bool isGrey = false;     // on a grey ground, though what it shows holds
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

  // The page or dialog that the grid stands on.
  void SetParentPage(GridHost* host) { host_ = host; }
  virtual void Initialize() {}
  // The model is shown anew.
  virtual void OnRefresh() {}

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
  virtual bool IsEnabled() { return enabled_; }
  void SetEnabled(bool enabled) { enabled_ = enabled; }
  // The current cell has come to another row; 0 for none.
  virtual void OnCurrentRow(int) {}
  // The row that the grid itself has as the current one, 0 for none; nothing where that is no concern of it.
  virtual std::optional<int> CurrentRow() { return std::nullopt; }

  // Fills the cell's style; 1 when there is such a cell.
  virtual int GetStyleRowCol(int row, int col, CellStyle& style);
  // Stores an edited cell; 1 when the text was taken. Text that is no value is dropped, and the model's value
  // stands.
  virtual int StoreStyleRowCol(int row, int col, std::string_view text);
  // A press of the button in a cell.
  virtual void OnClickedButtonRowCol(int row, int col);

  // What can be pointed at on a map for the cell; nothing where that takes no points at present.
  virtual std::optional<CellPick> PickRowCol(int row, int col);
  // Stores the places in the cell and in those that hold the rest of the same points, as one edit; 1 when
  // they were taken.
  virtual int StorePickRowCol(int row, int col, std::span<const PickedPlace> places);

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
  GridHost& host() { return *host_; }
  CVdDoc& document() { return host_->document(); }
  CKvsBase& GetKvs() { return host_->GetKvs(); }
  template <class Parts>
  Parts& parts() {
    return host_->parts<Parts>();
  }
  int UpdateDoc() { return host_->UpdateDoc(); }
  static void SetDisabled(CellStyle& style) { style.enabled = false; }
  static void SetReadOnly(CellStyle& style) { style.readOnly = true; }

  // What the operations above ask for a cell that is there. A store gets the trimmed text.
  virtual bool styleOf(int row, int col, CellStyle& style) = 0;
  virtual Stored storeCell(int row, int col, std::string_view text) = 0;
  virtual void buttonPressed(int, int) {}
  // The name is left empty where it is that of the cell alone.
  virtual std::optional<CellPick> pickOf(int, int) { return std::nullopt; }
  virtual Stored storePick(int, int, std::span<const PickedPlace>) { return Stored::refused; }
  // What the browsing of a result file cell is for.
  virtual void setUpResultFile(int, int, CVdGridResultFileEditCtrl&) {}
  // What an edit of the cell is called: its column and row, or the name of the grid where it shows no
  // headers.
  virtual std::string editName(int row, int col);

 private:
  int store(const std::string& name, const std::function<Stored()>& edit);

  GridHost* host_ = nullptr;
  bool enabled_ = true;
  bool rebuilding_ = false;
  std::set<int> toolTipColumns_;
  CVdMapProjectionGXComboBox projection_;
};

}  // namespace gridbay
