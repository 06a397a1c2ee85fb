#include "structures/level_width_dialog.h"

#include "platform/units/units.h"
#include "structures/line_structure.h"
#include "structures/page_texts.h"

namespace gridbay {

CStructureGrid::CStructureGrid(Pairs& pairs) : PairGrid(pairs, "Level", "Width", item::kLevel) {}

CLWStructureDlg::CLWStructureDlg(CVdDoc& document, const std::vector<float>& level,
                                 const std::vector<float>& width)
    : PairDialog(document, texts::levelWidthTitle.format, "Number of measures", LineStructure::kMostMeasures,
                 "Measures", level, width) {}

}  // namespace gridbay
