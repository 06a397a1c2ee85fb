#include "basic/mass_budget_page.h"

#include <fmt/format.h>

#include <algorithm>

#include "basic/basic_parts.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "pages/scan.h"

namespace gridbay {
namespace {

constexpr int kRowsAbove = 2;  // the area and the number of corners
constexpr int kMostCorners = 32767;

}  // namespace

int CMassBudgetGrid::GetColCount() {
  return parts<BasicParts>().moduleSelection->HasMassBudget() ? parts<BasicParts>().massBudget->GetCount()
                                                              : 0;
}
int CMassBudgetGrid::GetRowCount() {
  return kRowsAbove + (GetColCount() == 0 ? 0 : parts<BasicParts>().massBudget->GetMaxCorners());
}

std::string CMassBudgetGrid::GetRowHeader(int row) {
  if (row <= kRowsAbove) return row == 1 ? "Associated area" : "No. of corner points";
  return fmt::format("Corner point {}", row - kRowsAbove);
}

std::string CMassBudgetGrid::editName(int row, int col) {
  return fmt::format("Polygon {}, {}", col, GetRowHeader(row));
}

// One cell for each of the two rows above, and one for all corners.
void CMassBudgetGrid::LayOut() {
  const auto polygon = itemOf(&BasicParts::massBudget);
  const auto corner = [polygon](GridRow at) -> GridPoint* {
    auto& corners = polygon(at)->corners;
    const auto place = static_cast<std::size_t>(at.sub) - 1;
    return place < corners.size() ? &corners[place] : nullptr;
  };
  const auto setCount = [polygon](GridRow at, std::string_view text) {
    const std::optional<std::int32_t> number = scannedInteger(text);
    if (!number || *number < 0 || *number > kMostCorners) return Stored::refused;
    polygon(at)->corners.resize(static_cast<std::size_t>(*number), {1, 1});
    return Stored::taken;
  };
  Integer("", 0, polygon, &CMassBudgetItemKvs::associatedArea);
  Add({.get = [polygon](GridRow at) { return std::to_string(polygon(at)->corners.size()); },
       .set = setCount});
  Column& corners =
      Point("", 0, corner).OfArea([polygon](GridRow at) { return polygon(at)->associatedArea; });
  corners.get = [corner](GridRow at) {
    const GridPoint* point = corner(at);
    return point == nullptr ? std::string() : fmt::format("{},{}", point->j, point->k);
  };
  corners.set = [corner](GridRow at, std::string_view text) {
    GridPoint* held = corner(at);
    const std::optional<GridPoint> typed = scannedBarePoint(text);
    if (!typed || held == nullptr) return Stored::refused;
    *held = *typed;
    return Stored::taken;
  };
}

CellGrid::Place CMassBudgetGrid::placeOf(int row, int col) {
  const std::size_t cell = std::min<std::size_t>(static_cast<std::size_t>(row) - 1, kRowsAbove);
  return {&lines().front()[cell], {col, row - kRowsAbove}};
}

void CMassBudgetDlg::DoDataExchange(Form& form) {
  form.Count("&Number of polygons:", countOf(objectOf(&BasicParts::massBudget)), CMassBudgetKvs::kMostOnPage)
      .EnabledIf(
          [selection = objectOf(&BasicParts::moduleSelection)] { return selection().HasMassBudget(); });
  form.Grid("Polygons", grid_);
}

}  // namespace gridbay
