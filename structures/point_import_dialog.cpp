#include "structures/point_import_dialog.h"

#include "platform/units/units.h"
#include "structures/line_structure.h"
#include "structures/page_texts.h"

namespace gridbay {

CPointImportGrid::CPointImportGrid(Pairs& pairs) : PairGrid(pairs, "X", "Y", item::kGeographicalCoordinate) {}

Column::Pick CPointImportGrid::pairPick() {
  const auto wanted = [this](GridRow row) {
    const NumberPair<double>& held = pairAt(row);
    return std::optional(CellPick{.name = "Point",
                                  .of = CellPick::Of::coordinates,
                                  .projection = projection_,
                                  .held = {{.x = held.first, .y = held.second}}});
  };
  const auto take = [this](GridRow row, std::span<const PickedPlace> places) {
    pairAt(row) = {places.front().x, places.front().y};
    return Stored::taken;
  };
  return {wanted, take};
}

CPointImportDlg::CPointImportDlg(CVdDoc& document, const std::string& projection,
                                 const std::vector<double>& x, const std::vector<double>& y)
    : PairDialog(document, texts::pointSelectionTitle.format, "Number of points", LineStructure::kMostPoints,
                 "Points", x, y) {
  grid().SetProjection(projection);
}

}  // namespace gridbay
