#include "pages/grid_wnd.h"

#include "pages/scan.h"

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
  if (!IsEnabled()) SetDisabled(style);
  if (style.toolTip.empty() && toolTipColumns_.contains(col))
    style.toolTip = CVdDoc::GetToolTipsString(style.value);
  return 1;
}

int CV27SetupGridWnd::StoreStyleRowCol(int row, int col, std::string_view text) {
  if (rebuilding_) return 0;
  if (row == 0 || col == 0) return 1;
  CellStyle style;
  if (GetStyleRowCol(row, col, style) == 0 || !style.takesValue()) return 0;
  return store(editName(row, col), [&] { return storeCell(row, col, std::string(trimmed(text))); });
}

int CV27SetupGridWnd::store(const std::string& name, const std::function<Stored()>& edit) {
  host_->SetEditName(name);
  Stored stored = Stored::refused;
  const bool done = document().Attempt([&] {
    stored = edit();
    if (stored == Stored::taken || stored == Stored::partly) UpdateDoc();
  });
  host_->SetEditName({});
  return done && (stored == Stored::taken || stored == Stored::same) ? 1 : 0;
}

std::optional<CellPick> CV27SetupGridWnd::PickRowCol(int row, int col) {
  CellStyle style;
  if (row < 1 || col < 1 || GetStyleRowCol(row, col, style) == 0) return std::nullopt;
  if (!style.enabled || style.readOnly || style.kind == CellKind::label) return std::nullopt;
  std::optional<CellPick> pick = pickOf(row, col);
  if (!pick) return std::nullopt;
  const std::string item = GetRowHeader(row);
  pick->name = pick->name.empty() ? editName(row, col)
               : item.empty()     ? pick->name
                                  : pick->name + ", row " + item;
  return pick;
}

int CV27SetupGridWnd::StorePickRowCol(int row, int col, std::span<const PickedPlace> places) {
  const std::optional<CellPick> pick = PickRowCol(row, col);
  if (!pick || places.size() < pick->least || places.size() > pick->most) return 0;
  return store(pick->name, [&] { return storePick(row, col, places); });
}

void CV27SetupGridWnd::OnClickedButtonRowCol(int row, int col) {
  CellStyle style;
  if (GetStyleRowCol(row, col, style) == 0 || style.kind != CellKind::button || !style.enabled) return;
  host_->SetEditName(editName(row, col));
  document().Attempt([&] { buttonPressed(row, col); });
  host_->SetEditName({});
}

bool CV27SetupGridWnd::ProcessKeys(GridKey key, int row, int col) {
  CellStyle style;
  if (key != GridKey::browse || GetStyleRowCol(row, col, style) == 0) return false;
  if (style.kind != CellKind::resultFile || !style.editable()) return false;
  CVdGridResultFileEditCtrl control(document().host());
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
  if (column.empty()) return host_->nameOf(*this).empty() ? "Cell" : host_->nameOf(*this);
  return GetRowHeader(row).empty() ? column : column + ", row " + GetRowHeader(row);
}

}  // namespace gridbay
