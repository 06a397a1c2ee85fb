#pragma once

#include <string>

#include "mud_transport_expanded/texts.h"
#include "pages/cell_grid.h"

namespace gridbay {

// A grid with a row for each grain size fraction.
class FractionGrid : public ColumnGrid {
 protected:
  std::string CornerHeader() override { return "Fraction"; }
  int RowHeaderWidth() override { return 100; }
  std::string RowHeader(GridRow row) override { return formatted(texts::fractionEntry, row.item); }
};

// A grid with a row for each layer of the bed.
class LayerGrid : public ColumnGrid {
 protected:
  std::string CornerHeader() override { return "Layer"; }
  int RowHeaderWidth() override { return 100; }
  std::string RowHeader(GridRow row) override { return formatted(texts::layerEntry, row.item); }
};

}  // namespace gridbay
