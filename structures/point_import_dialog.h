#pragma once

#include <string>
#include <utility>
#include <vector>

#include "structures/pair_dialog.h"

namespace gridbay {

class CPointImportGrid final : public PairGrid<double> {
 public:
  explicit CPointImportGrid(Pairs& pairs);
  // That the points are in.
  void SetProjection(std::string projection) { projection_ = std::move(projection); }

 private:
  Column::Pick pairPick() override;

  std::string projection_;
};

// The points of a polyline (metres, in the projection of the structure); OK copies them back.
class CPointImportDlg final : public PairDialog<double, CPointImportGrid> {
 public:
  CPointImportDlg(CVdDoc& document, const std::string& projection, const std::vector<double>& x,
                  const std::vector<double>& y);
};

}  // namespace gridbay
