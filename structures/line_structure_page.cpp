#include "structures/line_structure_page.h"

#include "platform/units/units.h"
#include "structures/level_width_dialog.h"
#include "structures/point_import_dialog.h"
#include "structures/structure_choices.h"

namespace gridbay {

std::string LineStructureGrid::editName(int row, int col) {
  const std::string& below = column(col).subHeader;
  return below.empty() ? ColumnGrid::editName(row, col) : below + ", row " + GetRowHeader(row);
}

void LineStructureGrid::PlaceColumns(const Structure& structure) {
  Text("Name", 90, structure, &LineStructure::name);
  const auto wanted = [structure](GridRow row) {
    const LineStructure& line = *structure(row);
    CellPick pick{.name = "Location",
                  .of = CellPick::Of::coordinates,
                  .projection = line.coordinateType,
                  .shape = CellPick::Shape::line,
                  .least = 2,
                  .most = LineStructure::kMostPoints};
    for (std::size_t i = 0; i < std::min(line.x.size(), line.y.size()); ++i)
      pick.held.push_back({.x = line.x[i], .y = line.y[i]});
    return std::optional(pick);
  };
  const auto take = [structure](GridRow row, std::span<const PickedPlace> places) {
    LineStructure& line = *structure(row);
    line.x.clear();
    line.y.clear();
    for (const PickedPlace& place : places) {
      line.x.push_back(place.x);
      line.y.push_back(place.y);
    }
    return Stored::taken;
  };
  Column& location = Button("...", 60, [this, structure](GridRow row) { editPoints(*structure(row)); });
  location.Picks({wanted, take}).header = "Location";
  // A full text is long, and there is room for its beginning only.
  Projection("Projection", 90, structure, &LineStructure::coordinateType).Tip([structure](GridRow row) {
    return CVdDoc::GetToolTipsString(structure(row)->coordinateType);
  });
}

void LineStructureGrid::ValveColumn(const Structure& structure) {
  List("Valve", 120, structure, &LineStructure::valve, valves());
}

void LineStructureGrid::AlphaZeroColumn(const Structure& structure) {
  Number("Alpha zero", 60, structure, &LineStructure::alphaZero, item::kWaterLevel);
}

void LineStructureGrid::HeadLossColumns(std::string_view header, std::span<const char* const> subHeaders,
                                        const std::function<double*(GridRow, std::size_t)>& factor) {
  for (std::size_t place = 0; place < subHeaders.size(); ++place) {
    const auto value = [factor, place](GridRow row) { return factor(row, place); };
    Number(place == 0 ? header : "", 65, value)
        .SubHeader(subHeaders[place])
        .HeaderSpan(place == 0 ? static_cast<int>(subHeaders.size()) : 1);
  }
}

Column& LineStructureGrid::LevelWidthColumn(const Structure& structure) {
  return Button("...", 65, [this, structure](GridRow row) { editLevelWidth(*structure(row)); });
}

void LineStructureGrid::editPoints(LineStructure& structure) {
  CPointImportDlg dialog(document(), structure.coordinateType, structure.x, structure.y);
  if (dialog.DoModal() != 1) return;
  dialog.OnOK(structure.x, structure.y);
  UpdateDoc();
}

void LineStructureGrid::editLevelWidth(LineStructure& structure) {
  CLWStructureDlg dialog(document(), structure.level, structure.width);
  if (dialog.DoModal() != 1) return;
  dialog.OnOK(structure.level, structure.width);
  UpdateDoc();
}

}  // namespace gridbay
