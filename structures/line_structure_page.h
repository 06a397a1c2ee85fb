#pragma once

#include <functional>
#include <span>
#include <string>
#include <string_view>

#include "pages/cell_grid.h"
#include "structures/line_structure.h"

// What the pages of weirs and culverts have in common.

namespace gridbay {

// A grid with a row for each structure, below a second row of headers.
class LineStructureGrid : public ColumnGrid {
 protected:
  using Structure = std::function<LineStructure*(GridRow)>;

  int RowHeaderWidth() override { return 20; }
  std::string editName(int row, int col) override;

  // Name, polyline and projection.
  void PlaceColumns(const Structure& structure);
  void ValveColumn(const Structure& structure);
  void AlphaZeroColumn(const Structure& structure);
  // The factors of head losses, below one header for all. `factor` gives that of a row by its place.
  void HeadLossColumns(std::string_view header, std::span<const char* const> subHeaders,
                       const std::function<double*(GridRow, std::size_t)>& factor);
  // The button for the table of levels and widths.
  Column& LevelWidthColumn(const Structure& structure);

 private:
  void editPoints(LineStructure& structure);
  void editLevelWidth(LineStructure& structure);
};

// The count of a list of structures; one below 0 is taken for 0.
template <class Access>
Control& AddStructureCount(Form& form, std::string_view label, Access list) {
  Binding<std::int32_t> count = countOf(list);
  count.set = [list](std::int32_t wanted) { list().SetCount(std::max(wanted, 0)); };
  Control& control = form.Count(label, count, LineStructure::kMost, LineStructure::kMost,
                                std::numeric_limits<std::int32_t>::min());
  control.spinLowest = 0;
  return control;
}

}  // namespace gridbay
