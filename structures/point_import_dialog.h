#pragma once

#include <vector>

#include "structures/pair_dialog.h"

namespace gridbay {

class CPointImportGrid final : public PairGrid<double> {
 public:
  explicit CPointImportGrid(Pairs& pairs);
};

// The points of a polyline (metres, in the projection of the structure); OK copies them back.
class CPointImportDlg final : public PairDialog<double, CPointImportGrid> {
 public:
  CPointImportDlg(CVdDoc& document, const std::vector<double>& x, const std::vector<double>& y);
};

}  // namespace gridbay
