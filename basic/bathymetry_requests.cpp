#include "basic/bathymetry_requests.h"

#include <cmath>

#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr int kHotStartDataType = 11;
constexpr double kSpacingTolerance = 0.01;

bool isMultiple(int fine, int coarse) {
  return coarse > 0 && fine % coarse == 0;
}

// Whether cells of the fine spacing fill those of the coarse one; the counts are multiples by then.
bool spacingFits(double coarse, int coarseCells, double fine, int fineCells) {
  return std::abs(coarse - fineCells * fine / coarseCells) <= kSpacingTolerance * fine;
}

}  // namespace

void RequestBathymetry(CVdFileSelectorDlg& selector, bool hotStart) {
  if (hotStart) {
    selector.SetDataType(kHotStartDataType);
  } else {
    selector.SetNoItems(1);
  }
  selector.AddRequestItemType(item::kBathymetry);
  selector.SetVane27Compliant();
}

COverlandRqTsbItem::COverlandRqTsbItem(const CBathymetryObjectKvs& area1)
    : area1NoJ_(area1.noJ), area1NoK_(area1.noK), area1Dx_(area1.dx), area1Dy_(area1.dy) {
  SetSelectionDescr(texts::fineBathymetryFile.format);
  SetQunType(item::kBathymetry, 0);
}

bool COverlandRqTsbItem::IsTsbFileValid(const TsbHeader& header, CValidationMessageBuffer& buffer,
                                        std::span<const std::uint32_t> items) const {
  if (!CVdRqTsbItem::IsTsbFileValid(header, buffer, items)) return false;
  const auto refuse = [&buffer](const Text& text) {
    buffer.AddValidationMessage(false, {formatted(text)});
    return false;
  };
  if (items.size() != 1 || items.front() != 1) return refuse(texts::fineFirstItemOnly);
  int noJ = 0;
  int noK = 0;
  float dx = 0;
  float dy = 0;
  if (tsbGetItemAxisType(header, 1) != TsbAxisType::d2 ||
      tsbGetItemAxisEqD2(header, 1, &noJ, &noK, &dx, &dy) != 0) {
    return refuse(texts::fineAxis);
  }
  if (!isMultiple(noJ, area1NoJ_)) return refuse(texts::fineCellsJ);
  if (!isMultiple(noK, area1NoK_)) return refuse(texts::fineCellsK);
  if (!spacingFits(area1Dx_, area1NoJ_, dx, noJ)) return refuse(texts::fineSpacingJ);
  if (!spacingFits(area1Dy_, area1NoK_, dy, noK)) return refuse(texts::fineSpacingK);
  return true;
}

}  // namespace gridbay
