#include "pages/grid_wnd.h"

#include <cstdlib>

namespace gridbay {

int CV27SetupGridWnd::GetStyleRowCol(int row, int col, CellStyle& style) {
  style = {};
  if (rebuilding_) return 0;
  if (row == 0 || col == 0) {
    style.kind = CellKind::label;
    style.value = row == 0 ? GetColHeader(col) : GetRowHeader(row);
    return 1;
  }
  if (row < 0 || col < 0 || row > GetRowCount() || col > GetColCount()) return 0;
  if (!styleOf(row, col, style)) return 0;
  if (style.toolTip.empty() && toolTipColumns_.contains(col))
    style.toolTip = CVdDoc::GetToolTipsString(style.value);
  return 1;
}

int CV27SetupGridWnd::StoreStyleRowCol(int row, int col, std::string_view text) {
  if (rebuilding_) return 0;
  if (row == 0 || col == 0) return 1;
  CellStyle style;
  if (GetStyleRowCol(row, col, style) == 0 || !style.takesValue()) return 0;
  const std::size_t first = text.find_first_not_of(" \t");
  const std::string_view rest = first == text.npos ? std::string_view() : text.substr(first);
  const std::string trimmed(rest.substr(0, rest.find_last_not_of(" \t") + 1));
  page_->SetEditName(editName(row, col));
  const bool stored = storeCell(row, col, trimmed);
  if (stored) UpdateDoc();
  page_->SetEditName({});
  return stored ? 1 : 0;
}

void CV27SetupGridWnd::OnClickedButtonRowCol(int row, int col) {
  CellStyle style;
  if (GetStyleRowCol(row, col, style) == 0 || style.kind != CellKind::button || !style.enabled) return;
  page_->SetEditName(editName(row, col));
  buttonPressed(row, col);
  page_->SetEditName({});
}

bool CV27SetupGridWnd::ProcessKeys(GridKey key, int row, int col) {
  CellStyle style;
  if (key != GridKey::browse || GetStyleRowCol(row, col, style) == 0) return false;
  if (style.kind != CellKind::resultFile || !style.editable()) return false;
  CVdGridResultFileEditCtrl control(page_->document().host());
  setUpResultFile(row, col, control);
  if (control.ShowDialog(&style.value)) StoreStyleRowCol(row, col, style.value);
  return true;
}

std::vector<std::string> CV27SetupGridWnd::OnStartEditing(int row, int col) {
  CellStyle style;
  if (GetStyleRowCol(row, col, style) == 0 || style.kind != CellKind::mapProjection) return {};
  projection_.UpdateMapProjection(style.value);
  return projection_.choices();
}

void CV27SetupGridWnd::OnModifyCell(std::string_view text) {
  projection_.UpdateMapProjection(text);
}

std::string CV27SetupGridWnd::editName(int row, int col) {
  const std::string column = ShowsHeaders() ? GetColHeader(col) : std::string();
  if (!column.empty()) return GetRowHeader(row).empty() ? column : column + ", row " + GetRowHeader(row);
  for (const Control& control : page_->form().controls()) {
    if (control.grid == this) return control.name();
  }
  return {};
}

ColumnGrid::Column ColumnGrid::PointColumn(std::string_view header, int width,
                                           const std::function<GridPoint&(int item)>& point) {
  return {.header = std::string(header),
          .width = width,
          .get = [point](int item) { return pointText(point(item)); },
          .set =
              [point](int item, std::string_view text) {
                const std::optional<GridPoint> typed = pointOfText(text);
                if (typed) point(item) = *typed;
                return typed.has_value();
              }};
}

void ColumnGrid::SetColumns(int rowHeaderWidth, std::vector<Column> columns) {
  rowHeaderWidth_ = rowHeaderWidth;
  columns_ = std::move(columns);
}

bool ColumnGrid::styleOf(int row, int col, CellStyle& style) {
  const Column& it = column(col);
  style.kind = it.kind;
  style.align = it.align;
  style.choices = it.choices;
  if (it.get) style.value = it.get(row);
  if (it.kind == CellKind::button)
    style.value = it.header.empty() && !it.choices.empty() ? it.choices.front() : it.header;
  if (it.enabled && !it.enabled(row)) SetDisabled(style);
  if (it.readOnly && it.readOnly(row)) SetReadOnly(style);
  return true;
}

bool ColumnGrid::storeCell(int row, int col, std::string_view text) {
  const Column& it = column(col);
  return it.set && it.set(row, text);
}

void ColumnGrid::buttonPressed(int row, int col) {
  if (const Column& it = column(col); it.press) it.press(row);
}

int plainInteger(std::string_view text) {
  return std::atoi(std::string(text).c_str());
}

}  // namespace gridbay
