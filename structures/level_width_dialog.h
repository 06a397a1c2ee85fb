#pragma once

#include <vector>

#include "structures/pair_dialog.h"

namespace gridbay {

class CStructureGrid final : public PairGrid<float> {
 public:
  explicit CStructureGrid(Pairs& pairs);
};

// The table of levels and widths (metres) of a structure; OK copies it back.
class CLWStructureDlg final : public PairDialog<float, CStructureGrid> {
 public:
  CLWStructureDlg(CVdDoc& document, const std::vector<float>& level, const std::vector<float>& width);
};

}  // namespace gridbay
