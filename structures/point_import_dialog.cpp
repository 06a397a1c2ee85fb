#include "structures/point_import_dialog.h"

#include "platform/units/units.h"
#include "structures/line_structure.h"
#include "structures/page_texts.h"

namespace gridbay {

CPointImportGrid::CPointImportGrid(Pairs& pairs) : PairGrid(pairs, "X", "Y", item::kGeographicalCoordinate) {}

CPointImportDlg::CPointImportDlg(CVdDoc& document, const std::vector<double>& x, const std::vector<double>& y)
    : PairDialog(document, texts::pointSelectionTitle.format, "Number of points", LineStructure::kMostPoints,
                 "Points", x, y) {}

}  // namespace gridbay
