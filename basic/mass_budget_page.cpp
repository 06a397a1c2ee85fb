#include "basic/mass_budget_page.h"

#include <fmt/format.h>

#include <cstdio>

#include "basic/mass_budget.h"
#include "basic/module_selection.h"

namespace gridbay {
namespace {

constexpr int kAreaRow = 1;
constexpr int kCountRow = 2;
constexpr int kMostCorners = 32767;

}  // namespace

int CMassBudgetGrid::GetColCount() {
  return CMassBudgetDlg::IsAvailable(parts<BasicParts>()) ? parts<BasicParts>().massBudget->GetCount() : 0;
}
int CMassBudgetGrid::GetRowCount() {
  return kCountRow + (GetColCount() == 0 ? 0 : parts<BasicParts>().massBudget->GetMaxCorners());
}

std::string CMassBudgetGrid::GetRowHeader(int row) {
  if (row == kAreaRow) return "Associated area";
  return row == kCountRow ? "No. of corner points" : fmt::format("Corner point {}", row - kCountRow);
}

int CMassBudgetGrid::GetColWidth(int col) {
  constexpr int kHeaderWidth = 130;
  constexpr int kWidth = 70;
  return col == 0 ? kHeaderWidth : kWidth;
}

bool CMassBudgetGrid::styleOf(int row, int col, CellStyle& style) {
  const CMassBudgetItemKvs* polygon = parts<BasicParts>().massBudget->GetItem(col);
  if (polygon == nullptr) return false;
  const auto corner = static_cast<std::size_t>(row - kCountRow - 1);
  if (row == kAreaRow) {
    style.value = std::to_string(polygon->associatedArea);
  } else if (row == kCountRow) {
    style.value = std::to_string(polygon->corners.size());
  } else if (corner < polygon->corners.size()) {
    style.value = fmt::format("{},{}", polygon->corners[corner].j, polygon->corners[corner].k);
  } else {
    SetDisabled(style);
  }
  return true;
}

bool CMassBudgetGrid::storeCell(int row, int col, std::string_view text) {
  CMassBudgetItemKvs& polygon = *parts<BasicParts>().massBudget->GetItem(col);
  const std::string typed(text);
  GridPoint point;
  int number = 0;
  if (row > kCountRow) {
    if (std::sscanf(typed.c_str(), "%d,%d", &point.j, &point.k) != 2) return false;
    polygon.corners[static_cast<std::size_t>(row - kCountRow - 1)] = point;
    return true;
  }
  if (std::sscanf(typed.c_str(), "%d", &number) != 1) return false;
  if (row == kAreaRow) {
    polygon.associatedArea = number;
    return true;
  }
  if (number < 0 || number > kMostCorners) return false;
  polygon.corners.resize(static_cast<std::size_t>(number), {1, 1});
  return true;
}

std::string CMassBudgetGrid::editName(int row, int col) {
  return fmt::format("Polygon {}, {}", col, GetRowHeader(row));
}

bool CMassBudgetDlg::IsAvailable(BasicParts& basic) {
  const std::int32_t code = basic.moduleSelection->simulationType;
  const std::int32_t scheme = basic.moduleSelection->adScheme;
  return (code == module::kAdvectionDispersion || code == module::kMudTransportExpanded ||
          code == module::kEcological) &&
         (scheme == 1 || scheme == -1);
}

void CMassBudgetDlg::DoDataExchange(Form& form) {
  AddCount(form, "&Number of polygons:", number_, CMassBudgetKvs::kMostOnPage,
           [this] { return parts<BasicParts>().massBudget->GetCount(); });
  form.DDX_Control("Polygons", grid_);
}

int CMassBudgetDlg::Initialize() {
  SetUpGrid("Polygons");
  return 1;
}

void CMassBudgetDlg::SetData() {
  number_ = parts<BasicParts>().massBudget->GetCount();
  form().of(&number_).enabled = IsAvailable(parts<BasicParts>());
  UpdateData(false);
}

int CMassBudgetDlg::GetData() {
  if (!UpdateData(true)) return 0;
  if (number_ >= 0 && number_ <= CMassBudgetKvs::kMostOnPage)
    parts<BasicParts>().massBudget->SetNoPolygons(number_);
  return 1;
}

}  // namespace gridbay
